package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.io.FileInputStream;
import java.io.FileNotFoundException;
import java.io.IOException;
import java.io.InputStream;
import java.nio.file.AccessDeniedException;
import java.nio.file.FileAlreadyExistsException;
import java.nio.file.Files;
import java.nio.file.InvalidPathException;
import java.nio.file.NoSuchFileException;
import java.nio.file.OpenOption;
import java.nio.file.Paths;
import java.nio.file.StandardOpenOption;

/** Reads what a file holds, or standard input; and writes files. */
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
        byte[] content;
        try {
            if (file.equals(STANDARD_INPUT)) {
                content = read(standardInput, limit);
            } else {
                try (InputStream in = open(file)) {
                    content = read(in, limit);
                }
            }
        } catch (IOException | InvalidPathException unreadable) {
            throw new IOException(reason(unreadable, "cannot be read: "), unreadable);
        }
        if (content == null) {
            String longer = "is longer than " + limit + " bytes; --limit has more of them read";
            throw new IOException(longer);
        }
        return content;
    }

    /** Opens a file in the way that costs least; where that fails, in the way that tells why. */
    private static InputStream open(String file) throws IOException {
        try {
            return new FileInputStream(file);
        } catch (FileNotFoundException unopened) {
            return Files.newInputStream(Paths.get(file));
        }
    }

    /**
     * Writes a file, which may be there already when that is said.
     *
     * @throws IOException with a sentence for people
     */
    static void write(String file, byte[] content, boolean mayBeThere) throws IOException {
        OpenOption[] onlyNew = {StandardOpenOption.CREATE_NEW, StandardOpenOption.WRITE};
        try {
            Files.write(Paths.get(file), content, mayBeThere ? new OpenOption[0] : onlyNew);
        } catch (FileAlreadyExistsException there) {
            throw new IOException("is there already; --force overwrites it", there);
        } catch (IOException | InvalidPathException unwritable) {
            throw new IOException(reason(unwritable, "cannot be written: "), unwritable);
        }
    }

    /** All bytes; null when there are more than the limit. */
    private static byte[] read(InputStream in, int limit) throws IOException {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        byte[] block = new byte[8192];
        for (int n = in.read(block); n >= 0; n = in.read(block)) {
            if (n > limit - bytes.size()) {
                return null;
            }
            bytes.write(block, 0, n);
        }
        return bytes.toByteArray();
    }

    /** Many exceptions carry no more than the file's name. */
    private static String reason(Exception failure, String otherwise) {
        if (failure instanceof NoSuchFileException) {
            return "no such file";
        }
        if (failure instanceof AccessDeniedException) {
            return "permission denied";
        }
        if ("Is a directory".equals(failure.getMessage())) {
            return "is a directory";
        }
        return otherwise + failure.getMessage();
    }
}
