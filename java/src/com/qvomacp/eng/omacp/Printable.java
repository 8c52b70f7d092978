package com.qvomacp.eng.omacp;

/** Texts of a message in a form that may stand in one line of a log. */
final class Printable {
    private static final int LONGEST = 60;

    private Printable() {}

    /** The text, with control characters written as U+0000, and cut when it is long. */
    static String of(String text) {
        StringBuilder line = new StringBuilder();
        append(line, text, LONGEST);
        return line.toString();
    }

    static String quoted(String text) {
        return '"' + of(text) + '"';
    }

    /** The whole text in quotes, with control characters written as U+0000. */
    static String whole(String text) {
        StringBuilder line = new StringBuilder(text.length() + 2).append('"');
        append(line, text, text.length());
        return line.append('"').toString();
    }

    private static void append(StringBuilder line, String text, int longest) {
        int end = Math.min(text.length(), longest);
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

    /** Whether a character shows itself, and neither breaks a line nor changes its direction. */
    private static boolean isShown(char c) {
        int type = Character.getType(c);
        return type != Character.CONTROL
                && type != Character.FORMAT
                && type != Character.LINE_SEPARATOR
                && type != Character.PARAGRAPH_SEPARATOR;
    }
}
