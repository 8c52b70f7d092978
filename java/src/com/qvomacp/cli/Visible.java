package com.qvomacp.cli;

import java.nio.charset.StandardCharsets;

/** Texts of a message as a terminal may have them: a message comes from a stranger. */
final class Visible {
    /** Bytes of a text that are shown in the midst of other things. */
    private static final int LONGEST_QUOTED = 120;

    private Visible() {}

    /**
     * The text with everything that is no visible character written as its code, since a terminal
     * obeys control characters.
     */
    static String of(String text) {
        StringBuilder visible = new StringBuilder();
        text.codePoints()
                .forEach(
                        c -> {
                            if (isVisible(c)) {
                                visible.appendCodePoint(c);
                            } else {
                                visible.append(String.format("\\u%04x", c));
                            }
                        });
        return visible.toString();
    }

    /** Bytes as a text in quotes, cut when it is long. */
    static String quoted(byte[] data, int from, int to) {
        int end = Math.min(to, from + LONGEST_QUOTED);
        String text = '"' + of(new String(data, from, end - from, StandardCharsets.UTF_8)) + '"';
        return end == to ? text : text + "... (" + (to - from) + " bytes)";
    }

    /** The columns that a text takes on a terminal. */
    static int columns(String text) {
        return text.codePoints().map(c -> isWide(c) ? 2 : 1).sum();
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

    private static boolean isVisible(int codePoint) {
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
