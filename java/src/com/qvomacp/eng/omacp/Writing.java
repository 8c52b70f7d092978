package com.qvomacp.eng.omacp;

/** How a type, a name or a value is written in the body. */
public enum Writing {
    /** As a token that stands for it. */
    TOKEN,

    /** As a text in its place. */
    INLINE,

    /** As a reference to the string table. */
    TABLE,

    /** As opaque data. */
    OPAQUE,

    /** As a character entity or an extension. */
    ENTITY,

    /** As several pieces, or as none, which makes the empty text. */
    JOINED
}
