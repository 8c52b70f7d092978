package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.util.SplittableRandom;

/** Draws from a seed, and what is drawn often: numbers, bytes, one out of several. */
final class Draw {
    private final SplittableRandom random;

    Draw(long seed) {
        random = new SplittableRandom(seed);
    }

    /** A number below the bound. */
    int below(int bound) {
        return random.nextInt(bound);
    }

    int between(int least, int most) {
        return least + random.nextInt(most - least + 1);
    }

    boolean chance(double part) {
        return random.nextDouble() < part;
    }

    double part() {
        return random.nextDouble();
    }

    int of(int... choices) {
        return choices[random.nextInt(choices.length)];
    }

    @SafeVarargs
    @SuppressWarnings("varargs")
    final <T> T one(T... choices) {
        return choices[random.nextInt(choices.length)];
    }

    byte[] bytes(int count) {
        byte[] bytes = new byte[count];
        for (int i = 0; i < count; ++i) {
            bytes[i] = (byte) random.nextInt(256);
        }
        return bytes;
    }

    /** A multi-byte integer, behind so many bytes that add nothing. */
    static byte[] integer(long value, int extra) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        for (int i = 0; i < extra; ++i) {
            out.write(0x80);
        }
        for (int shift = 28; shift > 0; shift -= 7) {
            if (value >> shift != 0) {
                out.write(0x80 | (int) (value >> shift) & 0x7F);
            }
        }
        out.write((int) value & 0x7F);
        return out.toByteArray();
    }
}
