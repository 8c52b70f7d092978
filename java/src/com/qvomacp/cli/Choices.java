package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.Locale;
import picocli.CommandLine;
import picocli.CommandLine.Model.OptionSpec;

/**
 * Options of the command line that are those of encoding. A secret may also stand in a file or in the
 * environment, where no list of processes shows it.
 */
final class Choices {
    private static final String FILE = "-file";
    private static final String ENVIRONMENT = "-env";

    private final Job job;
    private boolean isInputTaken;

    Choices(Job job) {
        this.job = job;
        this.isInputTaken = job.readsStandardInput();
    }

    /** A command with the options that it takes: secrets alone, unless it encodes. */
    static CommandLine command(Job job) {
        CommandLine command = new CommandLine(job);
        for (EncodeOption option : EncodeOption.values()) {
            String name = option.optionName();
            if (option.isSecret() || job instanceof Encode) {
                String label = option.choices().isEmpty() ? name : "how";
                add(command, option, "", label, described(option));
            }
            if (option.isSecret()) {
                add(command, option, FILE, "file", "Read --" + name + " from a file, or \"-\".");
                add(command, option, ENVIRONMENT, "name", "Take --" + name + " from the environment.");
            }
        }
        return command;
    }

    private static void add(
            CommandLine command, EncodeOption option, String way, String label, String text) {
        OptionSpec.Builder spec =
                OptionSpec.builder("--" + option.optionName() + way)
                        .paramLabel(label.toUpperCase(Locale.ROOT))
                        .type(String.class)
                        .description(text);
        if (!option.choices().isEmpty()) {
            spec.completionCandidates(option.choices());
        }
        command.getCommandSpec().addOption(spec.build());
    }

    private static String described(EncodeOption option) {
        String text = option.description();
        String choices = String.join(", ", option.choices());
        String byItself = option.defaultValue();
        return Character.toUpperCase(text.charAt(0))
                + text.substring(1)
                + (choices.isEmpty() ? "" : ": " + choices)
                + (byItself == null || byItself.isEmpty() ? "" : " (by itself " + byItself + ")")
                + ".";
    }

    /** The value that the command line states for an option, or says where it stands; or null. */
    String value(EncodeOption option) {
        String name = "--" + option.optionName();
        String value = job.spec.findOption(name).getValue();
        return option.isSecret()
                ? one(name, value, one(name, ofFile(name + FILE), ofEnvironment(name + ENVIRONMENT)))
                : value;
    }

    private static String one(String name, String first, String second) {
        if (first != null && second != null) {
            throw new UsageException(name + " is told more than once");
        }
        return first == null ? second : first;
    }

    private String ofEnvironment(String name) {
        String variable = job.spec.findOption(name).getValue();
        String value = variable == null ? null : System.getenv(variable);
        if (variable != null && value == null) {
            throw new UsageException(name + " names no variable: " + variable);
        }
        return value;
    }

    private String ofFile(String name) {
        String file = job.spec.findOption(name).getValue();
        if (file == null) {
            return null;
        }
        boolean isInput = file.equals(Input.STANDARD_INPUT);
        if (isInput && isInputTaken) {
            throw new UsageException(name + ": standard input is read for something else");
        }
        isInputTaken |= isInput;
        try {
            byte[] content = Input.read(file, job.console.in, job.limit());
            return new String(content, StandardCharsets.UTF_8).replaceFirst("\r?\n$", "");
        } catch (IOException unreadable) {
            throw new UsageException(
                    name + ": " + Input.nameOf(file) + ": " + unreadable.getMessage());
        }
    }
}
