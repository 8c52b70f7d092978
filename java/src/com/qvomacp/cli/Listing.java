package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ByteVisitor;
import com.qvomacp.eng.omacp.Deviation;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.eng.omacp.ReadOptions;
import com.qvomacp.eng.omacp.Verdict;
import java.io.PrintWriter;
import java.util.ArrayDeque;
import java.util.Arrays;
import java.util.Deque;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/**
 * Writes every byte of a message with what it means: its offset in the message and in the body, the
 * bytes, the meaning, indented as the elements nest. Where the library reads otherwise, that stands
 * below the bytes. No line is wider than a terminal.
 */
final class Listing implements ByteVisitor {
    private static final int BYTES_PER_LINE = 8;
    private static final int BYTES_WIDTH = BYTES_PER_LINE * 3 - 1;
    /** Deeper elements are indented no further. */
    private static final int DEEPEST = 8;

    /** Characters of a meaning that are shown. */
    private static final int LONGEST = 160;

    private static final String UNREAD = "not read";

    private final PrintWriter out;
    private final Palette palette;
    private final byte[] message;
    private final int digits;

    /** How wide the offsets in the body are; 1 where no header makes them others. */
    private final int secondWidth;

    /** Where what is told begins: the offsets of a header or of a body. */
    private int start;

    private boolean isBody;

    /** Up to where bytes have been told, counted from {@link #start}. */
    private int told;

    private int depth;

    /** What the library reads otherwise and is still to be said: where, and what. */
    private final Deque<Integer> otherwiseAt = new ArrayDeque<>();

    private final Deque<String> otherwise = new ArrayDeque<>();

    /** The departures from the format that are still to be said. */
    private final Deque<Deviation> deviations = new ArrayDeque<>();

    /** Where the library stops, counted from {@link #start}; -1 where it does not. */
    private int stop = -1;

    private String stopReason;

    private Listing(PrintWriter out, Palette palette, Reading reading) {
        this.out = out;
        this.palette = palette;
        this.message = reading.held.bytes;
        this.digits = message.length > 0x10000 ? 6 : 4;
        this.secondWidth = reading.header == null ? 1 : digits + 2;
    }

    static void write(PrintWriter out, Palette palette, Reading reading) {
        Listing listing = new Listing(out, palette, reading);
        boolean hasHeader = reading.header != null;
        boolean isPush = reading.held.isPush;
        String first = hasHeader ? "msg" : isPush ? "at" : "body";
        String titles = listing.offsets(first, hasHeader ? "body" : "");
        String bytes = Lines.padded("bytes", BYTES_WIDTH + 2);
        out.append(palette.bold(titles + bytes + "meaning")).append('\n');
        Verdict verdict = reading.verdict;
        listing.stopReason = "the library refuses: " + verdict.reason();
        int stop = verdict.isAccepted() ? -1 : verdict.offset();
        if (hasHeader) {
            listing.stop = verdict.isHeaderRefused() ? stop : -1;
            reading.header.describe(listing);
            listing.end(reading.bodyAt());
        }
        listing.start = reading.bodyAt();
        listing.isBody = hasHeader || !isPush;
        listing.told = 0;
        boolean isRead = reading.document != null;
        boolean isTooMuch = !isRead && reading.failure.reason() == Reason.TEXT_TOO_LONG;
        listing.stop = !verdict.isHeaderRefused() && (isTooMuch || isRead) ? stop : -1;
        if (isRead) {
            listing.compare(verdict);
            listing.deviations.addAll(reading.document.deviations());
            reading.document.describe(listing);
        } else if (isTooMuch) {
            listing.describe();
        }
        listing.end(reading.held.bytes.length - listing.start);
    }

    /** Describes a body with too much text for a document, up to where it is too much. */
    private void describe() {
        byte[] body = Arrays.copyOfRange(message, start, message.length);
        ReadOptions options = ReadOptions.DEFAULT.withInputLimit(body.length);
        try {
            ProvisioningDocument.describe(body, options, this);
        } catch (ProvisioningException tooMuch) {
            // What is left is told as not read.
        }
    }

    private void compare(Verdict verdict) {
        Map<String, String> once = new HashMap<>();
        verdict.describeOtherwise((offset, length, depth, meaning) -> {
            otherwiseAt.add(offset);
            once.putIfAbsent(meaning, meaning);
            otherwise.add(once.get(meaning));
        });
    }

    @Override
    public void visit(int offset, int length, int nesting, String meaning) {
        depth = nesting;
        while (!deviations.isEmpty() && deviations.peek().offset() < offset + length) {
            row(offset, 0, "departs from the format: " + deviations.poll().sentence());
        }
        row(offset, length, meaning);
        told = offset + length;
        while (!otherwiseAt.isEmpty() && otherwiseAt.peek() < told) {
            otherwiseAt.poll();
            row(offset, 0, otherwise.poll());
        }
        if (stop >= 0 && stop < told) {
            row(told, 0, stopReason);
            stop = -1;
        }
    }

    /** Tells what is left up to the end. */
    private void end(int end) {
        if (told < end) {
            visit(told, end - told, 0, UNREAD);
        }
        if (stop >= 0) {
            row(told, 0, stopReason);
        }
    }

    private void row(int offset, int length, String meaning) {
        int column = digits + 1 + secondWidth + BYTES_WIDTH + 2;
        int indent = Math.min(depth, DEEPEST) * Lines.INDENT;
        String begin = meaning.substring(0, Math.min(meaning.length(), LONGEST));
        String shown = Visible.of(begin) + (meaning.length() > LONGEST ? "..." : "");
        List<String> texts = Lines.of(shown, Lines.WIDTH - column - indent);
        int lines = Math.max((length + BYTES_PER_LINE - 1) / BYTES_PER_LINE, texts.size());
        boolean isUnread = meaning.equals(UNREAD);
        for (int i = 0; i < lines; ++i) {
            int from = offset + Math.min(i * BYTES_PER_LINE, length);
            int to = Math.min(from + BYTES_PER_LINE, offset + length);
            String text = i < texts.size() ? texts.get(i) : "";
            text = i > 0 && isUnread ? characters(from, to) : text;
            boolean isText = meaning.indexOf('"') >= 0;
            text = length == 0 ? palette.error(text) : isText ? palette.text(text) : text;
            line(from, to, indent, text);
        }
    }

    /** Bytes that were not read, as characters where they are ones of ASCII. */
    private String characters(int from, int to) {
        StringBuilder text = new StringBuilder("|");
        for (int i = start + from; i < start + to; ++i) {
            text.append(message[i] >= ' ' && message[i] <= '~' ? (char) message[i] : '.');
        }
        return text.append('|').toString();
    }

    private void line(int from, int to, int indent, String text) {
        boolean hasBytes = from < to;
        String first = hasBytes ? hexadecimal(start + from, digits) : "";
        boolean hasTwo = hasBytes && isBody && secondWidth > 1;
        String offsets = offsets(first, hasTwo ? hexadecimal(from, digits) : "");
        String bytes = HexText.digits(message, start + from, start + to, " ");
        String line = text.isEmpty() ? bytes : Lines.padded(bytes, BYTES_WIDTH + 2 + indent) + text;
        out.append(palette.dim(offsets)).append(line).append('\n');
    }

    /** The columns in front of the bytes. */
    private String offsets(String first, String second) {
        return Lines.padded(first, digits + 1) + Lines.padded(second, secondWidth);
    }

    /** A number with at least so many digits, up to eight. */
    static String hexadecimal(int number, int atLeast) {
        String text = Integer.toHexString(number).toUpperCase();
        return "00000000".substring(0, Math.max(atLeast - text.length(), 0)) + text;
    }
}
