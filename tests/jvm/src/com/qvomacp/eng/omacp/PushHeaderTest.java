package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.support.HeaderGrammar;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;
import java.util.Locale;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The header of a push, in all the forms that WSP allows and some that it does not. */
class PushHeaderTest {
    private static final String MAC = "0BB3BB551F0A93359EC29E6CEAC1440E4A617489";
    private static final String WBXML = "application/vnd.wap.connectivity-wbxml";

    /** Hexadecimal digits, with texts between apostrophes, to bytes. */
    private static byte[] bytes(String text) {
        StringBuilder digits = new StringBuilder();
        String[] parts = text.split("'", -1);
        for (int i = 0; i < parts.length; ++i) {
            if (i % 2 == 0) {
                digits.append(parts[i].replace(" ", ""));
            } else {
                parts[i].chars().forEach(c -> digits.append(String.format("%02X", c)));
            }
        }
        return HexFormat.of().parseHex(digits);
    }

    /** A push with these headers, and a body that has nothing to say. */
    private static byte[] push(String headers) {
        byte[] header = bytes(headers);
        assertTrue(header.length < 128);
        String digits = HexFormat.of().formatHex(header);
        return bytes(String.format("0106%02X%s030B6A00", header.length, digits));
    }

    private static PushHeader parse(String headers) throws ProvisioningException {
        byte[] push = push(headers);
        PushHeader header = PushHeader.parse(push);
        assertEquals(push.length - 4, header.length());
        assertEveryByteIsDescribed(header);
        return header;
    }

    private static List<String> texts(List<HeaderField> fields) {
        List<String> texts = new ArrayList<>();
        for (HeaderField field : fields) {
            texts.add(field.name() + "=" + field.value());
        }
        return texts;
    }

    private static List<String> describe(PushHeader header) {
        List<String> lines = new ArrayList<>();
        header.describe(
                (offset, length, depth, meaning) ->
                        lines.add(offset + "+" + length + " " + depth + " " + meaning));
        return lines;
    }

    private static void assertEveryByteIsDescribed(PushHeader header) {
        int[] at = {0};
        header.describe(
                (offset, length, depth, meaning) -> {
                    assertEquals(at[0], offset);
                    assertTrue(length > 0 && depth >= 0 && depth < 2, meaning);
                    at[0] += length;
                });
        assertEquals(header.length(), at[0]);
    }

    private static void assertSecured(PushHeader header) {
        assertEquals(WBXML, header.contentType().mediaType());
        assertEquals(54, header.contentType().code());
        assertEquals(SecurityMethod.USERPIN, header.securityMethod());
        assertEquals(MAC, header.mac());
    }

    @Test
    void readsWhatProvisioningServersSend() throws Exception {
        byte[] push = bytes("2A 06 2F 1F 2D B6 91 81 92 '" + MAC + "' 00 030B6A");
        PushHeader header = PushHeader.parse(push);
        assertSecured(header);
        assertEquals(0x2A, header.transactionIdentifier());
        assertEquals(50, header.length());
        assertEquals(8, header.macOffset());
        assertEquals(List.of(), header.fields());
        List<String> parameters = texts(header.contentType().parameters());
        assertEquals(List.of("SEC=USERPIN", "MAC=" + MAC), parameters);
        assertEquals(
                List.of(
                        "0+1 0 transaction identifier 42",
                        "1+1 0 push",
                        "2+1 0 header length 47",
                        "3+2 0 length of the content type",
                        "5+1 1 content type: " + WBXML,
                        "6+2 1 SEC: USERPIN",
                        "8+42 1 MAC: " + MAC),
                describe(header));
    }

    @Test
    void readsHeadersAsAPlatformHandsThemOut() throws Exception {
        byte[] push = bytes("2A 06 2F 1F 2D B6 91 81 92 '" + MAC + "' 00");
        PushHeader header = PushHeader.parseHeaders(Arrays.copyOfRange(push, 3, push.length));
        assertSecured(header);
        assertEquals(-1, header.transactionIdentifier());
        assertEquals(47, header.length());
        assertEquals(5, header.macOffset());
        assertEveryByteIsDescribed(header);
        assertNotEquals(PushHeader.parse(push), header);
    }

    @Test
    void readsEveryFormThatTheGrammarMakes() throws Exception {
        for (long seed = 0; seed < 20000; ++seed) {
            HeaderGrammar made = new HeaderGrammar(seed);
            PushHeader header = PushHeader.parse(made.bytes);
            String message = "seed " + seed + ": " + HexFormat.of().formatHex(made.bytes);
            assertEquals(made.transaction, header.transactionIdentifier(), message);
            assertEquals(made.bytes.length, header.length(), message);
            assertEquals(made.mediaType, header.contentType().mediaType(), message);
            assertEquals(made.code, header.contentType().code(), message);
            List<String> parameters = texts(header.contentType().parameters());
            assertEquals(made.parameters.toString(), parameters.toString(), message);
            assertEquals(made.fields.toString(), texts(header.fields()).toString(), message);
            String method = made.sec == null ? "NONE" : made.sec;
            assertEquals(method, header.securityMethod().name(), message);
            assertEquals(made.mac, header.mac(), message);
            assertEveryByteIsDescribed(header);
            byte[] headers = Arrays.copyOfRange(made.bytes, made.from, made.bytes.length);
            PushHeader alone = PushHeader.parseHeaders(headers);
            assertEquals(header.contentType(), alone.contentType());
            assertEquals(header.fields(), alone.fields());
            assertEquals(header, PushHeader.parse(made.bytes));
            assertEquals(header.hashCode(), PushHeader.parse(made.bytes).hashCode());
        }
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "1F2D B6 9181 92'%s'00",
                "1F802D B6 9181 92'%s'00",
                "1F2D B6 92'%s'00 9181",
                "1F31 B6 91020001 92'%s'00",
                "1F2E B6 910101 92'%s'00",
                "1F2E B6 9181 92 22'%s'00",
                "1F30 B6 81EA 9181 92 '%s'00 90",
                "1F34 0136 'sEc' 00 81 'Mac' 00 '%s'00",
                "1F35 020036 'sec'00'1'00 92'%s'00",
                "1F30 0136 01119181 9181 92'%s'00",
                "1F40 B6 85'x'00 81EA 91 81 'x-y'00 05 0102030405 92'%s'00",
                "1F56 'application/vnd.wap.connectivity-WBXML'00 9181 92'%s'00",
                "B6 9181 92'%s'00",
                "36 9181 92'%s'00",
                "B6 'SEC'00 81 'MAC'00'%s'00",
                "B6 AF82 9181 8D0401020304 92'%s'00",
                "B6 03 01 92'%s'00 91 81",
                "'Application/Vnd.Wap.Connectivity-Wbxml'00 9181 92'%s'00",
                "'application/vnd.wap.connectivity-wbxml; SEC=1; mac=%s'00",
                "'application/vnd.wap.connectivity-wbxml;sec=userpin ;MAC=\"%s\"'00",
                "1F7F B6 9181 92'%s'00",
                "1F01 B6 9181 92'%s'00",
                "1F05 B6 9181 92'%s'00",
                "1F2C B6 9181 92'%s'",
                "1F2F B6 0000 9181 92'%s'00",
            })
    void findsSecAndMacWhereverTheyAre(String form) throws Exception {
        PushHeader header = parse(String.format(form, MAC));
        if (form.startsWith("1F30 0136 0111")) {
            assertEquals(SecurityMethod.UNKNOWN, header.securityMethod(), "the first one counts");
            return;
        }
        assertSecured(header);
    }

    @Test
    void takesAHeaderLengthOfAnyWidth() throws Exception {
        String comment = "x".repeat(200);
        byte[] headers = bytes("1F 81 01 B6 9181 8C '" + comment.substring(0, 124) + "' 00 9182");
        for (String length : List.of("8106", "808106", "8080808106")) {
            byte[] push = bytes("0106" + length + HexFormat.of().formatHex(headers) + "03");
            PushHeader header = PushHeader.parse(push);
            assertEquals(push.length - 1, header.length());
            assertEquals(SecurityMethod.USERPIN, header.securityMethod());
            assertEquals(2 + length.length() / 2, header.contentType().offset());
            assertEveryByteIsDescribed(header);
        }
    }

    @ParameterizedTest
    @CsvSource({
        "80, NETWPIN", "81, USERPIN", "82, USERNETWPIN", "83, USERPINMAC", "84, UNKNOWN",
        "FF, UNKNOWN", "00, UNKNOWN", "0103, USERPINMAC", "0104, UNKNOWN", "03000002, USERNETWPIN",
        "'netwpin' 00, NETWPIN", "'3' 00, USERPINMAC", "'x' 00, UNKNOWN",
        "0A01020304050607080900, UNKNOWN"
    })
    void tellsTheSecurityMethod(String value, SecurityMethod method) throws Exception {
        String octets = value.replace('’', '\'');
        int length = bytes(octets).length + 2;
        PushHeader header = parse(String.format("1F %02X B6 91 %s", length, octets));
        assertEquals(method, header.securityMethod());
        assertNull(header.mac());
        assertEquals(-1, header.macOffset());
    }

    @Test
    void hasNoMethodAndNoMacWithoutThem() throws Exception {
        PushHeader header = parse("B6");
        assertEquals(SecurityMethod.NONE, header.securityMethod());
        assertNull(header.mac());
        assertEquals(List.of(), header.contentType().parameters());
    }

    @ParameterizedTest
    @CsvSource({
        "91 B6, Content-Type=application/vnd.wap.connectivity-wbxml",
        "92 04 3B9ACA00, Date=2001-09-09T01:46:40Z",
        "92 'Sun' 00, Date=Sun",
        "92 85, Date=1970-01-01T00:00:05Z",
        "92 07 FFFFFFFFFFFFFF, Date=72057594037927935",
        "AF 84, X-Wap-Application-Id=x-wap-application:mms.ua",
        "AF 02 4001, X-Wap-Application-Id=16385",
        "AF 'x-wap-application:y' 00, X-Wap-Application-Id=x-wap-application:y",
        "B4 87, 'Push-Flag=authenticated, trusted, last'",
        "B4 80, Push-Flag=0",
        "B4 88, Push-Flag=8",
        "C3 94, Encoding-Version=1.4",
        "C3 1F 02 94 95, Encoding-Version=9495",
        "8D 02 0123, Content-Length=291",
        "8D 1F 02 0123, Content-Length=0123",
        "80 B7, Accept=application/pkcs7-mime",
        "81 EA, Accept-Charset=UTF-8",
        "B0 00, X-Wap-Content-URI=",
        "B0 7F 'a' 00, X-Wap-Content-URI=a",
        "B0 22 'a' 00, X-Wap-Content-URI=a",
        "A7 80, Transfer-Encoding=0",
        "C2 1F 03 010203, Cookie=010203",
        "FE 81, 0x7E=1",
        "'X' 00 'y' 00, X=y",
        "8D 05 0123, Content-Length=0123",
        "8D 1F 05 0123, Content-Length=0123",
        "8D, Content-Length=null",
        "'X' 00, X=null",
        "58, X=null",
    })
    void keepsFurtherHeaders(String field, String expected) throws Exception {
        PushHeader header = parse("01 B6 " + field);
        assertEquals(List.of(expected), texts(header.fields()));
        assertEquals(5, header.fields().get(0).offset());
        assertEquals(header.length() - 5, header.fields().get(0).length());
        assertEquals(SecurityMethod.NONE, header.securityMethod());
        assertNull(header.mac());
    }

    @Test
    void followsTheCodePagesOfHeaders() throws Exception {
        PushHeader header = parse("B6 7F10 91 81 01 AF82 03 92 'AB' 00 00");
        assertEquals(
                List.of(
                        "0x11 of code page 16=1",
                        "X-Wap-Application-Id=x-wap-application:wml.ua",
                        "0x12 of code page 3=AB"),
                texts(header.fields()));
        assertEquals(SecurityMethod.NONE, header.securityMethod());
        assertNull(header.mac());
        assertEquals(
                List.of(
                        "4+2 0 headers of code page 16",
                        "6+2 0 0x11 of code page 16: 1",
                        "8+1 0 headers of code page 1",
                        "9+2 0 X-Wap-Application-Id: x-wap-application:wml.ua",
                        "11+1 0 headers of code page 3",
                        "12+4 0 0x12 of code page 3: AB",
                        "16+1 0 no header"),
                describe(header).subList(4, 11));
    }

    @ParameterizedTest
    @CsvSource({
        "80 01, Q=0.00", "80 64, Q=0.99", "80 8331, Q=0.333", "80 00, Q=0", "80 FF7F, Q=16383",
        "82 93, level=1.3", "82 9F, level=1", "82 '2' 00, level=2", "83 85, type=5",
        "89 B6, type=application/vnd.wap.connectivity-wbxml", "81 80, charset=*",
        "81 'utf-8' 00, charset=utf-8", "81 02 03E8, charset=ISO-10646-UCS-2",
        "87 B0, differences=X-Wap-Content-URI", "88 81, padding=1", "8E 02 0E10, max-age=3600",
        "90 00, secure=null", "93 04 3B9ACA00, creation-date=2001-09-09T01:46:40Z",
        "96 03 010000, size=65536", "98 22 'a b' 00, filename=a b", "85 7F E4 00, name=\u00e4",
        "BF 81, 0x3F=1", "02 0102 81, 0x102=1", "'x' 00 02 0102, x=258",
        "'x' 00 1F 02 0102, x=0102",
        "85 8A, name=10", "'q' 00 '0.5' 00, q=0.5", "05 0102030405, null"
    })
    void readsEveryKindOfParameter(String parameter, String expected) throws Exception {
        int length = bytes(parameter).length + 1;
        PushHeader header = parse(String.format("%02X B6 %s AF82", length, parameter));
        List<String> parameters = texts(header.contentType().parameters());
        assertEquals(expected.equals("null") ? List.of() : List.of(expected), parameters);
        assertEquals(1, header.fields().size());
        assertEquals(3, header.contentType().offset());
        assertEquals(length + 1, header.contentType().length());
    }

    @ParameterizedTest
    @CsvSource({
        "'', 0", "01, 1", "01 07 01 B6, 1", "03 0B 6A 00, 1", "01 06, 2", "01 06 80, 2",
        "01 06 FFFFFFFF7F B6, 2", "01 06 FFFFFFFFFF7F B6, 2", "01 06 00, 3", "01 06 00 B6, 3",
        "01 06 02 B6, 2", "01 06 8080 B6, 2", "01 06 01 00, 4", "01 06 01 01, 4",
        "01 06 02 1F00, 5", "01 06 02 '; ', 3", "01 06 02 2200, 3", "01 06 02 1F B6, 5",
        "01 06 03 02 02 36, 4", "01 06 03 02 00 36, 4",
        "01 06 03 02 1F 36, 4", "01 06 06 05 05 0000000036, 4", "01 06 07 06 05 0100000036, 4"
    })
    void isNoHeaderWithoutLengthAndMediaType(String push, int offset) {
        ProvisioningException refused =
                assertThrows(ProvisioningException.class, () -> PushHeader.parse(bytes(push)));
        assertEquals(Reason.NO_PUSH_HEADER, refused.reason());
        assertEquals(offset, refused.offset(), refused.getMessage());
        assertFalse(refused.getMessage().isEmpty());
    }

    @Test
    void readsALongMediaTypeWithLeadingZeros() throws Exception {
        assertEquals(54, parse("07 06 000000000036").contentType().code());
        assertEquals("0x301", parse("03 02 0301").contentType().mediaType());
        assertEquals("application/vnd.syncml+wbxml", parse("03 02 0303").contentType().mediaType());
    }

    @Test
    void toldLinesHoldNeitherValuesNorControlCharacters() throws Exception {
        PushHeader header = parse("1F3F 'a/b' 0A1B00 9181 92'" + MAC + "'00 'k' 0A00 'secret' 00");
        for (Object told :
                List.of(header, header.contentType(), header.contentType().parameters().get(2))) {
            String line = told.toString();
            assertTrue(line.chars().allMatch(c -> c >= ' ' && c < 0x7F), line);
            assertFalse(line.contains(MAC) || line.contains("secret"), line);
        }
    }

    @Test
    void neverAnswersAnythingElseToAnyBytes() {
        Random random = new Random(1);
        int read = 0;
        for (int i = 0; i < 200000; ++i) {
            byte[] push;
            if (i % 2 == 0) {
                push = new byte[random.nextInt(40)];
                random.nextBytes(push);
                if (push.length > 2) {
                    push[1] = 6;
                    push[2] = (byte) random.nextInt(push.length);
                }
            } else {
                push = new HeaderGrammar(i).bytes;
                for (int changes = 1 + random.nextInt(3); changes > 0; --changes) {
                    push[random.nextInt(push.length)] = (byte) random.nextInt(256);
                }
                boolean isCut = random.nextBoolean();
                push = isCut ? Arrays.copyOf(push, random.nextInt(push.length)) : push;
            }
            try {
                PushHeader header = PushHeader.parse(push);
                assertTrue(header.length() <= push.length);
                assertEveryByteIsDescribed(header);
                ++read;
            } catch (ProvisioningException refused) {
                assertEquals(Reason.NO_PUSH_HEADER, refused.reason());
                assertTrue(refused.offset() >= 0 && refused.offset() <= push.length);
            }
        }
        assertTrue(read > 50000, read + " read");
    }

    @ParameterizedTest
    @ValueSource(
            strings = {"00", "01", "7F10", "8080", "9222", "924100", "41004100", "1F1F", "920041"})
    void readsAMebibyteOfAnything(String piece) throws Exception {
        byte[] unit = bytes(piece);
        byte[] headers = new byte[1 << 20];
        headers[0] = (byte) 0xB6;
        for (int at = 1; at < headers.length; ++at) {
            headers[at] = unit[(at - 1) % unit.length];
        }
        assertEveryByteIsDescribed(PushHeader.parseHeaders(headers));
        byte[] parameters = new byte[headers.length + 4];
        System.arraycopy(bytes("1F FF FF 7F"), 0, parameters, 0, 4);
        System.arraycopy(headers, 0, parameters, 4, headers.length);
        assertEveryByteIsDescribed(PushHeader.parseHeaders(parameters));
    }

    @Test
    void namesAreReadInAnyLocale() throws Exception {
        Locale usual = Locale.getDefault();
        try {
            Locale.setDefault(Locale.forLanguageTag("tr"));
            assertEquals(46, parse("'APPLICATION/VND.WAP.SIC' 00").contentType().code());
        } finally {
            Locale.setDefault(usual);
        }
    }
}
