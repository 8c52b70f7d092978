package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.Arrays;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/**
 * Reads a dump with a column of offsets, as hexdump, xxd, od and others print it. The offsets say
 * how many bytes a line has, so that a column of characters behind them is never taken for bytes.
 */
final class Dump {
    static final int[] RADIXES = {16, 8, 10};
    static final int LONGEST_LINE = 256;
    private static final int HALF_LINE = 8;

    /** How many digits od and hexdump write for a byte and for a word of two, in octal. */
    private static final int OCTAL_BYTE = 3;

    private static final int OCTAL_WORD = 6;

    /** The bytes of the dump; null when its cells are no bytes. */
    final byte[] bytes;

    /** The line behind it. */
    final int next;

    Dump(byte[] bytes, int next) {
        this.bytes = bytes;
        this.next = next;
    }

    /** Reads the dump that begins at a line; null when none does. */
    static Dump at(List<String> lines, int first, Repeats repeats) {
        Dump cells = CellDump.at(lines, first);
        boolean areRead = cells != null && cells.bytes != null;
        String line = lines.get(first).trim();
        boolean hasPrefix = line.startsWith("0x") || line.startsWith("0X");
        boolean isFirst = line.startsWith("0000", hasPrefix ? 2 : 0);
        if (areRead || !isFirst || new Row(line).offset(16) != 0) {
            return cells;
        }
        for (int radix : RADIXES) {
            Dump dump = read(lines, first, radix, repeats);
            if (dump != null) {
                return dump;
            }
        }
        return cells;
    }

    private static Dump read(List<String> lines, int first, int radix, Repeats repeats) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        byte[] last = {};
        boolean isRepeated = false;
        int index = first;
        for (; index < lines.size(); ++index) {
            String line = lines.get(index).trim();
            if (line.equals("*")) {
                isRepeated = true;
                continue;
            }
            Row row = new Row(line);
            long offset = row.offset(radix);
            if (offset < bytes.size() || offset > bytes.size() && !isRepeated) {
                break;
            }
            if (isRepeated && !repeats.write(bytes, last, offset)) {
                return null;
            }
            isRepeated = false;
            long end = index + 1 < lines.size() ? new Row(lines.get(index + 1)).offset(radix) : -1;
            boolean isKnown = end > offset && end - offset <= LONGEST_LINE;
            int most = last.length == 0 ? LONGEST_LINE : last.length;
            byte[] read = row.read(isKnown ? (int) (end - offset) : most, !isKnown);
            if (read == null) {
                return null;
            }
            bytes.write(read, 0, read.length);
            last = read.length > 0 ? read : last;
        }
        return bytes.size() == 0 || isRepeated ? null : new Dump(bytes.toByteArray(), index);
    }

    /** What digits stand for; -1 where some are none of the radix. */
    static long number(String digits, int radix) {
        try {
            return Long.parseLong(digits, radix);
        } catch (NumberFormatException other) {
            return -1;
        }
    }

    /** What asterisks stand for in a text: lines like the last one. */
    static final class Repeats {
        private int left = 1 << 20;

        /** Writes the last line again, up to an offset; false when that is more than is allowed. */
        boolean write(ByteArrayOutputStream bytes, byte[] last, long offset) {
            if (last.length == 0 || offset - bytes.size() > left) {
                return false;
            }
            left -= (int) (offset - bytes.size());
            while (bytes.size() < offset) {
                bytes.write(last, 0, (int) Math.min(last.length, offset - bytes.size()));
            }
            return true;
        }
    }

    /** A line of a dump: an offset, and groups of digits. */
    private static final class Row {
        private static final String END = "(?!\\S)";
        private static final Pattern OFFSET =
                Pattern.compile("(?:0[xX])?([0-9a-fA-F]{1,12})(:?)" + END);
        private static final Pattern GROUP =
                Pattern.compile("(\\s*)([0-9a-fA-F]+)" + END);

        /** The digits of the offset; empty when the line does not begin with one. */
        final String digits;

        private final boolean hasColon;
        private final boolean hasBar;
        private final Matcher groups;

        Row(String text) {
            String line = text.trim();
            Matcher offset = OFFSET.matcher(line);
            boolean isRow = offset.lookingAt();
            digits = isRow ? offset.group(1) : "";
            hasColon = isRow && !offset.group(2).isEmpty();
            hasBar = line.indexOf('|') >= 0;
            groups = GROUP.matcher(line).region(isRow ? offset.end() : 0, line.length());
        }

        /** The offset; -1 when the line does not begin with one. */
        long offset(int radix) {
            return number(digits, radix);
        }

        /**
         * Reads so many bytes; null when the line has fewer, or goes on with more. The last line
         * may have fewer, and ends at a bar, a gap or what is no group; but eight bytes may be
         * followed by a gap of two blanks.
         */
        byte[] read(int count, boolean isLast) {
            ByteArrayOutputStream bytes = new ByteArrayOutputStream();
            while (bytes.size() < count) {
                int gap = gap();
                boolean isPair = gap == 2 && groups.group(2).length() == 2;
                boolean isHalf = isPair && bytes.size() == HALF_LINE;
                boolean isAtGap = bytes.size() > 0 && gap > 1 && !hasBar && !isHalf;
                byte[] group = isLast && isAtGap ? null : group();
                if (group == null) {
                    break;
                }
                bytes.write(group, 0, group.length);
            }
            int read = Math.min(bytes.size(), count);
            boolean isOther = read < count || gap() == 1 && group() != null;
            return isOther && !isLast ? null : Arrays.copyOf(bytes.toByteArray(), read);
        }

        /** How many blanks stand in front of the next group; 0 when there is none. */
        private int gap() {
            return groups.lookingAt() ? groups.end(1) - groups.start() : 0;
        }

        /** The bytes of the next group of digits; null when there is none. */
        private byte[] group() {
            byte[] bytes = groups.lookingAt() ? bytes(groups.group(2)) : null;
            if (bytes == null) {
                return null;
            }
            groups.region(groups.end(), groups.regionEnd());
            // Words without a colon behind the offset are numbers, of a machine with its low byte
            // first.
            for (int low = 0, high = bytes.length - 1; !hasColon && low < high; ++low, --high) {
                byte swapped = bytes[low];
                bytes[low] = bytes[high];
                bytes[high] = swapped;
            }
            return bytes;
        }

        /** The highest byte of a group first; null when it has not as many digits as it must. */
        private byte[] bytes(String group) {
            boolean isWord = group.length() == OCTAL_WORD && !hasColon;
            if (group.length() != OCTAL_BYTE && !isWord) {
                return group.length() % 2 != 0 ? null : HexText.bytes(group);
            }
            int value = (int) number(group, 8);
            byte[] word = {(byte) (value >> 8), (byte) value};
            return value < 0 ? null : isWord ? word : new byte[] {(byte) value};
        }
    }
}
