package com.qvomacp.eng.omacp;

/**
 * Something in a message that a {@link Rule} has found. Immutable.
 *
 * <pre>{@code
 * for (Finding finding : message.lint()) {
 *     System.out.println(finding.offset() + ": " + finding.rule().severity() + ": "
 *             + finding.sentence() + "; right would be " + finding.remedy());
 * }
 * }</pre>
 */
public final class Finding {
    static final int NO_OFFSET = -1;

    private final Rule rule;

    /** Null in the push header. */
    private final Item item;

    private final int offset;
    private final int line;
    private final int column;
    private final String sentence;
    private final String remedy;

    private Finding(
            Rule rule, Item item, int offset, int line, int column, String sentence, String remedy) {
        this.rule = rule;
        this.item = item;
        this.offset = offset;
        this.line = line;
        this.column = column;
        this.sentence = sentence;
        this.remedy = remedy;
    }

    /** Something in a body; the item is null for the push header, whatever the offset. */
    static Finding of(Rule rule, Item item, int offset, String sentence, String remedy) {
        int at = item == null ? NO_OFFSET : offset;
        return new Finding(rule, item, at, 0, 0, sentence, remedy);
    }

    /** The same at its place in a document in XML: line and column. */
    Finding at(int[] place) {
        return new Finding(rule, item, NO_OFFSET, place[0], place[1], sentence, remedy);
    }

    /** {@return the rule that it is found by: the rule, never {@code null}} */
    public Rule rule() {
        return rule;
    }

    /** {@return in which element it is, as {@link Deviation#path} does; {@code push header} there} */
    public String path() {
        return item == null ? "push header" : item.path();
    }

    /** The item that it is in; null for the push header. */
    Item item() {
        return item;
    }

    /**
     * {@return where it is: bytes from the start of the body, counted from 0; -1 in the push header
     * and in XML}
     */
    public int offset() {
        return offset;
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
     * {@return what it is: a sentence without a full stop, which may hold names, numbers and
     * addresses of the message, cut when they are long}
     */
    public String sentence() {
        return sentence;
    }

    /** {@return what would be right: a part of a sentence, never {@code null}} */
    public String remedy() {
        return remedy == null ? rule.remedy() : remedy;
    }

    @Override
    public boolean equals(Object other) {
        if (!(other instanceof Finding)) {
            return false;
        }
        Finding that = (Finding) other;
        return rule == that.rule
                && offset == that.offset
                && line == that.line
                && column == that.column
                && sentence.equals(that.sentence)
                && remedy().equals(that.remedy())
                && path().equals(that.path());
    }

    @Override
    public int hashCode() {
        return 31 * (31 * (31 * rule.ordinal() + offset) + line) + sentence.hashCode();
    }

    /** {@return rule, offset and path, without any value of the message, in a line for a log} */
    @Override
    public String toString() {
        return rule.ruleName() + ", offset " + offset + ", " + path();
    }
}
