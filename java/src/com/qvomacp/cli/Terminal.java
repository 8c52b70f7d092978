package com.qvomacp.cli;

import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.Map;

/** What the outputs of the program are connected to. */
final class Terminal {
    static final Terminal NONE = new Terminal(false, false, false);

    /** When colours are wanted. */
    enum Color { auto, always, never }

    final boolean hasColorOut;
    final boolean hasColorErr;

    /** Whether the output is for people's eyes, in colours or without. */
    final boolean isScreen;

    Terminal(boolean hasColorOut, boolean hasColorErr, boolean isScreen) {
        this.hasColorOut = hasColorOut;
        this.hasColorErr = hasColorErr;
        this.isScreen = isScreen;
    }

    /** The terminal of this process, as its environment wants it used. */
    static Terminal ofProcess(Map<String, String> environment) {
        boolean isScreen = isTerminal(1);
        boolean wantsColor = wantsColor(environment);
        return new Terminal(wantsColor && isScreen, wantsColor && isTerminal(2), isScreen);
    }

    static boolean wantsColor(Map<String, String> environment) {
        return environment.getOrDefault("NO_COLOR", "").isEmpty()
                && !environment.getOrDefault("TERM", "dumb").equals("dumb");
    }

    /** Whether a descriptor is a terminal; Java itself only tells it of all of them together. */
    static boolean isTerminal(int descriptor) {
        try {
            Path link = Files.readSymbolicLink(Paths.get("/proc/self/fd/" + descriptor));
            return link.startsWith("/dev/pts") || link.toString().startsWith("/dev/tty");
        } catch (IOException | UnsupportedOperationException unknown) {
            return false;
        }
    }
}
