package com.qvomacp.eng.omacp;

/** Says that a message cannot be parsed, and why. */
public final class ProvisioningException extends Exception {
    private static final long serialVersionUID = 1L;

    /** Why a message cannot be parsed. */
    public enum Reason {
        /** There is no message: null, or not a single byte. */
        NO_MESSAGE,

        /** The message is not a connectionless WSP push. */
        NOT_A_PUSH,

        /** The message ends within the push header. */
        HEADER_CUT_OFF,

        /** The content type is none of {@link ContentType}. */
        UNKNOWN_CONTENT_TYPE,

        /** The MAC of the push header does not end within the message, or is too long. */
        BAD_MAC,

        /** The message ends with its push header. */
        EMPTY_BODY,

        /** The body is not a provisioning document that the library can decode. */
        BODY_REFUSED
    }

    /** Why the message was refused. */
    private final Reason reason;

    /** The decoder's result code; null without its word. */
    private final Integer resultCode;

    /** How many bytes of the body the decoder had read; null without its word. */
    private final Integer bodyOffset;

    ProvisioningException(Reason reason, String text) {
        this(reason, text, null);
    }

    ProvisioningException(Reason reason, String text, NativeDecoder decoder) {
        super(text);
        this.reason = reason;
        this.resultCode = decoder == null ? null : decoder.code;
        this.bodyOffset = decoder == null ? null : decoder.read;
    }

    /**
     * Tells why the message cannot be parsed. {@link #getMessage} says the same in words.
     *
     * @return the reason, never {@code null}
     */
    public Reason getReason() {
        return reason;
    }

    /**
     * Tells the library's result code for a body that it refuses.
     *
     * <p>The codes are those of {@code qvsresult.h}: 4101 for an element, attribute or token that is
     * unknown or out of place, 4103 when the data ends or a text has no end, 4107 for another kind
     * of document, 4111 when the texts of the body are too much, 2 for an empty body; 0 when it can
     * be decoded and holds no document.
     *
     * @return the result code; {@code null} when the push header is refused, and when the library
     *     {@code omacp_explain}, which asks the decoder, is not beside the library
     */
    public Integer getResultCode() {
        return resultCode;
    }

    /**
     * Tells how far the decoder had come in a body that it refuses. The byte that it refuses is
     * the one at this offset, or the last one in front of it.
     *
     * @return bytes from the start of the body, up to its length; {@code null} where {@link
     *     #getResultCode} is
     */
    public Integer getBodyOffset() {
        return bodyOffset;
    }
}
