package com.qvomacp.eng.omacp;

import java.nio.charset.Charset;
import java.nio.charset.CharsetEncoder;
import java.nio.charset.StandardCharsets;

/** A character set of texts, by the number that IANA assigns (MIBenum). */
final class CharacterSet {
    static final int NOT_STATED = 0;
    static final char REPLACEMENT = '\uFFFD';

    private static final int UTF_8_NUMBER = 106;

    static final CharacterSet UTF_8 = new CharacterSet(UTF_8_NUMBER, "UTF-8", null, 1, true);

    private static final String UCS_2 = "ISO-10646-UCS-2";

    /** The numbers and the names. Java has the same names, but none of UCS-2. */
    private static final String[] ROWS =
            ("3 US-ASCII 4 ISO-8859-1 5 ISO-8859-2 6 ISO-8859-3 7 ISO-8859-4 8 ISO-8859-5 "
                            + "9 ISO-8859-6 10 ISO-8859-7 11 ISO-8859-8 12 ISO-8859-9 13 ISO-8859-10 "
                            + "17 Shift_JIS 18 EUC-JP 38 EUC-KR 39 ISO-2022-JP 109 ISO-8859-13 "
                            + "110 ISO-8859-14 111 ISO-8859-15 112 ISO-8859-16 113 GBK 114 GB18030 "
                            + "1000 ISO-10646-UCS-2 1013 UTF-16BE 1014 UTF-16LE 1015 UTF-16 2025 GB2312 "
                            + "2026 Big5 2084 KOI8-R 2088 KOI8-U 2250 windows-1250 2251 windows-1251 "
                            + "2252 windows-1252 2253 windows-1253 2254 windows-1254 2255 windows-1255 "
                            + "2256 windows-1256 2257 windows-1257 2258 windows-1258 2259 TIS-620")
                    .split(" ");

    private final long number;
    private final String name;

    /** What decodes texts; {@code null} for UTF-8, which is decoded here. */
    private final Charset charset;

    /** How many bytes of zero end a text. */
    private final int unit;

    /** Whether bytes below 80 hexadecimal are characters of ASCII, whatever stands around them. */
    private final boolean ascii;

    private CharacterSet(long number, String name, Charset charset, int unit, boolean ascii) {
        this.number = number;
        this.name = name;
        this.charset = charset;
        this.unit = unit;
        this.ascii = ascii;
    }

    /**
     * The character set of a number. UTF-8 when none is stated; ISO-8859-1, which has a character for
     * every byte, for one that is not known or that the platform lacks.
     */
    static CharacterSet of(long number) {
        if (number == UTF_8_NUMBER) {
            return UTF_8;
        }
        if (number == NOT_STATED) {
            return new CharacterSet(number, null, null, 1, true);
        }
        String digits = Long.toString(number);
        for (int i = 0; i < ROWS.length; i += 2) {
            if (ROWS[i].equals(digits)) {
                String name = ROWS[i + 1];
                String java = name.equals(UCS_2) ? "UTF-16" : name;
                int unit = java.startsWith("UTF-16") ? 2 : 1;
                boolean ascii = unit == 1 && !java.startsWith("ISO-2022");
                return new CharacterSet(number, name, charset(java), unit, ascii);
            }
        }
        return new CharacterSet(number, null, StandardCharsets.ISO_8859_1, 1, true);
    }

    private static Charset charset(String name) {
        try {
            return Charset.forName(name);
        } catch (IllegalArgumentException e) {
            return StandardCharsets.ISO_8859_1;
        }
    }

    /** The number of a name, in any case, or {@link #NOT_STATED} for one that is not known. */
    static int number(String name) {
        if (name.equalsIgnoreCase(UTF_8.name)) {
            return UTF_8_NUMBER;
        }
        for (int i = 0; i < ROWS.length; i += 2) {
            if (name.equalsIgnoreCase(ROWS[i + 1])) {
                return Integer.parseInt(ROWS[i]);
            }
        }
        return NOT_STATED;
    }

    /** What encodes texts, without a byte order mark in each. */
    CharsetEncoder newEncoder() {
        if (unit > 1 && charset != StandardCharsets.UTF_16LE) {
            return StandardCharsets.UTF_16BE.newEncoder();
        }
        return (charset == null ? StandardCharsets.UTF_8 : charset).newEncoder();
    }

    long number() {
        return number;
    }

    /** Whether a byte below 80 hexadecimal is a character of ASCII, whatever stands around it. */
    boolean isAscii() {
        return ascii;
    }

    /** The name, or {@code null} for a number that stands for none that is known. */
    String name() {
        return name;
    }

    /** How many bytes of zero end a text. */
    int unit() {
        return unit;
    }

    /** Where the zero stands that ends a text, or {@code end} when there is none. */
    int zero(byte[] bytes, int from, int end) {
        int at = from;
        if (unit == 1) {
            while (at < end && bytes[at] != 0) {
                ++at;
            }
            return at;
        }
        while (at + 1 < end) {
            if (bytes[at] == 0 && bytes[at + 1] == 0) {
                return at;
            }
            at += unit;
        }
        return end;
    }

    /** The text of some bytes. What they have no character for is U+FFFD. */
    String decode(byte[] bytes, int from, int to) {
        if (from == to) {
            return "";
        }
        int at = from;
        if (ascii) {
            while (at < to && bytes[at] >= 0) {
                ++at;
            }
            if (at == to) {
                return latin1(bytes, from, to);
            }
        }
        return charset == null ? utf8(bytes, from, to) : new String(bytes, from, to - from, charset);
    }

    /** The text of bytes as ISO-8859-1, by the constructor that is faster than that charset. */
    @SuppressWarnings("deprecation")
    static String latin1(byte[] bytes, int from, int to) {
        return from == to ? "" : new String(bytes, 0, from, to - from);
    }

    /**
     * UTF-8, decoded here, so that every virtual machine has as many U+FFFD for the same mistake: one
     * for each longest run of bytes that a character could begin with, as Unicode recommends.
     */
    private static String utf8(byte[] bytes, int from, int to) {
        char[] chars = new char[to - from];
        int count = 0;
        for (int at = from; at < to; ) {
            int lead = bytes[at++] & 0xFF;
            if (lead < 0x80) {
                chars[count++] = (char) lead;
                continue;
            }
            int more = lead < 0xC2 ? 0 : lead < 0xE0 ? 1 : lead < 0xF0 ? 2 : lead < 0xF5 ? 3 : 0;
            int point = lead & 0x3F >> more;
            // What may follow the first byte is less for those that begin a form that is too long, a
            // surrogate, or a number above the last code point.
            int lowest = lead == 0xE0 ? 0xA0 : lead == 0xF0 ? 0x90 : 0x80;
            int highest = lead == 0xED ? 0x9F : lead == 0xF4 ? 0x8F : 0xBF;
            int left = more;
            while (left > 0 && at < to) {
                int next = bytes[at] & 0xFF;
                if (next < lowest || next > highest) {
                    break;
                }
                point = point << 6 | next & 0x3F;
                lowest = 0x80;
                highest = 0xBF;
                ++at;
                --left;
            }
            if (more == 0 || left > 0) {
                chars[count++] = REPLACEMENT;
            } else if (more < 3) {
                chars[count++] = (char) point;
            } else {
                chars[count++] = Character.highSurrogate(point);
                chars[count++] = Character.lowSurrogate(point);
            }
        }
        return new String(chars, 0, count);
    }
}
