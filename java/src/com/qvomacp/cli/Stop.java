package com.qvomacp.cli;

/** Ends the reading of a message that is refused, and says where and why. */
final class Stop extends Exception {
    static final int FAILED = 1;
    static final int BAD_ARGUMENT = 2;
    static final int UNKNOWN_ELEMENT = 4101;
    static final int NO_DATA = 4103;
    static final int DOCUMENT_TYPE = 4107;
    static final int NO_MEMORY = 4111;

    private static final long serialVersionUID = 1L;

    /** The library's result code; 0 where it gives none. */
    final int code;

    /** The bytes that are refused, counted as those of the notes. */
    final int at;

    final int length;

    /** What would have been taken in their place; null when nothing can be said. */
    final String accepted;

    /** How many bytes had been read. */
    int read;

    /** The elements around; empty outside any. */
    String path = "";

    Stop(int code, int at, int length, String reason, String accepted) {
        super(reason, null, false, false);
        this.code = code;
        this.at = at;
        this.length = length;
        this.accepted = accepted;
    }
}
