package com.qvomacp.cli;

import java.io.FileDescriptor;
import java.io.FileInputStream;
import java.io.FileOutputStream;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.UncheckedIOException;

/** The command-line program: shows, checks and makes pushed provisioning messages. */
public final class Main {
    /** In the order of the help; the first is meant where none is named. */
    static final String[] COMMANDS = {"show", "verify", "encode", "lint", "diff", "graph"};

    private Main() {}

    /** The command of a name; null when there is none, or none that works on messages. */
    static Job command(String name) {
        switch (name) {
            case "show":
                return new Show();
            case "verify":
                return new Verify();
            case "encode":
                return new Encode();
            case "lint":
                return new Lint();
            case "diff":
                return new Diff();
            case "graph":
                return new Graph();
            default:
                return null;
        }
    }

    /**
     * Runs the program and ends the virtual machine with its exit status.
     *
     * @param arguments what the command line gives
     */
    public static void main(String[] arguments) {
        // Nobody types a message.
        boolean helpless = arguments.length == 0 && Terminal.isTerminal(0);
        InputStream in = new FileInputStream(FileDescriptor.in);
        OutputStream out = new FileOutputStream(FileDescriptor.out);
        OutputStream err = new FileOutputStream(FileDescriptor.err);
        Terminal terminal = Terminal.ofProcess(System.getenv());
        System.exit(run(in, out, err, terminal, helpless ? new String[] {"--help"} : arguments));
    }

    /**
     * Runs the program with streams of the caller's; both outputs are UTF-8 and left open.
     *
     * @return the exit status: 0 all is well, 1 refused, 2 could not be tried
     */
    static int run(InputStream in, OutputStream out, OutputStream err, Terminal terminal,
            String... arguments) {
        Console console = new Console(in, out, err, terminal);
        try {
            run(console, arguments);
            console.out.flush();
        } catch (UncheckedIOException closed) {
            console.raise(Console.FAILED);
            // Whoever reads through a pipe has seen enough, which is no news to him.
            if (!"Broken pipe".equals(closed.getCause().getMessage())) {
                console.err.println("omacp: the output cannot be written");
            }
        }
        console.err.flush();
        return console.status;
    }

    /** Loads picocli, which takes longer than most messages, only where it is needed. */
    private static void run(Console console, String[] arguments) {
        String first = arguments.length == 0 ? "" : arguments[0];
        boolean isNamed = command(first) != null;
        String name = isNamed ? first : COMMANDS[0];
        Job job = command(name);
        Arguments plain = Arguments.plain(job.options(), arguments, isNamed ? 1 : 0);
        if (plain == null || first.equals(Usage.COMPLETION)) {
            Usage.run(console, arguments);
        } else {
            run(console, name, job, plain);
        }
    }

    static void run(Console console, String name, Job job, Arguments arguments) {
        try {
            job.run(console, arguments);
        } catch (UsageException wrong) {
            Usage.explain(console, name, wrong.getMessage());
        }
    }
}
