package com.qvomacp.eng.omacp;

/** A header of a push, or a parameter of its content type. Immutable. */
public final class HeaderField {
    private HeaderField() {}

    /**
     * Tells the name.
     *
     * @return the name, such as {@code charset}; a printable one for a number that stands for none
     */
    public String name() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the value.
     *
     * @return the value as text; {@code null} when there is none
     */
    public String value() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells where the field begins.
     *
     * @return bytes from the start of what was read, counted from 0
     */
    public int offset() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how long the field is, name and value.
     *
     * @return bytes
     */
    public int length() {
        throw new UnsupportedOperationException();
    }
}
