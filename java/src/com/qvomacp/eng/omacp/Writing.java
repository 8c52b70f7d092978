package com.qvomacp.eng.omacp;

/**
 * How a type, a name or a value is written in the body.
 *
 * <pre>{@code
 * for (Characteristic characteristic : document.characteristics()) {
 *     if (characteristic.typeWriting() == Writing.INLINE) {
 *         System.out.println(characteristic.type() + " is written out");
 *     }
 * }
 * }</pre>
 */
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
    JOINED;

    private static final Writing[] ALL = values();

    /** A byte for an item, which has no room for more. */
    static byte code(Writing writing) {
        return (byte) (writing == null ? -1 : writing.ordinal());
    }

    static Writing of(byte code) {
        return code < 0 ? null : ALL[code];
    }
}
