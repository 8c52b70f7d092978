package com.qvomacp.cli;

import java.io.BufferedWriter;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.OutputStreamWriter;
import java.io.PrintWriter;
import java.nio.charset.StandardCharsets;

/** What the program reads and writes, and the status that it ends with. */
final class Console {
    static final int DONE = 0;
    static final int REFUSED = 1;
    static final int FAILED = 2;

    final InputStream in;
    final PrintWriter out;
    final PrintWriter err;
    final Terminal terminal;
    private int status = DONE;

    Console(InputStream in, OutputStream out, OutputStream err, Terminal terminal) {
        this.in = in;
        this.out = writer(new Output(out));
        this.err = writer(err);
        this.terminal = terminal;
    }

    private static PrintWriter writer(OutputStream to) {
        return new PrintWriter(
                new BufferedWriter(new OutputStreamWriter(to, StandardCharsets.UTF_8)));
    }

    /** Writes to standard error, in its place among what has been written. */
    void complain(String text) {
        out.flush();
        err.print(text);
        err.flush();
    }

    int status() {
        return status;
    }

    /** The status is the worst of all files. */
    void raise(int raised) {
        status = Math.max(status, raised);
    }
}
