package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** Breaks text into lines. */
final class Lines {
    /** The columns of a terminal that everybody has. */
    static final int WIDTH = 80;

    /** How many columns the lines of a paragraph are indented. */
    static final int INDENT = 2;

    private Lines() {}

    static String blanks(int count) {
        char[] blanks = new char[Math.max(count, 0)];
        Arrays.fill(blanks, ' ');
        return new String(blanks);
    }

    /** A text with blanks behind it until it is so wide. */
    static String padded(String text, int width) {
        return text + blanks(width - text.length());
    }

    /** A paragraph, all of whose lines but the first are indented; that one begins as is told. */
    static String paragraph(String start, String text) {
        return start + String.join("\n  ", of(text, WIDTH - INDENT)) + '\n';
    }

    /** The lines of a text, none wider than {@code columns}; words longer than that are cut. */
    static List<String> of(String text, int columns) {
        List<String> lines = new ArrayList<>();
        String line = "";
        for (String word : text.split(" ", -1)) {
            String longer = line.isEmpty() ? word : line + ' ' + word;
            if (!line.isEmpty() && end(longer, 0, columns) < longer.length()) {
                lines.add(line);
                longer = word;
            }
            int start = 0;
            for (int end; (end = end(longer, start, columns)) < longer.length(); start = end) {
                lines.add(longer.substring(start, end));
            }
            line = longer.substring(start);
        }
        lines.add(line);
        return lines;
    }

    /** Where a line ends that begins at a place of a text; behind one character at least. */
    private static int end(String text, int start, int columns) {
        int used = 0;
        int end = start;
        while (end < text.length()) {
            int codePoint = text.codePointAt(end);
            used += Visible.isWide(codePoint) ? 2 : 1;
            if (used > columns && end > start) {
                break;
            }
            end += Character.charCount(codePoint);
        }
        return end;
    }
}
