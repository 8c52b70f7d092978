package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.List;

/**
 * Why a message is refused. Code and position are the decoder's own; what stands there and what
 * would have been accepted is the annotation's, which reads as the decoder does.
 */
final class Explanation {
    private static final int AROUND = 8;
    private static final String INDENT = "  ";

    /** Says in one line what is wrong. */
    final String reason;

    /** The library's result code; 0 where it gives none, as for a push header. */
    final int code;

    /** What would have been accepted; null when that cannot be said. */
    final String accepted;

    /** The elements around. */
    final String path;

    /** The first byte that is refused, counted from the body's first; -1 in the push header. */
    final int bodyOffset;

    /** The first byte that is refused, counted from the message's first. */
    final int messageOffset;

    final Source source;
    private final int length;
    private final String remark;

    private Explanation(
            Source source, Stop stop, int start, Verdict verdict, String remark) {
        this.source = source;
        this.remark = remark;
        this.reason = stop.getMessage();
        this.code = verdict == null ? stop.code : verdict.code;
        this.accepted = stop.accepted;
        this.path = stop.path;
        this.length = stop.length;
        this.bodyOffset = start < 0 ? -1 : stop.at;
        this.messageOffset = Math.max(start, 0) + stop.at;
    }

    static Explanation of(Source source, boolean headerTaken) {
        Annotation annotation = source.annotation();
        if (!headerTaken) {
            Stop stop = annotation.header == null ? null : annotation.header.stop;
            return new Explanation(
                    source,
                    stop == null ? unknown(0, 0, "push header") : stop,
                    -1,
                    null,
                    source.remark());
        }
        if (annotation.body == null) {
            return new Explanation(source, unknown(0, 0, "body"), 0, null, null);
        }
        Verdict verdict = Verdict.of(source.push());
        Stop stop = annotation.body.stop;
        String remark = null;
        if (verdict == null) {
            remark =
                    "This is as the program itself reads the message: libomacp_explain.so, which"
                            + " asks the library, cannot be loaded.";
            if (stop == null) {
                stop = unknown(0, 0, "body");
            }
        } else if (stop == null && verdict.code == 0) {
            stop = new Stop(0, 0, 0, "the body holds no document", "wap-provisioningdoc (0x05)");
        } else if (!agrees(annotation.body, verdict)) {
            stop = unknown(verdict.code, verdict.read, "body");
        }
        return new Explanation(source, stop, annotation.bodyAt(), verdict, remark);
    }

    /** Whether the annotation of a body stops as the decoder does. */
    static boolean agrees(Annotation.Section body, Verdict verdict) {
        return body.stop == null
                ? verdict.code == 0
                : body.stop.code == verdict.code
                        && Math.min(body.stop.read, body.length) == verdict.read;
    }

    private static Stop unknown(int code, int at, String part) {
        return new Stop(code, at, 0, "the " + part + " cannot be read", null);
    }

    boolean isHeader() {
        return bodyOffset < 0;
    }

    /** Writes it as a compiler would, behind {@code start}, such as the name of the file. */
    String write(String start, Palette palette) {
        StringBuilder out = new StringBuilder();
        List<String> lines = Lines.of(start + "refused: " + reason, Lines.WIDTH - INDENT.length());
        String first = lines.get(0);
        int painted = first.startsWith(start) ? start.length() : 0;
        out.append(first, 0, painted).append(palette.error(first.substring(painted)));
        out.append('\n');
        for (String line : lines.subList(1, lines.size())) {
            out.append(INDENT).append(palette.error(line)).append('\n');
        }
        paragraph(out, place());
        if (source.bytes.length > 0) {
            bytes(out, palette);
        }
        if (accepted != null) {
            paragraph(out, "Accepted here: " + accepted + ".");
        }
        if (remark != null) {
            paragraph(out, remark);
        }
        return out.toString();
    }

    private String place() {
        List<String> parts = new ArrayList<>();
        if (code != 0) {
            parts.add(code + " " + Vocabulary.result(code));
        }
        if (!isHeader()) {
            parts.add(String.format("body offset %d (0x%X)", bodyOffset, bodyOffset));
        }
        if (source.isPush) {
            parts.add(String.format("message offset %d (0x%X)", messageOffset, messageOffset));
        }
        if (!path.isEmpty()) {
            parts.add("in " + path);
        }
        return String.join(", ", parts) + ".";
    }

    private static void paragraph(StringBuilder out, String text) {
        for (String line : Lines.of(Visible.of(text), Lines.WIDTH - INDENT.length())) {
            out.append(INDENT).append(line).append('\n');
        }
    }

    /** The bytes around, and a mark below those that are refused. */
    private void bytes(StringBuilder out, Palette palette) {
        int from = Math.max(messageOffset - AROUND, 0);
        int to = Math.min(messageOffset + AROUND, source.bytes.length);
        String line = Listing.hexadecimal(source.bytes, from, to);
        String start = String.format(INDENT + INDENT + "%04X  ", from);
        out.append(palette.dim(start)).append(line).append('\n');
        int marked = Math.max(Math.min(length, to - messageOffset), 1);
        StringBuilder mark = new StringBuilder();
        for (int i = 0; i < start.length() + (messageOffset - from) * 3; ++i) {
            mark.append(' ');
        }
        StringBuilder carets = new StringBuilder();
        for (int i = 0; i < marked * 3 - 1; ++i) {
            carets.append('^');
        }
        out.append(mark).append(palette.error(carets.toString())).append('\n');
    }
}
