package com.qvomacp.eng.omacp;

import java.util.List;

/** The content type of a push: a media type and its parameters. Immutable. */
public final class ContentType {
    private ContentType() {}

    /**
     * Tells the media type.
     *
     * @return in lower case, such as {@code application/vnd.wap.connectivity-wbxml}; a printable name
     *     for a number that stands for none
     */
    public String mediaType() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the number that WSP assigns to the media type.
     *
     * @return the number, such as 54; -1 when the media type is given as text and has none
     */
    public int code() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the parameters.
     *
     * @return every parameter, in the order of the message; not modifiable
     */
    public List<HeaderField> parameters() {
        throw new UnsupportedOperationException();
    }
}
