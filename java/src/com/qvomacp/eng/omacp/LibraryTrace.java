package com.qvomacp.eng.omacp;

/** What a {@link LibraryWalk} tells of the elements that it reads, in the order of the body. */
interface LibraryTrace {
    /**
     * The attributes of a characteristic have been read.
     *
     * @param depth how many characteristics it stands in
     * @param start where it begins
     * @param kind null when its type is none that the library knows
     * @param type as the message names it; null when there is none
     */
    void characteristic(int depth, int start, LibraryKind kind, String type);

    /** A characteristic is over, at its END or where it begins, since it has no content. */
    void characteristicEnd(int start, int end);

    /** A parm begins. */
    void parm(int start);

    /** The name of a parameter is known; null when it is none that the library knows. */
    void name(String name);

    /** The value of a parameter has been read. */
    void value(int start, int end);

    /** A parm is over. */
    void parmEnd(int start, int end);
}
