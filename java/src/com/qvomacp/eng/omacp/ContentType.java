package com.qvomacp.eng.omacp;

import java.util.Collections;
import java.util.List;

/**
 * The content type of a push: a media type and its parameters. Immutable.
 *
 * <pre>{@code
 * ContentType type = header.contentType();
 * System.out.println(type.mediaType() + ", " + type.parameters().size() + " parameters");
 * }</pre>
 */
public final class ContentType {
    private final String mediaType;
    private final int code;
    private final int offset;
    private final int mediaTypeOffset;
    private final int mediaTypeEnd;
    private final int end;
    private final List<HeaderField> parameters;

    ContentType(
            String mediaType,
            int code,
            int offset,
            int mediaTypeOffset,
            int mediaTypeEnd,
            int end,
            List<HeaderField> parameters) {
        this.mediaType = mediaType;
        this.code = code;
        this.offset = offset;
        this.mediaTypeOffset = mediaTypeOffset;
        this.mediaTypeEnd = mediaTypeEnd;
        this.end = end;
        this.parameters = Collections.unmodifiableList(parameters);
    }

    /**
     * {@return the media type: in lower case, such as {@code
     * application/vnd.wap.connectivity-wbxml}; a printable name for a number that stands for none}
     */
    public String mediaType() {
        return mediaType;
    }

    /**
     * {@return the number that WSP assigns to the media type, such as 54; -1 for a text that has
     * none}
     */
    public int code() {
        return code;
    }

    /** {@return the parameters, in the order of the message; not modifiable} */
    public List<HeaderField> parameters() {
        return parameters;
    }

    /** {@return where it begins, with its length in front: bytes from the start of what was read} */
    public int offset() {
        return offset;
    }

    /** {@return how long the content type is, with its parameters: bytes} */
    public int length() {
        return end - offset;
    }

    /** Where the media type begins: bytes from the start of what was read. */
    int mediaTypeOffset() {
        return mediaTypeOffset;
    }

    void describe(ByteVisitor visitor) {
        int depth = 0;
        if (mediaTypeOffset > offset) {
            visitor.visit(offset, mediaTypeOffset - offset, 0, "length of the content type");
            depth = 1;
        }
        int length = mediaTypeEnd - mediaTypeOffset;
        visitor.visit(mediaTypeOffset, length, depth, "content type: " + mediaType);
        int at = mediaTypeEnd;
        for (HeaderField parameter : parameters) {
            describeGap(visitor, at, parameter.offset());
            parameter.describe(visitor, 1);
            at = parameter.offset() + parameter.length();
        }
        describeGap(visitor, at, end);
    }

    private static void describeGap(ByteVisitor visitor, int from, int to) {
        if (to > from) {
            visitor.visit(from, to - from, 1, "no parameter");
        }
    }

    /** {@return whether it is a content type that says the same, however it is written} */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof ContentType)) {
            return false;
        }
        ContentType that = (ContentType) other;
        return mediaType.equals(that.mediaType) && parameters.equals(that.parameters);
    }

    @Override
    public int hashCode() {
        return 31 * mediaType.hashCode() + parameters.hashCode();
    }

    /** {@return the media type and how many parameters there are, in a line for a log} */
    @Override
    public String toString() {
        return "ContentType{" + Printable.of(mediaType) + ", " + parameters.size() + " parameters}";
    }
}
