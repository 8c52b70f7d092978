package com.qvomacp.cli;

/**
 * An option of a command: all that is said of it, for whoever reads command lines, explains or
 * completes them.
 *
 * @param <T> its value: a text, a constant, or true where it takes none
 */
final class Option<T> {
    final String[] names;

    /** What its value is called; null for an option that takes none. */
    final String label;

    final String description;

    /** The constants that its value is one of; null for one that is any text. */
    final T[] constants;

    /** Texts that its value may be. */
    final String[] completions;

    /** Whether it may be there several times: then the texts are told with commas between. */
    final boolean isRepeated;

    private Option(String names, String label, String description, T[] constants,
            boolean isRepeated, String... completions) {
        this.names = names.split(" ");
        this.label = label;
        this.description = description;
        this.constants = constants;
        this.isRepeated = isRepeated;
        this.completions = completions;
    }

    /** An option that is there or is not. */
    static Option<Boolean> flag(String names, String description) {
        return new Option<>(names, null, description, null, false);
    }

    /** An option whose value is a text; there may be several names, with blanks between. */
    static Option<String> text(
            String names, String label, String description, String... completions) {
        return new Option<>(names, label, description, null, false, completions);
    }

    /** An option that may be there several times, its value being several texts. */
    static Option<String> texts(String names, String label, String description) {
        return new Option<>(names, label, description, null, true);
    }

    /** An option whose value is a constant, named in letters of either case. */
    static <T extends Enum<T>> Option<T> constant(
            String names, String label, T[] constants, String description) {
        return new Option<>(names, label, description, constants, false);
    }

    /** The value that a text stands for; null where it stands for none. */
    Object value(String text) {
        if (constants == null) {
            return text;
        }
        for (T constant : constants) {
            if (constant.toString().equalsIgnoreCase(text)) {
                return constant;
            }
        }
        return null;
    }
}
