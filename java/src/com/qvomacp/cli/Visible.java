package com.qvomacp.cli;

/** Texts of a stranger as a terminal may have them. */
final class Visible {
    private static final String DIGITS = "0123456789abcdef";

    private Visible() {}

    /**
     * The text with everything that is no visible character written as its code, since a terminal
     * obeys control characters, and with each backslash doubled, so that no text looks like a code.
     */
    static String of(String text) {
        return escaped(text, '\\');
    }

    /** The text in quotes, in which a quote has a backslash in front. */
    static String quoted(String text) {
        return '"' + escaped(of(text), '"') + '"';
    }

    /** A value as it is shown in a line of its own: in quotes where its ends could not be seen. */
    static String value(String text) {
        boolean plain =
                !text.isEmpty()
                        && text.charAt(0) != '"'
                        && !isBlank(text.charAt(0))
                        && !isBlank(text.charAt(text.length() - 1));
        return plain ? of(text) : quoted(text);
    }

    private static boolean isBlank(char c) {
        return Character.isWhitespace(c) || Character.isSpaceChar(c);
    }

    private static String escaped(String text, char escapedToo) {
        int from = 0;
        while (from < text.length() && isPlain(text.charAt(from), escapedToo)) {
            ++from;
        }
        if (from == text.length()) {
            return text;
        }
        StringBuilder visible = new StringBuilder(text.length() + 16).append(text, 0, from);
        for (int i = from; i < text.length(); ) {
            int codePoint = text.codePointAt(i);
            int next = i + Character.charCount(codePoint);
            if (codePoint == escapedToo) {
                visible.append('\\');
            }
            if (isVisible(codePoint)) {
                visible.append(text, i, next);
            } else {
                escape(visible, text, i, next);
            }
            i = next;
        }
        return visible.toString();
    }

    private static boolean isPlain(char c, char escapedToo) {
        return c >= ' ' && c < 0x7F && c != escapedToo;
    }

    /** Appends characters as JSON and Java write their codes. */
    static void escape(StringBuilder to, CharSequence text, int from, int end) {
        for (int i = from; i < end; ++i) {
            to.append("\\u");
            for (int shift = 12; shift >= 0; shift -= 4) {
                to.append(DIGITS.charAt(text.charAt(i) >> shift & 0xF));
            }
        }
    }

    /** The columns that a text takes on a terminal. */
    static int columns(String text) {
        return columns(text, 0, Integer.MAX_VALUE - 2);
    }

    /** The columns that a text takes from a place on; counted until they are too many. */
    static int columns(CharSequence text, int from, int most) {
        int columns = 0;
        for (int i = from; i < text.length() && columns <= most; ) {
            int codePoint = Character.codePointAt(text, i);
            columns += isWide(codePoint) ? 2 : 1;
            i += Character.charCount(codePoint);
        }
        return columns;
    }

    static boolean isWide(int codePoint) {
        return codePoint >= 0x1100
                && (codePoint <= 0x115F
                        || codePoint >= 0x2E80 && codePoint <= 0xA4CF
                        || codePoint >= 0xAC00 && codePoint <= 0xD7A3
                        || codePoint >= 0xF900 && codePoint <= 0xFAFF
                        || codePoint >= 0xFE30 && codePoint <= 0xFE6F
                        || codePoint >= 0xFF00 && codePoint <= 0xFF60
                        || codePoint >= 0xFFE0 && codePoint <= 0xFFE6
                        || codePoint >= 0x1F300 && codePoint <= 0x1FAFF
                        || codePoint >= 0x20000 && codePoint <= 0x3FFFD);
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
