package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.io.PrintWriter;
import java.util.List;
import java.util.Objects;

/** Writes the library's answers for people, with a mark in front of those that the message belies. */
final class AnswerText implements Comparison.Listener {
    private static final int HEADER_COLUMN = 16;

    private final PrintWriter out;
    private final Palette palette;
    private final TextWriter text;
    private int depth;
    private int column;

    AnswerText(PrintWriter out, Palette palette) {
        this.out = out;
        this.palette = palette;
        this.text = new TextWriter(out, palette);
    }

    @Override
    public void begin() {
        out.append('\n').append(palette.bold("The native library answers"));
        out.append(" (! otherwise than the message says, - not at all):\n");
    }

    @Override
    public void begin(String type, List<Item> said) {
        out.append(depth == 0 ? "\n" : "");
        line(' ', type, null);
        ++depth;
        column = type.equals(Comparison.HEADER) ? HEADER_COLUMN : TextWriter.column(said);
    }

    @Override
    public void answered(String name, String value, boolean isSaid, String said) {
        String shown = value == null ? "(none)" : Visible.value(value);
        if (!isSaid) {
            line('!', name, shown + "  (the message does not say it)");
        } else if (Objects.equals(value, said)) {
            line(' ', name, shown);
        } else {
            String instead = said == null ? "gives no value" : "says " + Visible.quoted(said);
            line('!', name, shown + "  (the message " + instead + ")");
        }
    }

    @Override
    public void notAnswered(String name, String value) {
        line('-', name == null ? "(no NAME)" : name, value == null ? null : Visible.value(value));
    }

    @Override
    public void notAnswered(String type) {
        out.append(depth == 0 ? "\n" : "");
        line('-', type == null ? "(no TYPE)" : type, null);
    }

    @Override
    public void end() {
        --depth;
    }

    @Override
    public void unanswered(String why) {
        out.append('\n').append(palette.bold("The native library answers nothing"));
        out.append(": " + why + ".\n");
    }

    private void line(char mark, String name, String shown) {
        out.append(mark == ' ' ? " " : palette.error(String.valueOf(mark))).append(' ');
        text.line(depth * TextWriter.INDENT, column, name, shown);
    }
}
