package com.qvomacp.cli;

import java.io.FileDescriptor;
import java.io.FileInputStream;
import java.io.FileOutputStream;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.PrintWriter;
import java.util.Arrays;
import picocli.AutoComplete;
import picocli.CommandLine;
import picocli.CommandLine.Command;
import picocli.CommandLine.IVersionProvider;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParseResult;

/** The command-line program: shows, checks and makes pushed provisioning messages. */
@Command(
        name = "omacp",
        versionProvider = Main.Version.class,
        description = "Shows what pushed OMA Client Provisioning messages set, checks and makes them.",
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
            "0:every message was shown, drawn or written, its MAC is right, no error was found, or two say"
                    + " the same",
            "1:a message or a document is refused, its MAC is not right, an error was found, or"
                    + " two differ",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library that is asked cannot be loaded"
        })
public final class Main {
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

    private Main() {}

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
        Console console = new Console(in, out, err, terminal);
        try {
            run(console, arguments);
            console.out.flush();
        } catch (Output.ClosedError closed) {
            console.raise(Console.FAILED);
            if (!closed.isBrokenPipe()) {
                console.err.println("omacp: the output cannot be written");
            }
        }
        console.err.flush();
        return console.status();
    }

    private static void run(Console console, String[] arguments) {
        CommandLine program = program().setOut(console.out).setErr(console.err);
        try {
            ParseResult parsed = program.parseArgs(withCommand(program, arguments));
            if (CommandLine.printHelpIfRequested(parsed)) {
                return;
            }
            CommandLine command = parsed.subcommand().commandSpec().commandLine();
            try {
                run(console, command.getCommandSpec().userObject());
            } catch (UsageException wrong) {
                throw new ParameterException(command, wrong.getMessage());
            }
        } catch (ParameterException wrong) {
            explainUsage(console, wrong);
        }
    }

    private static void run(Console console, Object command) {
        if (command instanceof Job) {
            ((Job) command).run(console);
        } else {
            console.out.print(AutoComplete.bash("omacp", program()));
        }
    }

    static CommandLine program() {
        // A file's name may begin with @, and what stands in the file is nobody's command line.
        return new CommandLine(new Main())
                .addSubcommand(new Show())
                .addSubcommand(Choices.command(new Verify()))
                .addSubcommand(Choices.command(new Encode()))
                .addSubcommand(new Lint())
                .addSubcommand(new Diff())
                .addSubcommand(new Graph())
                .addSubcommand(new Completion())
                .setExpandAtFiles(false)
                .setCaseInsensitiveEnumValuesAllowed(true);
    }

    /** Says in a few lines what is wrong with a command line. */
    private static void explainUsage(Console console, ParameterException wrong) {
        CommandLine command = wrong.getCommandLine();
        PrintWriter err = console.err;
        err.println("omacp: " + Visible.of(wrong.getMessage()));
        err.print(command.getHelp().synopsisHeading() + command.getHelp().synopsis(0));
        err.println('"' + command.getCommandSpec().qualifiedName() + " --help\" tells more.");
        console.raise(Console.FAILED);
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
    private static final class Completion {
        @Option(
                names = {"-h", "--help"},
                usageHelp = true,
                description = "Show this help and exit.")
        private boolean help;
    }
}
