package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import java.util.Locale;

/**
 * Options of the command line that are those of encoding. A secret may also stand in a file or in the
 * environment, where no list of processes shows it.
 */
final class Choices {
    private static final String FILE = "-file";
    private static final String ENVIRONMENT = "-env";

    /** What encoding takes, and what a check of a MAC takes of it. */
    static final List<Option<String>> ALL = new ArrayList<>();

    static final List<Option<String>> SECRETS = new ArrayList<>();

    static {
        for (EncodeOption option : EncodeOption.values()) {
            String name = "--" + option.optionName();
            String label = option.choices().isEmpty() ? option.optionName() : "how";
            List<Option<String>> ways = new ArrayList<>();
            ways.add(Option.text(name, label.toUpperCase(Locale.ROOT), described(option), option.choices()));
            if (option.isSecret()) {
                ways.add(Option.text(name + FILE, "FILE", "Read " + name + " from a file, or \"-\"."));
                ways.add(Option.text(name + ENVIRONMENT, "NAME", "Take " + name + " from the environment."));
                SECRETS.addAll(ways);
            }
            ALL.addAll(ways);
        }
    }

    private final Job job;
    private boolean isInputTaken;

    Choices(Job job) {
        this.job = job;
        this.isInputTaken = job.arguments.files.contains(Input.STANDARD_INPUT);
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
        String value = stated(name);
        return option.isSecret()
                ? one(name, value, one(name, ofFile(name + FILE), ofEnvironment(name + ENVIRONMENT)))
                : value;
    }

    private String stated(String name) {
        for (Option<String> option : ALL) {
            if (option.isNamed(name)) {
                return job.value(option);
            }
        }
        throw new AssertionError(name);
    }

    private static String one(String name, String first, String second) {
        if (first != null && second != null) {
            throw new UsageException(name + " is told more than once");
        }
        return first == null ? second : first;
    }

    private String ofEnvironment(String name) {
        String variable = stated(name);
        String value = variable == null ? null : System.getenv(variable);
        if (variable != null && value == null) {
            throw new UsageException(name + " names no variable: " + variable);
        }
        return value;
    }

    private String ofFile(String name) {
        String file = stated(name);
        if (file == null) {
            return null;
        }
        boolean isInput = file.equals(Input.STANDARD_INPUT);
        if (isInput && isInputTaken) {
            throw new UsageException(name + ": standard input is read for something else");
        }
        isInputTaken |= isInput;
        try {
            byte[] content = Input.read(file, job.console.in, job.limit);
            return new String(content, StandardCharsets.UTF_8).replaceFirst("\r?\n$", "");
        } catch (IOException unreadable) {
            throw new UsageException(
                    name + ": " + Input.nameOf(file) + ": " + unreadable.getMessage());
        }
    }
}
