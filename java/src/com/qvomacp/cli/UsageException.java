package com.qvomacp.cli;

/** Says what is wrong with a command line. */
final class UsageException extends RuntimeException {
    private static final long serialVersionUID = 1L;

    UsageException(String what) {
        super(what);
    }
}
