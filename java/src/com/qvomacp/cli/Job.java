package com.qvomacp.cli;

import java.io.IOException;
import java.util.ArrayList;
import java.util.List;
import picocli.CommandLine.Option;
import picocli.CommandLine.Parameters;

/** A command that does the same to each of its files. */
abstract class Job {
    private static final int DEFAULT_LIMIT = 64 << 10;

    @Option(
            names = "--limit",
            paramLabel = "BYTES",
            description =
                    "Read no more than so many bytes of a file; K and M may stand behind the number"
                            + " (by itself 64K).")
    private String limit;

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

    Console console;
    private int bytesRead;

    /** Does it to one message. */
    abstract void run(Source source);

    /** Looks at what the command line asks for, in front of the first file. */
    abstract void begin();

    /** Says in which way a file has failed, where more than a complaint is wanted. */
    void failed(String name, String reason) {}

    /** Called behind the last file. */
    void end() {}

    final void run(Console to) {
        console = to;
        bytesRead = limit == null ? DEFAULT_LIMIT : bytes(limit);
        begin();
        if (files.isEmpty()) {
            files.add(Input.STANDARD_INPUT);
        }
        for (String file : files) {
            try {
                run(Source.of(Input.read(file, console.in, bytesRead)));
            } catch (IOException unreadable) {
                fail(Console.FAILED, Input.nameOf(file), unreadable.getMessage());
            } catch (OutOfMemoryError tooLarge) {
                fail(Console.FAILED, Input.nameOf(file), "needs more memory than there is");
            }
        }
        end();
    }

    private static int bytes(String number) {
        int unit = "KM".indexOf(number.charAt(number.length() - 1));
        try {
            String digits = unit < 0 ? number : number.substring(0, number.length() - 1);
            long bytes = Math.multiplyExact(Long.parseLong(digits), 1L << 10 * (unit + 1));
            if (bytes > 0 && bytes <= Integer.MAX_VALUE / 2) {
                return (int) bytes;
            }
        } catch (ArithmeticException | NumberFormatException none) {
            // Said below.
        }
        throw new UsageException("--limit is a number of bytes, up to 1023M: " + number);
    }

    /** How much of a file is read, and so how long a message may be. */
    int limit() {
        return bytesRead;
    }

    boolean hasSeveralFiles() {
        return files.size() > 1;
    }

    Palette outPalette() {
        return console.terminal.out(color);
    }

    Palette errPalette() {
        return console.terminal.err(color);
    }

    /** How a line begins that says something about a file where errors go. */
    static String startOf(String name) {
        return "omacp: " + Visible.of(name) + ": ";
    }

    void fail(int status, String name, String reason) {
        console.raise(status);
        console.complain(startOf(name) + Visible.of(reason) + System.lineSeparator());
        failed(name, reason);
    }
}
