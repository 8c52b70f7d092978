package com.qvomacp.cli;

import java.io.BufferedWriter;
import java.io.FilterOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.OutputStreamWriter;
import java.io.PrintWriter;
import java.io.UncheckedIOException;
import java.nio.charset.StandardCharsets;

/** What the program reads and writes, and the status that it ends with. */
final class Console {
    static final int DONE = 0;
    static final int REFUSED = 1;
    static final int FAILED = 2;

    /** Ends the work when it cannot be written; a {@link PrintWriter} would only remember. */
    private static final class Output extends FilterOutputStream {
        Output(OutputStream out) {
            super(out);
        }

        @Override
        public void write(byte[] bytes, int from, int count) {
            try {
                out.write(bytes, from, count);
            } catch (IOException failed) {
                throw new UncheckedIOException(failed);
            }
        }

        @Override
        public void flush() {
            try {
                out.flush();
            } catch (IOException failed) {
                throw new UncheckedIOException(failed);
            }
        }
    }

    final InputStream in;
    final PrintWriter out;
    private final Output bytes;
    final PrintWriter err;
    final Terminal terminal;

    /** The worst of all files. */
    int status = DONE;

    Console(InputStream in, OutputStream out, OutputStream err, Terminal terminal) {
        this.in = in;
        this.bytes = new Output(out);
        this.out = writer(bytes);
        this.err = writer(err);
        this.terminal = terminal;
    }

    private static PrintWriter writer(OutputStream to) {
        return new PrintWriter(
                new BufferedWriter(new OutputStreamWriter(to, StandardCharsets.UTF_8)));
    }

    /** Writes bytes to standard output, behind what has been written as text. */
    void write(byte[] content) {
        out.flush();
        bytes.write(content, 0, content.length);
        bytes.flush();
    }

    /** Writes to standard error, in its place among what has been written. */
    void complain(String text) {
        out.flush();
        err.print(text);
        err.flush();
    }

    void raise(int raised) {
        status = Math.max(status, raised);
    }
}
