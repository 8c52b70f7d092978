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

    private final Held held;
    private final String sentence;

    /** The result code with its name; null where there is none, as for a push header. */
    private final String code;

    /** What is refused, counted from the start of the body; -1 in the push header. */
    private final int bodyOffset;

    /** What is refused, counted from the start of the message. */
    private final int offset;

    private final String path;
    private final List<String> expected;

    /** Why a message is refused that cannot be read, or is not taken by the library. */
    Refusal(Reading reading) {
        ProvisioningException failure = reading.failure;
        Verdict verdict = reading.verdict;
        boolean isHeaderRefused = verdict.isHeaderRefused();
        boolean isLibrarys =
                failure == null || verdict.offset() == failure.offset() && !isHeaderRefused;
        boolean isHeader = isLibrarys ? isHeaderRefused : failure.reason() == Reason.NO_PUSH_HEADER;
        int place = isLibrarys ? verdict.offset() : failure.offset();
        held = reading.held;
        sentence = failure == null ? verdict.reason() : failure.getMessage();
        code = isLibrarys && verdict.code() != 0 ? verdict.code() + " " + verdict.codeName() : null;
        bodyOffset = isHeader ? -1 : place;
        offset = isHeader ? place : reading.bodyAt() + place;
        path = isHeader ? "push header" : isLibrarys ? verdict.path() : failure.path();
        expected = isLibrarys ? verdict.expected() : failure.expected();
    }

    /** Writes it behind {@code start}, such as the name of the file. */
    String write(String start, Palette palette) {
        StringBuilder out = new StringBuilder();
        String text = start + "refused: " + Visible.of(sentence);
        List<String> lines = Lines.of(text, Lines.WIDTH - INDENT.length());
        String first = lines.get(0);
        int painted = first.startsWith(start) ? start.length() : 0;
        out.append(first, 0, painted).append(palette.error(first.substring(painted))).append('\n');
        for (String line : lines.subList(1, lines.size())) {
            out.append(INDENT).append(palette.error(line)).append('\n');
        }
        out.append(Lines.paragraph(INDENT, Visible.of(place())));
        if (held.bytes.length > 0) {
            bytes(out, palette);
        }
        if (!expected.isEmpty()) {
            String accepted = "Accepted here: " + String.join(", ", expected) + ".";
            out.append(Lines.paragraph(INDENT, Visible.of(accepted)));
        }
        return out.toString();
    }

    private String place() {
        List<String> parts = new ArrayList<>();
        if (code != null) {
            parts.add(code);
        }
        if (bodyOffset >= 0) {
            parts.add(String.format("body offset %d (0x%X)", bodyOffset, bodyOffset));
        }
        if (held.isPush) {
            parts.add(String.format("message offset %d (0x%X)", offset, offset));
        }
        if (path != null && !path.isEmpty()) {
            parts.add("in " + path);
        }
        return String.join(", ", parts) + ".";
    }

    /** The bytes around, and a mark below the first that is refused. */
    private void bytes(StringBuilder out, Palette palette) {
        int from = Math.max(offset - AROUND, 0);
        int to = Math.min(offset + AROUND, held.bytes.length);
        String start = INDENT + INDENT + Listing.hexadecimal(from, 4) + "  ";
        String bytes = HexText.digits(held.bytes, from, to, " ");
        out.append(palette.dim(start)).append(bytes).append('\n');
        Listing.pad(out, "", start.length() + (offset - from) * 3);
        out.append(palette.error("^^")).append('\n');
    }
}
