package com.qvomacp.eng.omacp;

import java.util.Objects;

/**
 * A header of a push, or a parameter of its content type. Immutable.
 *
 * <pre>{@code
 * for (HeaderField parameter : header.contentType().parameters()) {
 *     System.out.println(parameter.name() + " = " + parameter.value());
 * }
 * }</pre>
 */
public final class HeaderField {
    private final String name;
    private final String value;
    private final int offset;
    private final int length;

    HeaderField(String name, String value, int offset, int length) {
        this.name = name;
        this.value = value;
        this.offset = offset;
        this.length = length;
    }

    /**
     * {@return the name, such as {@code charset}, as the standard writes it when it is sent as a
     * number, and as the message does when it is sent as text; a printable one for any other number}
     */
    public String name() {
        return name;
    }

    /**
     * {@return the value: a number in decimal digits or by the name that it stands for, a date in
     * UTC as ISO 8601 writes it, a text without the quotes of its form, and anything else in
     * hexadecimal digits; {@code null} when there is none}
     */
    public String value() {
        return value;
    }

    /** {@return where the field begins: bytes from the start of what was read, counted from 0} */
    public int offset() {
        return offset;
    }

    /** {@return how long the field is, name and value: bytes} */
    public int length() {
        return length;
    }

    void describe(ByteVisitor visitor, int depth) {
        visitor.visit(offset, length, depth, value == null ? name : name + ": " + value);
    }

    /** {@return whether name and value are the same, wherever and however they are written} */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof HeaderField)) {
            return false;
        }
        HeaderField that = (HeaderField) other;
        return name.equals(that.name) && Objects.equals(value, that.value);
    }

    @Override
    public int hashCode() {
        return 31 * name.hashCode() + Objects.hashCode(value);
    }

    /** {@return the name, which may go to a log; the value may be a secret: one line of text} */
    @Override
    public String toString() {
        return "HeaderField{" + Printable.of(name) + "}";
    }
}
