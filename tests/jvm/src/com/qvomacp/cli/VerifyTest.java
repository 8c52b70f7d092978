package com.qvomacp.cli;

import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.withShortType;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document;
import com.qvomacp.support.Natives;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HexFormat;
import javax.crypto.Mac;
import javax.crypto.spec.SecretKeySpec;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** The command that checks MACs. */
class VerifyTest extends Natives {
    private static final byte[] BODY = Document.document(Document.characteristic("PORT"));

    @TempDir Path directory;

    private String output;
    private String errors;

    private int verify(byte[] input, String... arguments) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        String[] all = new String[arguments.length + 1];
        all[0] = "verify";
        System.arraycopy(arguments, 0, all, 1, arguments.length);
        int status = Main.run(new ByteArrayInputStream(input), out, err, Terminal.NONE, all);
        output = out.toString(StandardCharsets.UTF_8);
        errors = err.toString(StandardCharsets.UTF_8);
        return status;
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
                withShortType(0xB6, BODY).sec(0x99).mac("00").bytes(),
                "--pin=1");
        assertSays(
                1, "NOT VERIFIED: it has no push header, and so no MAC", BODY, "--pin=1");
    }

    /** The MAC is that of the body, whether or not the body can be decoded. */
    @Test
    void explainsARefusedHeaderAlone() throws Exception {
        byte[] message = signed(0x81, ascii("1234"));
        message[1] = 7;
        assertEquals(1, verify(message, "--pin", "1234"));
        assertEquals("", output);
        assertTrue(errors.startsWith("omacp: standard input: refused: PDU type 0x07"), errors);
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
}
