package com.qvomacp.support;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;
import java.util.HexFormat;

/** Writes bytes as tests show them. */
public final class Bytes {
    private Bytes() {}

    /** Hexadecimal digits with texts in between: {@code "87 11 06 03 'NAP1' 00 01"}. */
    public static byte[] of(String shown) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        String[] parts = shown.split("'", -1);
        for (int i = 0; i < parts.length; ++i) {
            bytes.writeBytes(
                    i % 2 == 1
                            ? parts[i].getBytes(StandardCharsets.UTF_8)
                            : HexFormat.of().parseHex(parts[i].replace(" ", "")));
        }
        return bytes.toByteArray();
    }

    /** So many bytes: the head, and the pattern over and over. */
    public static byte[] repeated(int length, String head, String pattern) {
        byte[] bytes = Arrays.copyOf(of(head), length);
        byte[] again = of(pattern);
        for (int at = of(head).length, i = 0; at < length; ++at, ++i) {
            bytes[at] = again[i % again.length];
        }
        return bytes;
    }
}
