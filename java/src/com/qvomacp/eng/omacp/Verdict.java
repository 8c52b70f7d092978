package com.qvomacp.eng.omacp;

import java.util.List;

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
    private Verdict() {}

    /**
     * Tells whether the library takes the message.
     *
     * @return true when it does
     */
    public boolean isAccepted() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells whether it is the push header that the library refuses.
     *
     * @return true when it does not get as far as the body
     */
    public boolean isHeaderRefused() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the result code of the library's decoder.
     *
     * @return the code, such as 4101; 0 for a body that is taken, and for one that can be decoded
     *     and holds no document; 0 too when the header is refused, for which there is no code
     */
    public int code() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the name of the result code.
     *
     * @return such as {@code QVS_ERROR_WBXML_UNKNOWN_ELEMENT}; never {@code null}
     */
    public String codeName() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how much of the body the decoder has read when it ends.
     *
     * @return bytes
     */
    public int bytesRead() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells where what is refused stands: in the body, or in the message when the header is refused.
     *
     * @return bytes from its start, counted from 0; -1 when the message is accepted
     */
    public int offset() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells in which element what is refused stands, as {@link Deviation#path} does.
     *
     * @return the path; {@code null} when the message is accepted or the header is refused
     */
    public String path() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells what stands there.
     *
     * @return such as {@code SWITCH_PAGE (0x00)}; {@code null} when the message is accepted
     */
    public String found() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists what would have been taken there.
     *
     * @return what would have been taken, in the order of the tokens; not modifiable, empty when the
     *     message is accepted and when nothing would have been
     */
    public List<String> expected() {
        throw new UnsupportedOperationException();
    }

    /**
     * Says why the message is refused.
     *
     * @return a sentence without a full stop; {@code null} when the message is accepted
     */
    public String reason() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the items that the library skips or reads as something else, up to where it ends.
     *
     * @return the items of the document, in its order; not modifiable
     */
    public List<Item> readOtherwise() {
        throw new UnsupportedOperationException();
    }
}
