package com.qvomacp.eng.omacp;

/**
 * Hears what a {@link BodyReader} reads, in order of the bytes and without a gap: each call is told
 * where its bytes begin and where they end, counted from the start of the body. The tree is one
 * listener, the deviations and the listing of every byte are others; none needs all that is told.
 */
interface Reading {
    /** An element or an instruction begins, in the one that has not ended yet. */
    void element(int from, int to, Element element, String name, boolean attributes);

    /**
     * An attribute begins. {@code name} is that of one that the format does not have; {@code value}
     * is what its token says of the value. Either may be {@code null}.
     */
    void attribute(int from, int to, Attribute attribute, String name, String value);

    /** A piece of an attribute's value, or of text where elements stand. */
    void text(int from, int to, Writing writing, String text);

    /**
     * A parm with a token for its name, and one text or token for its value, each in its place. Who
     * does not listen for that hears its parts.
     */
    default void parameter(int from, int to, String name, String value, Writing writing) {
        element(from, from + 1, Element.PARM, Element.PARM.text, true);
        attribute(from + 1, from + 2, Attribute.NAME, null, name);
        attribute(from + 2, from + 3, Attribute.VALUE, null, null);
        text(from + 3, to - 1, writing, value);
        end(to - 1, to);
    }

    /** The attributes of an element end, and its content begins. */
    void attributesEnd(int from, int to);

    /** The innermost element ends; {@code from} equals {@code to} when no END says so. */
    void end(int from, int to);

    /** Another code page is in force, for elements or for attributes. */
    default void page(int from, int to, boolean attributes, int page) {}

    /** The document has ended, and these bytes follow. */
    default void trailing(int from, int to) {}

    /** Something departs from the format. It is told before the bytes that it is in. */
    default void deviation(int at, Deviation.Kind kind) {}
}
