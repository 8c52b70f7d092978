package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;

import com.qvomacp.support.Bytes;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** Texts of every character set, by the number of the body's header. */
class CharacterSetTest {
    private static final String TEXT = "a\u00E9\u3042";

    private static String decoded(int number, byte[] bytes) {
        return CharacterSet.of(number).decode(bytes, 0, bytes.length);
    }

    private static String utf8(String hexadecimal) {
        return decoded(106, Bytes.of(hexadecimal));
    }

    @ParameterizedTest
    @CsvSource({
        "3, US-ASCII", "4, ISO-8859-1", "5, ISO-8859-2", "6, ISO-8859-3", "7, ISO-8859-4",
        "8, ISO-8859-5", "9, ISO-8859-6", "10, ISO-8859-7", "11, ISO-8859-8", "12, ISO-8859-9",
        "13, ISO-8859-10", "17, Shift_JIS", "18, EUC-JP", "38, EUC-KR", "39, ISO-2022-JP",
        "106, UTF-8", "109, ISO-8859-13", "110, ISO-8859-14", "111, ISO-8859-15",
        "112, ISO-8859-16", "113, GBK", "114, GB18030", "1013, UTF-16BE", "1014, UTF-16LE",
        "1015, UTF-16", "2025, GB2312", "2026, Big5", "2084, KOI8-R", "2088, KOI8-U",
        "2250, windows-1250", "2251, windows-1251", "2252, windows-1252", "2253, windows-1253",
        "2254, windows-1254", "2255, windows-1255", "2256, windows-1256", "2257, windows-1257",
        "2258, windows-1258", "2259, TIS-620"
    })
    void aNumberStandsForACharacterSet(int number, String name) {
        assertEquals(name, CharacterSet.of(number).name());
        // What the platform lacks has a character for every byte all the same.
        Charset charset =
                Charset.isSupported(name) ? Charset.forName(name) : StandardCharsets.ISO_8859_1;
        byte[] bytes = TEXT.getBytes(charset);
        assertEquals(new String(bytes, charset), decoded(number, bytes));
        byte[] all = new byte[256];
        for (int i = 0; i < all.length; ++i) {
            all[i] = (byte) i;
        }
        if (number != 106) {
            assertEquals(new String(all, charset), decoded(number, all));
        }
    }

    @Test
    void aNumberThatIsNotKnownIsReadAsLatin1AndTold() throws Exception {
        byte[] body = Bytes.of("03 0B 87 67 00 45 87 11 06 03 E9 00 01 01");
        ProvisioningDocument document = ProvisioningDocument.parse(body);
        assertEquals("\u00E9", ((Parameter) document.children().get(0)).value());
        assertEquals(999, document.charset());
        assertNull(document.charsetName());
        assertEquals(Deviation.Kind.CHARSET, document.deviations().get(0).kind());
        assertEquals(2, document.deviations().get(0).offset());
    }

    @Test
    void noCharacterSetIsUtf8() throws Exception {
        byte[] body = Bytes.of("03 0B 00 00 45 87 11 06 03 C3 A9 00 01 01");
        ProvisioningDocument document = ProvisioningDocument.parse(body);
        assertEquals("\u00E9", ((Parameter) document.children().get(0)).value());
    }

    @Test
    void textsOfTwoByteCharactersEndAtTwoZeroBytes() throws Exception {
        // Inline, in the table, opaque; U+0100 has a zero byte of its own, and U+4100 too.
        String values = "87 11 06 03 41 00 01 00 00 00 01 87 11 06 83 04 01 87 11 06 C3 02 00 41 01";
        String table = "0A 00 42 00 00 41 00 00 43 00 00";
        for (int number : new int[] {1000, 1013, 1015}) {
            byte[] body = Bytes.of("03 0B" + (number == 1000 ? "87 68" : number == 1013 ? "87 75" : "87 77") + table + "45" + values + "01");
            ProvisioningDocument document = ProvisioningDocument.parse(body);
            assertEquals("\u4100\u0100", ((Parameter) document.children().get(0)).value());
            assertEquals("\u4100C", ((Parameter) document.children().get(1)).value());
            assertEquals("A", ((Parameter) document.children().get(2)).value());
        }
        byte[] little = Bytes.of("03 0B 87 76 00 45 87 11 06 03 00 41 00 01 00 00 01 01");
        ProvisioningDocument document = ProvisioningDocument.parse(little);
        assertEquals("\u4100\u0100", ((Parameter) document.children().get(0)).value());
    }

    @Test
    void utf8HasOneReplacementForEachMistake() {
        assertEquals("\uD83D\uDE00", utf8("F0 9F 98 80"));
        assertEquals("\uFFFD\uFFFD", utf8("C0 80"));
        assertEquals("\uFFFD\uFFFD\uFFFD", utf8("E0 80 80"));
        assertEquals("\uFFFD\uFFFD\uFFFD", utf8("ED A0 80"));
        assertEquals("\uFFFD\uFFFD\uFFFD\uFFFD", utf8("F4 90 80 80"));
        assertEquals("\uFFFDa", utf8("E3 81 61"));
        assertEquals("\uFFFD", utf8("F0 9F 98"));
        assertEquals("\uFFFD\uFFFD", utf8("FF FE"));
    }

    /** But for surrogates (ED), of which it makes one mistake, the platform's decoder does the same. */
    @Test
    void utf8IsDecodedAsUnicodeRecommends() {
        Random random = new Random(1);
        int[] leads = {
            0x41, 0x7F, 0x80, 0xBF, 0xC1, 0xC2, 0xDF, 0xE0, 0xE1, 0xEF, 0xF0, 0xF4, 0xF5};
        for (int round = 0; round < 300_000; ++round) {
            byte[] bytes = new byte[1 + random.nextInt(7)];
            for (int i = 0; i < bytes.length; ++i) {
                bytes[i] =
                        (byte)
                                (random.nextBoolean()
                                        ? leads[random.nextInt(leads.length)]
                                        : 0x80 + random.nextInt(0x40));
            }
            assertEquals(new String(bytes, StandardCharsets.UTF_8), decoded(106, bytes));
        }
        for (int point = 1; point <= Character.MAX_CODE_POINT; ++point) {
            if (point < Character.MIN_SURROGATE || point > Character.MAX_SURROGATE) {
                String text = new String(Character.toChars(point));
                assertEquals(text, decoded(106, text.getBytes(StandardCharsets.UTF_8)));
            }
        }
    }
}
