package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.EnumMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/**
 * Options of the command line that are those of encoding. A secret may also stand in a file or in the
 * environment, where no list of processes shows it.
 */
final class Choices {
    /** What encoding takes, and what a check of a MAC takes of it. */
    static final List<Option<?>> ALL = new ArrayList<>();

    static final List<Option<?>> SECRETS = new ArrayList<>();

    private static final Map<EncodeOption, Option<String>> VALUES = new EnumMap<>(EncodeOption.class);
    private static final Map<EncodeOption, Option<String>> FILES = new EnumMap<>(EncodeOption.class);
    private static final Map<EncodeOption, Option<String>> VARIABLES = new EnumMap<>(EncodeOption.class);

    static {
        for (EncodeOption option : EncodeOption.values()) {
            String name = "--" + option.optionName();
            String label = option.choices().isEmpty() ? option.optionName() : "how";
            String upper = label.toUpperCase(Locale.ROOT);
            VALUES.put(option, Option.text(name, upper, described(option), option.choices()));
            ALL.add(VALUES.get(option));
            if (option.isSecret()) {
                FILES.put(option, Option.text(name + "-file", "FILE", "Read " + name + " from a file, or \"-\"."));
                VARIABLES.put(option, Option.text(name + "-env", "NAME", "Take " + name + " from the environment."));
                List<Option<String>> ways = Arrays.asList(FILES.get(option), VARIABLES.get(option));
                ALL.addAll(ways);
                SECRETS.add(VALUES.get(option));
                SECRETS.addAll(ways);
            }
        }
    }

    private final Job job;
    private boolean isInputTaken;

    Choices(Job job) {
        this.job = job;
        this.isInputTaken = job.readsStandardInput();
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
        String value = job.value(VALUES.get(option));
        if (!option.isSecret()) {
            return value;
        }
        String name = "--" + option.optionName();
        String ofFile = ofFile(FILES.get(option));
        return one(name, value, one(name, ofFile, ofEnvironment(VARIABLES.get(option))));
    }

    private static String one(String name, String first, String second) {
        if (first != null && second != null) {
            throw new UsageException(name + " is told more than once");
        }
        return first == null ? second : first;
    }

    private String ofEnvironment(Option<String> option) {
        String variable = job.value(option);
        String value = variable == null ? null : System.getenv(variable);
        if (variable != null && value == null) {
            throw new UsageException(option.names[0] + " names no variable: " + variable);
        }
        return value;
    }

    private String ofFile(Option<String> option) {
        String file = job.value(option);
        if (file == null) {
            return null;
        }
        String name = option.names[0];
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
