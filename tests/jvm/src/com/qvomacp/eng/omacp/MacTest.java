package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.FieldMessage;
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
import org.junit.jupiter.params.provider.EnumSource;
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

    private static final String IMSI = "001010123456789";

    private static byte[] ascii(String text) {
        return text.getBytes(StandardCharsets.US_ASCII);
    }

    /** A push whose MAC is to be checked. */
    private static final class Pushed {
        final PushHeader header;
        final byte[] body;

        Pushed(byte[] push) throws Exception {
            header = PushHeader.parse(push);
            body = Arrays.copyOfRange(push, header.length(), push.length);
        }

        Pushed(int sec, String mac, byte[] body) throws Exception {
            this(Push.secured(sec, mac, body));
        }

        MacResult verify(String pin, String imsi) {
            return ProvisioningMac.verify(header.securityMethod(), header.mac(), body, pin, imsi);
        }

        boolean isRight(String pin) {
            return verify(pin, null) == MacResult.RIGHT;
        }

        MacResult verify(byte[] key) {
            return ProvisioningMac.verify(header.securityMethod(), header.mac(), body, key);
        }

        String computed(String pin, String imsi) {
            return ProvisioningMac.compute(header.securityMethod(), body, pin, imsi);
        }
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
        Path file = Path.of(document.toString().replaceAll("xml$", "push"));
        Pushed message = new Pushed(Files.readAllBytes(file));
        String name = options.getOrDefault("sec", "none").toUpperCase(Locale.ROOT);
        SecurityMethod method = SecurityMethod.valueOf(name);
        assertEquals(method, message.header.securityMethod());
        String pin = options.get("pin");
        String imsi = options.get("imsi");
        if (method == SecurityMethod.NONE) {
            assertNull(message.header.mac());
            assertEquals(MacResult.NO_METHOD, message.verify("1234", IMSI));
            assertNull(message.computed("1234", IMSI));
            return;
        }
        if (pin == null && imsi == null) {
            assertEquals(SecurityMethod.USERPINMAC, method);
            assertEquals(MacResult.UNUSABLE_PIN, message.verify(null, null));
            return;
        }
        assertEquals(MacResult.RIGHT, message.verify(pin, imsi));
        MacResult withoutImsi = imsi == null ? MacResult.RIGHT : MacResult.UNUSABLE_IMSI;
        assertEquals(withoutImsi, message.verify(pin, null));
        MacResult withoutPin = pin == null ? MacResult.RIGHT : MacResult.UNUSABLE_PIN;
        assertEquals(withoutPin, message.verify(null, imsi));
        if (pin != null) {
            assertNotEquals(MacResult.RIGHT, message.verify("4321", imsi));
        }
        if (imsi != null) {
            assertEquals(MacResult.WRONG, message.verify(pin, "001010123456780"));
        }
        MacResult without = imsi == null ? MacResult.UNUSABLE_PIN : MacResult.UNUSABLE_IMSI;
        assertEquals(without, message.verify(null, null));
        assertEquals(without, message.verify("", ""));
        String told = method == SecurityMethod.USERPINMAC ? pin : message.header.mac();
        assertTrue(told.endsWith(message.computed(pin, imsi)));
    }

    @Test
    void theMacsOfFieldMessagesAreRightWithTheirPins() throws Exception {
        String file = System.getenv(FieldMessage.VARIABLE);
        assumeTrue(
                file != null && !file.isEmpty(), FieldMessage.VARIABLE + " names no file: skipped");
        for (FieldMessage message : FieldMessage.all()) {
            if (message.isPush && message.pin != null) {
                Pushed pushed = new Pushed(message.push());
                assertEquals(MacResult.RIGHT, pushed.verify(message.pin, null), message.id);
                System.out.println("field message " + message.id + ": the MAC is right");
            }
        }
    }

    @Test
    void knowsTheHmacOfAPublishedCase() throws Exception {
        assertTrue(new Pushed(0x81, HMAC, DATA).isRight(KEY));
        assertTrue(new Pushed(0x81, HMAC.toLowerCase(Locale.ROOT), DATA).isRight(KEY));
        Pushed message = new Pushed(0x80, HMAC, DATA);
        assertEquals(MacResult.RIGHT, message.verify(ascii(KEY)));
        assertEquals(MacResult.WRONG, message.verify(ascii("jefe")));
        assertEquals(MacResult.UNUSABLE_KEY, message.verify((byte[]) null));
        assertEquals(MacResult.UNUSABLE_KEY, message.verify(new byte[0]));
        assertEquals(MacResult.WRONG, new Pushed(0x81, HMAC, DATA).verify("jefe", null));
        assertEquals(MacResult.WRONG, new Pushed(0x81, HMAC, BODY).verify(KEY, null));
        assertEquals(HMAC, ProvisioningMac.compute(ascii(KEY), DATA));
        assertEquals(HMAC, ProvisioningMac.compute(SecurityMethod.USERPIN, DATA, KEY, null));
    }

    @Test
    void takesNoMacThatDiffersAnywhere() throws Exception {
        for (int i = 0; i < HMAC.length(); ++i) {
            char other = HMAC.charAt(i) == '0' ? '1' : '0';
            String wrong = HMAC.substring(0, i) + other + HMAC.substring(i + 1);
            assertEquals(MacResult.WRONG, new Pushed(0x81, wrong, DATA).verify(KEY, null), wrong);
        }
        String shorter = HMAC.substring(1);
        for (String wrong : List.of(shorter, HMAC.substring(0, 39), HMAC + "0", "\u00df")) {
            assertEquals(MacResult.WRONG, new Pushed(0x81, wrong, DATA).verify(KEY, null), wrong);
        }
    }

    /** Key: semi-octets of the IMSI with the parity in front. */
    @Test
    void makesAKeyOfAnImsi() throws Exception {
        byte[] odd = {0x09, 0x10, 0x10, 0x10, 0x32, 0x54, 0x76, (byte) 0x98};
        byte[] even = {0x01, 0x10, 0x10, 0x10, 0x32, 0x54, 0x76, (byte) 0xF8};
        assertSameKey(IMSI, odd);
        assertSameKey("00101012345678", even);
    }

    private static void assertSameKey(String imsi, byte[] key) throws Exception {
        String mac = mac(key);
        Pushed net = new Pushed(0x80, mac, DATA);
        assertEquals(MacResult.RIGHT, net.verify(key));
        assertEquals(MacResult.RIGHT, net.verify(null, imsi));
        assertEquals(MacResult.RIGHT, net.verify("1234", imsi), "the PIN does not matter");
        assertEquals(MacResult.UNUSABLE_IMSI, net.verify(imsi, null));
        byte[] both = Arrays.copyOf(key, key.length + 4);
        System.arraycopy(ascii("1234"), 0, both, key.length, 4);
        assertEquals(MacResult.RIGHT, new Pushed(0x82, mac(both), DATA).verify("1234", imsi));
        Pushed user = new Pushed(0x82, mac(key), DATA);
        assertEquals(MacResult.WRONG, user.verify("1234", imsi));
        assertEquals(MacResult.UNUSABLE_PIN, user.verify("", imsi));
        assertEquals(MacResult.UNUSABLE_PIN, user.verify(null, imsi));
        Pushed pinAlone = new Pushed(0x82, mac(ascii("1234")), DATA);
        assertEquals(MacResult.UNUSABLE_IMSI, pinAlone.verify("1234", null));
    }

    private static String mac(byte[] key) throws Exception {
        Mac mac = Mac.getInstance("HmacSHA1");
        mac.init(new SecretKeySpec(key, "HmacSHA1"));
        return String.format("%040X", new BigInteger(1, mac.doFinal(DATA)));
    }

    @ParameterizedTest
    @ValueSource(strings = {"", "00101012345678x", "0010101234567890", "+0101012345678", "\u0661"})
    void takesNoImsiThatIsNone(String imsi) throws Exception {
        Pushed message = new Pushed(Files.readAllBytes(Path.of("samples/internet.push")));
        assertEquals(MacResult.RIGHT, message.verify(null, IMSI));
        assertEquals(MacResult.UNUSABLE_IMSI, message.verify(null, imsi));
        assertNull(message.computed(null, imsi));
    }

    @Test
    void looksAtTheMacThatTheUserHasBeenTold() throws Exception {
        Pushed message = new Pushed(0x83, "00", BODY);
        assertTrue(message.isRight("12345" + TOLD));
        assertEquals(MacResult.RIGHT, message.verify("12345" + TOLD, IMSI));
        for (int i = 0; i < TOLD.length(); ++i) {
            char other = TOLD.charAt(i) == '0' ? '1' : '0';
            String wrong = TOLD.substring(0, i) + other + TOLD.substring(i + 1);
            assertEquals(MacResult.WRONG, message.verify("12345" + wrong, null), wrong);
        }
        assertEquals(MacResult.WRONG, message.verify("12346" + TOLD, null));
        for (String pin : new String[] {"12345" + TOLD + "0", "12345", "1234582l08", null}) {
            assertEquals(MacResult.UNUSABLE_PIN, message.verify(pin, null), pin);
        }
        assertEquals(MacResult.WRONG, new Pushed(0x83, "00", DATA).verify("12345" + TOLD, null));
        assertEquals(MacResult.WRONG, new Pushed(0x81, "00", BODY).verify("12345" + TOLD, null));
        assertEquals(MacResult.NO_MAC, message.verify(ascii("12345")), "a key cannot be compared");
    }

    @Test
    void needsNoMacInTheMessageForWhatTheUserHasBeenTold() throws Exception {
        Pushed message = new Pushed(Push.withShortType(0xB6, BODY).sec(0x83).bytes());
        assertNull(message.header.mac());
        assertTrue(message.isRight("12345" + TOLD));
    }

    @Test
    void tellsTheDigitsForTheUser() {
        assertEquals("12345" + TOLD, ProvisioningMac.digitsToTell("12345", BODY));
        assertEquals(
                TOLD,
                ProvisioningMac.compute(SecurityMethod.USERPINMAC, BODY, "1234500000", null));
        for (String key : new String[] {null, "", "1234", "1234x", "1".repeat(21)}) {
            assertNull(ProvisioningMac.digitsToTell(key, BODY), key);
        }
    }

    @Test
    void takesAToldMacOfTenToFortyDigits() throws Exception {
        Pushed message = new Pushed(0x83, "00", BODY);
        for (int half = 1; half < 30; ++half) {
            String key = "1".repeat(half);
            Mac mac = Mac.getInstance("HmacSHA1");
            mac.init(new SecretKeySpec(ascii(key), "HmacSHA1"));
            StringBuilder pin = new StringBuilder(key);
            for (byte b : Arrays.copyOf(mac.doFinal(BODY), half)) {
                pin.append(Byte.toUnsignedInt(b) % 10);
            }
            MacResult expected =
                    half >= 5 && half <= 20 ? MacResult.RIGHT : MacResult.UNUSABLE_PIN;
            assertEquals(expected, message.verify(pin.toString(), null), pin.toString());
            String told = expected == MacResult.RIGHT ? pin.toString() : null;
            assertEquals(told, ProvisioningMac.digitsToTell(key, BODY));
        }
    }

    @Test
    void tellsAMissingMethodFromAMissingMac() throws Exception {
        Pushed unsecured = new Pushed(Push.push(DATA));
        assertEquals(MacResult.NO_METHOD, unsecured.verify(KEY, null));
        assertEquals(MacResult.NO_METHOD, unsecured.verify(ascii(KEY)));
        Pushed macAlone = new Pushed(Push.withShortType(0xB6, DATA).mac(HMAC).bytes());
        assertEquals(HMAC, macAlone.header.mac());
        assertEquals(MacResult.NO_METHOD, macAlone.verify(KEY, KEY));
        Pushed secAlone = new Pushed(Push.withShortType(0xB6, DATA).sec(0x81).bytes());
        assertEquals(MacResult.NO_MAC, secAlone.verify(KEY, null));
        assertEquals(MacResult.NO_MAC, secAlone.verify(null, null));
        assertEquals(MacResult.NO_METHOD, new Pushed(0x84, HMAC, DATA).verify(KEY, KEY));
    }

    @ParameterizedTest
    @EnumSource(SecurityMethod.class)
    void computesWhatItTakesForRight(SecurityMethod method) {
        String mac = ProvisioningMac.compute(method, BODY, "1234567890", IMSI);
        boolean isKnown = method != SecurityMethod.NONE && method != SecurityMethod.UNKNOWN;
        assertEquals(isKnown, mac != null);
        if (mac != null) {
            String pin = method == SecurityMethod.USERPINMAC ? "12345" + mac : "1234567890";
            assertEquals(
                    MacResult.RIGHT, ProvisioningMac.verify(method, mac, BODY, pin, IMSI));
        }
        assertFalse(mac != null && mac.isEmpty());
    }
}
