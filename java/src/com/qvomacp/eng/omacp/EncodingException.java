package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/**
 * Says that a document cannot be encoded, or cannot be written as XML, and where and why. Of a
 * document in XML it tells line and column, of any other the path.
 *
 * <pre>{@code
 * try {
 *     push = ProvisioningEncoder.ofXml(xml, EncodeOptions.NONE).push();
 * } catch (EncodingException e) {
 *     System.err.println(e.line() + ":" + e.column() + ": " + e.getMessage());
 * }
 * }</pre>
 */
public final class EncodingException extends Exception {
    private static final long serialVersionUID = 1L;

    /** Counted from 1, or 0. */
    private final int line;

    /** Counted from 1, or 0. */
    private final int column;

    /** Null for XML. */
    private final String path;

    /** What would have been taken. */
    private final ArrayList<String> expected;

    private EncodingException(
            int line, int column, String path, String sentence, String... expected) {
        super(sentence);
        this.line = line;
        this.column = column;
        this.path = path;
        this.expected = new ArrayList<>(Arrays.asList(expected));
    }

    /** Something at a place of a document in XML. */
    static EncodingException at(int line, int column, String sentence, String... expected) {
        return new EncodingException(line, column, null, sentence, expected);
    }

    /** Something in an element of a document, or in none when the path is null. */
    static EncodingException in(String path, String sentence, String... expected) {
        return new EncodingException(0, 0, path, sentence, expected);
    }

    /** {@return the line of a document in XML: the line, counted from 1; 0 for anything else} */
    public int line() {
        return line;
    }

    /**
     * {@return the column of a document in XML: characters of the line, counted from 1; 0 for
     * anything else}
     */
    public int column() {
        return column;
    }

    /**
     * {@return the element, as {@link Deviation#path} does: the path; {@code null} for a document
     * in XML, and outside an element}
     */
    public String path() {
        return path;
    }

    /**
     * {@return what would have been taken: what would have been taken; not modifiable, empty when
     * that cannot be said}
     */
    public List<String> expected() {
        return Collections.unmodifiableList(expected);
    }
}
