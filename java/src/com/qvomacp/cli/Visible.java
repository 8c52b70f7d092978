package com.qvomacp.cli;

/** Texts of a stranger as a terminal may have them. */
final class Visible {
    /** Characters that take two columns: the first and the last of each range. */
    private static final int[] WIDE = {
        0x1100, 0x115F, 0x2E80, 0xA4CF, 0xAC00, 0xD7A3, 0xF900, 0xFAFF, 0xFE30, 0xFE6F,
        0xFF00, 0xFF60, 0xFFE0, 0xFFE6, 0x1F300, 0x1FAFF, 0x20000, 0x3FFFD
    };

    private Visible() {}

    /**
     * The text with everything that is no visible character written as its code, since a terminal
     * obeys control characters, and with each backslash doubled, so that no text looks like a code.
     */
    static String of(String text) {
        return escaped(text, "\\", "\\");
    }

    /** The text in quotes, in which a quote has a backslash in front. */
    static String quoted(String text) {
        return '"' + escaped(text, "\\\"", "\\\"") + '"';
    }

    /** The text as a string of JSON, with the codes that people know for line breaks and tabs. */
    static String json(String text) {
        return '"' + escaped(text, "\\\"\n\r\t", "\\\"nrt") + '"';
    }

    /** A value as it is shown in a line of its own: in quotes where its ends could not be seen. */
    static String value(String text) {
        boolean isOpen = text.isEmpty() || text.charAt(0) == '"' || isBlank(text.charAt(0));
        return isOpen || isBlank(text.charAt(text.length() - 1)) ? quoted(text) : of(text);
    }

    private static boolean isBlank(char c) {
        return Character.isWhitespace(c) || Character.isSpaceChar(c);
    }

    /** The text with letters behind backslashes for some characters, codes for the invisible. */
    private static String escaped(String text, String special, String letters) {
        int next = 0;
        while (next < text.length() && isPlain(text.charAt(next), special)) {
            ++next;
        }
        if (next == text.length()) {
            return text;
        }
        StringBuilder visible = new StringBuilder(text.length() + 16).append(text, 0, next);
        for (int i = next; i < text.length(); i = next) {
            int codePoint = text.codePointAt(i);
            int letter = special.indexOf(codePoint);
            next = i + Character.charCount(codePoint);
            if (letter >= 0) {
                visible.append('\\').append(letters.charAt(letter));
            } else if (isVisible(codePoint)) {
                visible.append(text, i, next);
            } else {
                // As JSON and Java write codes.
                for (char c : Character.toChars(codePoint)) {
                    visible.append("\\u").append(Integer.toHexString(0x10000 | c), 1, 5);
                }
            }
        }
        return visible.toString();
    }

    private static boolean isPlain(char c, String special) {
        return c >= ' ' && c < 0x7F && special.indexOf(c) < 0;
    }

    /** The columns that a text takes on a terminal. */
    static int columns(String text) {
        int columns = 0;
        for (int i = 0; i < text.length(); i += Character.charCount(text.codePointAt(i))) {
            columns += isWide(text.codePointAt(i)) ? 2 : 1;
        }
        return columns;
    }

    static boolean isWide(int codePoint) {
        for (int i = 0; i < WIDE.length && codePoint >= WIDE[i]; i += 2) {
            if (codePoint <= WIDE[i + 1]) {
                return true;
            }
        }
        return false;
    }

    /** False for what a terminal or a reader of text obeys, and for half a character. */
    static boolean isVisible(int codePoint) {
        switch (Character.getType(codePoint)) {
            case Character.CONTROL:
            case Character.FORMAT:
            case Character.LINE_SEPARATOR:
            case Character.PARAGRAPH_SEPARATOR:
            case Character.SURROGATE:
                return false;
            default:
                return true;
        }
    }
}
