package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * What stands in a document and is neither a characteristic nor a parameter. The format has no place
 * for it there, but nothing that was read is left out.
 */
public final class Other extends Item {
    /** What it is. */
    public enum Kind {
        /** An element of another name; its children stand in it. */
        ELEMENT,

        /** An attribute that its element does not have, or has twice. */
        ATTRIBUTE,

        /** Text, or a value, in place of an element. */
        TEXT,

        /** A processing instruction. */
        INSTRUCTION,

        /** What stands in a parm, behind which this item follows; its children stand in it. */
        PARM_CONTENT,

        /** Bytes behind the end of the document. */
        TRAILING
    }

    Other(Characteristic parent, int offset, int end) {
        super(parent, offset, end);
    }

    /**
     * Tells what it is.
     *
     * @return the kind, never {@code null}
     */
    public Kind kind() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the name of an element, an attribute or the target of an instruction.
     *
     * @return the name; a printable one for a token that stands for nothing; {@code null} for what
     *     has none
     */
    public String name() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the text, or the value of an attribute or instruction.
     *
     * @return the text; {@code null} for what has none
     */
    public String text() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists what stands in an element or in a parm.
     *
     * @return every item, in the order of the message; not modifiable
     */
    public List<Item> children() {
        throw new UnsupportedOperationException();
    }
}
