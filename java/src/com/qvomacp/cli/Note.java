package com.qvomacp.cli;

/** What a run of bytes means. */
final class Note {
    /** What kind of meaning it is, which a terminal shows as a colour. */
    enum Style {
        PLAIN,
        ELEMENT,
        TEXT,
        UNREAD,
        REFUSED
    }

    /** The first byte, counted from the first one of the message or of the body. */
    final int offset;

    /** Bytes; 0 for what is said of bytes that another note stands for. */
    final int length;

    /** How deep the bytes are nested. */
    final int depth;

    final Style style;
    final String text;

    Note(int offset, int length, int depth, Style style, String text) {
        this.offset = offset;
        this.length = length;
        this.depth = depth;
        this.style = style;
        this.text = text;
    }
}
