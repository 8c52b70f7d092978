package com.qvomacp.eng.parser;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.secured;
import static com.qvomacp.support.Push.withShortType;
import static com.qvomacp.support.Push.withTextType;
import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Everything;
import com.qvomacp.support.Natives;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The session: parse, header queries, delete. */
class ParserTest extends Natives {
    private static final byte[] BODY = document(characteristic("NAPDEF", parm("NAPID", "N1")));
    private static final byte[] UNDECODABLE = {0x03, 0x0B, 0x6A, 0x00, 0x7F};

    private static void assertNoHeader() {
        assertEquals(-1, parser.qvomacp_GetParserContentType());
        assertEquals(-1, parser.qvomacp_GetParserHeaderLen());
        assertEquals(-1, parser.qvomacp_GetParserBodyLen());
        assertEquals(-1, parser.qvomacp_GetParserMACLen());
        assertEquals(-1, parser.qvomacp_GetParserSEC());
        assertNull(parser.qvomacp_GetParserMAC());
        assertNull(parser.qvomacp_GetParserBody());
    }

    @Test
    void answersNoHeaderBeforeAParse() {
        assertNoHeader();
    }

    @Test
    void answersTheHeaderOfAWholeMessage() {
        byte[] body = Everything.body();
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertEquals(54, parser.qvomacp_GetParserContentType());
        assertEquals(47, parser.qvomacp_GetParserHeaderLen());
        assertEquals(body.length, parser.qvomacp_GetParserBodyLen());
        assertEquals(40, parser.qvomacp_GetParserMACLen());
        assertEquals(0x81, parser.qvomacp_GetParserSEC());
        assertEquals(
                Everything.MAC,
                new String(parser.qvomacp_GetParserMAC(), StandardCharsets.US_ASCII));
        assertArrayEquals(body, parser.qvomacp_GetParserBody());
    }

    @Test
    void answersAHeaderWithoutSecAndMac() {
        assertTrue(parse(push(BODY), WHOLE_MESSAGE));
        assertEquals(1, parser.qvomacp_GetParserHeaderLen());
        assertEquals(0, parser.qvomacp_GetParserSEC());
        assertEquals(0, parser.qvomacp_GetParserMACLen());
        assertArrayEquals(new byte[0], parser.qvomacp_GetParserMAC());
        assertArrayEquals(BODY, parser.qvomacp_GetParserBody());
    }

    @Test
    void readsSecAndMacByName() {
        byte[] message =
                withShortType(0xB6, BODY).secNamed("Sec", 0x83).macNamed("mac", "00FF").bytes();
        assertTrue(parse(message, HEADER_ONLY));
        assertEquals(0x83, parser.qvomacp_GetParserSEC());
        assertEquals(4, parser.qvomacp_GetParserMACLen());
        assertArrayEquals(
                "00FF".getBytes(StandardCharsets.US_ASCII), parser.qvomacp_GetParserMAC());
    }

    @Test
    void readsAMacWithoutSec() {
        assertTrue(parse(withShortType(0xB6, BODY).mac("AB").bytes(), HEADER_ONLY));
        assertEquals(0, parser.qvomacp_GetParserSEC());
        assertEquals(2, parser.qvomacp_GetParserMACLen());
    }

    @ParameterizedTest
    @CsvSource({
        "54, 0xB6, application/vnd.wap.connectivity-wbxml",
        "53, 0xB5, application/vnd.wap.connectivity-xml",
        "68, 0xC4, application/vnd.syncml.notification",
        "78, 0xCE, application/vnd.syncml.ds.notification",
        "66, 0xC2, application/vnd.syncml.dm+wbxml",
    })
    void knowsFiveContentTypes(int code, String sent, String name) {
        int token = Integer.decode(sent);
        assertTrue(parse(withShortType(token, BODY).bytes(), WHOLE_MESSAGE));
        assertEquals(code, parser.qvomacp_GetParserContentType());
        delete();
        assertTrue(parse(withTextType(name, BODY).bytes(), WHOLE_MESSAGE));
        assertEquals(code, parser.qvomacp_GetParserContentType());
        delete();
        assertFalse(parse(withTextType(name.toUpperCase(), BODY).bytes(), WHOLE_MESSAGE));
        assertEquals(-1, parser.qvomacp_GetParserContentType());
    }

    @Test
    void refusesAnythingButAPlainPush() {
        byte[] message = push(BODY);
        message[1] = 0x07;
        assertFalse(parse(message, WHOLE_MESSAGE));
        assertNoHeader();
        assertFalse(parse(message, HEADER_ONLY));
        assertNoHeader();
    }

    @Test
    void refusesEveryCutInsideTheHeader() {
        byte[] message = Everything.push();
        for (int length = 0; length < 3 + 47; ++length) {
            byte[] cut = Arrays.copyOf(message, length);
            assertFalse(parse(cut, HEADER_ONLY), "cut to " + length);
            assertNoHeader();
        }
    }

    @Test
    void readsTheHeaderAloneInModeOne() {
        assertTrue(parse(push(BODY), HEADER_ONLY));
        assertEquals(54, parser.qvomacp_GetParserContentType());
        assertArrayEquals(BODY, parser.qvomacp_GetParserBody());
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void takesAnyBodyInModeOne() {
        assertTrue(parse(push(UNDECODABLE), HEADER_ONLY));
        assertEquals(UNDECODABLE.length, parser.qvomacp_GetParserBodyLen());
        delete();
        assertTrue(parse(push(new byte[0]), HEADER_ONLY));
        assertEquals(0, parser.qvomacp_GetParserBodyLen());
        assertArrayEquals(new byte[0], parser.qvomacp_GetParserBody());
    }

    @ParameterizedTest
    @ValueSource(ints = {0, 2, -1, Integer.MIN_VALUE, Integer.MAX_VALUE})
    void readsTheWholeMessageInEveryOtherMode(int mode) {
        assertTrue(parse(push(BODY), mode));
        assertEquals(1, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void forgetsTheHeaderOfAMessageWhoseBodyIsRefused() {
        assertFalse(parse(secured(0x80, "AB", UNDECODABLE), WHOLE_MESSAGE));
        assertNoHeader();
        assertFalse(parse(push(new byte[0]), WHOLE_MESSAGE));
        assertNoHeader();
        assertFalse(parse(push(document()), WHOLE_MESSAGE), "a document of nothing");
        assertNoHeader();
    }

    @Test
    void keepsTheContextWhenALaterHeaderIsRefused() {
        assertTrue(parse(push(BODY), WHOLE_MESSAGE));
        assertFalse(parse(new byte[] {1, 7, 0, 0}, WHOLE_MESSAGE));
        assertNoHeader();
        assertEquals(1, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void keepsTheContextWhenALaterHeaderIsReadAlone() {
        assertTrue(parse(push(BODY), WHOLE_MESSAGE));
        assertTrue(parse(withShortType(0xC4, UNDECODABLE).bytes(), HEADER_ONLY));
        assertEquals(68, parser.qvomacp_GetParserContentType());
        assertEquals(1, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void losesTheContextWhenALaterBodyIsRefused() {
        assertTrue(parse(push(BODY), WHOLE_MESSAGE));
        assertFalse(parse(push(UNDECODABLE), WHOLE_MESSAGE));
        assertNoHeader();
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void readsAsManyBytesAsTheLengthSays() {
        byte[] message = push(BODY);
        byte[] longer = Arrays.copyOf(message, message.length + 1000);
        assertTrue(parser.qvomacp_parser(longer, message.length, WHOLE_MESSAGE));
        assertArrayEquals(BODY, parser.qvomacp_GetParserBody());
        delete();
        assertTrue(parser.qvomacp_parser(longer, 5, HEADER_ONLY));
        assertEquals(1, parser.qvomacp_GetParserBodyLen());
    }

    @Test
    void looksAtTheLowHalfOfTheLengthAlone() {
        byte[] message = push(BODY);
        assertTrue(parser.qvomacp_parser(message, message.length + (7L << 32), WHOLE_MESSAGE));
        assertEquals(BODY.length, parser.qvomacp_GetParserBodyLen());
    }

    @Test
    void leavesTheMessageAsItWas() {
        byte[] message = Everything.push();
        byte[] before = message.clone();
        assertTrue(parse(message, WHOLE_MESSAGE));
        assertArrayEquals(before, message);
    }

    @Test
    void keepsItsOwnCopyOfTheBody() {
        byte[] message = push(BODY);
        assertTrue(parse(message, HEADER_ONLY));
        Arrays.fill(message, (byte) 0xFF);
        assertArrayEquals(BODY, parser.qvomacp_GetParserBody());
    }

    @Test
    void deletesTwiceAndWithNothingParsed() {
        parser.qvomacp_parser_del();
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        parser.qvomacp_parser_del();
        assertNoHeader();
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
        parser.qvomacp_parser_del();
        assertNoHeader();
    }

    @Test
    void parsesAgainAfterADelete() {
        for (int i = 0; i < 100; ++i) {
            assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
            assertEquals("n-NAPID", napDefs.qvomacp_GetPxNapDefData(1)[0]);
            delete();
            assertFalse(parse(push(UNDECODABLE), WHOLE_MESSAGE));
            assertNoHeader();
        }
    }
}
