package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/**
 * Reads a dump whose cells are characters ({@code od -c}, {@code hexdump -c}) or bits ({@code xxd
 * -b}), and knows any other by its offsets, so that its cells are not taken for hexadecimal digits.
 */
final class CellDump {
    private static final Pattern ROW =
            Pattern.compile("(?:0[xX])?([0-9a-fA-F]{4,12})(:?)(?:\\s.*)?");

    private static final Pattern BITS = Pattern.compile(" ([01]{8})(?= |$)");
    private static final Pattern OCTAL = Pattern.compile("[0-3][0-7]{2}");
    private static final int FULL_ROW = 16;
    private static final int CELL = 4;

    /** How many cells the last row has. */
    private static final int UNKNOWN = -1;

    private static final String ESCAPES = "0abtnvfr";
    private static final String ESCAPED = "\0\u0007\b\t\n\u000b\f\r";

    private CellDump() {}

    /** Reads the dump that begins at a line; null when none does. */
    static Dump at(List<String> lines, int first) {
        if (lines.get(first).startsWith(" ")) {
            return withoutOffsets(lines, first);
        }
        Dump best = null;
        for (int radix : Dump.RADIXES) {
            Dump dump = withOffsets(lines, first, radix);
            boolean isOther = dump != null && best != null;
            boolean isReadToo = isOther && dump.next == best.next && dump.bytes != null;
            best = best == null || isOther && dump.next > best.next || isReadToo ? dump : best;
        }
        return best;
    }

    private static Dump withOffsets(List<String> lines, int first, int radix) {
        List<Long> offsets = new ArrayList<>();
        List<String> rows = new ArrayList<>();
        boolean isWhole = true;
        int next = first;
        for (; next < lines.size(); ++next) {
            String line = lines.get(next);
            if (next > first && (line.startsWith(" ") || line.equals("*"))) {
                isWhole = false;
                continue;
            }
            Matcher row = ROW.matcher(line);
            long offset = row.matches() ? Dump.number(row.group(1), radix) : -1;
            if (rows.isEmpty() ? offset != 0 : offset <= offsets.get(rows.size() - 1)) {
                break;
            }
            offsets.add(offset);
            rows.add(line.substring(row.end(1)));
        }
        long width = rows.size() < 2 ? 0 : offsets.get(1);
        if (width == 0 || width > Dump.LONGEST_LINE) {
            return null;
        }
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        for (int i = 0; i < rows.size() && isWhole; ++i) {
            boolean isLast = i + 1 == rows.size();
            long distance = isLast ? UNKNOWN : offsets.get(i + 1) - offsets.get(i);
            int count = (int) Math.min(distance, width + 1);
            byte[] row = cells(rows.get(i), count);
            isWhole = row != null && (isLast ? row.length <= width : row.length == count);
            if (isWhole) {
                bytes.write(row, 0, row.length);
            }
        }
        return new Dump(isWhole ? bytes.toByteArray() : null, next);
    }

    /** As {@code od -An -c} and {@code od -An -b} print it: rows of 16, but for the last. */
    private static Dump withoutOffsets(List<String> lines, int first) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        int next = first;
        while (next < lines.size() && bytes.size() == (next - first) * FULL_ROW) {
            String line = lines.get(next);
            boolean isRow = line.startsWith(" ") && !line.trim().isEmpty();
            byte[] row = isRow ? cells(line, UNKNOWN) : null;
            if (row == null || row.length > FULL_ROW) {
                break;
            }
            bytes.write(row, 0, row.length);
            ++next;
        }
        return bytes.size() < FULL_ROW ? null : new Dump(bytes.toByteArray(), next);
    }

    /** The bytes of so many cells; null when there are others, or neither bits nor characters. */
    private static byte[] cells(String row, int count) {
        return row.startsWith(":") ? bits(row) : characters(row, count);
    }

    private static byte[] bits(String row) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        Matcher group = BITS.matcher(row).region(1, row.length());
        while (group.lookingAt()) {
            bytes.write(Integer.parseInt(group.group(1), 2));
            group.region(group.end(), row.length());
        }
        return bytes.toByteArray();
    }

    private static byte[] characters(String row, int count) {
        String cells = count == UNKNOWN ? row.replaceFirst("\\s+$", "") : row;
        byte[] bytes = new byte[count == UNKNOWN ? (cells.length() + CELL - 1) / CELL : count];
        int end = Math.min(bytes.length * CELL, cells.length());
        for (int i = 0; i < bytes.length; ++i) {
            int from = Math.min(i * CELL, end);
            int value = character(cells.substring(from, Math.min(from + CELL, end)));
            if (value < 0) {
                return null;
            }
            bytes[i] = (byte) value;
        }
        return cells.substring(end).trim().isEmpty() ? bytes : null;
    }

    /** What a cell stands for; -1 for what is none. */
    private static int character(String cell) {
        String text = cell.trim();
        if (cell.length() != CELL || !cell.endsWith(text)) {
            return -1;
        }
        switch (text.length()) {
            case 0:
                return ' ';
            case 1:
                return text.charAt(0) < 0x7F ? text.charAt(0) : -1;
            case 2:
                int escape = text.charAt(0) == '\\' ? ESCAPES.indexOf(text.charAt(1)) : -1;
                return escape < 0 ? -1 : ESCAPED.charAt(escape);
            default:
                return OCTAL.matcher(text).matches() ? Integer.parseInt(text, 8) : -1;
        }
    }
}
