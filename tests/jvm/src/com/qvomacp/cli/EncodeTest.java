package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.eng.omacp.MacResult;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.support.Sms;
import com.qvomacp.support.TreeText;
import com.qvomacp.support.Wbxml2Xml;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Base64;
import java.util.HexFormat;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;
import org.w3c.dom.Element;

/** The command that makes messages. */
class EncodeTest {
    private static final byte[] NOTHING = {};
    private static final String TAKES = "the library takes it\n";

    @TempDir Path directory;

    private int status;
    private byte[] output;
    private String errors;

    static List<Path> pushes() throws Exception {
        return SamplesTest.pushes();
    }

    private void encode(byte[] input, String... arguments) {
        encode(Terminal.NONE, input, arguments);
    }

    private void encode(Terminal terminal, byte[] input, String... arguments) {
        List<String> all = new ArrayList<>(List.of("encode"));
        all.addAll(List.of(arguments));
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        status =
                Main.run(
                        new ByteArrayInputStream(input),
                        out,
                        err,
                        terminal,
                        all.toArray(new String[0]));
        output = out.toByteArray();
        errors = err.toString(StandardCharsets.UTF_8);
    }

    private String text() {
        return new String(output, StandardCharsets.UTF_8);
    }

    private static String xmlOf(Path push) {
        return push.toString().replaceAll("push$", "xml");
    }

    private static byte[] xml(String parms) {
        return ("<wap-provisioningdoc version=\"1.0\">\n<characteristic type=\"NAPDEF\">"
                        + parms
                        + "</characteristic></wap-provisioningdoc>")
                .getBytes(StandardCharsets.UTF_8);
    }

    private static byte[] xml() {
        return xml("<parm name=\"NAPID\" value=\"a\"/>");
    }

    private static byte[] body(byte[] push) throws Exception {
        return Arrays.copyOfRange(push, PushHeader.parse(push).length(), push.length);
    }

    private void assertFails(int expected, String sentence) {
        assertEquals(expected, status, errors);
        assertTrue(errors.startsWith("omacp: " + sentence), errors);
        assertEquals("", text());
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void makesASampleOfItsDocument(Path push) throws Exception {
        byte[] sample = Files.readAllBytes(push);
        encode(NOTHING, xmlOf(push));
        assertEquals(0, status, errors);
        assertTrue(errors.endsWith(xmlOf(push) + ": " + TAKES), errors);
        assertArrayEquals(sample, output);
        encode(Files.readAllBytes(Path.of(xmlOf(push))), "--body");
        assertArrayEquals(body(sample), output);
        encode(NOTHING, "--hex", xmlOf(push));
        assertArrayEquals(sample, HexFormat.of().parseHex(text().strip()));
        encode(NOTHING, "--base64", xmlOf(push));
        assertArrayEquals(sample, Base64.getDecoder().decode(text().strip()));
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void makesTheSameOfTheXmlThatShowPrints(Path push) throws Exception {
        Program shown = Program.run(NOTHING, "--xml", push.toString());
        assertEquals(0, shown.status(), shown.errors());
        assertEquals("", shown.errors());
        String imsi = push.endsWith("xcap.push") ? "00101012345678" : "001010123456789";
        encode(shown.output().getBytes(StandardCharsets.UTF_8), "--pin=1234", "--imsi=" + imsi);
        assertEquals(0, status, errors);
        assertArrayEquals(Files.readAllBytes(push), output);
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void makesShortMessagesFromWhichTheSameIsRead(Path push) throws Exception {
        byte[] sample = Files.readAllBytes(push);
        encode(NOTHING, "--sms=ud", xmlOf(push));
        byte[] parts = output;
        String[] lines = text().split("\n");
        assertEquals(sample.length <= 133 ? 1 : (sample.length + 127) / 128, lines.length);
        for (String line : lines) {
            assertTrue(line.length() <= 280, line);
            assertTrue(line.substring(2).startsWith(Sms.PORTS), line);
        }
        Program shown = Program.run(NOTHING, push.toString());
        assertEquals(shown, Program.run(parts));

        encode(NOTHING, "--sms=submit", "--to=+155501234", xmlOf(push));
        String[] submitted = text().split("\n");
        assertEquals(lines.length, submitted.length);
        for (int i = 0; i < lines.length; ++i) {
            String length = String.format("%02X", lines[i].length() / 2);
            assertEquals("4100" + "099151551032F4" + "00F5" + length + lines[i], submitted[i]);
        }
        Program read = Program.run(submitted[0].getBytes(StandardCharsets.US_ASCII));
        assertTrue(read.errors().contains("no message: this is an SMS-SUBMIT"), read.errors());
    }

    @Test
    void putsTogetherTheLongestShortMessageAndNoLonger() {
        encode(xml("<parm name=\"NAME\" value=\"" + "x".repeat(100) + "\"/>"), "--sms=ud");
        assertEquals(1, text().lines().count());
        int free = 140 - text().strip().length() / 2;
        encode(xml("<parm name=\"NAME\" value=\"" + "x".repeat(100 + free) + "\"/>"), "--sms=ud");
        assertEquals(281, text().length());
        encode(xml("<parm name=\"NAME\" value=\"" + "x".repeat(101 + free) + "\"/>"), "--sms=ud");
        assertEquals(2, text().lines().count());
        assertEquals(281, text().indexOf('\n') + 1);
        encode(xml("<parm name=\"NAME\" value=\"" + "x".repeat(33_000) + "\"/>"), "--sms=ud");
        assertFails(2, "standard input: is too long for an SMS\n");
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void wbxml2xmlReadsTheSameWhereItKnowsTheTokens(Path push) throws Exception {
        assumeTrue(Wbxml2Xml.isInstalled(), "libwbxml2-utils is not installed");
        encode(NOTHING, "--body", "--tokens=none", xmlOf(push));
        Element peer = Wbxml2Xml.read(output);
        assertEquals(TreeText.of(ProvisioningDocument.parse(output)), TreeText.of(peer));
    }

    @Test
    void tellsTheDigitsForTheUser() throws Exception {
        encode(xml(), "--sec=userpinmac", "--pin=12345");
        assertEquals(0, status, errors);
        String told = "omacp: standard input: the user has to be told ";
        assertTrue(errors.matches(told + "12345[0-9]{5}\n.*: " + TAKES), errors);
        String digits = errors.substring(told.length(), told.length() + 10);
        assertEquals(
                MacResult.RIGHT, ProvisioningMessage.parsePush(output).verifyMac(digits, null));
        Program verified = Program.run(output, "verify", "--pin", digits);
        assertEquals("standard input: verified (USERPINMAC)\n", verified.output());
        encode(xml(), "--sec=userpinmac", "--pin=1234");
        assertTrue(errors.contains("told digits, for which a PIN of 5 to 20 is needed\n"), errors);
    }

    @Test
    void takesSecretsFromFilesStandardInputAndTheEnvironment() throws Exception {
        Path document = Files.write(directory.resolve("document.xml"), xml());
        String pin = System.getenv("PATH");
        Path file = Files.writeString(directory.resolve("pin"), pin + "\n");
        encode(NOTHING, "--sec=userpin", "--pin", pin, document.toString());
        byte[] expected = output;
        assertEquals(0, status, errors);
        encode(NOTHING, "--sec=userpin", "--pin-env=PATH", document.toString());
        assertArrayEquals(expected, output);
        encode(xml(), "--sec=userpin", "--pin-file", file.toString());
        assertArrayEquals(expected, output);
        encode((pin + "\r\n").getBytes(), "--sec=userpin", "--pin-file=-", document.toString());
        assertArrayEquals(expected, output);

        encode(xml(), "--sec=userpin", "--pin-file=-");
        assertFails(2, "--pin-file: standard input is read for something else\n");
        encode(xml(), "--sec=userpin", "--pin-file=" + file + "\u001b[31m");
        assertFails(2, "--pin-file: " + file + "\\u001b[31m: no such file\n");
        encode(xml(), "--sec=userpin", "--pin-env=NO SUCH\u001b");
        assertFails(2, "--pin-env names no variable: NO SUCH\\u001b\n");
        encode(xml(), "--sec=userpin", "--pin-env=PATH", "--pin=1");
        assertFails(2, "--pin is told more than once\n");
    }

    @Test
    void anOptionIsHeldToWhatItMayBe() {
        encode(xml(), "--sec=\u001b[31m");
        assertFails(2, "--sec is none of [netwpin, userpin, usernetwpin, userpinmac]: \\u001b[31m\n");
        encode(xml(), "--sec=userpin");
        assertFails(2, "standard input: userpin needs a PIN\n");
        encode(xml(), "--tid=1");
        assertFails(2, "standard input: tid is not hexadecimal\n");
        encode(xml(), "--sec=userpin", "--key=12x4");
        assertFails(2, "standard input: key is not hexadecimal\n");
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "--hex --base64", "--sms=ud --hex", "--sms=ud --body", "--sms=submit", "--to=1",
                "--sms=ud --to=1", "--sms=submit --to=", "--sms=submit --to=+12a", "--sms=mms",
                "--sms=submit --to=123456789012345678901"
            })
    void refusesFormsThatGoNotTogether(String options) {
        encode(xml(), options.split(" "));
        assertFails(2, "");
        assertTrue(errors.contains("\nUsage: omacp encode "), errors);
    }

    @Test
    void sendsNoBytesToATerminal() throws Exception {
        Terminal screen = new Terminal(false, false, true);
        encode(screen, xml());
        assertFails(2, "bytes are not for a terminal");
        encode(screen, xml(), "--hex");
        assertEquals(0, status, errors);
        encode(screen, xml(), "-o", directory.resolve("push").toString());
        assertEquals(0, status, errors);
        encode(Terminal.NONE, xml());
        assertArrayEquals(Files.readAllBytes(directory.resolve("push")), output);
    }

    @Test
    void overwritesNoFileUnlessItIsTold() throws Exception {
        Path file = Files.writeString(directory.resolve("push\u001b"), "mine");
        String name = directory + "/push\\u001b";
        encode(xml(), "-o", file.toString());
        assertEquals(2, status);
        assertTrue(
                errors.endsWith(name + ": is there already; --force overwrites it\n"), errors);
        assertEquals("mine", Files.readString(file));
        encode(xml(), "--output=" + file, "--force", "--hex");
        assertEquals(0, status, errors);
        assertTrue(Files.readString(file).startsWith("0106"));
        assertEquals("", text());
        encode(xml(), "-o", file + "/push");
        assertEquals(2, status);
        assertFalse(errors.contains("\u001b"), errors);
    }

    @Test
    void writesNoFileForADocumentThatIsRefused() {
        Path file = directory.resolve("push");
        encode("<wap-provisioningdoc>".getBytes(), "-o", file.toString());
        assertEquals(1, status);
        assertFalse(Files.exists(file));
    }

    @Test
    void saysWhereADocumentIsRefusedAndWhatWasExpected() throws Exception {
        encode(xml("<noparm/>"));
        assertFails(1, "standard input:2:31: no element of a provisioning document");
        assertTrue(errors.endsWith(", expected <characteristic>, <parm>\n"), errors);
        Path file = Files.write(directory.resolve("a\u001b[31m.xml"), xml("<p\u001b[31m/>"));
        encode(NOTHING, file.toString());
        assertFails(1, directory + "/a\\u001b[31m.xml:2:");
        assertFalse(errors.contains("\u001b"), errors);
    }

    @Test
    void opensNothingForADocument() throws Exception {
        Path secret = Files.writeString(directory.resolve("secret"), "open sesame");
        String type = "<!DOCTYPE a [<!ENTITY e SYSTEM \"" + secret.toUri() + "\">]>\n";
        byte[] rest = xml("<parm name=\"NAME\" value=\"&e;\"/>");
        ByteArrayOutputStream document = new ByteArrayOutputStream();
        document.writeBytes(type.getBytes());
        document.writeBytes(rest);
        encode(document.toByteArray());
        assertFails(1, "standard input:3:");
        assertFalse(errors.contains("sesame"), errors);
    }

    @Test
    void readsDocumentsInUtf16AndBehindBlanks() {
        encode(xml());
        byte[] expected = output;
        String xml = new String(xml(), StandardCharsets.UTF_8);
        for (String form : List.of(xml, "\uFEFF" + xml, "\n " + xml)) {
            encode(form.getBytes(StandardCharsets.UTF_8));
            assertArrayEquals(expected, output, errors);
        }
        encode(xml.getBytes(StandardCharsets.UTF_16));
        assertArrayEquals(expected, output, errors);
        encode(xml.getBytes(StandardCharsets.UTF_16LE));
        assertArrayEquals(expected, output, errors);
        encode(expected, "--tid=3C");
        byte[] tagLike = output;
        encode(tagLike, "--tid=01");
        assertArrayEquals(expected, output, errors);
    }

    @Test
    void makesAMessageOfOneInAnyForm() throws Exception {
        byte[] push = Files.readAllBytes(Path.of("samples/mms.push"));
        encode(Sms.lines(Sms.parts(push, 100, false, 7)), "--pin=1234");
        assertEquals(0, status, errors);
        assertArrayEquals(push, output);
        encode(Sms.lines(Sms.parts(push, 100, false, 7)), "--body");
        assertArrayEquals(body(push), output);
        encode(Arrays.copyOf(push, push.length - body(push).length + 2), "--as=push");
        assertEquals(1, status);
        assertTrue(errors.contains("refused: "), errors);
        encode("hello".getBytes());
        assertFails(1, "standard input: no message: this is ");
    }

    @Test
    void severalGoToLinesAndNotToBytes() {
        encode(NOTHING, "--hex", "samples/mms.xml", "samples/browser.xml");
        assertEquals(2, text().lines().count());
        encode(NOTHING, "samples/mms.xml", "samples/browser.xml");
        assertFails(2, "samples/mms.xml: is one of several, which only --hex");
    }

    @Test
    void notesThatTheMessageWhichItReadsIsDamaged() throws Exception {
        for (String[] each :
                new String[][] {
                    {"030B6A0045C65501873606036100010101", ""},
                    {"030B7F0045C65501873606036100010101", "departs from the format in 1 place"},
                    {"030B6A0045C65501873006010101", "is refused by the library"},
                    {
                        "030B7F0045C655018736060361000101",
                        "departs from the format in 2 places and is refused by the library"
                    }
                }) {
            encode(each[0].getBytes(StandardCharsets.UTF_8), "--hex", "--body");
            String note =
                    "omacp: standard input: note: what is read " + each[1] + "; only what it sets is encoded";
            String takes = "omacp: standard input: " + TAKES;
            assertEquals(each[1].isEmpty() ? takes.strip() : note, errors.lines().findFirst().get());
            boolean isWrittenToo = each[1].startsWith("is");
            assertEquals(isWrittenToo ? 1 : 0, status);
            assertEquals(isWrittenToo, !errors.endsWith(takes), errors);
        }
    }

    @Test
    void saysThatTheLibraryRefusesWhatWasWritten() {
        encode(xml("<parm name=\"NAPID\" value=\"N\"/><parm name=\"CLIENT-ID\" value=\"x\"/>"), "--tokens=oma");
        assertEquals(1, status, errors);
        assertTrue(errors.startsWith("omacp: standard input: refused: "), errors);
        assertTrue(output.length > 0);
    }
}
