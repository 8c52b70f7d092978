package com.qvomacp.cli;

import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.withShortType;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document;
import com.qvomacp.support.Json;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;
import javax.crypto.Mac;
import javax.crypto.spec.SecretKeySpec;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** The command that checks MACs. */
class VerifyTest {
    private static final byte[] BODY = Document.document(Document.characteristic("PORT"));

    @TempDir Path directory;

    private String output;
    private String errors;

    private int verify(byte[] input, String... arguments) {
        String[] all = new String[arguments.length + 1];
        all[0] = "verify";
        System.arraycopy(arguments, 0, all, 1, arguments.length);
        Program program = Program.run(input, all);
        output = program.output();
        errors = program.errors();
        return program.status();
    }

    private static byte[] signed(int sec, byte[] key) throws Exception {
        Mac mac = Mac.getInstance("HmacSHA1");
        mac.init(new SecretKeySpec(key, "HmacSHA1"));
        String hex = HexFormat.of().withUpperCase().formatHex(mac.doFinal(BODY));
        return withShortType(0xB6, BODY).sec(sec).mac(hex).bytes();
    }

    private static byte[] ascii(String text) {
        return text.getBytes(StandardCharsets.US_ASCII);
    }

    private void assertSays(int status, String line, byte[] input, String... arguments) {
        assertEquals(status, verify(input, arguments), errors);
        assertEquals("standard input: " + line + "\n", output);
        assertEquals("", errors);
    }

    @Test
    void verifiesByPin() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        assertSays(0, "verified (USERPIN)", message, "--pin", "1234");
        assertSays(0, "verified (USERPIN)", message, "--pin=1234", "--imsi=240018000000000", "-");
        assertSays(1, "NOT VERIFIED: the MAC is wrong (USERPIN)", message, "--pin", "1235");
        assertSays(1, "NOT VERIFIED: USERPIN needs --pin", message, "--imsi", "240018000000000");
    }

    @Test
    void verifiesByImsi() throws Exception {
        byte[] message = signed(0x80, HexFormat.of().parseHex("2943103254769810"));
        assertSays(0, "verified (NETWPIN)", message, "--imsi", "234012345678901");
        assertSays(
                1, "NOT VERIFIED: the MAC is wrong (NETWPIN)", message, "--imsi", "234012345678902");
        assertSays(1, "NOT VERIFIED: NETWPIN needs --imsi", message, "--pin", "1234");
    }

    @Test
    void verifiesByBoth() throws Exception {
        byte[] message = signed(0x82, HexFormat.of().parseHex("294310325476981031323334"));
        assertSays(0, "verified (USERNETWPIN)", message, "--imsi=234012345678901", "--pin=1234");
        assertSays(
                1, "NOT VERIFIED: USERNETWPIN needs --imsi and --pin", message, "--pin", "1234");
    }

    @Test
    void saysWhatCannotBeVerified() {
        assertSays(
                1, "NOT VERIFIED: the message states no security method", push(BODY), "--pin=1");
        assertSays(
                1,
                "NOT VERIFIED: the message states a security method that is not known",
                Push.secured(0x99, "00", BODY),
                "--pin=1");
        assertSays(
                1, "NOT VERIFIED: it has no push header, and so no MAC", BODY, "--pin=1");
    }

    @Test
    void tellsAMissingMacFromAWrongOne() {
        byte[] message = withShortType(0xB6, BODY).sec(0x81).bytes();
        assertSays(1, "NOT VERIFIED: no MAC was found (USERPIN)", message, "--pin=1");
        byte[] behind = Arrays.copyOf(message, message.length + 42);
        Arrays.fill(behind, message.length + 1, behind.length - 1, (byte) 'A');
        assertSays(
                1,
                "NOT VERIFIED: no MAC was found (USERPIN), but what may be one stands at message"
                        + " offset "
                        + (message.length + 1),
                behind,
                "--pin=1");
    }

    @Test
    void saysWhatCannotBeAPinOrAnImsi() throws Exception {
        byte[] userPinMac = withShortType(0xB6, BODY).sec(0x83).bytes();
        assertSays(
                2, "NOT VERIFIED: the PIN cannot be one for USERPINMAC", userPinMac, "--pin=1234");
        byte[] netwPin = signed(0x80, HexFormat.of().parseHex("2943103254769810"));
        for (String imsi : new String[] {"", "23401234567890a", "2340123456789012"}) {
            assertSays(
                    2,
                    "NOT VERIFIED: the IMSI is no number of 1 to 15 digits",
                    netwPin,
                    "--imsi=" + imsi);
        }
    }

    /** The MAC is that of the body, whether or not the body can be decoded. */
    @Test
    void checksTheBodyWhateverItIs() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        message[0] = 99;
        message[1] = 7;
        assertEquals(1, verify(message, "--pin", "1234"));
        assertEquals("", output);
        String start = "omacp: standard input: no message: this is a confirmed push";
        assertTrue(errors.startsWith(start), errors);
        message[1] = 6;
        message[message.length - 1] = 99;
        assertSays(1, "NOT VERIFIED: the MAC is wrong (USERPIN)", message, "--pin", "1234");
    }

    @Test
    void verifiesSeveralFiles() throws Exception {
        String good = Files.write(directory.resolve("good"), signed(0x81, ascii("1"))).toString();
        String bad = Files.write(directory.resolve("bad"), signed(0x81, ascii("2"))).toString();
        assertEquals(1, verify(new byte[0], "--pin=1", good, bad, good));
        assertEquals(
                good
                        + ": verified (USERPIN)\n"
                        + bad
                        + ": NOT VERIFIED: the MAC is wrong (USERPIN)\n"
                        + good
                        + ": verified (USERPIN)\n",
                output);
        assertEquals(2, verify(new byte[0], "--pin=1", good, bad, good + ".missing"));
    }

    @Test
    void verifiesByAKey() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        assertSays(0, "verified (USERPIN)", message, "--key=31323334");
        assertSays(1, "NOT VERIFIED: the MAC is wrong (USERPIN)", message, "--key=31323335");
        byte[] told = withShortType(0xB6, BODY).sec(0x83).bytes();
        assertSays(1, "NOT VERIFIED: no MAC was found (USERPINMAC)", told, "--key=31323334");
        for (String[] wrong :
                new String[][] {{"--key="}, {"--key=123"}, {"--key=12x4"}, {"--key=12", "--pin=1"}}) {
            assertEquals(2, verify(message, wrong));
            assertTrue(errors.contains("\nUsage: omacp verify "), errors);
        }
    }

    @Test
    void takesSecretsFromFilesStandardInputAndTheEnvironment() throws Exception {
        String secret = System.getenv("PATH");
        String message = Files.write(directory.resolve("message"), signed(0x81, ascii(secret))).toString();
        String pin = Files.writeString(directory.resolve("pin"), secret + "\n").toString();
        String right = message + ": verified (USERPIN)\n";
        String key = HexFormat.of().formatHex(ascii(secret));
        assertEquals(0, verify(new byte[0], "--pin-env=PATH", message));
        assertEquals(right, output);
        assertEquals(0, verify(new byte[0], "--pin-file", pin, message));
        assertEquals(right, output);
        assertEquals(0, verify(ascii(secret), "--pin-file", "-", message));
        assertEquals(right, output);
        assertEquals(0, verify(ascii(key + "\r\n"), "--key-file=-", message));
        assertEquals(right, output);
        assertEquals(2, verify(ascii(secret), "--pin-file=-"));
        assertEquals(2, verify(ascii(secret), "--pin-file=-", "--imsi-file=-", message));
        assertEquals(2, verify(ascii(secret), "--pin-file=" + pin + ".missing", message));
        assertEquals(2, verify(ascii(secret), "--imsi-env=NO SUCH VARIABLE", message));
        assertEquals(2, verify(ascii(secret), "--pin-env=PATH", "--pin-file", pin, message));
        assertTrue(errors.startsWith("omacp: --pin is told more than once\n"), errors);
    }

    @Test
    void tellsTheMacThatShouldBeThere() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        Mac mac = Mac.getInstance("HmacSHA1");
        mac.init(new SecretKeySpec(ascii("1"), "HmacSHA1"));
        String computed = HexFormat.of().withUpperCase().formatHex(mac.doFinal(BODY));
        String wrong = "NOT VERIFIED: the MAC is wrong (USERPIN), computed " + computed;
        assertSays(1, wrong, message, "--pin=1", "--show-mac");
        assertSays(1, wrong, message, "--key=31", "--show-mac");
        assertSays(
                1, "NOT VERIFIED: USERPIN needs --pin", message, "--imsi=1", "--show-mac");
        byte[] told = withShortType(0xB6, BODY).sec(0x83).bytes();
        verify(told, "--pin=1234500000", "--show-mac");
        assertTrue(output.matches(".*the MAC is wrong \\(USERPINMAC\\), computed [0-9]{5}\n"), output);
    }

    @Test
    void tellsItAsJson() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        assertEquals(0, verify(message, "--pin=1234", "--json"));
        assertEquals(
                Map.of("verified", true, "result", "RIGHT", "method", "USERPIN"), Json.parse(output));
        String good = Files.write(directory.resolve("good"), message).toString();
        String bad = Files.writeString(directory.resolve("bad\u001b\u202e"), "bad").toString();
        assertEquals(2, verify(BODY, "--pin=1", "--show-mac", "--json", good, "-", bad, good + "none"));
        List<?> all = (List<?>) Json.parse(output);
        Map<?, ?> first = (Map<?, ?>) all.get(0);
        assertEquals(good, first.get("file"));
        assertEquals(false, first.get("verified"));
        assertEquals("WRONG", first.get("result"));
        assertEquals("the MAC is wrong (USERPIN)", first.get("reason"));
        assertEquals(40, ((String) first.get("computedMac")).length());
        Map<?, ?> second = (Map<?, ?>) all.get(1);
        assertEquals("NO_MAC", second.get("result"));
        assertEquals("it has no push header, and so no MAC", second.get("reason"));
        assertEquals(bad, ((Map<?, ?>) all.get(2)).get("file"));
        assertEquals("no such file", ((Map<?, ?>) all.get(3)).get("error"));
        assertFalse((output + errors).matches("(?s).*[\u001b\u202e].*"), output);
        assertEquals(1, verify(message, "--pin=1", "--json-lines"));
        assertEquals(1, output.lines().count());
    }
}
