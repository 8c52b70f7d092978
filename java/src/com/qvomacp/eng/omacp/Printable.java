package com.qvomacp.eng.omacp;

/** Makes texts of a message fit for a line of a log. */
final class Printable {
    private static final int LONGEST = 64;

    private Printable() {}

    /** The text with a question mark for all but printable ASCII, cut at 64 characters. */
    static String of(String text) {
        int length = Math.min(text.length(), LONGEST);
        StringBuilder line = new StringBuilder(length);
        for (int i = 0; i < length; ++i) {
            char c = text.charAt(i);
            line.append(c >= ' ' && c <= '~' ? c : '?');
        }
        return line.append(length < text.length() ? "..." : "").toString();
    }
}
