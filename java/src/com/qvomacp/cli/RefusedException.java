package com.qvomacp.cli;

/** The library does not take the message; the text says which part of it, for people. */
final class RefusedException extends Exception {
    private static final long serialVersionUID = 1L;

    RefusedException(String reason) {
        super(reason);
    }
}
