package com.qvomacp.cli;

import java.util.Collections;
import java.util.List;

/**
 * Writes every byte of a message with what it means: its offset in the message and in the body, the
 * bytes, the meaning, indented as the elements nest. No line is wider than a terminal.
 */
final class Listing {
    private static final int BYTES_PER_LINE = 8;
    private static final int BYTES_WIDTH = BYTES_PER_LINE * 3 - 1;
    private static final int INDENT = 2;

    /** Deeper elements are indented no further. */
    private static final int DEEPEST = 8;

    private final StringBuilder out = new StringBuilder();

    private final byte[] message;
    private final Palette palette;
    private final String offset;
    private final int width;

    /** The offset in the message and that in the body. */
    private final boolean hasTwoOffsets;

    private Listing(Annotation annotation, Palette palette) {
        this.message = annotation.message;
        this.hasTwoOffsets = annotation.header != null;
        this.palette = palette;
        int digits = message.length > 0x10000 ? 6 : 4;
        this.offset = "%0" + digits + "X";
        this.width = digits;
    }

    static String write(Annotation annotation, Palette palette) {
        Listing listing = new Listing(annotation, palette);
        listing.title();
        if (annotation.header != null) {
            listing.section(annotation.header, 0, false);
        }
        if (annotation.body != null) {
            listing.section(annotation.body, annotation.bodyAt(), annotation.header != null);
        }
        return listing.out.toString();
    }

    private void title() {
        StringBuilder title = new StringBuilder();
        pad(title, hasTwoOffsets ? "msg" : "body", width + 1);
        pad(title, hasTwoOffsets ? "body" : "", hasTwoOffsets ? width + 2 : 1);
        pad(title, "bytes", BYTES_WIDTH + 2);
        out.append(palette.bold(title + "meaning")).append('\n');
    }

    private void section(Annotation.Section section, int start, boolean isBody) {
        for (Note note : section.notes) {
            note(note, start, isBody);
        }
    }

    private void note(Note note, int start, boolean isBody) {
        int column = width + 1 + (hasTwoOffsets ? width + 2 : 1) + BYTES_WIDTH + 2;
        int indent = Math.min(note.depth, DEEPEST) * INDENT;
        List<String> texts = Lines.of(note.text, Lines.WIDTH - column - indent);
        int rows = Math.max((note.length + BYTES_PER_LINE - 1) / BYTES_PER_LINE, texts.size());
        for (int row = 0; row < rows; ++row) {
            int from = note.offset + row * BYTES_PER_LINE;
            int to = Math.min(from + BYTES_PER_LINE, note.offset + note.length);
            StringBuilder line = new StringBuilder();
            StringBuilder offsets = new StringBuilder();
            boolean hasBytes = from < to;
            pad(offsets, hasBytes ? String.format(offset, start + from) : "", width + 1);
            if (hasTwoOffsets) {
                pad(offsets, hasBytes && isBody ? String.format(offset, from) : "", width + 2);
            } else {
                offsets.append(' ');
            }
            line.append(palette.dim(offsets.toString()));
            pad(line, hexadecimal(message, start + from, start + to), BYTES_WIDTH + 2, line.length());
            String text = row < texts.size() ? texts.get(row) : "";
            if (text.isEmpty() && note.style == Note.Style.UNREAD) {
                text = characters(message, start + from, start + to);
            }
            if (!text.isEmpty()) {
                pad(line, "", indent, line.length());
                line.append(palette.of(note.style, text));
            }
            out.append(trimmed(line)).append('\n');
        }
    }

    private static String trimmed(StringBuilder line) {
        int end = line.length();
        while (end > 0 && line.charAt(end - 1) == ' ') {
            --end;
        }
        return line.substring(0, end);
    }

    /** Bytes that were not read, as characters where they are ones of ASCII. */
    private static String characters(byte[] bytes, int from, int to) {
        StringBuilder text = new StringBuilder("|");
        for (int i = from; i < to; ++i) {
            text.append(bytes[i] >= ' ' && bytes[i] <= '~' ? (char) bytes[i] : '.');
        }
        return text.append('|').toString();
    }

    static String hexadecimal(byte[] bytes, int from, int to) {
        StringBuilder text = new StringBuilder();
        for (int i = from; i < to; ++i) {
            text.append(i == from ? "" : " ").append(String.format("%02X", bytes[i]));
        }
        return text.toString();
    }

    private static void pad(StringBuilder to, String text, int width) {
        pad(to, text, width, to.length());
    }

    /** Appends text and blanks, so that {@code width} columns are used behind {@code start}. */
    private static void pad(StringBuilder to, String text, int width, int start) {
        to.append(text);
        int missing = start + width - to.length();
        to.append(String.join("", Collections.nCopies(Math.max(missing, 0), " ")));
    }
}
