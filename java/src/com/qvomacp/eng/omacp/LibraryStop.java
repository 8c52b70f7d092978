package com.qvomacp.eng.omacp;

/** Ends the walk over a body that the native library refuses. */
final class LibraryStop extends Exception {
    /** Why the walk ends. */
    enum Cause {
        EMPTY_BODY,
        DOCUMENT_TYPE,
        ENDED,
        MISPLACED,
        NO_SUCH_PAGE,
        NO_SUCH_STRING,
        OPAQUE_TOO_LONG,
        OPAQUE_WITHOUT_LENGTH,
        EMPTY_NAME,
        UNKNOWN_NAME,
        TOO_MUCH_TEXT
    }

    /** Where in the grammar it ends, which says what would have been taken. */
    enum Place {
        DOCUMENT,
        VERSION,
        BEHIND_VERSION,
        IN_DOCUMENT,
        NEXT_CHARACTERISTIC,
        TYPE,
        IN_CHARACTERISTIC,
        PARM,
        MASKED_NAME,
        BEHIND_NAME,
        VALUE_START,
        VALUE,
        IN_VALUE,
        IN_SKIPPED,
        COMMA_VALUE
    }

    private static final long serialVersionUID = 1L;

    /** The library's result code. */
    final int code;

    final transient Cause cause;
    final transient Place place;

    /** Where that begins which is refused. */
    final int offset;

    LibraryStop(int code, Cause cause, Place place, int offset) {
        super(cause.name(), null, false, false);
        this.code = code;
        this.cause = cause;
        this.place = place;
        this.offset = offset;
    }
}
