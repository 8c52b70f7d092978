package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.List;

/** Breaks text into lines. */
final class Lines {
    /** The columns of a terminal that everybody has. */
    static final int WIDTH = 80;

    /** How many columns the lines of a paragraph are indented. */
    static final int INDENT = 2;

    private Lines() {}

    /** A paragraph, all of whose lines but the first are indented; that one begins as is told. */
    static String paragraph(String start, String text) {
        return start + String.join("\n  ", of(text, WIDTH - INDENT)) + '\n';
    }

    /** The lines of a text, none wider than {@code columns}; words longer than that are cut. */
    static List<String> of(String text, int columns) {
        List<String> lines = new ArrayList<>();
        StringBuilder line = new StringBuilder();
        for (String word : text.split(" ", -1)) {
            int wanted = Visible.columns(word, 0, columns) + (line.length() == 0 ? 0 : 1);
            if (line.length() > 0 && Visible.columns(line, 0, columns) + wanted > columns) {
                lines.add(line.toString());
                line.setLength(0);
            }
            if (line.length() > 0) {
                line.append(' ');
            }
            line.append(word);
            int start = 0;
            while (Visible.columns(line, start, columns) > columns) {
                int end = cut(line, start, columns);
                lines.add(line.substring(start, end));
                start = end;
            }
            line.delete(0, start);
        }
        lines.add(line.toString());
        return lines;
    }

    /** Where a line is cut that is too wide from a place on; behind one character at least. */
    private static int cut(CharSequence line, int start, int columns) {
        int used = 0;
        int end = start;
        while (end < line.length()) {
            int codePoint = Character.codePointAt(line, end);
            used += Visible.isWide(codePoint) ? 2 : 1;
            if (used > columns && end > start) {
                break;
            }
            end += Character.charCount(codePoint);
        }
        return end;
    }
}
