package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ByteVisitor;
import com.qvomacp.eng.omacp.Deviation;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.eng.omacp.ReadOptions;
import com.qvomacp.eng.omacp.Verdict;
import java.io.PrintWriter;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.HashMap;
import java.util.Iterator;
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
    private static final int INDENT = 2;

    /** Deeper elements are indented no further. */
    private static final int DEEPEST = 8;

    /** Characters of a meaning that are shown. */
    private static final int LONGEST = 160;

    private static final String UNREAD = "not read";

    private final PrintWriter out;
    private final Palette palette;
    private final byte[] message;
    private final int bodyAt;
    private final int digits;

    /** Whether a push header stands in front of the body. */
    private final boolean hasTwoOffsets;

    /** Where what is told begins: the offsets of a header or of a body. */
    private int start;

    private boolean isBody;

    /** Up to where bytes have been told, counted from {@link #start}. */
    private int told;

    private int depth;

    /** What the library reads otherwise: where, and what; and how much of it has been said. */
    private int[] otherwiseAt = {};

    private final List<String> otherwise = new ArrayList<>();
    private int saidOtherwise;

    /** The departures from the format that are still to be said; null behind the last. */
    private Iterator<Deviation> deviations = Collections.emptyIterator();

    private Deviation nextDeviation;

    /** Where the library stops, counted from {@link #start}; -1 where it does not. */
    private int stop = -1;

    private String stopReason;

    private Listing(PrintWriter out, Palette palette, Reading reading) {
        this.out = out;
        this.palette = palette;
        this.message = reading.held.bytes;
        this.bodyAt = reading.bodyAt();
        this.hasTwoOffsets = reading.header != null;
        this.digits = message.length > 0x10000 ? 6 : 4;
    }

    static void write(PrintWriter out, Palette palette, Reading reading) {
        Listing listing = new Listing(out, palette, reading);
        listing.title(reading.held.isPush);
        Verdict verdict = reading.verdict;
        boolean isRefused = !verdict.isAccepted();
        if (reading.header != null) {
            if (isRefused && verdict.isHeaderRefused()) {
                listing.stopsAt(verdict);
            }
            reading.header.describe(listing);
            listing.end(reading.bodyAt());
        }
        listing.start = reading.bodyAt();
        listing.isBody = reading.header != null || !reading.held.isPush;
        listing.told = 0;
        boolean isTooMuch =
                reading.failure != null && reading.failure.reason() == Reason.TEXT_TOO_LONG;
        if (isRefused && !verdict.isHeaderRefused() && (isTooMuch || reading.document != null)) {
            listing.stopsAt(verdict);
        }
        if (reading.document != null) {
            listing.compare(verdict);
            listing.deviations = reading.document.deviations().iterator();
            listing.nextDeviation();
            reading.document.describe(listing);
        } else if (isTooMuch) {
            listing.describe();
        }
        listing.end(reading.held.bytes.length - listing.start);
    }

    /** Describes a body with too much text for a document, up to where it is too much. */
    private void describe() {
        byte[] body = Arrays.copyOfRange(message, start, message.length);
        try {
            ProvisioningDocument.describe(
                    body, ReadOptions.DEFAULT.withInputLimit(body.length), this);
        } catch (ProvisioningException tooMuch) {
            // What is left is told as not read.
        }
    }

    private void compare(Verdict verdict) {
        Map<String, String> once = new HashMap<>();
        verdict.describeOtherwise(
                (offset, length, depth, meaning) -> {
                    if (otherwise.size() == otherwiseAt.length) {
                        otherwiseAt = Arrays.copyOf(otherwiseAt, 2 * otherwise.size() + 1);
                    }
                    otherwiseAt[otherwise.size()] = offset;
                    once.putIfAbsent(meaning, meaning);
                    otherwise.add(once.get(meaning));
                });
    }

    private void stopsAt(Verdict verdict) {
        stop = verdict.offset();
        stopReason = "the library refuses: " + verdict.reason();
    }

    private void nextDeviation() {
        nextDeviation = deviations.hasNext() ? deviations.next() : null;
    }

    private void title(boolean isPush) {
        StringBuilder title = new StringBuilder();
        pad(title, hasTwoOffsets ? "msg" : isPush ? "at" : "body", digits + 1);
        pad(title, hasTwoOffsets ? "body" : "", hasTwoOffsets ? digits + 2 : 1);
        pad(title, "bytes", BYTES_WIDTH + 2);
        out.append(palette.bold(title + "meaning")).append('\n');
    }

    @Override
    public void visit(int offset, int length, int nesting, String meaning) {
        depth = nesting;
        while (nextDeviation != null && nextDeviation.offset() < offset + length) {
            row(offset, 0, "departs from the format: " + nextDeviation.sentence());
            nextDeviation();
        }
        row(offset, length, meaning);
        told = offset + length;
        while (saidOtherwise < otherwise.size() && otherwiseAt[saidOtherwise] < told) {
            row(offset, 0, otherwise.get(saidOtherwise++));
        }
        if (stop >= 0 && stop < told) {
            refused();
        }
    }

    /** Tells what is left up to the end. */
    private void end(int end) {
        if (told < end) {
            visit(told, end - told, 0, UNREAD);
        }
        if (stop >= 0) {
            refused();
        }
    }

    private void refused() {
        stop = -1;
        row(told, 0, stopReason);
    }

    private void row(int offset, int length, String meaning) {
        int column = digits + 1 + (hasTwoOffsets ? digits + 2 : 1) + BYTES_WIDTH + 2;
        int indent = Math.min(depth, DEEPEST) * INDENT;
        List<String> texts = Lines.of(shown(meaning), Lines.WIDTH - column - indent);
        int lines = Math.max((length + BYTES_PER_LINE - 1) / BYTES_PER_LINE, texts.size());
        boolean isUnread = meaning.equals(UNREAD);
        for (int i = 0; i < lines; ++i) {
            int from = offset + Math.min(i * BYTES_PER_LINE, length);
            int to = Math.min(from + BYTES_PER_LINE, offset + length);
            String text = i < texts.size() ? texts.get(i) : "";
            if (i > 0 && isUnread) {
                text = characters(from, to);
            }
            line(from, to, indent, length == 0 ? palette.error(text) : painted(meaning, text));
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

    private static String shown(String meaning) {
        boolean isLong = meaning.length() > LONGEST;
        return isLong ? Visible.of(meaning.substring(0, LONGEST)) + "..." : Visible.of(meaning);
    }

    private String painted(String meaning, String text) {
        return meaning.indexOf('"') >= 0 ? palette.text(text) : text;
    }

    private void line(int from, int to, int indent, String text) {
        StringBuilder offsets = new StringBuilder();
        boolean hasBytes = from < to;
        pad(offsets, hasBytes ? hexadecimal(start + from, digits) : "", digits + 1);
        if (hasTwoOffsets) {
            pad(offsets, hasBytes && isBody ? hexadecimal(from, digits) : "", digits + 2);
        } else {
            offsets.append(' ');
        }
        StringBuilder line = new StringBuilder();
        pad(line, HexText.digits(message, start + from, start + to, " "), BYTES_WIDTH + 2);
        if (text.isEmpty()) {
            line.setLength(Math.max(3 * (to - from) - 1, 0));
        } else {
            pad(line, "", indent);
            line.append(text);
        }
        out.append(palette.dim(offsets.toString())).append(line).append('\n');
    }

    /** A number with at least so many digits. */
    static String hexadecimal(int number, int atLeast) {
        StringBuilder text = new StringBuilder(Integer.toHexString(number).toUpperCase());
        while (text.length() < atLeast) {
            text.insert(0, '0');
        }
        return text.toString();
    }

    /** Appends a text, and blanks until it is so wide. */
    static void pad(StringBuilder to, String text, int width) {
        to.append(text);
        for (int i = text.length(); i < width; ++i) {
            to.append(' ');
        }
    }
}
