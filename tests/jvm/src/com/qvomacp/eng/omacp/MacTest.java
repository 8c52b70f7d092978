package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Push;
import java.math.BigInteger;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.HashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import java.util.stream.Stream;
import javax.crypto.Mac;
import javax.crypto.spec.SecretKeySpec;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The check of the MAC, by each security method. */
class MacTest {
    /** From RFC 2202, its second case: key and data are texts. */
    private static final String KEY = "Jefe";

    private static final byte[] DATA = ascii("what do ya want for nothing?");
    private static final String HMAC = "EFFCDF6AE5EB2FA2D27416D5F184DF9C259A7C79";

    /** The HMAC of "body" with the key 12345 starts with the bytes 94 66 6F 5A BC. */
    private static final byte[] BODY = ascii("body");

    /** Those bytes, each modulo ten. */
    private static final String TOLD = "82108";

    private static byte[] ascii(String text) {
        return text.getBytes(StandardCharsets.US_ASCII);
    }

    private static PushHeader header(int sec, String mac, byte[] body) throws Exception {
        return ProvisioningMessage.parseHeader(Push.secured(sec, mac, body));
    }

    static List<Path> samples() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".xml")).sorted().toList();
        }
    }

    /** How a sample is put together, from the line in its document. */
    private static Map<String, String> options(Path document) throws Exception {
        Matcher line =
                Pattern.compile("<\\?omacp-push (.*?)\\?>").matcher(Files.readString(document));
        assertTrue(line.find(), document.toString());
        Matcher pair = Pattern.compile("([a-z-]+)=\"([^\"]*)\"").matcher(line.group(1));
        Map<String, String> options = new HashMap<>();
        while (pair.find()) {
            options.put(pair.group(1), pair.group(2));
        }
        return options;
    }

    @Test
    void everyMethodThatCarriesAMacHasASample() throws Exception {
        Map<String, Integer> counts = new HashMap<>();
        for (Path document : samples()) {
            counts.merge(String.valueOf(options(document).get("sec")), 1, Integer::sum);
        }
        for (String method : List.of("netwpin", "userpin", "usernetwpin", "userpinmac", "null")) {
            assertTrue(counts.containsKey(method), method);
        }
    }

    @ParameterizedTest
    @MethodSource("samples")
    void theMacOfEverySampleIsRight(Path document) throws Exception {
        Map<String, String> options = options(document);
        Path push = Path.of(document.toString().replaceAll("xml$", "push"));
        ProvisioningMessage message = ProvisioningMessage.parse(Files.readAllBytes(push));
        String method = options.getOrDefault("sec", "none").toUpperCase(Locale.ROOT);
        assertEquals(SecurityMethod.valueOf(method), message.getHeader().getSecurityMethod());
        String pin = options.get("pin");
        String imsi = options.get("imsi");
        boolean carries = message.getHeader().getMac() != null;
        assertEquals(carries, pin != null || imsi != null);
        assertEquals(carries, message.verifyMac(pin, imsi));
        assertEquals(carries && imsi == null, message.verifyMac(pin));
        assertEquals(carries && pin == null, message.verifyMacWithImsi(imsi));
        assertFalse(message.verifyMac("4321", imsi) && pin != null);
        assertFalse(message.verifyMac(pin, "001010123456780") && imsi != null);
        assertFalse(message.verifyMac(null, null));
        assertFalse(message.verifyMac("", ""));
    }

    @Test
    void knowsTheHmacOfAPublishedCase() throws Exception {
        assertTrue(header(0x81, HMAC, DATA).verifyMac(KEY));
        assertTrue(header(0x81, HMAC.toLowerCase(Locale.ROOT), DATA).verifyMac(KEY));
        assertTrue(header(0x80, HMAC, DATA).verifyMacWithKey(ascii(KEY)));
        assertFalse(header(0x80, HMAC, DATA).verifyMacWithKey(ascii("jefe")));
        assertFalse(header(0x80, HMAC, DATA).verifyMacWithKey(null));
        assertFalse(header(0x80, HMAC, DATA).verifyMacWithKey(new byte[0]));
        assertFalse(header(0x81, HMAC, DATA).verifyMac("jefe"));
        assertFalse(header(0x81, HMAC, BODY).verifyMac(KEY));
    }

    @Test
    void takesNoMacThatDiffersAnywhere() throws Exception {
        for (int i = 0; i < HMAC.length(); ++i) {
            char other = HMAC.charAt(i) == '0' ? '1' : '0';
            String wrong = HMAC.substring(0, i) + other + HMAC.substring(i + 1);
            assertFalse(header(0x81, wrong, DATA).verifyMac(KEY), wrong);
        }
        assertFalse(header(0x81, HMAC.substring(1), DATA).verifyMac(KEY));
        assertFalse(header(0x81, HMAC.substring(0, 39), DATA).verifyMac(KEY));
        assertFalse(header(0x81, HMAC + "0", DATA).verifyMac(KEY));
    }

    /** Key: semi-octets of the IMSI with the parity in front. */
    @Test
    void makesAKeyOfAnImsi() throws Exception {
        byte[] odd = {0x09, 0x10, 0x10, 0x10, 0x32, 0x54, 0x76, (byte) 0x98};
        byte[] even = {0x01, 0x10, 0x10, 0x10, 0x32, 0x54, 0x76, (byte) 0xF8};
        assertSameKey("001010123456789", odd);
        assertSameKey("00101012345678", even);
    }

    private static void assertSameKey(String imsi, byte[] key) throws Exception {
        String mac = mac(key);
        assertTrue(header(0x80, mac, DATA).verifyMacWithKey(key));
        assertTrue(header(0x80, mac, DATA).verifyMacWithImsi(imsi));
        assertTrue(header(0x80, mac, DATA).verifyMac("1234", imsi), "the PIN does not matter");
        assertFalse(header(0x80, mac, DATA).verifyMac(imsi));
        byte[] both = Arrays.copyOf(key, key.length + 4);
        System.arraycopy(ascii("1234"), 0, both, key.length, 4);
        assertTrue(header(0x82, mac(both), DATA).verifyMac("1234", imsi));
        assertFalse(header(0x82, mac(key), DATA).verifyMac("1234", imsi));
        assertFalse(header(0x82, mac(key), DATA).verifyMac("", imsi), "a part is missing");
        assertFalse(header(0x82, mac(key), DATA).verifyMac(null, imsi), "a part is missing");
        assertFalse(header(0x82, mac(ascii("1234")), DATA).verifyMac("1234", null));
    }

    private static String mac(byte[] key) throws Exception {
        Mac mac = Mac.getInstance("HmacSHA1");
        mac.init(new SecretKeySpec(key, "HmacSHA1"));
        return String.format("%040X", new BigInteger(1, mac.doFinal(DATA)));
    }

    @ParameterizedTest
    @ValueSource(strings = {"", "00101012345678x", "0010101234567890", "+0101012345678"})
    void takesNoImsiThatIsNone(String imsi) throws Exception {
        byte[] message = Files.readAllBytes(Path.of("samples/internet.push"));
        PushHeader header = ProvisioningMessage.parseHeader(message);
        assertTrue(header.verifyMacWithImsi("001010123456789"));
        assertFalse(header.verifyMacWithImsi(imsi));
    }

    @Test
    void looksAtTheMacThatTheUserHasBeenTold() throws Exception {
        PushHeader header = header(0x83, "00", BODY);
        assertTrue(header.verifyMac("12345" + TOLD));
        assertTrue(header.verifyMac("12345" + TOLD, "001010123456789"));
        for (int i = 0; i < TOLD.length(); ++i) {
            char other = TOLD.charAt(i) == '0' ? '1' : '0';
            String wrong = TOLD.substring(0, i) + other + TOLD.substring(i + 1);
            assertFalse(header.verifyMac("12345" + wrong), wrong);
        }
        assertFalse(header.verifyMac("12346" + TOLD));
        assertFalse(header.verifyMac("12345" + TOLD + "0"), "an odd number of digits");
        assertFalse(header.verifyMac("12345"), "a key alone");
        assertFalse(header.verifyMac(null));
        assertFalse(header(0x83, "00", DATA).verifyMac("12345" + TOLD));
        assertFalse(header(0x81, "00", BODY).verifyMac("12345" + TOLD));
    }

    @Test
    void takesAToldMacOfTenToFortyDigits() throws Exception {
        PushHeader header = header(0x83, "00", BODY);
        for (int half = 1; half < 30; ++half) {
            String key = "1".repeat(half);
            Mac mac = Mac.getInstance("HmacSHA1");
            mac.init(new SecretKeySpec(ascii(key), "HmacSHA1"));
            StringBuilder pin = new StringBuilder(key);
            for (byte b : Arrays.copyOf(mac.doFinal(BODY), half)) {
                pin.append(Byte.toUnsignedInt(b) % 10);
            }
            assertEquals(half >= 5 && half <= 20, header.verifyMac(pin.toString()), pin.toString());
        }
    }

    @Test
    void verifiesNothingWithoutAMethodOrAMac() throws Exception {
        PushHeader unsecured = ProvisioningMessage.parseHeader(Push.push(DATA));
        assertFalse(unsecured.verifyMac(KEY));
        assertFalse(unsecured.verifyMacWithKey(ascii(KEY)));
        byte[] macAlone = Push.withShortType(0xB6, DATA).mac(HMAC).bytes();
        assertFalse(ProvisioningMessage.parseHeader(macAlone).verifyMac(KEY, KEY));
        byte[] secAlone = Push.withShortType(0xB6, DATA).sec(0x81).bytes();
        assertFalse(ProvisioningMessage.parseHeader(secAlone).verifyMac(KEY));
        assertFalse(header(0x84, HMAC, DATA).verifyMac(KEY, KEY), "an unknown method");
    }
}
