package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.ContentType;
import com.qvomacp.eng.omacp.Deviation;
import com.qvomacp.eng.omacp.HeaderField;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Other;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.PushHeader;
import java.io.PrintWriter;
import java.util.ArrayList;
import java.util.List;

/**
 * Writes a message for people: its items in their order, indented as they nest, the values of a
 * characteristic in a column.
 */
final class TextWriter {
    static final int HEADER_COLUMN = 16;

    /** Deeper items are indented no further. */
    static final int DEEPEST = 16;

    /** A wider name has its value two columns behind it. */
    private static final int WIDEST = 32;

    private static final int DEVIATIONS = 8;

    private final PrintWriter out;
    private final Palette palette;

    TextWriter(PrintWriter out, Palette palette) {
        this.out = out;
        this.palette = palette;
    }

    /** Writes what the push header says; null for a body alone. */
    void header(PushHeader header, int bodyLength) {
        if (header == null) {
            fact("Body length", bodyLength + " bytes, without a push header");
            return;
        }
        ContentType type = header.contentType();
        String code = type.code() < 0 ? "" : " (" + type.code() + ")";
        fact("Content type", type.mediaType() + code);
        fact("Header length", header.length() + " bytes");
        fact("Body length", bodyLength + " bytes");
        List<HeaderField> fields = new ArrayList<>(type.parameters());
        fields.addAll(header.fields());
        for (HeaderField field : fields) {
            fact(field.name(), field.value());
        }
    }

    private void fact(String name, String value) {
        line(0, HEADER_COLUMN, name, shown(value));
    }

    void document(ProvisioningDocument document) {
        // Where the values stand, by depth as far as items are indented.
        int[] columns = new int[DEEPEST + 1];
        columns[0] = column(document.children());
        new Walk() {
            private boolean wasCharacteristic = true;

            @Override
            void enter(Item item, int depth) {
                boolean isCharacteristic = item instanceof Characteristic;
                if (depth == 0) {
                    out.append(isCharacteristic || wasCharacteristic ? "\n" : "");
                    wasCharacteristic = isCharacteristic;
                }
                int nesting = Math.min(depth, DEEPEST);
                int indent = nesting * Lines.INDENT;
                String name = name(item);
                String value = shown(value(item));
                if (name == null) {
                    row(indent, palette.error(title(item)), Lines.INDENT, value);
                } else {
                    line(indent, columns[nesting], name, value);
                }
                if (!item.children().isEmpty()) {
                    columns[Math.min(depth + 1, DEEPEST)] = column(item.children());
                }
            }
        }.through(document.children());
        deviations(document.deviations());
    }

    /** The column in which the values stand. */
    static int column(List<Item> items) {
        int column = 0;
        for (Item item : items) {
            if (item instanceof Parameter) {
                String name = ((Parameter) item).name();
                int width = name == null ? 0 : Visible.columns(name);
                column = Math.max(column, width <= WIDEST ? width + Lines.INDENT : 0);
            }
        }
        return column;
    }

    /** The type of a characteristic or the name of a parameter; null for none. */
    private static String name(Item item) {
        return item instanceof Characteristic ? ((Characteristic) item).type()
                : item instanceof Parameter ? ((Parameter) item).name() : null;
    }

    /** The value of a parameter; null for none. */
    static String value(Item item) {
        return item instanceof Parameter ? ((Parameter) item).value() : null;
    }

    /** What an item is called; where it has no name, what it is. */
    static String title(Item item) {
        String name = name(item);
        boolean isOther = item instanceof Other;
        String what = isOther ? describe((Other) item) : unnamed(item instanceof Parameter);
        return name == null ? what : Visible.of(name);
    }

    private static String unnamed(boolean isParameter) {
        return isParameter ? "(no NAME)" : "(no TYPE)";
    }

    private static String describe(Other other) {
        boolean isTrailing = other.kind() == Other.Kind.TRAILING;
        StringBuilder text = new StringBuilder("(");
        String kind = MessageJson.lowerCase(other.kind());
        text.append(isTrailing ? other.length() + " bytes behind the document" : kind);
        if (other.name() != null) {
            text.append(' ').append(Visible.of(other.name()));
        }
        if (other.text() != null) {
            text.append(' ').append(Visible.quoted(other.text()));
        }
        return text.append(')').toString();
    }

    private void deviations(List<Deviation> deviations) {
        if (deviations.isEmpty()) {
            return;
        }
        out.append('\n').append(palette.bold("Departs from the format:")).append('\n');
        for (Deviation deviation : deviations.subList(0, Math.min(DEVIATIONS, deviations.size()))) {
            String path = deviation.path().isEmpty() ? "" : ", " + deviation.path();
            String text = deviation.sentence() + " (body offset " + deviation.offset() + path + ")";
            out.append(Lines.paragraph("- ", Visible.of(text)));
        }
        if (deviations.size() > DEVIATIONS) {
            int more = deviations.size() - DEVIATIONS;
            out.append("- and " + more + " more, which --json lists\n");
        }
    }

    /** Writes what the library answers, with a mark in front of what the message belies. */
    void answers(Comparison comparison) {
        boolean isAnswered = comparison.unanswered == null;
        String title = "The native library answers" + (isAnswered ? "" : " nothing");
        out.append('\n').append(palette.bold(title));
        if (isAnswered) {
            out.append(" (! otherwise than the message says, - not at all):\n");
            answers(comparison.answers, 0, 0);
        } else {
            out.append(": " + comparison.unanswered + ".\n");
        }
    }

    private void answers(List<Answer> answers, int depth, int column) {
        for (Answer answer : answers) {
            boolean isParameter = answer.children == null;
            boolean isOtherwise = isParameter && answer.isAnswered && !answer.isSame();
            String mark = isOtherwise ? "!" : answer.isAnswered ? "" : "-";
            String name = answer.name == null ? unnamed(isParameter) : answer.name;
            out.append(depth == 0 && !isParameter ? "\n" : "");
            out.append(mark.isEmpty() ? " " : palette.error(mark)).append(' ');
            line(depth * Lines.INDENT, column, name, isParameter ? shown(answer) : null);
            if (!isParameter) {
                answers(answer.children, depth + 1, answer.column);
            }
        }
    }

    private static String shown(Answer answer) {
        if (!answer.isAnswered) {
            return shown(answer.said);
        }
        String shown = answer.value == null ? "(none)" : Visible.value(answer.value);
        String says = answer.said == null ? "the message gives no value"
                : "the message says " + Visible.quoted(answer.said);
        String instead = answer.isSaid ? says : "the message does not say it";
        return answer.isSame() ? shown : shown + "  (" + instead + ")";
    }

    /** Writes a name, and in its column the value as it is shown; null for none. */
    void line(int indent, int column, String name, String shown) {
        String shownName = Visible.of(name);
        int gap = shown == null ? 0 : Math.max(column - Visible.columns(shownName), Lines.INDENT);
        row(indent, shownName, gap, shown);
    }

    private void row(int indent, String name, int gap, String shown) {
        String value = shown == null ? "" : Lines.blanks(gap) + shown;
        out.append(Lines.blanks(indent) + name + value + '\n');
    }

    private static String shown(String value) {
        return value == null ? null : Visible.value(value);
    }
}
