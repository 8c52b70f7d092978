package com.qvomacp.cli;

import com.qvomacp.eng.omacp.NativeLibrary;
import java.io.IOException;
import java.io.PrintWriter;
import java.nio.file.InvalidPathException;
import java.util.ArrayList;
import java.util.List;
import java.util.concurrent.Callable;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.Spec;

/** A command that does the same to each of its files. */
abstract class Job implements Callable<Integer> {
    @Spec CommandSpec spec;

    @Option(
            names = "--color",
            paramLabel = "WHEN",
            defaultValue = "auto",
            description =
                    "Use colours: auto (on a terminal, unless NO_COLOR is set), always, never.")
    private Terminal.Color color;

    @Option(
            names = {"-h", "--help"},
            usageHelp = true,
            description = "Show this help and exit.")
    private boolean help;

    @Parameters(
            arity = "0..*",
            paramLabel = "FILE",
            description =
                    "A message: a push, or the WBXML body of one alone; its bytes, or hexadecimal"
                            + " or base64 text. Standard input when it is \"-\" or there is none.")
    private List<String> files = new ArrayList<>();

    private final Main main;
    private int status = Main.DONE;

    Job(Main main) {
        this.main = main;
    }

    /** Does it to one message. */
    abstract void run(Source source) throws RefusedException;

    /** Says that a message is refused. */
    abstract void refused(Explanation explanation);

    /** Says in which other way a file has failed. */
    void failed(String name, String reason) {}

    /** Called in front of the first file and behind the last one. */
    void begin() {}

    void end() {}

    @Override
    public Integer call() {
        if (files.isEmpty()) {
            files.add(Source.STANDARD_INPUT);
        }
        begin();
        for (String file : files) {
            call(file);
        }
        end();
        return status;
    }

    private void call(String file) {
        Source source;
        try {
            source = Source.read(file, main.in);
        } catch (IOException | InvalidPathException unreadable) {
            fail(Main.FAILED, Source.nameOf(file), Source.reasonOf(unreadable));
            return;
        }
        try {
            NativeLibrary.load();
            run(source);
        } catch (RefusedException refused) {
            raise(Main.REFUSED);
            refused(Explanation.of(source, refused.headerTaken));
        } catch (UnsatisfiedLinkError missing) {
            fail(Main.FAILED, source.name, missing.getMessage());
        }
    }

    boolean hasSeveralFiles() {
        return files.size() > 1;
    }

    PrintWriter out() {
        return spec.commandLine().getOut();
    }

    Palette outPalette() {
        return main.terminal.out(color);
    }

    /** Writes an explanation where errors go, in its place among what has been written. */
    void complain(Explanation explanation) {
        String start = startOf(explanation.source.name);
        complain(explanation.write(start, main.terminal.err(color)));
    }

    private static String startOf(String name) {
        return "omacp: " + Visible.of(name) + ": ";
    }

    private void complain(String text) {
        out().flush();
        PrintWriter err = spec.commandLine().getErr();
        err.print(text);
        err.flush();
    }

    void fail(int raised, String name, String reason) {
        raise(raised);
        complain(startOf(name) + reason + System.lineSeparator());
        failed(name, reason);
    }

    /** The exit status is the worst of all files. */
    void raise(int raised) {
        status = Math.max(status, raised);
    }
}
