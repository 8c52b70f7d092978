package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.Arrays;
import java.util.List;

/**
 * Reads a dump with a column of offsets, as hexdump, xxd, od and others print it. The offsets say
 * how many bytes a line has, so that a column of characters behind them is never taken for bytes.
 */
final class Dump {
    static final int[] RADIXES = {16, 8, 10};
    static final int LONGEST_LINE = 256;
    private static final int HALF_LINE = 8;
    private static final int SHORTEST_OFFSET = 4;
    private static final int LONGEST_OFFSET = 12;

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
        Row row = new Row(lines.get(first));
        if (areRead || row.offset(16) != 0 || row.offsetEnd - row.offsetAt < SHORTEST_OFFSET) {
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
        private final String line;
        private final int offsetAt;
        private final int offsetEnd;
        private final boolean hasColon;

        /** Up to where the line has been read. */
        private int at;

        Row(String text) {
            line = text.trim();
            offsetAt = line.startsWith("0x") || line.startsWith("0X") ? 2 : 0;
            offsetEnd = endOfDigits(offsetAt);
            hasColon = line.startsWith(":", offsetEnd);
            at = offsetEnd + (hasColon ? 1 : 0);
        }

        private int endOfDigits(int from) {
            int end = from;
            while (end < line.length() && Character.digit(line.charAt(end), 16) >= 0) {
                ++end;
            }
            return end;
        }

        private boolean isAlone(int end) {
            return end == line.length() || Character.isWhitespace(line.charAt(end));
        }

        /** The offset; -1 when the line does not begin with one. */
        long offset(int radix) {
            boolean isOffset = isAlone(at) && offsetEnd - offsetAt <= LONGEST_OFFSET;
            return isOffset ? number(line.substring(offsetAt, offsetEnd), radix) : -1;
        }

        /**
         * Reads so many bytes; null when the line has fewer, or goes on with more. The last line
         * may have fewer, and ends at a bar, a gap or what is no group; but eight bytes may be
         * followed by a gap of two blanks.
         */
        byte[] read(int count, boolean isLast) {
            ByteArrayOutputStream bytes = new ByteArrayOutputStream();
            boolean hasBar = line.indexOf('|') >= 0;
            while (bytes.size() < count) {
                int gap = gap();
                boolean isPair = gap == 2 && endOfDigits(at + gap) == at + gap + 2;
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

        /** How many blanks stand in front of what comes next. */
        private int gap() {
            int blank = at;
            while (blank < line.length() && Character.isWhitespace(line.charAt(blank))) {
                ++blank;
            }
            return blank - at;
        }

        /** The bytes of the next group of digits; null when there is none. */
        private byte[] group() {
            int from = at + gap();
            int end = endOfDigits(from);
            byte[] bytes = isAlone(end) ? bytes(line.substring(from, end)) : null;
            if (bytes == null) {
                return null;
            }
            at = end;
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
                return group.isEmpty() || group.length() % 2 != 0 ? null : HexText.bytes(group);
            }
            int value = (int) number(group, 8);
            byte[] word = {(byte) (value >> 8), (byte) value};
            return value < 0 ? null : isWord ? word : new byte[] {(byte) value};
        }
    }
}
