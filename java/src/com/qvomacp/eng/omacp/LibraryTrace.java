package com.qvomacp.eng.omacp;

/** Hears of the elements that a {@link LibraryWalk} reads, in the order of the body. */
class LibraryTrace {
    /** Hears nothing. */
    static final LibraryTrace NONE = new LibraryTrace();

    /**
     * The attributes of a characteristic have been read.
     *
     * @param depth how many characteristics it stands in
     * @param start where it begins
     * @param kind null when its type is none that the library knows
     */
    void characteristic(LibraryWalk walk, int depth, int start, LibraryKind kind) {}

    /** A parm begins. */
    void parm(int start) {}

    /** The name of a parameter has been read. */
    void name(LibraryWalk walk) {}

    /** The value of a parameter has been read. */
    void value(int end) {}

    /** The innermost characteristic or parm is over. */
    void end(int end) {}
}
