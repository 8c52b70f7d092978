package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.nio.file.AccessDeniedException;
import java.nio.file.Files;
import java.nio.file.InvalidPathException;
import java.nio.file.NoSuchFileException;
import java.nio.file.Paths;

/** Reads what a file holds, or standard input. */
final class Input {
    static final String STANDARD_INPUT = "-";

    private Input() {}

    static String nameOf(String file) {
        return file.equals(STANDARD_INPUT) ? "standard input" : file;
    }

    /**
     * Reads a file, or standard input under its name, up to a limit.
     *
     * @throws IOException with a sentence for people
     */
    static byte[] read(String file, InputStream standardInput, int limit) throws IOException {
        try {
            if (file.equals(STANDARD_INPUT)) {
                return read(standardInput, limit);
            }
            try (InputStream in = Files.newInputStream(Paths.get(file))) {
                return read(in, limit);
            }
        } catch (TooLongException tooLong) {
            throw tooLong;
        } catch (IOException | InvalidPathException unreadable) {
            throw new IOException(reason(unreadable), unreadable);
        }
    }

    private static final class TooLongException extends IOException {
        private static final long serialVersionUID = 1L;

        TooLongException(int limit) {
            super("is longer than " + limit + " bytes; --limit has more of them read");
        }
    }

    private static byte[] read(InputStream in, int limit) throws IOException {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        byte[] block = new byte[8192];
        for (int n = in.read(block); n >= 0; n = in.read(block)) {
            if (n > limit - bytes.size()) {
                throw new TooLongException(limit);
            }
            bytes.write(block, 0, n);
        }
        return bytes.toByteArray();
    }

    /** Many exceptions carry no more than the file's name. */
    private static String reason(Exception unreadable) {
        if (unreadable instanceof NoSuchFileException) {
            return "no such file";
        }
        if (unreadable instanceof AccessDeniedException) {
            return "permission denied";
        }
        if ("Is a directory".equals(unreadable.getMessage())) {
            return "is a directory";
        }
        return "cannot be read: " + unreadable.getMessage();
    }
}
