package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.Arrays;
import java.util.List;

/**
 * Reads a dump with a column of offsets, as hexdump, xxd, od and others print it. The offsets say
 * how many bytes a line has, so that a column of characters behind them is never taken for bytes.
 */
final class HexDump {
    private static final int[] RADIXES = {16, 8, 10};
    private static final int LONGEST_LINE = 256;
    private static final int HALF_LINE = 8;

    /** How many digits od and hexdump write for a byte and for a word of two, in octal. */
    private static final int OCTAL_BYTE = 3;

    private static final int OCTAL_WORD = 6;

    /** The bytes of the dump. */
    final byte[] bytes;

    /** The line behind it. */
    final int next;

    private HexDump(byte[] bytes, int next) {
        this.bytes = bytes;
        this.next = next;
    }

    /** Reads the dump that begins at a line; null when none does. */
    static HexDump at(List<String> lines, int first, Repeats repeats) {
        Row row = new Row(lines.get(first));
        if (row.offset(16) != 0 || row.digits < 4) {
            return null;
        }
        for (int radix : RADIXES) {
            HexDump dump = read(lines, first, radix, repeats);
            if (dump != null) {
                return dump;
            }
        }
        return null;
    }

    private static HexDump read(
            List<String> lines, int first, int radix, Repeats repeats) {
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
            byte[] read = isKnown ? row.read((int) (end - offset)) : row.readToGap(last.length);
            if (read == null) {
                return null;
            }
            bytes.write(read, 0, read.length);
            last = read.length > 0 ? read : last;
        }
        return bytes.size() == 0 || isRepeated ? null : new HexDump(bytes.toByteArray(), index);
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
        private int offsetEnd;
        private int at;

        /** How many digits the offset has. */
        final int digits;

        private boolean hasColon;

        Row(String text) {
            line = text.trim();
            offsetAt = line.startsWith("0x") || line.startsWith("0X") ? 2 : 0;
            offsetEnd = offsetAt;
            while (offsetEnd < line.length() && Character.digit(line.charAt(offsetEnd), 16) >= 0) {
                ++offsetEnd;
            }
            digits = offsetEnd - offsetAt;
            hasColon = offsetEnd < line.length() && line.charAt(offsetEnd) == ':';
            at = offsetEnd + (hasColon ? 1 : 0);
        }

        /** The offset; -1 when the line does not begin with one. */
        long offset(int radix) {
            boolean isAlone = at == line.length() || Character.isWhitespace(line.charAt(at));
            if (digits == 0 || digits > 12 || !isAlone) {
                return -1;
            }
            try {
                return Long.parseLong(line.substring(offsetAt, offsetEnd), radix);
            } catch (NumberFormatException other) {
                return -1;
            }
        }

        /** Reads so many bytes; null when the line has fewer, or goes on with more. */
        byte[] read(int count) {
            ByteArrayOutputStream bytes = new ByteArrayOutputStream();
            while (bytes.size() < count) {
                byte[] group = group();
                if (group == null) {
                    return null;
                }
                bytes.write(group, 0, group.length);
            }
            boolean isLonger = gap() == 1 && group() != null;
            return isLonger ? null : Arrays.copyOf(bytes.toByteArray(), count);
        }

        /**
         * Reads the bytes of the last line: up to a bar, a gap or what is no group, and no more
         * than the lines before have. Eight bytes may be followed by a gap of two blanks.
         */
        byte[] readToGap(int width) {
            ByteArrayOutputStream bytes = new ByteArrayOutputStream();
            int most = width == 0 ? LONGEST_LINE : width;
            boolean hasBar = line.indexOf('|', at) >= 0;
            while (bytes.size() < most) {
                int gap = gap();
                boolean isHalf = gap == 2 && bytes.size() == HALF_LINE && isPair(at + gap);
                if (bytes.size() > 0 && gap > 1 && !hasBar && !isHalf) {
                    break;
                }
                byte[] group = group();
                if (group == null) {
                    break;
                }
                bytes.write(group, 0, group.length);
            }
            byte[] read = bytes.toByteArray();
            return read.length > most ? Arrays.copyOf(read, most) : read;
        }

        private int gap() {
            int blank = at;
            while (blank < line.length() && Character.isWhitespace(line.charAt(blank))) {
                ++blank;
            }
            return blank - at;
        }

        private boolean isPair(int from) {
            return from + 1 < line.length()
                    && Character.digit(line.charAt(from), 16) >= 0
                    && Character.digit(line.charAt(from + 1), 16) >= 0
                    && (from + 2 == line.length()
                            || Character.isWhitespace(line.charAt(from + 2)));
        }

        /** The next group of digits; null when there is none. */
        private byte[] group() {
            int from = at + gap();
            int end = from;
            while (end < line.length() && Character.digit(line.charAt(end), 16) >= 0) {
                ++end;
            }
            boolean isAlone = end == line.length() || Character.isWhitespace(line.charAt(end));
            byte[] bytes = isAlone ? number(line.substring(from, end)) : null;
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

        /**
         * The bytes of a group, the highest first; null when it has not as many digits as it must.
         */
        private byte[] number(String group) {
            boolean isWord = group.length() == OCTAL_WORD && !hasColon;
            if (group.length() != OCTAL_BYTE && !isWord) {
                return group.isEmpty() || group.length() % 2 != 0 ? null : HexText.bytes(group);
            }
            try {
                int value = Integer.parseInt(group, 8);
                return isWord
                        ? new byte[] {(byte) (value >> 8), (byte) value}
                        : new byte[] {(byte) value};
            } catch (NumberFormatException other) {
                return null;
            }
        }
    }
}
