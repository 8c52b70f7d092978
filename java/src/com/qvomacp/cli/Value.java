package com.qvomacp.cli;

import java.nio.charset.StandardCharsets;
import java.util.Arrays;

/** A text that the decoder puts together: as much of it as decides what is read next. */
final class Value {
    /** Longer than every name that is compared. */
    private static final int COMPARED = 32;

    private final byte[] start = new byte[COMPARED];
    private boolean held;
    private long length;

    /** Bytes of the text that the first piece continues; -1 when there is none. */
    long before = -1;

    boolean holdsText() {
        return held || before >= 0;
    }

    boolean isHeld() {
        return held;
    }

    long length() {
        return held ? length : Math.max(before, 0);
    }

    /** Appends bytes, which end the text at the first zero among them. */
    void append(byte[] data, int from, int to) {
        length = length();
        held = true;
        for (int i = from; i < to && data[i] != 0; ++i) {
            if (length < COMPARED) {
                start[(int) length] = data[i];
            }
            ++length;
        }
    }

    void append(String text) {
        byte[] bytes = text.getBytes(StandardCharsets.US_ASCII);
        append(bytes, 0, bytes.length);
    }

    /** Takes the place of what was there. */
    void replace(int onlyByte) {
        held = true;
        length = 1;
        start[0] = (byte) onlyByte;
    }

    /** Whether this is the text, byte for byte. A text that continues another one is none. */
    boolean is(String text) {
        byte[] bytes = text.getBytes(StandardCharsets.US_ASCII);
        return held
                && before < 0
                && length == bytes.length
                && Arrays.equals(bytes, Arrays.copyOf(start, bytes.length));
    }
}
