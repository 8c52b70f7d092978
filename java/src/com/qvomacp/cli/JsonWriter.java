package com.qvomacp.cli;

import java.io.PrintWriter;

/**
 * Writes JSON as it is told it: nothing but the open brackets is kept. What a terminal would obey
 * is escaped in strings.
 */
final class JsonWriter {
    /** Deeper values are indented no further: the brackets tell how deep they are. */
    private static final int DEEPEST = 12;

    private final PrintWriter out;
    private final boolean onOneLine;

    /** The closing brackets of what is open, the innermost one last. */
    private final StringBuilder open = new StringBuilder();

    /** How much of {@link #open} stands on lines of its own; the rest shares a line. */
    private int flatFrom = Integer.MAX_VALUE;

    private boolean isFirst = true;
    private boolean isNamed;
    private boolean isSeparated;

    JsonWriter(PrintWriter out, boolean onOneLine) {
        this.out = out;
        this.onOneLine = onOneLine;
    }

    JsonWriter beginObject() {
        return begin('{', '}');
    }

    /** An object all of which stands on one line. */
    JsonWriter beginFlatObject() {
        beginObject();
        flatFrom = Math.min(flatFrom, open.length());
        return this;
    }

    JsonWriter beginArray() {
        return begin('[', ']');
    }

    /** Ends the innermost object or array; a line ends behind the outermost one. */
    JsonWriter end() {
        int last = open.length() - 1;
        char bracket = open.charAt(last);
        boolean wasFlat = isFlat();
        open.setLength(last);
        if (open.length() < flatFrom) {
            flatFrom = Integer.MAX_VALUE;
        }
        if (!isFirst && !wasFlat) {
            out.append('\n');
            indent();
        }
        isFirst = open.length() == 0;
        out.append(bracket).append(isFirst ? "\n" : "");
        return this;
    }

    int depth() {
        return open.length();
    }

    /** Ends what has been begun since there were so many objects and arrays open. */
    void endTo(int depth) {
        if (isNamed) {
            text(null);
        }
        while (open.length() > depth) {
            end();
        }
    }

    JsonWriter name(String name) {
        next();
        out.append(Visible.json(name)).append(": ");
        isNamed = true;
        return this;
    }

    JsonWriter member(String name, String value) {
        return name(name).text(value);
    }

    JsonWriter member(String name, long value) {
        return name(name).literal(Long.toString(value));
    }

    JsonWriter member(String name, boolean value) {
        return name(name).literal(Boolean.toString(value));
    }

    /** A member that is left out where it is null. */
    JsonWriter optional(String name, String value) {
        return value == null ? this : member(name, value);
    }

    /** A place, or null where it is negative. */
    JsonWriter place(String name, int place) {
        return place < 0 ? member(name, null) : member(name, place);
    }

    /** A string, or null. */
    JsonWriter text(String text) {
        return literal(text == null ? "null" : Visible.json(text));
    }

    private JsonWriter literal(String value) {
        next();
        out.append(value);
        return this;
    }

    private JsonWriter begin(char bracket, char closing) {
        next();
        out.append(bracket);
        open.append(closing);
        isFirst = true;
        return this;
    }

    /** Whatever stands between one value and the next. */
    private void next() {
        if (isNamed) {
            isNamed = false;
            return;
        }
        if (open.length() > 0 && isFlat()) {
            out.append(isFirst ? "" : ", ");
        } else if (open.length() > 0) {
            separate();
            indent();
            isSeparated = false;
        }
        isFirst = false;
    }

    /** Ends the line in front of a value that will follow, for something to stand between. */
    void separate() {
        if (open.length() > 0 && !isFlat() && !isSeparated) {
            out.append(isFirst ? "\n" : ",\n");
            isSeparated = true;
        }
    }

    private boolean isFlat() {
        return onOneLine || open.length() >= flatFrom;
    }

    private void indent() {
        out.append(Lines.blanks(Math.min(open.length(), DEEPEST) * Lines.INDENT));
    }
}
