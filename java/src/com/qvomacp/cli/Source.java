package com.qvomacp.cli;

import java.util.Arrays;
import java.util.Base64;

/**
 * A message that is to be read: a push, or the WBXML body of one alone. It may be given as its bytes,
 * as hexadecimal text or in base64; which of them it is shows in its content.
 */
final class Source {
    private static final int PUSH = 0x06;
    private static final int LAST_WBXML_VERSION = 0x03;

    /** For people. */
    final String name;

    final byte[] bytes;

    /** False for a body alone. */
    final boolean isPush;

    Source(String name, byte[] bytes) {
        this.name = name;
        this.bytes = bytes;
        this.isPush = !isBody(bytes);
    }

    static Source of(Input input) {
        return new Source(input.name, decode(input.content));
    }

    /** The public identifier of a body is no 6, which is the type of a push in the same place. */
    private static boolean isBody(byte[] bytes) {
        return bytes.length > 1
                && bytes[0] >= 0
                && bytes[0] <= LAST_WBXML_VERSION
                && bytes[1] != PUSH;
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
        return bytes.length > 1 && (bytes[1] == PUSH || isBody(bytes));
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
        byte[] letters = new byte[content.length];
        int count = 0;
        for (byte b : content) {
            if (!Character.isWhitespace(b)) {
                letters[count++] = b == '-' ? (byte) '+' : b == '_' ? (byte) '/' : b;
            }
        }
        try {
            return count == 0 ? null : Base64.getDecoder().decode(Arrays.copyOf(letters, count));
        } catch (IllegalArgumentException other) {
            return null;
        }
    }
}
