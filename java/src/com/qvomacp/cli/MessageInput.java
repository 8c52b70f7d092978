package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.nio.file.AccessDeniedException;
import java.nio.file.Files;
import java.nio.file.NoSuchFileException;
import java.nio.file.Paths;

/** Reads a pushed message that is given as its bytes or as hexadecimal text. */
final class MessageInput {
    private MessageInput() {}

    static byte[] read(String file) throws IOException {
        return decode(Files.readAllBytes(Paths.get(file)));
    }

    static byte[] read(InputStream in) throws IOException {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        byte[] block = new byte[8192];
        for (int n = in.read(block); n >= 0; n = in.read(block)) {
            bytes.write(block, 0, n);
        }
        return decode(bytes.toByteArray());
    }

    /** Says for people why reading failed; many exceptions carry no more than the file's name. */
    static String reasonOf(Exception unreadable) {
        if (unreadable instanceof NoSuchFileException) {
            return "no such file";
        }
        if (unreadable instanceof AccessDeniedException) {
            return "permission denied";
        }
        return "cannot be read: " + unreadable.getMessage();
    }

    /**
     * The bytes of the message: what hexadecimal text stands for, anything else as it is.
     *
     * <p>No push is taken for text, since the second byte of every push, 0x06, is neither a digit
     * nor white space.
     */
    private static byte[] decode(byte[] content) {
        int digits = 0;
        for (byte b : content) {
            if (Character.digit(b, 16) >= 0) {
                ++digits;
            } else if (!Character.isWhitespace(b)) {
                return content;
            }
        }
        if (digits == 0 || digits % 2 != 0) {
            return content;
        }
        byte[] bytes = new byte[digits / 2];
        int at = 0;
        for (byte b : content) {
            int digit = Character.digit(b, 16);
            if (digit >= 0) {
                bytes[at / 2] = (byte) (bytes[at / 2] << 4 | digit);
                ++at;
            }
        }
        return bytes;
    }
}
