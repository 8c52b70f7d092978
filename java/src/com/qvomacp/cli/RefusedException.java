package com.qvomacp.cli;

/** The library does not take the message. */
final class RefusedException extends Exception {
    private static final long serialVersionUID = 1L;

    /** Whether it takes the push header, so that it is the body that it refuses. */
    final boolean headerTaken;

    RefusedException(boolean headerTaken) {
        super(headerTaken ? "the body is refused" : "the push header is refused");
        this.headerTaken = headerTaken;
    }
}
