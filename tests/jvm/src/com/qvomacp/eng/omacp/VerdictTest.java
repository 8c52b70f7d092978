package com.qvomacp.eng.omacp;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document;
import com.qvomacp.support.Push;
import java.io.ByteArrayOutputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.HexFormat;
import java.util.List;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** What the verdict says of a message. That it is the library's own, tests/verdict shows. */
class VerdictTest {
    private static final ReadOptions LARGE = ReadOptions.DEFAULT.withInputLimit(4 << 20);
    private static final int SMALL_STACK = 64 << 10;

    private static Verdict of(byte[] body) {
        ProvisioningDocument document = null;
        try {
            document = ProvisioningDocument.parse(body, LARGE);
        } catch (ProvisioningException unreadable) {
            // The verdict is on bytes that nobody else can read, too.
        }
        return Verdict.onBody(body, document);
    }

    private static Verdict of(String hex) {
        return of(HexFormat.of().parseHex(hex.replace(" ", "")));
    }

    private static Verdict of(Document.Element... elements) {
        return of(document(elements));
    }

    private static Verdict ofPush(byte[] push) {
        return Verdict.onPush(push, push.length, null);
    }

    private static void assertRefused(Verdict verdict, int code, int offset, String reason) {
        assertFalse(verdict.isAccepted());
        assertEquals(reason, verdict.reason());
        assertEquals(code, verdict.code());
        assertEquals(offset, verdict.offset());
    }

    // ---- Bodies that the format and the library read differently

    @Test
    void takesTheEndOfTheDocumentForThatOfAnEmptyElement() {
        Verdict verdict = of("030b6a00 45 06 01");
        assertRefused(verdict, 4103, 7, "the body ends behind a characteristic");
        assertEquals(7, verdict.bytesRead());
        assertEquals("wap-provisioningdoc", verdict.path());
    }

    @Test
    void dropsAReferenceWithAllThatFollowsAsOneText() {
        Verdict verdict = of("030b6a05 6162636400 45 8301 C65501 871106037800 01 01 01");
        assertRefused(
                verdict,
                0,
                21,
                "the document is empty; skipped before: 11 bytes from offset 10 on, all up to a zero"
                        + " byte, as one text");
        assertEquals("QVS_OK", verdict.codeName());
        assertEquals("END (0x01)", verdict.found());
        assertEquals(22, verdict.bytesRead());
        assertEquals(3, verdict.readOtherwise().size(), "the text, the NAPDEF and its NAPID");
    }

    @Test
    void readsACharacterSetInWbxml10() {
        Verdict verdict = of("000b00 45 C65501 871106037800 01 01 01");
        assertRefused(verdict, 4103, 16, "the body ends within its string table of 69 bytes");
        assertEquals(16, verdict.bytesRead());
        assertEquals(2, verdict.readOtherwise().size(), "the NAPDEF and its NAPID");
    }

    // ---- Where and why

    @Test
    void acceptsWhatTheLibraryTakes() {
        byte[] body = document(characteristic("NAPDEF", parm("NAPID", "N")));
        Verdict verdict = of(body);
        assertTrue(verdict.isAccepted());
        assertFalse(verdict.isHeaderRefused());
        assertEquals(0, verdict.code());
        assertEquals("QVS_OK", verdict.codeName());
        assertEquals(body.length, verdict.bytesRead());
        assertEquals(-1, verdict.offset());
        assertNull(verdict.path());
        assertNull(verdict.found());
        assertNull(verdict.reason());
        assertEquals(List.of(), verdict.expected());
        assertEquals(List.of(), verdict.readOtherwise());
        assertEquals("accepted", verdict.toString());
    }

    @Test
    void tellsAParameterThatACharacteristicDoesNotHave() {
        Verdict verdict =
                of(
                        characteristic("NAPDEF", parm("NAPID", "M")),
                        characteristic("PORT", parm("PORTNBR", "80")),
                        characteristic("NAPDEF", parm("NAPID", "N"), parm("CLIENT-ID", "x")));
        assertRefused(verdict, 4101, 41, "CLIENT-ID (0x30) is no parameter of NAPDEF");
        assertEquals("QVS_ERROR_WBXML_UNKNOWN_ELEMENT", verdict.codeName());
        assertEquals("wap-provisioningdoc / NAPDEF 2 / parm", verdict.path());
        assertEquals("CLIENT-ID (0x30)", verdict.found());
        assertEquals(
                List.of("SWITCH_PAGE (0x00)", "END (0x01)", "NAME=text (0x05)", "NAME (0x07)"),
                verdict.expected().subList(0, 4));
        assertTrue(verdict.expected().contains("T-BIT (0x4C)"));
        assertEquals(
                "refused: CLIENT-ID (0x30) is no parameter of NAPDEF, 4101"
                        + " QVS_ERROR_WBXML_UNKNOWN_ELEMENT, offset 41, wap-provisioningdoc / NAPDEF 2"
                        + " / parm",
                verdict.toString());
    }

    @ParameterizedTest
    @CsvSource({
        "'', 2, 0, the body is empty",
        "03, 4107, 1, the body ends behind its version",
        "0300, 4107, 2, 'the body ends within its header, where its public identifier''s index is expected'",
        "030b, 4103, 2, 'the body ends within its header, where its character set is expected'",
        "030b6a, 4103, 3, 'the body ends within its header, where its string table''s length is expected'",
        "030b6a00, 4103, 4, the body ends behind its header",
        "030b6a05 6162, 4103, 6, the body ends within its string table of 5 bytes",
        "03046a00 45, 4107, 1, public identifier 4 is no provisioning document",
        "0300006a02 6100, 4107, 5, the string table does not begin with the type of a provisioning document",
        "03ffffffffff00, 4107, 1, the public identifier has no end",
        "030b6a00 01, 0, 4, the body holds no document",
        "030b6a00 00, 0, 4, the body ends within a SWITCH_PAGE",
        "030b6a00 0001, 0, 4, a document that begins with a SWITCH_PAGE is taken for an empty one",
        "030b6a00 87, 0, 4, a document that begins with a parm is taken for an empty one",
        "030b6a00 08, 4101, 4, element 0x08 cannot begin a document",
        "030b6a00 05, 0, 4, the document is empty",
        "030b6a00 0501, 0, 5, the document is empty",
        "030b6a00 45, 4103, 5, the body ends within wap-provisioningdoc",
        "030b6a00 4501, 0, 5, the document is empty",
        "030b6a00 4500, 4103, 6, the body ends within a SWITCH_PAGE",
        "030b6a00 450001, 4103, 7, the body ends behind a SWITCH_PAGE",
        "030b6a00 4587, 4101, 5, parm (0x87) cannot stand in wap-provisioningdoc",
        "030b6a00 c5, 4103, 5, the body ends within the attributes of wap-provisioningdoc",
        "030b6a00 c507, 4101, 5, NAME (0x07) is no attribute of wap-provisioningdoc",
        "030b6a00 c54502, 4101, 6, ENTITY (0x02) cannot stand behind the version",
        "030b6a00 c54603, 4103, 7, the body ends within wap-provisioningdoc; skipped before: 1 byte from offset 6 on",
        "030b6a00 4506030003, 4101, 8, STR_I (0x03) cannot stand behind a characteristic and a text",
        "030b6a00 450687, 4101, 6, parm (0x87) cannot stand behind a characteristic",
        "030b6a00 45c600, 4101, 6, the body ends within a SWITCH_PAGE",
        "030b6a00 45c60002, 4101, 6, there is no code page 2",
        "030b6a00 45c65c, 4101, 6, TYPE=BEARERINFO (0x5C) is no TYPE of a characteristic",
        "030b6a04 4142430045 c6 0402, 4101, 10, 'LITERAL \"C\" (0x04) is no TYPE of a characteristic'",
        "030b6a00 45c601 87, 4101, 7, parm (0x87) cannot stand in a characteristic without a TYPE",
        "030b6a00 45c650035800 01 87, 4101, 11, 'parm (0x87) cannot stand in a characteristic of the unknown TYPE \"X\"'",
        "030b6a00 45c65301 c6, 4101, 8, characteristic (0xC6) cannot stand in PORT",
        "030b6a00 45c65301 04, 4101, 8, LITERAL (0x04) cannot stand in PORT",
        "030b6a00 45c65301 87, 4103, 9, the body ends within a parm",
        "030b6a00 45c65301 8723, 4103, 10, the body ends behind the name of a parameter",
        "030b6a00 45c65301 872303, 4101, 10, STR_I (0x03) cannot stand behind the name of a parameter",
        "030b6a00 45c65301 8723000107, 4101, 12, NAME (0x07) stands in place of VALUE",
        "030b6a00 45c65301 872306, 4103, 11, the body ends in front of a value",
        "030b6a00 45c65301 87230603 61, 4103, 13, the body ends within the text at offset 12",
        "030b6a00 45c65301 8723060361 00, 4103, 14, the body ends within a value",
        "030b6a00 45c65301 8723060361 0040, 4103, 14, EXT_I_0 (0x40) cannot stand in a value that begins with a string",
        "030b6a00 45c65301 8723068305, 4103, 11, there is no such string in the string table",
        "030b6a00 45c65301 872306c30501, 4103, 11, the opaque data is longer than the rest of the body",
        "030b6a00 45c65301 872306c385, 4103, 11, the body ends within the length of opaque data",
        "030b6a00 45c65101 87000055, 4101, 11, 'TYPE=NAPDEF (0x55) is not found behind a SWITCH_PAGE, being above 0x3F'",
        "030b6a00 45c65501 8705c300, 1, 9, the name of the parameter is empty",
        "030b6a00 45c650035749 2d4649000187050378000603, 4101, 20, '\"x\" is no parameter of WI-FI'",
    })
    void saysWhereAndWhy(String hex, int code, int offset, String reason) {
        Verdict verdict = of(hex);
        assertTrue(verdict.reason().contains(reason), verdict.reason());
        assertRefused(verdict, code, offset, verdict.reason());
        assertNotNull(verdict.path());
        assertNotNull(verdict.found());
    }

    @Test
    void tellsALiteralNameByItsText() {
        Verdict verdict = of(characteristic("WI-FI", named("netssid", "x")));
        assertEquals("\"netssid\" is no parameter of WI-FI", verdict.reason());
        assertEquals("wap-provisioningdoc / WI-FI 1 / netssid", verdict.path());
        assertEquals("VALUE (0x06) behind NAME=\"netssid\"", verdict.found());
        assertEquals("NAME=\"NETSSID\"", verdict.expected().get(0));
    }

    @Test
    void namesWhatWasSkippedBefore() {
        Verdict verdict =
                of(
                        characteristic("PORT", parm("PORTNBR", token(0x10))),
                        characteristic("PORT", parm("PORTNBR", "x")),
                        characteristic("PORT", parm("NAPID", "x")));
        assertTrue(
                verdict.reason()
                        .endsWith(
                                "; skipped before: 1 byte from offset 13 on, an unknown value with all"
                                        + " up to an END"),
                verdict.reason());
    }

    @Test
    void showsNoControlCharacterOfALiteralName() {
        Verdict verdict = of(characteristic("WI-FI", named("a\nb", "x")));
        assertTrue(verdict.toString().contains("WI-FI 1 / a\\u000Ab"), verdict.toString());
        assertFalse(verdict.toString().contains("\n"));
    }

    @Test
    void numbersTheElementsAroundAmongThoseOfTheirType() {
        Verdict verdict =
                of(
                        characteristic("PXLOGICAL", characteristic("PXPHYSICAL")),
                        characteristic("X"),
                        characteristic("Y"),
                        characteristic(
                                "PXLOGICAL",
                                characteristic("PORT"),
                                characteristic("PXPHYSICAL", characteristic("PORT")),
                                characteristic(
                                        "PXPHYSICAL",
                                        characteristic("PORT"),
                                        characteristic("PORT", parm("NAPID", "x")))));
        assertEquals(
                "wap-provisioningdoc / PXLOGICAL 2 / PXPHYSICAL 2 / PORT 2 / parm", verdict.path());
        assertEquals(
                "wap-provisioningdoc / Y 2",
                of(
                                characteristic("Y"),
                                characteristic("X"),
                                characteristic("Y", parm("NAPID", "x")))
                        .path());
    }

    @Test
    void tellsTheInnermostEightElements() {
        Document.Element inner = characteristic("PXLOGICAL", parm("NAPID", "x"));
        for (int i = 0; i < 9; ++i) {
            inner = characteristic("PXLOGICAL", inner);
        }
        assertEquals(
                "..." + " / PXLOGICAL 1".repeat(7) + " / parm", of(inner).path());
    }

    // ---- What is read otherwise

    @Test
    void listsTextBetweenElements() {
        List<Item> otherwise = of("030b6a00 45 030a00 c65501 01 01").readOtherwise();
        assertEquals(1, otherwise.size());
        assertEquals(5, otherwise.get(0).offset());
    }

    @Test
    void listsAParameterOfAnotherName() {
        // On code page 0 the token means MAX-BITRATE-DNLINK; the library takes it for APPID.
        Verdict verdict = of("030b6a00 45 c65b01 87360603 7700 01 01 01");
        assertTrue(verdict.isAccepted());
        assertEquals(1, verdict.readOtherwise().size());
        assertEquals(8, verdict.readOtherwise().get(0).offset());
    }

    @Test
    void listsACharacteristicOfUnknownType() {
        Verdict verdict = of(characteristic("APPSRV"), characteristic("PORT"));
        assertTrue(verdict.isAccepted());
        assertEquals(1, verdict.readOtherwise().size());
        assertEquals(7, verdict.readOtherwise().get(0).offset());
    }

    @Test
    void listsNothingBehindWhereTheLibraryEnds() {
        Verdict verdict =
                of(
                        characteristic("PORT", parm("NAPID", "x")),
                        characteristic("APPSRV"),
                        characteristic("PORT", parm("PORTNBR", "1")));
        assertFalse(verdict.isAccepted());
        assertEquals(List.of(), verdict.readOtherwise());
    }

    @ParameterizedTest
    @ValueSource(strings = {"internet", "mms", "email", "syncml", "xcap", "wifi", "vowifi", "access"})
    void readsTheSamplesAsTheFormatSays(String sample) throws Exception {
        byte[] push = Files.readAllBytes(Path.of("samples", sample + ".push"));
        Verdict verdict = of(Arrays.copyOfRange(push, 3 + push[2], push.length));
        assertTrue(verdict.isAccepted(), verdict.toString());
        assertEquals(List.of(), verdict.readOtherwise());
    }

    @Test
    void tellsWhatIsReadInTheOrderOfTheBody() throws Exception {
        Random random = new Random(12);
        byte[] push = Files.readAllBytes(Path.of("samples", "everything.push"));
        int compared = 0;
        for (int i = 0; i < 5000; ++i) {
            byte[] body = Arrays.copyOfRange(push, 3 + push[2], push.length);
            for (int n = 1 + i % 3; n > 0; --n) {
                body[random.nextInt(body.length)] = (byte) random.nextInt(256);
            }
            Verdict verdict;
            try {
                verdict = ProvisioningDocument.parse(body).verdict();
            } catch (ProvisioningException noDocument) {
                continue;
            }
            List<Integer> offsets = new ArrayList<>();
            List<Item> otherwise =
                    verdict.describeOtherwise(
                            (offset, length, depth, meaning) -> {
                                assertTrue(length > 0 && offset + length <= body.length + 1);
                                assertTrue(meaning.startsWith("the library "), meaning);
                                assertFalse(meaning.contains("null"), meaning);
                                offsets.add(offset);
                            });
            assertEquals(verdict.readOtherwise(), otherwise);
            assertEquals(offsets.stream().sorted().toList(), offsets);
            compared += otherwise.isEmpty() ? 0 : 1;
            assertTrue(otherwise.isEmpty() || !offsets.isEmpty(), HexFormat.of().formatHex(body));
        }
        assertTrue(compared > 300, compared + " are read otherwise");
    }

    // ---- Limits

    @Test
    void refusesTooMuchText() {
        byte[] text = new byte[60000];
        Arrays.fill(text, (byte) 'x');
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.writeBytes(HexFormat.of().parseHex("030b6a83d460"));
        body.writeBytes(text);
        body.writeBytes(HexFormat.of().parseHex("45c65501870706"));
        for (int i = 0; i < 200; ++i) {
            body.writeBytes(HexFormat.of().parseHex("8300"));
        }
        body.writeBytes(HexFormat.of().parseHex("01010101"));
        Verdict verdict = Verdict.onBody(body.toByteArray(), null);
        assertRefused(verdict, 4111, 60291, "the body is decoded to too much text");
        assertEquals("QVS_ERROR_NO_MEMORY", verdict.codeName());
        assertEquals("wap-provisioningdoc / NAPDEF 1 / NAME", verdict.path());
    }

    @ParameterizedTest
    @ValueSource(booleans = {true, false})
    void costsNoStackHoweverDeepTheElementsNest(boolean isClosed) throws Exception {
        int depth = 1 << 18;
        byte[] body = new byte[5 + depth * (isClosed ? 4 : 3) + (isClosed ? 1 : 0)];
        Arrays.fill(body, (byte) 1);
        System.arraycopy(HexFormat.of().parseHex("030b6a0045"), 0, body, 0, 5);
        for (int i = 0; i < depth; ++i) {
            body[5 + 3 * i] = (byte) 0xC6;
            body[6 + 3 * i] = 0x51;
        }
        Verdict[] verdict = new Verdict[1];
        Thread thread =
                new Thread(
                        null,
                        () -> verdict[0] = Verdict.onBody(body, null),
                        "small stack",
                        SMALL_STACK);
        thread.start();
        thread.join();
        assertEquals(isClosed, verdict[0].isAccepted());
        assertEquals(body.length, verdict[0].bytesRead());
        if (!isClosed) {
            assertEquals("..." + " / PXLOGICAL 1".repeat(8), verdict[0].path());
        }
    }

    @Test
    void hasAReasonForWhateverIsRefused() throws Exception {
        Random random = new Random(11);
        byte[] push = Files.readAllBytes(Path.of("samples", "everything.push"));
        int refused = 0;
        for (int i = 0; i < 5000; ++i) {
            byte[] body = Arrays.copyOfRange(push, 3 + push[2], push.length);
            for (int n = 1 + i % 3; n > 0; --n) {
                body[random.nextInt(body.length)] = (byte) random.nextInt(256);
            }
            Verdict verdict = of(body);
            assertEquals(verdict, of(body));
            assertEquals(verdict.hashCode(), of(body).hashCode());
            if (!verdict.isAccepted()) {
                ++refused;
                assertTrue(verdict.offset() >= 0 && verdict.offset() <= body.length);
                assertTrue(verdict.bytesRead() <= body.length);
                assertNotEquals("", verdict.path());
                assertFalse(verdict.reason().contains("null"), verdict.reason());
                assertFalse(verdict.found().contains("null"), verdict.found());
            }
            assertFalse(verdict.readOtherwise().contains(null));
        }
        assertTrue(refused > 500, refused + " refused");
    }

    // ---- Headers

    @ParameterizedTest
    @CsvSource({
        "'', 0, the message is empty",
        "0106, 2, 'the message ends within its push header, after 2 bytes'",
        "010701b6, 1, PDU type 0x07 is no push",
        "010602b6, 2, headers of 2 bytes are longer than the rest of the message",
        "010602 1f02, 5, the message ends in front of its content type",
        "010601 b7, 3, the content type 0xB7 is not known",
        "010603 616200, 3, 'the content type \"ab\" is not known'",
        "010602 6162, 3, the message ends within its content type",
        "010604 b6924142, 5, the message ends within its MAC",
    })
    void saysWhyAHeaderIsRefused(String hex, int offset, String reason) {
        Verdict verdict = ofPush(HexFormat.of().parseHex(hex.replace(" ", "")));
        assertTrue(verdict.isHeaderRefused());
        assertRefused(verdict, 0, offset, reason);
        assertNull(verdict.path());
        assertNotNull(verdict.found());
        assertEquals(0, verdict.bytesRead());
        assertEquals(List.of(), verdict.readOtherwise());
        assertEquals("refused: " + reason + ", offset " + offset, verdict.toString());
    }

    @Test
    void refusesAMacThatIsTooLong() {
        byte[] body = document(characteristic("PORT"));
        assertTrue(ofPush(Push.withShortType(0xB6, body).mac("7".repeat(43)).bytes()).isAccepted());
        Verdict verdict = ofPush(Push.withShortType(0xB6, body).mac("7".repeat(44)).bytes());
        assertEquals("a MAC of 44 characters is too long", verdict.reason());
    }

    @Test
    void readsTheBodyOfAPush() throws Exception {
        byte[] body = document(characteristic("PORT", parm("NAPID", "x")));
        Verdict verdict = ofPush(Push.push(body));
        assertFalse(verdict.isHeaderRefused());
        assertEquals(11, verdict.offset(), "in the body");
        ProvisioningDocument document = ProvisioningDocument.parse(body);
        assertEquals(
                document.verdict(),
                Verdict.onPush(Push.push(body), 4, document));
    }

    /** A length of more than 127 takes two bytes, of which the library reads one. */
    @Test
    void saysWhenTheLibraryTakesOtherBytesForTheBody() throws Exception {
        ByteArrayOutputStream push = new ByteArrayOutputStream();
        push.writeBytes(HexFormat.of().parseHex("01068136"));
        push.writeBytes(new byte[0xB6]);
        byte[] body = document(characteristic("PORT"));
        push.writeBytes(body);
        Verdict verdict =
                Verdict.onPush(
                        push.toByteArray(), 4 + 0xB6, ProvisioningDocument.parse(body));
        assertFalse(verdict.isAccepted());
        assertTrue(
                verdict.reason()
                        .endsWith("; the library takes the body to begin 54 bytes earlier"),
                verdict.reason());
        assertEquals(Collections.emptyList(), verdict.readOtherwise());
    }
}
