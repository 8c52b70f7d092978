package com.qvomacp.cli;

import java.io.FileDescriptor;
import java.io.FileInputStream;
import java.io.FileOutputStream;
import java.io.FilterOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.OutputStreamWriter;
import java.io.PrintWriter;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;
import picocli.AutoComplete;
import picocli.CommandLine;
import picocli.CommandLine.Command;
import picocli.CommandLine.IVersionProvider;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.Spec;

/**
 * The command-line program: shows and checks pushed provisioning messages.
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
        versionProvider = Main.Version.class,
        description = "Shows what pushed OMA Client Provisioning messages set, and checks them.",
        synopsisHeading = "Usage: ",
        customSynopsis = {"omacp [show] [OPTION...] [FILE...]", "       omacp COMMAND ..."},
        commandListHeading = "%nCommands:%n",
        optionListHeading = "%nOptions:%n",
        footerHeading = "%n",
        footer = {
            "\"omacp COMMAND --help\" tells the options of a command. Without a command, show is"
                    + " meant."
        },
        exitCodeListHeading = "%nExit status:%n",
        exitCodeList = {
            "0:every message was shown, or its MAC is right",
            "1:a message is refused, or its MAC is not right",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library cannot be loaded"
        })
public final class Main implements Runnable {
    static final int DONE = 0;
    static final int REFUSED = 1;
    static final int FAILED = 2;

    final InputStream in;
    final Terminal terminal;

    @Spec private CommandSpec spec;

    @Option(
            names = {"-h", "--help"},
            usageHelp = true,
            description = "Show this help and exit.")
    private boolean help;

    @Option(
            names = {"-V", "--version"},
            versionHelp = true,
            description = "Show the version and exit.")
    private boolean version;

    private Main(InputStream in, Terminal terminal) {
        this.in = in;
        this.terminal = terminal;
    }

    /**
     * Runs the program and ends the virtual machine with its exit status.
     *
     * @param arguments what the command line gives
     */
    public static void main(String[] arguments) {
        // Nobody types a message.
        boolean helpless = arguments.length == 0 && Terminal.isTerminal(0);
        System.exit(
                run(
                        new FileInputStream(FileDescriptor.in),
                        new FileOutputStream(FileDescriptor.out),
                        new FileOutputStream(FileDescriptor.err),
                        Terminal.ofProcess(System.getenv()),
                        helpless ? new String[] {"--help"} : arguments));
    }

    /**
     * Runs the program with streams of the caller's; both outputs are UTF-8 and left open.
     *
     * @param in standard input
     * @param out standard output
     * @param err standard error
     * @param terminal what the outputs are connected to
     * @param arguments what the command line gives
     * @return the exit status: 0 all is well, 1 refused, 2 could not be tried
     */
    static int run(
            InputStream in,
            OutputStream out,
            OutputStream err,
            Terminal terminal,
            String... arguments) {
        Pipe pipe = new Pipe(out);
        PrintWriter output = new PrintWriter(new OutputStreamWriter(pipe, StandardCharsets.UTF_8));
        PrintWriter errors = new PrintWriter(new OutputStreamWriter(err, StandardCharsets.UTF_8));
        CommandLine program = program(new Main(in, terminal));
        int status =
                program.setOut(output).setErr(errors).execute(withCommand(program, arguments));
        if (output.checkError()) {
            if (!pipe.isBroken()) {
                errors.println("omacp: the output cannot be written");
            }
            status = FAILED;
        }
        errors.flush();
        return status;
    }

    static CommandLine program() {
        return program(new Main(null, Terminal.NONE));
    }

    private static CommandLine program(Main main) {
        return new CommandLine(main)
                .addSubcommand(new Show(main))
                .addSubcommand(new Verify(main))
                .addSubcommand(new Completion())
                .setParameterExceptionHandler(Main::explainUsage);
    }

    /** Says in a few lines what is wrong with a command line. */
    private static int explainUsage(ParameterException wrong, String[] arguments) {
        CommandLine command = wrong.getCommandLine();
        PrintWriter err = command.getErr();
        err.println("omacp: " + wrong.getMessage());
        err.print(command.getHelp().synopsisHeading() + command.getHelp().synopsis(0));
        err.println('"' + command.getCommandSpec().qualifiedName() + " --help\" tells more.");
        return FAILED;
    }

    /** The arguments with {@code show} in front, where no command or question is. */
    private static String[] withCommand(CommandLine program, String[] arguments) {
        if (arguments.length > 0
                && (program.getSubcommands().containsKey(arguments[0])
                        || Arrays.asList("-h", "--help", "-V", "--version")
                                .contains(arguments[0]))) {
            return arguments;
        }
        String[] withShow = new String[arguments.length + 1];
        withShow[0] = "show";
        System.arraycopy(arguments, 0, withShow, 1, arguments.length);
        return withShow;
    }

    /** An output that notices when whoever reads it has seen enough, which is no news to him. */
    private static final class Pipe extends FilterOutputStream {
        private boolean broken;

        Pipe(OutputStream out) {
            super(out);
        }

        boolean isBroken() {
            return broken;
        }

        @Override
        public void write(byte[] bytes, int from, int count) throws IOException {
            try {
                out.write(bytes, from, count);
            } catch (IOException failed) {
                broken = "Broken pipe".equals(failed.getMessage());
                throw failed;
            }
        }
    }

    @Override
    public void run() {
        spec.commandLine().usage(spec.commandLine().getOut());
    }

    /** The version that the jar states. */
    static final class Version implements IVersionProvider {
        @Override
        public String[] getVersion() {
            String version = Main.class.getPackage().getImplementationVersion();
            return new String[] {"omacp " + (version == null ? "unpacked" : version)};
        }
    }

    /** Prints what a shell needs to complete the program's command lines. */
    @Command(
            name = "completion",
            description = "Print a script with which bash and zsh complete command lines.",
            optionListHeading = "%nOptions:%n",
            footerHeading = "%n",
            footer = {"Use it by: source <(omacp completion)"})
    private static final class Completion implements Runnable {
        @Spec private CommandSpec spec;

        @Option(
                names = {"-h", "--help"},
                usageHelp = true,
                description = "Show this help and exit.")
        private boolean help;

        @Override
        public void run() {
            CommandLine own = spec.commandLine();
            own.getOut().print(AutoComplete.bash("omacp", own.getParent()));
        }
    }
}
