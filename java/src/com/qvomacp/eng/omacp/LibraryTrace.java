package com.qvomacp.eng.omacp;

/** Hears of the elements that a {@link LibraryWalk} reads, in the order of the body. */
abstract class LibraryTrace {
    /**
     * The attributes of a characteristic have been read.
     *
     * @param depth how many characteristics it stands in
     * @param start where it begins
     * @param kind null when its type is none that the library knows
     * @param type as the message names it; null when there is none
     */
    abstract void characteristic(int depth, int start, LibraryKind kind, String type);

    /** A parm begins. */
    void parm(int start) {}

    /** The name of a parameter is known; null when it is none that the library knows. */
    void name(String name) {}

    /** The value of a parameter has been read. */
    void value(int end) {}

    /** The innermost characteristic or parm is over. */
    void end(int end) {}
}
