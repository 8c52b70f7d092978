package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/**
 * Options of the command line that are those of encoding. A secret may also stand in a file or in
 * the environment, where no list of processes shows it.
 */
final class Choices {
    private static final String FILE = "-file";
    private static final String ENVIRONMENT = "-env";

    /** What encoding takes, by the name, and what a check of a MAC takes of it. */
    static final Map<String, Option<String>> ALL = new LinkedHashMap<>();

    static final List<Option<String>> SECRETS = new ArrayList<>();

    static {
        for (EncodeOption option : EncodeOption.values()) {
            String name = "--" + option.optionName();
            String[] choices = option.choices().toArray(new String[0]);
            String label = choices.length == 0 ? option.optionName() : "how";
            label = label.toUpperCase(Locale.ROOT);
            ALL.put(name, Option.text(name, label, described(option), choices));
            if (option.isSecret()) {
                String file = "Read " + name + " from a file, or \"-\".";
                ALL.put(name + FILE, Option.text(name + FILE, "FILE", file));
                String variable = "Take " + name + " from the environment.";
                ALL.put(name + ENVIRONMENT, Option.text(name + ENVIRONMENT, "NAME", variable));
                for (String way : new String[] {"", FILE, ENVIRONMENT}) {
                    SECRETS.add(ALL.get(name + way));
                }
            }
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
        String value = job.value(ALL.get(name));
        return !option.isSecret() ? value
                : one(name, value, one(name, ofFile(name), ofEnvironment(name)));
    }

    private static String one(String name, String first, String second) {
        if (first != null && second != null) {
            throw new UsageException(name + " is told more than once");
        }
        return first == null ? second : first;
    }

    private String ofEnvironment(String secret) {
        String name = secret + ENVIRONMENT;
        String variable = job.value(ALL.get(name));
        String value = variable == null ? null : System.getenv(variable);
        if (variable != null && value == null) {
            throw new UsageException(name + " names no variable: " + variable);
        }
        return value;
    }

    private String ofFile(String secret) {
        String name = secret + FILE;
        String file = job.value(ALL.get(name));
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
            String what = Input.nameOf(file) + ": " + unreadable.getMessage();
            throw new UsageException(name + ": " + what);
        }
    }
}
