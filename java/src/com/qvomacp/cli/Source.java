package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.AccessDeniedException;
import java.nio.file.Files;
import java.nio.file.NoSuchFileException;
import java.nio.file.Paths;
import java.util.Arrays;
import java.util.Base64;

/**
 * A message that is to be read: a push, or the WBXML body of one alone, given as its bytes, as
 * hexadecimal text or in base64.
 */
final class Source {
    static final String STANDARD_INPUT = "-";

    private static final int PUSH = 0x06;
    private static final int DELETE = 0x7F;

    /** A push header that says no more than that a body follows. */
    private static final byte[] BARE_HEADER = {0x01, PUSH, 0x01, (byte) 0xB6};

    /** For people. */
    final String name;

    final byte[] bytes;

    /** False for a body alone. */
    final boolean isPush;

    Source(String name, byte[] bytes) {
        this.name = name;
        this.bytes = bytes;
        this.isPush = !BodyAnnotator.isDocument(bytes);
    }

    /** Reads a file, or standard input under its name. */
    static Source read(String file, InputStream in) throws IOException {
        return file.equals(STANDARD_INPUT)
                ? new Source(nameOf(file), decode(readAll(in)))
                : new Source(nameOf(file), decode(Files.readAllBytes(Paths.get(file))));
    }

    static String nameOf(String file) {
        return file.equals(STANDARD_INPUT) ? "standard input" : file;
    }

    /** Says for people why reading failed; many exceptions carry no more than the file's name. */
    static String reasonOf(Exception unreadable) {
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

    /** The message as the library takes it. */
    byte[] push() {
        return isPush ? bytes : push(bytes);
    }

    /** A body behind the least header that the library takes. */
    static byte[] push(byte[] body) {
        byte[] push = new byte[BARE_HEADER.length + body.length];
        System.arraycopy(BARE_HEADER, 0, push, 0, BARE_HEADER.length);
        System.arraycopy(body, 0, push, BARE_HEADER.length, body.length);
        return push;
    }

    /** Says for people what a text is that is no message; null for anything but a text. */
    String remark() {
        int digits = 0;
        int others = 0;
        for (byte b : bytes) {
            boolean isSpace = Character.isWhitespace(b);
            if (b < ' ' && !isSpace || b == DELETE) {
                return null;
            }
            boolean isDigit = Character.digit(b, 16) >= 0;
            digits += isDigit ? 1 : 0;
            others += isDigit || isSpace || isSeparator(b) ? 0 : 1;
        }
        if (bytes.length == 0) {
            return null;
        }
        if (bytes[0] == '<') {
            return "This is XML. What is pushed to a handset is the WBXML that encodes it.";
        }
        return digits % 2 != 0 && others == 0
                ? "This is hexadecimal text with an odd number of digits: " + digits + "."
                : "This is text, and neither hexadecimal nor base64 of a message.";
    }

    Annotation annotation() {
        return isPush ? Annotation.ofPush(bytes) : Annotation.ofBody(bytes);
    }

    private static byte[] readAll(InputStream in) throws IOException {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        byte[] block = new byte[8192];
        for (int n = in.read(block); n >= 0; n = in.read(block)) {
            bytes.write(block, 0, n);
        }
        return bytes.toByteArray();
    }

    /**
     * The bytes of the message: what a text stands for, anything else as it is.
     *
     * <p>No push is taken for text, since the second byte of every push, 0x06, occurs in neither
     * kind of text; nor is a body, for its first byte.
     */
    private static byte[] decode(byte[] content) {
        byte[] hexadecimal = ofHexadecimal(content);
        if (hexadecimal != null && isMessage(hexadecimal)) {
            return hexadecimal;
        }
        byte[] base64 = ofBase64(content);
        if (base64 != null && isMessage(base64)) {
            return base64;
        }
        return hexadecimal == null ? content : hexadecimal;
    }

    private static boolean isMessage(byte[] bytes) {
        return bytes.length > 1 && bytes[1] == PUSH || BodyAnnotator.isDocument(bytes);
    }

    /**
     * What hexadecimal digits stand for; null for anything else. White space, separators and {@code
     * 0x} in front of a byte are left out.
     */
    private static byte[] ofHexadecimal(byte[] content) {
        byte[] bytes = new byte[content.length / 2];
        int digits = 0;
        for (int i = 0; i < content.length; ++i) {
            byte b = content[i];
            boolean isPrefix =
                    b == '0'
                            && digits % 2 == 0
                            && i + 1 < content.length
                            && (content[i + 1] | ' ') == 'x';
            int digit = Character.digit(b, 16);
            if (isPrefix) {
                ++i;
            } else if (digit >= 0) {
                if (digits / 2 < bytes.length) {
                    bytes[digits / 2] = (byte) (bytes[digits / 2] << 4 | digit);
                }
                ++digits;
            } else if (!Character.isWhitespace(b) && !isSeparator(b)) {
                return null;
            }
        }
        return digits == 0 || digits % 2 != 0 ? null : Arrays.copyOf(bytes, digits / 2);
    }

    private static boolean isSeparator(byte b) {
        return b == ':' || b == ',' || b == ';' || b == '-';
    }

    /** What base64 of either alphabet stands for, white space left out; null for anything else. */
    private static byte[] ofBase64(byte[] content) {
        String text =
                new String(content, StandardCharsets.ISO_8859_1)
                        .replaceAll("\\s", "")
                        .replace('-', '+')
                        .replace('_', '/');
        try {
            return text.isEmpty() ? null : Base64.getDecoder().decode(text);
        } catch (IllegalArgumentException other) {
            return null;
        }
    }
}
