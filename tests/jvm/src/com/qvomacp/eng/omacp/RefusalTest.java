package com.qvomacp.eng.omacp;

import static com.qvomacp.support.Document.document;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Natives;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;
import org.junit.jupiter.api.Test;

/** Why a message is refused, and what a refusal leaves behind. */
class RefusalTest extends Natives {
    private static final byte[] UNDECODABLE = {0x03, 0x0B, 0x6A, 0x00, 0x7F};

    private static byte[] bytes(int... values) {
        byte[] bytes = new byte[values.length];
        for (int i = 0; i < values.length; ++i) {
            bytes[i] = (byte) values[i];
        }
        return bytes;
    }

    private static void assertRefused(Reason reason, String text, byte[] message) {
        assertHeaderRefused(reason, text, message);
        assertBodyRefused(reason, text, message);
    }

    private static void assertHeaderRefused(Reason reason, String text, byte[] message) {
        ProvisioningException refusal =
                assertThrows(
                        ProvisioningException.class,
                        () -> ProvisioningMessage.parseHeader(message));
        assertEquals(reason, refusal.getReason());
        assertEquals(text, refusal.getMessage());
        assertNothingLeft();
    }

    private static void assertBodyRefused(Reason reason, String text, byte[] message) {
        ProvisioningException refusal =
                assertThrows(
                        ProvisioningException.class, () -> ProvisioningMessage.parse(message));
        assertEquals(reason, refusal.getReason());
        assertEquals(text, refusal.getMessage());
        assertNothingLeft();
    }

    private static void assertNothingLeft() {
        assertEquals(-1, parser.qvomacp_GetParserContentType());
        assertNull(parser.qvomacp_GetParserBody());
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
    }

    @Test
    void noMessage() {
        assertRefused(Reason.NO_MESSAGE, "there is no message", null);
        assertRefused(Reason.NO_MESSAGE, "there is no message", new byte[0]);
    }

    @Test
    void notAPush() {
        String text = "not a push: PDU type 0x07 in place of 0x06";
        assertRefused(Reason.NOT_A_PUSH, text, bytes(1, 7));
        byte[] message = Everything.push();
        message[1] = 7;
        assertRefused(Reason.NOT_A_PUSH, text, message);
    }

    @Test
    void everyCutInTheHeader() throws Exception {
        byte[] message = Everything.push();
        for (int length = 1; length < 50; ++length) {
            String text =
                    length <= 3
                            ? "the message ends within its push header, after " + length + " bytes"
                            : "the push header is 50 bytes long, but the message ends after "
                                    + length;
            assertRefused(Reason.HEADER_CUT_OFF, text, Arrays.copyOf(message, length));
        }
        byte[] header = Arrays.copyOf(message, 50);
        assertEquals(0, ProvisioningMessage.parseHeader(header).getBodyLength());
    }

    @Test
    void aHeaderThatEndsInFrontOfTheContentTypeOrInIt() {
        String ends = "the message ends in front of the content type";
        assertRefused(Reason.HEADER_CUT_OFF, ends, bytes(1, 6, 1, 0x1F));
        assertRefused(Reason.HEADER_CUT_OFF, ends, bytes(1, 6, 2, 0x1F, 1));
        assertRefused(
                Reason.HEADER_CUT_OFF,
                "the message ends within its content type",
                bytes(1, 6, 3, 'a', '/', 'b'));
    }

    @Test
    void anUnknownContentType() {
        assertRefused(
                Reason.UNKNOWN_CONTENT_TYPE,
                "unknown content type 0x83",
                Push.withShortType(0x83, Everything.body()).bytes());
        assertRefused(
                Reason.UNKNOWN_CONTENT_TYPE,
                "unknown content type \"text/plain\"",
                Push.withTextType("text/plain", Everything.body()).bytes());
        assertRefused(
                Reason.UNKNOWN_CONTENT_TYPE,
                "unknown content type \"text/?[31m" + "x".repeat(50) + "...\"",
                Push.withTextType("text/\u001B[31m" + "x".repeat(70), new byte[0]).bytes());
    }

    @Test
    void aBadMac() {
        String text = "the MAC of the push header does not end, or is too long";
        byte[] tooLong = Push.withShortType(0xB6, Everything.body()).mac("0".repeat(44)).bytes();
        assertRefused(Reason.BAD_MAC, text, tooLong);
        assertRefused(Reason.BAD_MAC, text, bytes(1, 6, 3, 0xB6, 0x92, '0'));
        byte[] named =
                Push.withTextType("application/vnd.wap.connectivity-wbxml", new byte[0])
                        .mac("0".repeat(44))
                        .bytes();
        assertRefused(Reason.BAD_MAC, text, named);
    }

    @Test
    void noBody() {
        assertBodyRefused(
                Reason.EMPTY_BODY,
                "the message (application/vnd.wap.connectivity-wbxml) ends with its push header:"
                        + " it has no body",
                Push.push(new byte[0]));
    }

    @Test
    void aBodyThatIsNoProvisioningDocument() {
        String text = "is not a provisioning document that can be decoded";
        assertBodyRefused(
                Reason.BODY_REFUSED,
                "the body (application/vnd.wap.connectivity-wbxml, 5 bytes) "
                        + text
                        + ": result code 4101 behind 4 bytes of it",
                Push.push(UNDECODABLE));
        byte[] xml = "<wap-provisioningdoc/>".getBytes(StandardCharsets.US_ASCII);
        assertBodyRefused(
                Reason.BODY_REFUSED,
                "the body (application/vnd.wap.connectivity-xml, 22 bytes) "
                        + text
                        + ": it is XML, not WBXML",
                Push.withShortType(0xB5, xml).bytes());
        assertBodyRefused(
                Reason.BODY_REFUSED,
                "the body (application/vnd.wap.connectivity-wbxml, "
                        + document().length
                        + " bytes) "
                        + text
                        + ": it holds no document",
                Push.push(document()));
    }

    @Test
    void theLibraryTellsResultCodeAndOffsetOfABody() {
        assertVerdict(4101, 4, Push.push(UNDECODABLE));
        assertVerdict(4103, 4, Push.push(bytes(0x03, 0x0B, 0x6A, 0x00)));
        assertVerdict(4107, 4, Push.push(bytes(0x03, 0x04, 0x6A, 0x00)));
        assertVerdict(2, 0, Push.push(new byte[0]));
        assertVerdict(0, document().length, Push.push(document()));
        assertVerdict(null, null, bytes(1, 7, 1, 0));
        assertVerdict(null, null, null);
    }

    /** A text without an end is behind the last byte, not behind the byte after that. */
    @Test
    void theOffsetIsOneOfTheBody() {
        byte[] message = Everything.push();
        for (int length = 51; length < message.length; ++length) {
            byte[] cut = Arrays.copyOf(message, length);
            try {
                ProvisioningMessage.parse(cut);
            } catch (ProvisioningException e) {
                assertEquals(length - 50, e.getBodyOffset(), "cut to " + length);
            }
        }
    }

    private static void assertVerdict(Integer code, Integer offset, byte[] message) {
        ProvisioningException refusal =
                assertThrows(
                        ProvisioningException.class, () -> ProvisioningMessage.parse(message));
        assertEquals(code, refusal.getResultCode());
        assertEquals(offset, refusal.getBodyOffset());
    }

    @Test
    void everyCutInTheBodyThatIsRefusedHasAReason() throws Exception {
        byte[] message = Everything.push();
        int refused = 0;
        for (int length = 50; length < message.length; ++length) {
            try {
                ProvisioningMessage.parse(Arrays.copyOf(message, length));
            } catch (ProvisioningException e) {
                Reason reason = length == 50 ? Reason.EMPTY_BODY : Reason.BODY_REFUSED;
                assertEquals(reason, e.getReason(), "cut to " + length);
                ++refused;
            }
            assertNothingLeft();
        }
        assertTrue(refused > message.length / 2, refused + " refused");
    }

    @Test
    void leavesNothingBehindWhenItParses() throws Exception {
        ProvisioningMessage.parse(Everything.push());
        assertNothingLeft();
        ProvisioningMessage.parseHeader(Everything.push());
        assertNothingLeft();
    }

    @Test
    void parsesWithNothingLeftOfARefusal() throws Exception {
        ProvisioningMessage before = ProvisioningMessage.parse(Everything.push());
        assertThrows(
                ProvisioningException.class,
                () -> ProvisioningMessage.parse(Push.push(UNDECODABLE)));
        assertEquals(before, ProvisioningMessage.parse(Everything.push()));
    }
}
