package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.LibraryStop.Result;
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

    private final Result result;
    private final int bytesRead;

    /** Null when the message is accepted. */
    private final Refusal refusal;

    /** Null when the body could not be read. */
    private final ProvisioningDocument document;

    /** Where the document begins in what the library takes for the body. */
    private final int shift;

    /** On a push whose header is refused. */
    private Verdict(Refusal refusal) {
        this.body = null;
        this.result = Result.OK;
        this.bytesRead = 0;
        this.refusal = refusal;
        this.document = null;
        this.shift = 0;
    }

    private Verdict(byte[] body, ProvisioningDocument document, int shift) {
        LibraryWalk walk = new LibraryWalk(body, LibraryTrace.NONE);
        Refusal refusal = null;
        Result result = Result.OK;
        try {
            walk.run();
            if (!walk.hasList) {
                refusal = Refusal.ofEmpty(walk);
            }
        } catch (LibraryStop stop) {
            result = stop.cause.result;
            refusal = Refusal.of(walk, stop);
        }
        this.body = body;
        this.result = result;
        this.bytesRead = walk.at;
        this.refusal = refusal == null || shift == 0 ? refusal : refusal.ofShiftedBody(shift);
        this.document = document;
        this.shift = shift;
    }

    /**
     * On a body.
     *
     * @param body the body, which is not copied
     * @param document what it says; null when it could not be read
     */
    static Verdict onBody(byte[] body, ProvisioningDocument document) {
        return new Verdict(body, document, 0);
    }

    /**
     * On a push.
     *
     * @param push the push, which is not copied
     * @param bodyAt where the body of the document begins in it
     * @param document what the body says; null when it could not be read
     */
    static Verdict onPush(byte[] push, int bodyAt, ProvisioningDocument document) {
        LibraryHeader header = LibraryHeader.of(push);
        if (header.refusal != null) {
            return new Verdict(header.refusal);
        }
        if (header.bodyAt == bodyAt && document != null) {
            return document.verdict();
        }
        // The library reads the length of the headers from one byte, whatever its form.
        byte[] body = Arrays.copyOfRange(push, header.bodyAt, push.length);
        return new Verdict(body, document, bodyAt - header.bodyAt);
    }

    /**
     * Finds out whether the library takes a push of which no document can be read; of others {@link
     * ProvisioningMessage#verdict} tells more.
     *
     * @param push any bytes
     * @return the verdict, which knows of no item that is read otherwise; never {@code null}
     */
    public static Verdict ofPush(byte[] push) {
        return onPush(push, 0, null);
    }

    /**
     * Finds out whether the library takes a body of which no document can be read; of others {@link
     * ProvisioningDocument#verdict} tells more.
     *
     * @param body any bytes
     * @return the verdict, which knows of no item that is read otherwise; never {@code null}
     */
    public static Verdict ofBody(byte[] body) {
        return onBody(body.clone(), null);
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
        return result.code;
    }

    /** {@return the name of the result code, such as {@code QVS_ERROR_WBXML_UNKNOWN_ELEMENT}} */
    public String codeName() {
        return result.codeName;
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
        // All of it follows from the body, or from the header.
        return Arrays.equals(body, that.body)
                && shift == that.shift
                && offset() == that.offset()
                && Objects.equals(reason(), that.reason());
    }

    @Override
    public int hashCode() {
        return 31 * (31 * bytesRead + offset()) + Objects.hashCode(reason());
    }

    /** {@return code, place and reason of a refusal, in a line for a log} */
    @Override
    public String toString() {
        if (isAccepted()) {
            return "accepted";
        }
        String result = body == null ? "" : ", " + code() + " " + codeName();
        String where = path() == null ? "" : ", " + path();
        return "refused: " + reason() + result + ", offset " + offset() + where;
    }
}
