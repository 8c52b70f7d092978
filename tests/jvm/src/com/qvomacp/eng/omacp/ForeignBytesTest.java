package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Sms;
import java.nio.charset.StandardCharsets;
import java.util.Base64;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** What bytes look like that are no provisioning message. */
class ForeignBytesTest {
    @ParameterizedTest
    @CsvSource(
            delimiter = '|',
            value = {
                "02056A0045C6|a service indication (SI 1.0) in WBXML",
                "02066A0045C6|a service loading (SL 1.0) in WBXML",
                "01076A0045C6|a cache operation (CO 1.0) in WBXML",
                "020D6A0045C6|an e-mail notification (EMN 1.0) in WBXML",
                "030E6A0045C6|DRM rights (DRMREL 1.0) in WBXML",
                "02A4016A006D6C|SyncML 1.2, as of synchronisation or device management in WBXML",
                "029F536A006D6C|SyncML 1.1, as of synchronisation or device management in WBXML",
                "030B6A0045C6|a provisioning document (PROV 1.0) in WBXML",
                "000500|a service indication (SI 1.0) in WBXML",
                "010601AE02056A00|a push of a service indication",
                "010601B0|a push of a service loading",
                "010601BE|a push of an MMS notification",
                "010601C4|a push of a device management notification",
                "010601B6|a push of a provisioning document",
                "0106066162632F6400|a push of the type abc/d",
                "0106076162632F0A6400|a push of the type abc/\\u000Ad",
                "010701B6|a confirmed push of a provisioning document",
                "8C8298313233008D90|an MMS notification",
                "1F8B0800|data compressed by gzip",
                "D4C3B2A1|a capture of packets (pcap)",
                "89504E47|a picture (PNG)",
            })
    void namesBinaryData(String digits, String name) {
        assertEquals(name, ForeignBytes.describe(Sms.bytes(digits)));
    }

    @ParameterizedTest
    @CsvSource(
            delimiter = '|',
            value = {
                "''|no bytes at all",
                "' \n'|nothing but blanks",
                "<?xml version='1.0'?><!DOCTYPE x><wap-provisioningdoc/>"
                        + "|a provisioning document in XML, which is not encoded yet",
                "<SI><indication/></SI>|a service indication in XML",
                "<syncml:SyncML>|XML",
                "<six/>|XML",
                "<html><body>|a page in HTML",
                "{\"a\": 1}|JSON",
                "+CMT: ,10|what a modem says of an SMS",
                "01 06 2F|hexadecimal text",
                "01 06 2|hexadecimal text with an odd number of digits, 5",
                "hello|text",
                "hello to you all, 1|text",
            })
    void namesText(String text, String name) {
        assertEquals(name, ForeignBytes.describe(text.getBytes(StandardCharsets.UTF_8)));
        if (!name.startsWith("no")) {
            assertEquals(name, ForeignBytes.describe(text.getBytes(StandardCharsets.UTF_16)));
            byte[] marked = ("\uFEFF" + text).getBytes(StandardCharsets.UTF_8);
            assertEquals(name, ForeignBytes.describe(marked));
        }
    }

    @Test
    void namesShortMessages() {
        byte[] data = Sms.userData(new byte[] {1, 6, 1, 2}, Sms.PORTS);
        assertEquals("the user data of an SMS", ForeignBytes.describe(data));
        assertEquals("an SMS (SMS-DELIVER)", ForeignBytes.describe(new Sms().deliver(data)));
        byte[] withoutCentre = new Sms().centre("").deliver(data);
        assertEquals("an SMS (SMS-DELIVER)", ForeignBytes.describe(withoutCentre));
        byte[] submit = Sms.bytes("00 41 00 0B915348000000F0 00 04 0B", Sms.hex(data));
        assertEquals("an SMS that is being sent (SMS-SUBMIT)", ForeignBytes.describe(submit));
        assertNull(ForeignBytes.describe(new Sms().deliver(data, data.length + 1)));
    }

    @Test
    void namesBase64() {
        byte[] words = "provisioning, of a kind".getBytes(StandardCharsets.UTF_8);
        assertEquals("base64 text", ForeignBytes.describe(Base64.getEncoder().encode(words)));
    }

    @Test
    void isSaidOfWhatIsNoPush() {
        ProvisioningException refused =
                assertThrows(
                        ProvisioningException.class,
                        () -> PushHeader.parse("<si></si>".getBytes(StandardCharsets.US_ASCII)));
        String message = refused.getMessage();
        assertTrue(message.contains("a service indication in XML"), message);
    }

    @Test
    void answersForAnyBytes() {
        Random random = new Random(5);
        for (int i = 0; i < 100000; ++i) {
            byte[] bytes = new byte[random.nextInt(20)];
            random.nextBytes(bytes);
            String name = ForeignBytes.describe(bytes);
            assertTrue(name == null || name.chars().noneMatch(Character::isISOControl), name);
        }
    }
}
