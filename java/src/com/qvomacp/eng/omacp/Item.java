package com.qvomacp.eng.omacp;

/**
 * Something that stands in a provisioning document: a {@link Characteristic}, a {@link Parameter},
 * or {@link Other} content. Items are immutable; two of them are equal when they say the same,
 * wherever they stand and however they are written.
 */
public abstract class Item {
    /** The place of an item that was not read from a body. */
    static final int NOWHERE = -1;

    final Characteristic parent;
    private final int offset;

    /** Behind the last byte, until the item is whole. */
    int end;

    Item(Characteristic parent, int offset, int end) {
        this.parent = parent;
        this.offset = offset;
        this.end = end;
    }

    /**
     * Tells where the item begins.
     *
     * @return bytes from the start of the body, counted from 0
     */
    public final int offset() {
        return offset;
    }

    /**
     * Tells how long the item is, with everything in it and its END.
     *
     * @return bytes of the body
     */
    public final int length() {
        return end - offset;
    }
}
