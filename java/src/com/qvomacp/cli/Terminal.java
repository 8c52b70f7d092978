package com.qvomacp.cli;

import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.Map;

/** What the outputs of the program are connected to. */
final class Terminal {
    static final Terminal NONE = new Terminal(false, false);

    /** When colours are wanted. */
    enum Color {
        auto,
        always,
        never
    }

    private final boolean out;
    private final boolean err;

    Terminal(boolean out, boolean err) {
        this.out = out;
        this.err = err;
    }

    /** The terminal of this process, as its environment wants it used. */
    static Terminal ofProcess(Map<String, String> environment) {
        if (!wantsColor(environment)) {
            return NONE;
        }
        return new Terminal(isTerminal(1), isTerminal(2));
    }

    static boolean wantsColor(Map<String, String> environment) {
        return environment.getOrDefault("NO_COLOR", "").isEmpty()
                && !environment.getOrDefault("TERM", "dumb").equals("dumb");
    }

    Palette out(Color color) {
        return palette(color, out);
    }

    Palette err(Color color) {
        return palette(color, err);
    }

    private static Palette palette(Color color, boolean terminal) {
        boolean on = color == Color.always || color == Color.auto && terminal;
        return on ? Palette.COLORS : Palette.NONE;
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
