package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.Objects;

/**
 * Whether the native library takes a message, and where and why it does not. The library has rules
 * of its own, and reads some bytes otherwise than the format says; its verdict is on what it reads.
 *
 * <pre>{@code
 * Verdict verdict = document.verdict();
 * if (!verdict.isAccepted()) {
 *     System.out.println(verdict.codeName() + " at " + verdict.offset() + ", " + verdict.path());
 * }
 * }</pre>
 */
public final class Verdict {
    /** Null when the library refuses the header. */
    private final byte[] body;

    private final int code;
    private final int bytesRead;

    /** Null when the message is accepted. */
    private final Refusal refusal;

    /** Null when the body could not be read. */
    private final ProvisioningDocument document;

    /** Where the document begins in what the library takes for the body. */
    private final int shift;

    Verdict(
            byte[] body,
            int code,
            int bytesRead,
            Refusal refusal,
            ProvisioningDocument document,
            int shift) {
        this.body = body;
        this.code = code;
        this.bytesRead = bytesRead;
        this.refusal = refusal;
        this.document = document;
        this.shift = shift;
    }

    /**
     * Finds out whether the library takes a push of which no document can be read; of others {@link
     * ProvisioningMessage#verdict} tells more.
     *
     * @param push any bytes
     * @return the verdict, which knows of no item that is read otherwise; never {@code null}
     */
    public static Verdict ofPush(byte[] push) {
        return LibraryRules.verdictOnPush(push, 0, null);
    }

    /**
     * Finds out whether the library takes a body of which no document can be read; of others {@link
     * ProvisioningDocument#verdict} tells more.
     *
     * @param body any bytes
     * @return the verdict, which knows of no item that is read otherwise; never {@code null}
     */
    public static Verdict ofBody(byte[] body) {
        return LibraryRules.verdictOnBody(body.clone(), null);
    }

    /** {@return whether the library takes the message} */
    public boolean isAccepted() {
        return refusal == null;
    }

    /** {@return whether it is the push header that the library refuses} */
    public boolean isHeaderRefused() {
        return body == null;
    }

    /**
     * {@return the result code of the library's decoder, such as 4101; 0 for a body that it can
     * decode, with a document or without, and when the header is refused}
     */
    public int code() {
        return code;
    }

    /** {@return the name of the result code, such as {@code QVS_ERROR_WBXML_UNKNOWN_ELEMENT}} */
    public String codeName() {
        switch (code) {
            case 0:
                return "QVS_OK";
            case LibraryStop.FAILED:
                return "QVS_ERROR_FAILED";
            case LibraryStop.BAD_ARGUMENT:
                return "QVS_ERROR_BAD_ARGUMENT";
            case LibraryStop.UNKNOWN_ELEMENT:
                return "QVS_ERROR_WBXML_UNKNOWN_ELEMENT";
            case LibraryStop.NO_DATA:
                return "QVS_ERROR_WBXML_NO_DATA";
            case LibraryStop.WRONG_DOCUMENT_TYPE:
                return "QVS_ERROR_WBXML_DOCUMENT_TYPE";
            case LibraryStop.NO_MEMORY:
                return "QVS_ERROR_NO_MEMORY";
            default:
                throw new AssertionError(code);
        }
    }

    /** {@return how much of the body the decoder has read when it ends: bytes} */
    public int bytesRead() {
        return bytesRead;
    }

    /**
     * {@return where what is refused stands: bytes from the start of the body, or of the message
     * when the header is refused, counted from 0; -1 when the message is accepted}
     */
    public int offset() {
        return refusal == null ? -1 : refusal.offset;
    }

    /**
     * {@return in which element what is refused stands, as {@link Deviation#path} tells it; {@code
     * null} when the message is accepted or the header is refused}
     */
    public String path() {
        return refusal == null ? null : refusal.path;
    }

    /** {@return what stands there, such as {@code SWITCH_PAGE (0x00)}; {@code null} if accepted} */
    public String found() {
        return refusal == null ? null : refusal.found;
    }

    /** {@return what would have been taken there, in the order of the tokens; not modifiable} */
    public List<String> expected() {
        return refusal == null ? Collections.<String>emptyList() : refusal.expected;
    }

    /** {@return why it is refused, a sentence without a full stop; {@code null} if accepted} */
    public String reason() {
        return refusal == null ? null : refusal.reason;
    }

    /**
     * {@return the items of the document that the library skips or reads as something else, up to
     * where it ends, in the order of the document; not modifiable}
     */
    public List<Item> readOtherwise() {
        return describeOtherwise((offset, length, depth, meaning) -> {});
    }

    /**
     * Tells what the library reads where it reads otherwise, in the order of the body. What it skips
     * is told once, for all items in it.
     *
     * @param visitor hears the offset in the body, how many bytes the library takes, and a few words,
     *     such as {@code the library reads no value}
     * @return {@link #readOtherwise}
     */
    public List<Item> describeOtherwise(ByteVisitor visitor) {
        return body == null || document == null
                ? Collections.<Item>emptyList()
                : Collections.unmodifiableList(ReadOtherwise.of(body, document, shift, visitor));
    }

    @Override
    public boolean equals(Object other) {
        if (!(other instanceof Verdict)) {
            return false;
        }
        Verdict that = (Verdict) other;
        return code == that.code
                && bytesRead == that.bytesRead
                && offset() == that.offset()
                && Objects.equals(path(), that.path())
                && Objects.equals(found(), that.found())
                && Objects.equals(reason(), that.reason())
                && expected().equals(that.expected())
                && shift == that.shift
                && Arrays.equals(body, that.body);
    }

    @Override
    public int hashCode() {
        return 31 * (31 * (31 * code + bytesRead) + offset()) + Objects.hashCode(reason());
    }

    /** {@return code, place and reason of a refusal, in a line for a log} */
    @Override
    public String toString() {
        if (isAccepted()) {
            return "accepted";
        }
        String result = body == null ? "" : ", " + code + " " + codeName();
        String where = path() == null ? "" : ", " + path();
        return "refused: " + reason() + result + ", offset " + offset() + where;
    }
}
