package com.qvomacp.cli;

import java.io.FileDescriptor;
import java.io.FileInputStream;
import java.io.FileOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.OutputStreamWriter;
import java.io.PrintWriter;
import java.nio.charset.StandardCharsets;
import java.nio.file.InvalidPathException;
import java.util.concurrent.Callable;
import picocli.CommandLine;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.Spec;

/**
 * Shows a pushed provisioning message, for people or as JSON.
 *
 * <p>The values are those that the natives of {@code com.qvomacp.eng.parser} answer. Where these do
 * not answer what the message holds, neither does this program: the SERVICE of a proxy's port is
 * named by its place in the list, a BEARER given as text shows the NAP-ADDRESS of its access point,
 * the text of a NAP-ADDRTYPE is not told, an AAUTHLEVEL that is not recognised is missing, and only
 * the first ROAMING of the first application is there. Characteristics stand by kind, those of one
 * kind in the order of the message.
 */
@Command(
        name = "omacp",
        description = "Shows what a pushed OMA Client Provisioning message sets.",
        optionListHeading = "%n",
        footerHeading = "%n",
        footer = {
            "Values are shown as the library answers them: the SERVICE of a proxy's port by its"
                    + " place in the list, a BEARER given as text by the NAP-ADDRESS of its access"
                    + " point."
        },
        exitCodeListHeading = "%nExit status:%n",
        exitCodeList = {
            "0:the message was shown",
            "1:the message cannot be parsed",
            "2:wrong usage, the message cannot be read, the output cannot be written,"
                    + " or the library cannot be loaded"
        })
public final class Main implements Callable<Integer> {
    private static final int SHOWN = 0;
    private static final int REFUSED = 1;
    private static final int FAILED = 2;

    private static final String STANDARD_INPUT = "-";

    private final InputStream in;

    @Spec private CommandSpec spec;

    @Option(names = "--json", description = "Print JSON.")
    private boolean json;

    @Option(
            names = {"-h", "--help"},
            usageHelp = true,
            description = "Show this help and exit.")
    private boolean help;

    @Parameters(
            arity = "0..1",
            paramLabel = "FILE",
            defaultValue = STANDARD_INPUT,
            description =
                    "The pushed message: its bytes, or hexadecimal text with or without blanks and"
                            + " line breaks. Standard input when it is \"-\" or missing.")
    private String file;

    private Main(InputStream in) {
        this.in = in;
    }

    /**
     * Runs the program and ends the virtual machine with its exit status.
     *
     * @param arguments what the command line gives
     */
    public static void main(String[] arguments) {
        System.exit(
                run(
                        new FileInputStream(FileDescriptor.in),
                        new FileOutputStream(FileDescriptor.out),
                        new FileOutputStream(FileDescriptor.err),
                        arguments));
    }

    /**
     * Runs the program with streams of the caller's; both outputs are UTF-8 and left open.
     *
     * @param in standard input
     * @param out standard output
     * @param err standard error
     * @param arguments what the command line gives
     * @return the exit status: 0 shown, 1 refused, 2 could not be tried
     */
    static int run(InputStream in, OutputStream out, OutputStream err, String... arguments) {
        PrintWriter output = new PrintWriter(new OutputStreamWriter(out, StandardCharsets.UTF_8));
        PrintWriter errors = new PrintWriter(new OutputStreamWriter(err, StandardCharsets.UTF_8));
        int status =
                new CommandLine(new Main(in)).setOut(output).setErr(errors).execute(arguments);
        if (output.checkError()) {
            errors.println("omacp: the output cannot be written");
            status = FAILED;
        }
        errors.flush();
        return status;
    }

    @Override
    public Integer call() {
        byte[] push;
        try {
            push = file.equals(STANDARD_INPUT) ? MessageInput.read(in) : MessageInput.read(file);
        } catch (IOException | InvalidPathException unreadable) {
            return fail(FAILED, MessageInput.reasonOf(unreadable));
        }
        try {
            System.loadLibrary("omacp");
            Message message = new MessageReader().read(push);
            PrintWriter out = spec.commandLine().getOut();
            out.print(json ? JsonWriter.write(message) : TextWriter.write(message));
            return SHOWN;
        } catch (RefusedException refused) {
            return fail(REFUSED, refused.getMessage());
        } catch (UnsatisfiedLinkError missing) {
            return fail(FAILED, "the library cannot be loaded: " + missing.getMessage());
        }
    }

    private int fail(int status, String reason) {
        String source = file.equals(STANDARD_INPUT) ? "standard input" : file;
        spec.commandLine().getErr().println("omacp: " + source + ": " + reason);
        return status;
    }
}
