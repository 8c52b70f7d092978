package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.List;

/**
 * Goes through bytes and keeps a note on each: the notes, in their order, cover every byte once.
 */
abstract class Cursor {
    final byte[] data;

    /** One behind the last byte that belongs here. */
    int size;

    final List<Note> notes = new ArrayList<>();

    /** The next byte. It may stand one byte behind the last one. */
    int at;

    int depth;

    /** The first byte without a note. */
    private int noted;

    Cursor(byte[] data, int size) {
        this.data = data;
        this.size = size;
    }

    boolean ended() {
        return at >= size;
    }

    /** The next byte, which must be there; -1 never. */
    int next() {
        return data[at] & 0xFF;
    }

    /** Puts a note on everything read since the last one. */
    void note(Note.Style style, String text) {
        noteTo(Math.min(at, size), style, text);
    }

    void note(String text) {
        note(Note.Style.PLAIN, text);
    }

    private void noteTo(int end, Note.Style style, String text) {
        if (end > noted) {
            notes.add(new Note(noted, end - noted, depth, style, text));
            noted = end;
        }
    }

    /** A note on bytes that have theirs, or belong to somebody else. */
    void remark(String text) {
        notes.add(new Note(noted, 0, depth, Note.Style.PLAIN, text));
    }

    /** Puts notes on what is left: what was refused, and what was not read. */
    void finish(Stop stop, String unread) {
        if (stop != null) {
            noteTo(Math.min(stop.at, size), Note.Style.PLAIN, "read, and no part of anything");
            int end = Math.min(stop.at + stop.length, size);
            noteTo(end, Note.Style.REFUSED, "refused: " + stop.getMessage());
            depth = 0;
        }
        noteTo(size, Note.Style.UNREAD, unread);
    }
}
