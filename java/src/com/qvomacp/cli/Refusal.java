package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.eng.omacp.Verdict;
import java.util.ArrayList;
import java.util.List;

/** Says why a message is refused, as a compiler would. */
final class Refusal {
    private static final int AROUND = 8;
    private static final String INDENT = "  ";

    private final Reading reading;

    /** Whether the library refuses it too, at the same place, and so tells more. */
    private final boolean isLibrarys;

    private final boolean isHeader;

    /** What is refused, counted from the start of the body, or of the message in a header. */
    private final int place;

    /** What is refused, counted from the start of the message. */
    private final int offset;

    /** Why a message is refused that cannot be read, or is not taken by the library. */
    Refusal(Reading reading) {
        this.reading = reading;
        ProvisioningException failure = reading.failure;
        Verdict verdict = reading.verdict;
        boolean isHeaderRefused = verdict.isHeaderRefused();
        isLibrarys = failure == null || verdict.offset() == failure.offset() && !isHeaderRefused;
        isHeader = isLibrarys ? isHeaderRefused : failure.reason() == Reason.NO_PUSH_HEADER;
        place = isLibrarys ? verdict.offset() : failure.offset();
        offset = isHeader ? place : reading.bodyAt() + place;
    }

    /** Writes it behind {@code start}, such as the name of the file. */
    String write(String start, Palette palette) {
        StringBuilder out = new StringBuilder();
        ProvisioningException failure = reading.failure;
        String sentence = failure == null ? reading.verdict.reason() : failure.getMessage();
        String text = start + "refused: " + Visible.of(sentence);
        List<String> lines = Lines.of(text, Lines.WIDTH - INDENT.length());
        String first = lines.get(0);
        int painted = first.startsWith(start) ? start.length() : 0;
        out.append(first, 0, painted).append(palette.error(first.substring(painted))).append('\n');
        for (String line : lines.subList(1, lines.size())) {
            out.append(INDENT).append(palette.error(line)).append('\n');
        }
        out.append(Lines.paragraph(INDENT, Visible.of(place())));
        if (reading.held.bytes.length > 0) {
            bytes(out, reading.held.bytes, palette);
        }
        List<String> expected = isLibrarys ? reading.verdict.expected() : failure.expected();
        if (!expected.isEmpty()) {
            String accepted = "Accepted here: " + String.join(", ", expected) + ".";
            out.append(Lines.paragraph(INDENT, Visible.of(accepted)));
        }
        return out.toString();
    }

    private String place() {
        Verdict verdict = reading.verdict;
        List<String> parts = new ArrayList<>();
        if (isLibrarys && verdict.code() != 0) {
            parts.add(verdict.code() + " " + verdict.codeName());
        }
        if (!isHeader && place >= 0) {
            parts.add(String.format("body offset %d (0x%X)", place, place));
        }
        if (reading.held.isPush) {
            parts.add(String.format("message offset %d (0x%X)", offset, offset));
        }
        String path = isLibrarys ? verdict.path() : reading.failure.path();
        if (isHeader || path != null && !path.isEmpty()) {
            parts.add("in " + (isHeader ? "push header" : path));
        }
        return String.join(", ", parts) + ".";
    }

    /** The bytes around, and a mark below the first that is refused. */
    private void bytes(StringBuilder out, byte[] message, Palette palette) {
        int from = Math.max(offset - AROUND, 0);
        int to = Math.min(offset + AROUND, message.length);
        String start = INDENT + INDENT + Listing.hexadecimal(from, 4) + "  ";
        String bytes = HexText.digits(message, from, to, " ");
        out.append(palette.dim(start)).append(bytes).append('\n');
        out.append(Lines.blanks(start.length() + (offset - from) * 3));
        out.append(palette.error("^^")).append('\n');
    }
}
