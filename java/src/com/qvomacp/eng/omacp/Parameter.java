package com.qvomacp.eng.omacp;

/** A parameter of a provisioning document: a name, such as {@code NAPID}, and a value. */
public final class Parameter extends Item {
    Parameter(Characteristic parent, int offset, int end) {
        super(parent, offset, end);
    }

    /**
     * Tells the name.
     *
     * @return NAME as the OMA documents write it, such as {@code NAP-ADDRESS}; {@code null} when
     *     the parameter has none
     */
    public String name() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the value.
     *
     * @return VALUE, which may be empty; {@code null} when the parameter has none
     */
    public String value() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how the name is written.
     *
     * @return how; {@code null} without a name
     */
    public Writing nameWriting() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how the value is written.
     *
     * @return how; {@code null} without a value
     */
    public Writing valueWriting() {
        throw new UnsupportedOperationException();
    }
}
