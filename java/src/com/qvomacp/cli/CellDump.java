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
    private static final int[] RADIXES = {16, 8, 10};
    private static final int LONGEST_ROW = 256;
    private static final int FULL_ROW = 16;
    private static final int CELL = 4;

    /** How many cells the last row has. */
    private static final int UNKNOWN = -1;

    private static final String ESCAPES = "0abtnvfr";
    private static final String ESCAPED = "\0\u0007\b\t\n\u000b\f\r";

    /** The bytes of the dump; null when its cells are something else. */
    final byte[] bytes;

    /** The line behind it. */
    final int next;

    private CellDump(byte[] bytes, int next) {
        this.bytes = bytes;
        this.next = next;
    }

    /** Reads the dump that begins at a line; null when none does. */
    static CellDump at(List<String> lines, int first) {
        if (lines.get(first).startsWith(" ")) {
            return withoutOffsets(lines, first);
        }
        CellDump best = null;
        for (int radix : RADIXES) {
            CellDump dump = withOffsets(lines, first, radix);
            boolean isLonger = dump != null && (best == null || dump.next > best.next);
            boolean isRead = dump != null && dump.bytes != null && !isLonger && dump.next == best.next;
            best = isLonger || isRead ? dump : best;
        }
        return best;
    }

    private static CellDump withOffsets(List<String> lines, int first, int radix) {
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
            long offset = row.matches() ? number(row.group(1), radix) : -1;
            if (rows.isEmpty() ? offset != 0 : offset <= offsets.get(rows.size() - 1)) {
                break;
            }
            offsets.add(offset);
            rows.add(line.substring(row.end(1)));
        }
        long width = rows.size() < 2 ? 0 : offsets.get(1);
        if (width == 0 || width > LONGEST_ROW) {
            return null;
        }
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        for (int i = 0; i < rows.size() && isWhole; ++i) {
            boolean isLast = i + 1 == rows.size();
            int count = isLast ? UNKNOWN : (int) Math.min(offsets.get(i + 1) - offsets.get(i), width + 1);
            byte[] row = cells(rows.get(i), count);
            isWhole = row != null && (isLast ? row.length <= width : row.length == count);
            if (isWhole) {
                bytes.write(row, 0, row.length);
            }
        }
        return new CellDump(isWhole ? bytes.toByteArray() : null, next);
    }

    /** As {@code od -An -c} and {@code od -An -b} print it: rows of 16, but for the last. */
    private static CellDump withoutOffsets(List<String> lines, int first) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        int next = first;
        while (next < lines.size() && bytes.size() == (next - first) * FULL_ROW) {
            String line = lines.get(next);
            byte[] row = line.startsWith(" ") && !line.trim().isEmpty() ? cells(line, UNKNOWN) : null;
            if (row == null || row.length > FULL_ROW) {
                break;
            }
            bytes.write(row, 0, row.length);
            ++next;
        }
        return bytes.size() < FULL_ROW ? null : new CellDump(bytes.toByteArray(), next);
    }

    private static long number(String digits, int radix) {
        try {
            return Long.parseLong(digits, radix);
        } catch (NumberFormatException other) {
            return -1;
        }
    }

    /** The bytes of so many cells; null when there are others, or they are neither bits nor characters. */
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
            int value = character(cells.substring(Math.min(i * CELL, end), Math.min((i + 1) * CELL, end)));
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
        boolean isAtEnd = cell.length() == CELL && cell.endsWith(text);
        if (text.isEmpty()) {
            return cell.length() == CELL ? ' ' : -1;
        }
        if (text.length() == 1) {
            return isAtEnd && text.charAt(0) < 0x7F ? text.charAt(0) : -1;
        }
        if (text.length() == 2) {
            int escape = ESCAPES.indexOf(text.charAt(1));
            return isAtEnd && text.charAt(0) == '\\' && escape >= 0 ? ESCAPED.charAt(escape) : -1;
        }
        return isAtEnd && OCTAL.matcher(text).matches() ? Integer.parseInt(text, 8) : -1;
    }
}
