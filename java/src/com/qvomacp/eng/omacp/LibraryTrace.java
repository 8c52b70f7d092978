package com.qvomacp.eng.omacp;

/** Hears what a {@link LibraryWalk} reads, in the order of the body. */
class LibraryTrace {
    /** Hears nothing. */
    static final LibraryTrace NONE = new LibraryTrace();

    /** A characteristic or a parm begins. */
    void begin(int start, boolean isParm) {}

    /** The type of the characteristic that began last, {@code depth} others around it, was read. */
    void type(LibraryWalk walk, int depth, int start, LibraryKind kind) {}

    /** The name of a parameter has been read. */
    void name(LibraryWalk walk) {}

    /** The value of a parameter has been read. */
    void value(int end) {}

    /** The innermost characteristic or parm is over. */
    void end(int end) {}

    /** Some bytes have been read to no effect. */
    void skipped(String what, int start, int end) {}
}
