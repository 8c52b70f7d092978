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

    ProvisioningException(Reason reason, String text) {
        super(text);
        this.reason = reason;
    }

    /**
     * Tells why the message cannot be parsed. {@link #getMessage} says the same in words.
     *
     * @return the reason, never {@code null}
     */
    public Reason getReason() {
        return reason;
    }
}
