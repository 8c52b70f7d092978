package com.qvomacp.eng.omacp;

import java.util.Locale;
import java.util.Objects;

/**
 * What stands in a document and is neither a characteristic nor a parameter. The format has no
 * place for it there, but nothing that was read is left out.
 *
 * <pre>{@code
 * for (Item item : document.children()) {
 *     if (item instanceof Other) {
 *         System.out.println(((Other) item).kind() + " at offset " + item.offset());
 *     }
 * }
 * }</pre>
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
        /** Bytes behind the end of the document. */
        TRAILING;

        private static final Kind[] ALL = values();
    }

    private final String name;
    private final String text;
    private final byte kind;
    private final byte textWriting;

    Other(
            int offset,
            int end,
            Item[] children,
            Kind kind,
            String name,
            String text,
            Writing textWriting) {
        super(offset, end, children);
        this.name = name;
        this.text = text;
        this.kind = (byte) kind.ordinal();
        this.textWriting = Writing.code(textWriting);
    }

    /** {@return what it is; never {@code null}} */
    public Kind kind() {
        return Kind.ALL[kind];
    }

    /**
     * {@return the name of an element, an attribute or the target of an instruction, a printable
     * one for a token that stands for nothing; {@code null} for what has none}
     */
    public String name() {
        return name;
    }

    /** {@return the text, or the value of an attribute or instruction; {@code null} for none} */
    public String text() {
        return text;
    }

    /** {@return how the text is written; {@code null} without a text} */
    public Writing textWriting() {
        return Writing.of(textWriting);
    }

    @Override
    String called() {
        return name;
    }

    @Override
    void step(StringBuilder path) {
        Printable.append(path, name == null ? kind().name().toLowerCase(Locale.ROOT) : name);
    }

    @Override
    boolean says(Item other) {
        return other instanceof Other
                && kind == ((Other) other).kind
                && Objects.equals(name, ((Other) other).name)
                && Objects.equals(text, ((Other) other).text);
    }

    @Override
    int hash() {
        return 31 * (31 * Objects.hashCode(name) + Objects.hashCode(text)) + kind;
    }

    /** {@return the item, without its text, which may be a secret: one line of text} */
    @Override
    public String toString() {
        return "Other{kind=" + kind() + (name == null ? "" : ", name=" + Printable.of(name))
                + ", children=" + inside().length + "}";
    }
}
