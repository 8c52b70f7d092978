package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.List;

/** Ends the walk over a body that the native library refuses. */
final class LibraryStop extends Exception {
    static final String SWITCH_PAGE = "SWITCH_PAGE (0x00)";
    static final String END = "END (0x01)";
    static final String STR_I = "STR_I (0x03)";
    static final String DOCUMENT = "wap-provisioningdoc (0x05)";
    static final String CHARACTERISTIC = "characteristic (0x06)";
    static final String PARM = "parm (0x07)";

    private static final String STR_T = "STR_T (0x83)";
    private static final String VALUE = "VALUE (0x06)";
    private static final String TOKEN_WITH_TEXT = "a value token that has a text";
    private static final String IN_ATTRIBUTES = "within the attributes of wap-provisioningdoc";
    private static final String IN_PARM = "within a parm";
    private static final String IN_A_VALUE = "within a value";
    private static final String NOT_IN_STRING = "cannot stand in a value that begins with a string";

    /** The library's result codes. */
    enum Result {
        OK(0, "QVS_OK"),
        FAILED(1, "QVS_ERROR_FAILED"),
        BAD_ARGUMENT(2, "QVS_ERROR_BAD_ARGUMENT"),
        UNKNOWN_ELEMENT(4101, "QVS_ERROR_WBXML_UNKNOWN_ELEMENT"),
        NO_DATA(4103, "QVS_ERROR_WBXML_NO_DATA"),
        DOCUMENT_TYPE(4107, "QVS_ERROR_WBXML_DOCUMENT_TYPE"),
        NO_MEMORY(4111, "QVS_ERROR_NO_MEMORY");

        final int code;
        final String codeName;

        Result(int code, String codeName) {
            this.code = code;
            this.codeName = codeName;
        }
    }

    /** Why the walk ends. */
    enum Cause {
        EMPTY_BODY(Result.BAD_ARGUMENT, "the body is empty", "a WBXML document"),
        DOCUMENT_TYPE(Result.DOCUMENT_TYPE, null, "public identifier 11",
                "public identifier 0 with a string table that begins with \""
                        + LibraryWalk.DOCUMENT_TYPE + '"'),
        ENDED(Result.NO_DATA, null),
        ENDED_IN_SWITCH(Result.UNKNOWN_ELEMENT, null),
        MISPLACED(Result.UNKNOWN_ELEMENT, null),
        MISPLACED_IN_VALUE(Result.NO_DATA, null),
        NO_SUCH_PAGE(Result.UNKNOWN_ELEMENT, null, "page 0", "page 1"),
        NO_SUCH_STRING(Result.NO_DATA, null),
        OPAQUE_TOO_LONG(Result.NO_DATA, "the opaque data is longer than the rest of the body"),
        OPAQUE_WITHOUT_LENGTH(Result.NO_DATA, null),
        EMPTY_NAME(Result.FAILED, "the name of the parameter is empty"),
        UNKNOWN_NAME(Result.UNKNOWN_ELEMENT, null),
        TOO_MUCH_TEXT(Result.NO_MEMORY, "the body is decoded to too much text");

        final Result result;

        /** In words; null for those that the bytes say more of. */
        final String reason;

        /** What would have been taken, where that is always the same. */
        final List<String> expected;

        Cause(Result result, String reason, String... expected) {
            this.result = result;
            this.reason = reason;
            this.expected = Arrays.asList(expected);
        }
    }

    /** Where in the grammar it ends, which says what would have been taken. */
    enum Place {
        DOCUMENT(IN_PARM, "cannot begin a document", LibraryStop.DOCUMENT, CHARACTERISTIC),
        VERSION(IN_ATTRIBUTES, "is no attribute of wap-provisioningdoc",
                "VERSION (0x45)", "VERSION=1.0 (0x46)"),
        BEHIND_VERSION(IN_ATTRIBUTES, "cannot stand behind the version", END, STR_I),
        IN_DOCUMENT("within wap-provisioningdoc", "cannot stand in wap-provisioningdoc",
                SWITCH_PAGE, END, STR_I, CHARACTERISTIC),
        NEXT_CHARACTERISTIC("behind a characteristic", "cannot stand behind a characteristic",
                END, STR_I, CHARACTERISTIC),
        BEHIND_TEXT("behind a characteristic", "cannot stand behind a characteristic and a text",
                END, CHARACTERISTIC),
        TYPE("within the attributes of a characteristic", "is no TYPE of a characteristic",
                SWITCH_PAGE, END),
        IN_CHARACTERISTIC("within", "cannot stand in", SWITCH_PAGE, END, STR_I),
        PARM(IN_PARM, "is no parameter of", SWITCH_PAGE, END),
        MASKED_NAME(IN_PARM, "is not found behind a SWITCH_PAGE, being above 0x3F",
                SWITCH_PAGE, END),
        BEHIND_NAME("behind the name of a parameter", "cannot stand behind the name of a parameter",
                SWITCH_PAGE, END, LibraryStop.VALUE),
        VALUE_START(IN_PARM, "stands in place of VALUE", LibraryStop.VALUE),
        VALUE("in front of a value", NOT_IN_STRING,
                STR_I, STR_T, "OPAQUE (0xC3)", "a value token"),
        IN_VALUE(IN_A_VALUE, NOT_IN_STRING,
                END, STR_I, LibraryStop.VALUE, STR_T, TOKEN_WITH_TEXT),
        IN_SKIPPED("before the END up to which an unknown value is skipped", NOT_IN_STRING, END),
        COMMA_VALUE(IN_A_VALUE, NOT_IN_STRING, STR_I, STR_T, TOKEN_WITH_TEXT);

        /** Where a body ends that ends here. */
        final String where;

        /** What there is to say of what cannot stand here. */
        final String refused;

        /** What would have been taken in every characteristic and on every code page. */
        final List<String> expected;

        Place(String where, String refused, String... expected) {
            this.where = where;
            this.refused = refused;
            this.expected = Arrays.asList(expected);
        }
    }

    private static final long serialVersionUID = 1L;

    final transient Cause cause;
    final transient Place place;

    /** Where that begins which is refused. */
    final int offset;

    LibraryStop(Cause cause, Place place, int offset) {
        super(cause.name(), null, false, false);
        this.cause = cause;
        this.place = place;
        this.offset = offset;
    }
}
