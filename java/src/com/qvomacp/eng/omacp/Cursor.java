package com.qvomacp.eng.omacp;

/** Bytes, and the place where reading stands. Nothing else looks at the end. */
final class Cursor {
    /** What {@link #integer} answers for one that is cut off, or larger than 32 bits. */
    static final long NO_INTEGER = -1;

    private final byte[] bytes;
    private final int end;
    private int at;

    Cursor(byte[] bytes, int from, int end) {
        this.bytes = bytes;
        this.at = from;
        this.end = end;
    }

    int at() {
        return at;
    }

    int left() {
        return end - at;
    }

    /** The next byte, 0 to 255, or -1 at the end; the place stays. */
    int peek() {
        return at < end ? bytes[at] & 0xFF : -1;
    }

    /** The next byte, 0 to 255, or -1 at the end, where the place stays. */
    int take() {
        return at < end ? bytes[at++] & 0xFF : -1;
    }

    /** Goes on by so many bytes, to the end at most. */
    void skip(int count) {
        at = count < end - at ? at + count : end;
    }
}
