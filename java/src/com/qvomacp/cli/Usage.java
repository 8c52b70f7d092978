package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.Locale;
import picocli.AutoComplete;
import picocli.CommandLine;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Model.OptionSpec;
import picocli.CommandLine.Model.PositionalParamSpec;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParseResult;

/** All that picocli does: help, complaints, completion, and command lines that are not plain. */
@Command(
        name = "omacp",
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
            "0:every message was shown, drawn or written, its MAC is right, no error was found, or"
                    + " two say the same",
            "1:a message or a document is refused, its MAC is not right, an error was found, or"
                    + " two differ",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library that is asked cannot be loaded"
        })
final class Usage {
    static final String COMPLETION = "completion";

    private static final String FILES =
            "What holds messages: pushes, WBXML bodies alone, or parts of SMS; their bytes, or"
                    + " hexadecimal or base64 text, also in a log or a dump. Standard input when it"
                    + " is \"-\" or there is none.";

    private Usage() {}

    static CommandLine program() {
        CommandLine program = new CommandLine(new Usage());
        OptionSpec.Builder version = OptionSpec.builder("-V", "--version").versionHelp(true);
        version.description("Show the version and exit.");
        program.getCommandSpec().addOption(help()).addOption(version.build());
        // The version that the jar states.
        String stated = Main.class.getPackage().getImplementationVersion();
        program.getCommandSpec().version("omacp " + (stated == null ? "unpacked" : stated));
        for (String name : Main.COMMANDS) {
            program.addSubcommand(command(Main.command(name)));
        }
        CommandLine completion = new CommandLine(new Completion());
        completion.getCommandSpec().addOption(help());
        // A file's name may begin with @, and what stands in the file is nobody's command line.
        return program.addSubcommand(completion)
                .setExpandAtFiles(false)
                .setCaseInsensitiveEnumValuesAllowed(true);
    }

    private static CommandLine command(Job job) {
        CommandLine command = new CommandLine(job);
        CommandSpec spec = command.getCommandSpec();
        spec.usageMessage()
                .sortOptions(false)
                .parameterListHeading("%n")
                .optionListHeading("%nOptions:%n")
                .exitCodeListHeading("%nExit status:%n");
        for (Option<?> option : job.options()) {
            spec.addOption(specOf(option));
        }
        PositionalParamSpec.Builder files = PositionalParamSpec.builder().paramLabel("FILE");
        files.arity("0..*").type(List.class).auxiliaryTypes(String.class).description(FILES);
        spec.addOption(help()).addPositional(files.build());
        return command;
    }

    private static OptionSpec specOf(Option<?> option) {
        OptionSpec.Builder spec = OptionSpec.builder(option.names).description(option.description);
        if (option.label == null) {
            return spec.type(boolean.class).build();
        }
        spec.paramLabel(option.label).type(String.class);
        if (option.isRepeated) {
            spec.type(String[].class);
        } else if (option.constants != null) {
            spec.type(option.constants[0].getClass());
            List<String> names = new ArrayList<>();
            for (Object constant : option.constants) {
                names.add(constant.toString().toLowerCase(Locale.ROOT));
            }
            spec.completionCandidates(names);
        } else if (option.completions.length > 0) {
            spec.completionCandidates(Arrays.asList(option.completions));
        }
        return spec.build();
    }

    private static OptionSpec help() {
        OptionSpec.Builder help = OptionSpec.builder("-h", "--help").usageHelp(true);
        return help.description("Show this help and exit.").build();
    }

    /** Does what any command line asks for. */
    static void run(Console console, String[] arguments) {
        CommandLine program = program().setOut(console.out).setErr(console.err);
        try {
            ParseResult parsed = parsed(program, arguments);
            if (CommandLine.printHelpIfRequested(parsed)) {
                return;
            }
            CommandSpec command = parsed.subcommand().commandSpec();
            if (command.userObject() instanceof Job) {
                Main.run(console, command.name(), (Job) command.userObject(), given(command));
            } else {
                console.out.print(completion());
            }
        } catch (ParameterException wrong) {
            explain(console, wrong.getCommandLine(), wrong.getMessage());
        }
    }

    /** A script that completes files, and the options of the first command without its name too. */
    private static String completion() {
        CommandLine program = program();
        for (Option<?> option : Main.command(Main.COMMANDS[0]).options()) {
            program.getCommandSpec().addOption(specOf(option));
        }
        String script = AutoComplete.bash("omacp", program);
        return script.replace("compopt +o default", "compopt -o default");
    }

    static ParseResult parsed(CommandLine program, String[] arguments) {
        String first = arguments.length == 0 ? "" : arguments[0];
        boolean isCommand = program.getSubcommands().containsKey(first);
        List<String> whole = new ArrayList<>(Arrays.asList(arguments));
        if (!isCommand && program.getCommandSpec().findOption(first) == null) {
            whole.add(0, Main.COMMANDS[0]);
        }
        return program.parseArgs(whole.toArray(new String[0]));
    }

    /** What picocli has read for a command. */
    static Arguments given(CommandSpec command) {
        Arguments given = new Arguments();
        for (Option<?> option : ((Job) command.userObject()).options()) {
            Object value = command.findOption(option.names[0]).getValue();
            if (value instanceof String[]) {
                value = String.join(",", (String[]) value);
            }
            if (value != null && !value.equals(false)) {
                given.values.put(option, value);
            }
        }
        List<String> files = command.positionalParameters().get(0).getValue();
        given.files.addAll(files == null ? Collections.<String>emptyList() : files);
        return given;
    }

    /** Says in a few lines what is wrong with the command line of a command. */
    static void explain(Console console, String command, String what) {
        explain(console, program().getSubcommands().get(command), what);
    }

    private static void explain(Console console, CommandLine command, String what) {
        CommandLine.Help help = command.getHelp();
        console.err.println("omacp: " + Visible.of(what));
        console.err.print(help.synopsisHeading() + help.synopsis(0));
        String name = command.getCommandSpec().qualifiedName();
        console.err.println('"' + name + " --help\" tells more.");
        console.raise(Console.FAILED);
    }

    /** Prints what a shell needs to complete the program's command lines. */
    @Command(
            name = Usage.COMPLETION,
            description = "Print a script with which bash and zsh complete command lines.",
            optionListHeading = "%nOptions:%n",
            footerHeading = "%n",
            footer = {"Use it by: source <(omacp completion)"})
    private static final class Completion {}
}
