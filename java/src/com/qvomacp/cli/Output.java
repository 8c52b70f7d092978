package com.qvomacp.cli;

import java.io.FilterOutputStream;
import java.io.IOException;
import java.io.OutputStream;

/**
 * An output that ends the work when it cannot be written: a {@link java.io.PrintWriter} above it
 * would only remember.
 */
final class Output extends FilterOutputStream {
    /** Thrown out of whatever writes. */
    static final class ClosedError extends RuntimeException {
        private static final long serialVersionUID = 1L;

        private ClosedError(IOException cause) {
            super(cause);
        }

        /** Whether whoever reads has seen enough, which is no news to him. */
        boolean isBrokenPipe() {
            return "Broken pipe".equals(getCause().getMessage());
        }
    }

    Output(OutputStream out) {
        super(out);
    }

    @Override
    public void write(int b) {
        write(new byte[] {(byte) b}, 0, 1);
    }

    @Override
    public void write(byte[] bytes, int from, int count) {
        try {
            out.write(bytes, from, count);
        } catch (IOException failed) {
            throw new ClosedError(failed);
        }
    }

    @Override
    public void flush() {
        try {
            out.flush();
        } catch (IOException failed) {
            throw new ClosedError(failed);
        }
    }
}
