package com.qvomacp.eng.omacp;

/**
 * Something in a body that departs from the format. It does not end the reading: the document says
 * what could be read all the same.
 *
 * <pre>{@code
 * for (Deviation deviation : document.deviations()) {
 *     System.out.println(deviation.offset() + ": " + deviation.sentence());
 * }
 * }</pre>
 */
public final class Deviation {
    /** What it is. */
    enum Kind {
        VERSION("the version is none of WBXML 1.0 to 1.3, and is read as 1.3"),
        DOCUMENT_TYPE("the document type is not stated"),
        CHARSET("the character set is not known, and is read as ISO-8859-1"),
        NO_ROOT("there is no element"),
        OTHER_ROOT("the document element is not wap-provisioningdoc"),
        OTHER_ELEMENT("the element is none of the format"),
        UNKNOWN_TOKEN("the token stands for nothing"),
        OTHER_PAGE("the token is not one of the code page in force, and is read by page 0"),
        OTHER_MEANING("WBXML has another meaning for the token of the code page"),
        NAME_MISSING("the parm has no NAME"),
        TYPE_MISSING("the characteristic has no TYPE"),
        SECOND_ATTRIBUTE("the element has the attribute already"),
        OTHER_ATTRIBUTE("the element has no such attribute"),
        VALUE_ALONE("the value belongs to no attribute"),
        TEXT("text stands where elements do"),
        IN_PARM("a parm has no content"),
        PARM_OUTSIDE("the parm is in no characteristic"),
        INNER_DOCUMENT("a wap-provisioningdoc stands in another element"),
        EXTENSION("the format gives the extension no meaning"),
        NO_CHARACTER("the number is not that of a character"),
        BAD_TEXT("the text holds bytes that its character set has no character for"),
        NUMBER("the number is larger than 32 bits"),
        REFERENCE("the reference leads out of the string table"),
        CUT_OFF("the body ends within this"),
        END_MISSING("the body ends without the END of the element"),
        TRAILING("these bytes stand behind the end of the document");

        private static final Kind[] ALL = values();

        private final String sentence;

        Kind(String sentence) {
            this.sentence = sentence;
        }

        static Kind of(int ordinal) {
            return ALL[ordinal];
        }
    }

    private final int offset;
    private final Kind kind;
    private final Item item;

    Deviation(int offset, Kind kind, Item item) {
        this.offset = offset;
        this.kind = kind;
        this.item = item;
    }

    Kind kind() {
        return kind;
    }

    /** The item that it is in. */
    Item item() {
        return item;
    }

    /** {@return where it is: bytes from the start of the body, counted from 0} */
    public int offset() {
        return offset;
    }

    /**
     * {@return in which element it is, such as {@code wap-provisioningdoc / NAPDEF 1 / BEARER}: the
     * innermost eight, characteristics with their number among those of their type in the same
     * element, counted from 1; never {@code null}}
     */
    public String path() {
        return item.path();
    }

    /** {@return what it is: a sentence without a full stop, without any value of the message} */
    public String sentence() {
        return kind.sentence;
    }

    @Override
    public boolean equals(Object other) {
        if (!(other instanceof Deviation)) {
            return false;
        }
        Deviation that = (Deviation) other;
        return offset == that.offset && kind == that.kind && path().equals(that.path());
    }

    @Override
    public int hashCode() {
        return 31 * offset + kind.ordinal();
    }

    /** {@return the deviation in one line, which may go to a log: offset, path and sentence} */
    @Override
    public String toString() {
        return "offset " + offset + ", " + path() + ": " + sentence();
    }
}
