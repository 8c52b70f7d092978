package com.qvomacp.eng.omacp;

import java.util.Locale;

/** Texts of a message in a form that may stand in one line of a log. */
final class Printable {
    private static final int LONGEST = 60;

    private Printable() {}

    /** The text, with control characters written as U+0000, and cut when it is long. */
    static String of(String text) {
        StringBuilder line = new StringBuilder();
        append(line, text);
        return line.toString();
    }

    /** Adds the text to a line, with control characters written as U+0000, and cut when it is long. */
    static void append(StringBuilder line, String text) {
        int end = Math.min(text.length(), LONGEST);
        for (int i = 0; i < end; ++i) {
            char c = text.charAt(i);
            if (isShown(c)) {
                line.append(c);
            } else {
                line.append("\\u");
                for (int shift = 12; shift >= 0; shift -= 4) {
                    line.append(Character.toUpperCase(Character.forDigit(c >> shift & 0xF, 16)));
                }
            }
        }
        if (end < text.length()) {
            line.append("...");
        }
    }

    /** The name of a constant, as people and programs write it. */
    static String nameOf(Enum<?> constant) {
        return constant.name().toLowerCase(Locale.ROOT).replace('_', '-');
    }

    static String quoted(String text) {
        return '"' + of(text) + '"';
    }

    /** Whether a character shows itself, and neither breaks a line nor changes its direction. */
    static boolean isShown(int c) {
        int type = Character.getType(c);
        return type != Character.CONTROL
                && type != Character.FORMAT
                && type != Character.LINE_SEPARATOR
                && type != Character.PARAGRAPH_SEPARATOR;
    }
}
