package com.qvomacp.eng.omacp;

/**
 * Something in a body that departs from the format. It does not end the reading: the document says
 * what could be read all the same.
 */
public final class Deviation {
    private Deviation() {}

    /**
     * Tells where it is.
     *
     * @return bytes from the start of the body, counted from 0
     */
    public int offset() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells in which element it is, such as {@code wap-provisioningdoc / NAPDEF 1 / BEARER}:
     * characteristics with their number among those of their type in the same element, counted from
     * 1. Of more than eight elements the innermost eight are told.
     *
     * @return the path, never {@code null}
     */
    public String path() {
        throw new UnsupportedOperationException();
    }

    /**
     * Says what it is.
     *
     * @return a sentence without a full stop, without any value of the message
     */
    public String sentence() {
        throw new UnsupportedOperationException();
    }

    /**
     * Shows the deviation in one line, which may go to a log.
     *
     * @return offset, path and sentence
     */
    @Override
    public String toString() {
        return "offset " + offset() + ", " + path() + ": " + sentence();
    }
}
