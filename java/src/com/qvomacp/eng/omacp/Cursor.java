package com.qvomacp.eng.omacp;

/** Bytes, and the place where reading stands. Nothing else looks at the end. */
final class Cursor {
    /** What {@link #integer} answers for one that is cut off, or larger than 32 bits. */
    static final long NO_INTEGER = -1;

    private static final int MORE = 0x80;
    private static final int DIGIT = 0x7F;
    private static final int DIGIT_BITS = 7;
    private static final long LARGEST = 0xFFFFFFFFL;

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

    /** The byte so many behind the next, 0 to 255, or -1 from the end on; the place stays. */
    int peek(int behind) {
        return behind < end - at ? bytes[at + behind] & 0xFF : -1;
    }

    /** The next byte, 0 to 255, or -1 at the end, where the place stays. */
    int take() {
        return at < end ? bytes[at++] & 0xFF : -1;
    }

    /** Goes on by so many bytes, to the end at most. */
    void skip(int count) {
        at = count < end - at ? at + count : end;
    }

    /**
     * A multi-byte integer: seven bits a byte, the top bit on all but the last. One that is too large
     * is taken whole, one that is cut off to the end.
     */
    long integer() {
        long value = 0;
        for (int next; (next = take()) >= 0; ) {
            value = value << DIGIT_BITS | next & DIGIT;
            if (value > LARGEST) {
                value = LARGEST + 1;
            }
            if ((next & MORE) == 0) {
                return value > LARGEST ? NO_INTEGER : value;
            }
        }
        return NO_INTEGER;
    }
}
