package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/**
 * Says that a message cannot be read, or is refused, and why and where.
 *
 * <pre>{@code
 * try {
 *     ProvisioningMessage.parseBody(new byte[] {3, 11, 106});
 * } catch (ProvisioningException e) {
 *     System.out.println(e.reason() + " at " + e.offset() + ": " + e.getMessage());
 * }
 * }</pre>
 */
public final class ProvisioningException extends Exception {
    private static final long serialVersionUID = 2L;

    /** Why a message is not read. */
    public enum Reason {
        /** The message is longer than the options allow. */
        INPUT_TOO_LONG,
        /** The texts of the document are more than the options allow. */
        TEXT_TOO_LONG,
        /** The message does not begin with the header of a push, or ends within it. */
        NO_PUSH_HEADER,
        /** The body is no WBXML, or none at all. */
        NO_WBXML,
        /** The body is a document of another type. */
        OTHER_DOCUMENT_TYPE,
        /** The native library refuses the message, and the options ask for that to count. */
        REFUSED
    }

    /** Why the message is not read. */
    private final Reason reason;

    /** The library's result code, or 0. */
    private final int code;

    /** Where the reading ends. */
    private final int offset;

    /** In which element it ends, or null. */
    private final String path;

    /** What would have been taken there. */
    private final ArrayList<String> expected;

    ProvisioningException(Reason reason, int offset, String text) {
        this(reason, 0, offset, null, Collections.<String>emptyList(), text);
    }

    ProvisioningException(
            Reason reason, int code, int offset, String path, List<String> expected, String text) {
        super(text);
        this.reason = reason;
        this.code = code;
        this.offset = offset;
        this.path = path;
        this.expected = new ArrayList<>(expected);
    }

    /** Throws for an input that is longer than the options allow. */
    static void checkInput(long length, ReadOptions options) throws ProvisioningException {
        if (length > options.inputLimit()) {
            String text = length + " bytes are more than the limit of " + options.inputLimit();
            throw new ProvisioningException(Reason.INPUT_TOO_LONG, options.inputLimit(), text);
        }
    }

    /** Throws for what the native library refuses. */
    static void checkVerdict(Verdict verdict) throws ProvisioningException {
        if (!verdict.isAccepted()) {
            throw new ProvisioningException(
                    Reason.REFUSED,
                    verdict.code(),
                    verdict.offset(),
                    verdict.path(),
                    verdict.expected(),
                    verdict.reason());
        }
    }

    /** {@return why the message is not read, as {@link #getMessage} says it in words} */
    public Reason reason() {
        return reason;
    }

    /** {@return {@link Verdict#code} for a body that the library refuses; 0 for another reason} */
    public int code() {
        return code;
    }

    /**
     * {@return where the reading ends: bytes from the start, counted from 0, of the message for
     * {@link Reason#NO_PUSH_HEADER} and for a header that is refused, of the body otherwise}
     */
    public int offset() {
        return offset;
    }

    /** {@return the {@link Deviation#path} where reading ends; {@code null} outside a document} */
    public String path() {
        return path;
    }

    /** {@return what would have been taken there; not modifiable, empty if it cannot be said} */
    public List<String> expected() {
        return Collections.unmodifiableList(expected);
    }
}
