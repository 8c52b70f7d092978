package com.qvomacp.cli;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.withShortType;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document;
import com.qvomacp.support.Json;
import com.qvomacp.support.Sms;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.Base64;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** What the program shows of bytes, of several files, of bodies alone and of refused messages. */
class ShowTest {
    private static final byte[] BODY =
            Document.document(characteristic("NAPDEF", parm("NAME", "abc")));
    private static final byte[] REFUSED =
            push(
                    characteristic("NAPDEF", parm("NAME", "abc")),
                    characteristic("NAPDEF", parm("NAPID", "N"), parm("CLIENT-ID", "x")));
    @TempDir Path directory;

    private String output;
    private String errors;

    private int run(byte[] input, String... arguments) {
        return run(Terminal.NONE, input, arguments);
    }

    private int run(Terminal terminal, byte[] input, String... arguments) {
        Program program = Program.run(terminal, input, arguments);
        output = program.output();
        errors = program.errors();
        return program.status();
    }

    private String file(String name, byte[] content) throws Exception {
        return Files.write(directory.resolve(name), content).toString();
    }

    // ---- Bytes

    @Test
    void listsEveryByte() {
        assertEquals(0, run(withShortType(0xB6, BODY).sec(0x81).mac("AB12").bytes(), "--bytes"));
        assertEquals("", errors);
        assertEquals(
                """
                msg  body  bytes                    meaning
                0000       01                       transaction identifier 1
                0001       06                       push
                0002       09                       header length 9
                0003       B6                       content type:
                                                    application/vnd.wap.connectivity-wbxml
                0004       91 81                    SEC: USERPIN
                0006       92 41 42 31 32 00        MAC: AB12
                000C 0000  03                       WBXML 1.3
                000D 0001  0B                       document type: "-//WAPFORUM//DTD PROV
                                                    1.0//EN"
                000E 0002  6A                       character set: UTF-8
                000F 0003  00                       string table: 0 bytes
                0010 0004  C5                       wap-provisioningdoc
                0011 0005  46                         VERSION = "1.0"
                0012 0006  01                         END of attributes
                0013 0007  C6                         characteristic
                0014 0008  55                           TYPE = "NAPDEF"
                0015 0009  01                           END of attributes
                0016 000A  87                           parm
                0017 000B  07                             NAME = "NAME"
                0018 000C  06                             VALUE
                0019 000D  03 61 62 63 00                 "abc", inline
                001E 0012  01                           END of parm
                001F 0013  01                         END of characteristic
                0020 0014  01                       END of wap-provisioningdoc
                """,
                output);
    }

    @Test
    void listsABodyAlone() {
        assertEquals(0, run(BODY, "--bytes"));
        assertTrue(
                output.startsWith(
                        """
                        body  bytes                    meaning
                        0000  03                       WBXML 1.3
                        """),
                output);
    }

    @Test
    void listsWhatStandsBehindTheDocument() {
        byte[] message = push(BODY);
        byte[] longer = Arrays.copyOf(message, message.length + 2);
        run(longer, "--bytes");
        assertTrue(output.contains("00 00                    behind the end of the document\n"), output);
    }

    @Test
    void tellsDeparturesFromTheFormatBesideTheBytes() {
        run(HexFormat.of().parseHex("030b6a0045c6550187990603610001" + "01"), "--bytes");
        String words = output.replaceAll("\\s+", " ");
        assertTrue(
                words.contains(" departs from the format: the token stands for nothing "), output);
        assertTrue(output.lines().allMatch(line -> Visible.columns(line) <= 80), output);
    }

    @Test
    void marksInTheListingWhereTheLibraryStops() {
        assertEquals(1, run(REFUSED, "--bytes"));
        assertEquals("", errors);
        String words = output.replaceAll("\\s+", " ");
        assertTrue(words.contains("30 NAME = \"CLIENT-ID\" the library refuses: CLIENT-ID "), output);
        assertTrue(words.contains("4101 QVS_ERROR_WBXML_UNKNOWN_ELEMENT, body offset 31"), output);
        // Behind the refusal the listing goes on by the format.
        assertTrue(words.contains("03 78 00 \"x\", inline"), output);
    }

    @ParameterizedTest
    @CsvSource({
        "030b6a0045 06 01, characteristic the library takes the next END for its own 0006",
        "030b6a05 6162636400 45 8301 c65501 871106037800 01 01 01, '000A 83 01 \"bcd\", table the"
                + " library skips 11 bytes from here on, all up to a zero byte, as one text 000C'",
        "000b00 45 c65501 871106037800 01 01 01, string table: 0 bytes the library reads a character"
                + " set 0003 45 wap-provisioningdoc the library reads 69 as the length of the string"
                + " table 0004",
        "030b6a0045 030a00 c65501 01 01, 'inline the library skips 3 bytes from here on, as a text'",
        "030b6a0045 c65b01 873606037700 01 01 01, 0008 87 parm the library reads a parm APPID 0009",
        "030b6a0045 c6500341505053000101 01, characteristic the library knows no such TYPE 0006",
        "030b6a0045 c65501 8711068001 01 01 01, 0008 87 parm the library ends this 1 byte earlier 0009",
    })
    void tellsInTheListingWhatTheLibraryReadsOtherwise(String hex, String told) {
        run(HexFormat.of().parseHex(hex.replace(" ", "")), "--bytes");
        String words = output.replaceAll("\\s+", " ");
        assertTrue(words.contains(told), output);
        assertTrue(output.lines().allMatch(line -> Visible.columns(line) <= 80), output);
    }

    @Test
    void listsADocumentWithTooMuchTextUpToWhereItIsTooMuch() {
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.writeBytes(HexFormat.of().parseHex("030b6a81e848"));
        body.writeBytes("x".repeat(29768).getBytes());
        body.writeBytes(HexFormat.of().parseHex("45c65501"));
        for (int i = 0; i < 300; ++i) {
            body.writeBytes(HexFormat.of().parseHex("871106830001"));
        }
        body.writeBytes(HexFormat.of().parseHex("0101"));
        assertEquals(2, run(body.toByteArray(), "--bytes"));
        assertTrue(output.contains("NAME = \"NAPID\"\n"), output);
        assertTrue(output.contains("table: 29768 bytes"), output);
        int limit = 8 << 20;
        assertEquals(limit / 29768 + 1, output.split("VALUE\n", -1).length - 1);
        assertTrue(output.contains(" not read\n"), output);
    }

    @Test
    void showsNoControlCharacterInAListing() {
        run(push(characteristic("NAPDEF", parm("NAME", "a\u001b[31m\n\u202eb\\"))), "--bytes");
        assertTrue(output.contains("\"a\\u001b[31m\\u000a\\u202eb\\\\\", inline\n"), output);
        assertFalse(output.contains("\u001b"));
    }

    @Test
    void cutsLongTextsAndCountsWideCharacters() {
        run(push(characteristic("NAPDEF", parm("NAME", "中".repeat(200)))), "--bytes");
        assertTrue(output.contains("...\n"), output);
        assertTrue(output.lines().allMatch(line -> Visible.columns(line) <= 80), output);
    }

    // ---- Departures from the format

    @Test
    void listsDeparturesFromTheFormatBriefly() {
        String parm = "879903610001";
        run(HexFormat.of().parseHex("030b6a0045c65501" + parm.repeat(9) + "01" + "01"));
        assertTrue(output.contains("\nDeparts from the format:\n- the token stands for"), output);
        assertTrue(output.matches("(?s).*\n- and \\d+ more, which --json lists\n"), output);
        assertTrue(output.lines().allMatch(line -> Visible.columns(line) <= 80), output);
    }

    @Test
    void marksWhatIsNoParameter() {
        run(HexFormat.of().parseHex("030b6a0045c65501" + "0361" + "00" + "870603620001" + "0109" + "01ff"));
        assertTrue(output.contains("\n  (text \"a\")\n  (no NAME)  b\n"), output);
        assertTrue(output.contains("\n(element unknown-"), output);
        assertTrue(output.contains("\n(1 bytes behind the document)\n"), output);
    }

    /** Neither the tree nor what is indented by it costs more than the elements do. */
    @Test
    void showsElementsOfAnyDepth() {
        byte[] body = new byte[5 + 3 * 20000];
        System.arraycopy(new byte[] {3, 0x0B, 0x6A, 0, 0x45}, 0, body, 0, 5);
        for (int i = 5; i < body.length; i += 3) {
            System.arraycopy(new byte[] {(byte) 0xC6, 0x51, 1}, 0, body, i, 3);
        }
        for (String form : List.of("--color=never", "--json", "--json-lines", "--bytes")) {
            run(body, form);
            assertTrue(output.length() < 1000 * 20000, form + ": " + output.length());
        }
    }

    /** The name of one parameter makes no other one wide. */
    @Test
    void isNotWidenedByALongName() {
        Document.Element[] parms = new Document.Element[100];
        Arrays.fill(parms, parm("NAME", "abc"));
        parms[50] = named("x".repeat(10000), "y");
        run(push(characteristic("VENDORCONFIG", parms)));
        assertTrue(output.contains("\n  NAME  abc\n"), output.substring(0, 200));
        assertTrue(output.contains("x  y\n"));
    }

    // ---- Refused messages

    @Test
    void showsARefusedMessageAllTheSame() {
        assertEquals(1, run(REFUSED));
        assertTrue(
                output.endsWith(
                        """

                        NAPDEF
                          NAME  abc

                        NAPDEF
                          NAPID      N
                          CLIENT-ID  x
                        """),
                output);
        assertTrue(errors.startsWith("omacp: standard input: refused: CLIENT-ID (0x30) "), errors);
        String words = errors.replaceAll("\\s+", " ");
        assertTrue(
                words.contains(
                        " 4101 QVS_ERROR_WBXML_UNKNOWN_ELEMENT, body offset 31 (0x1F), message"
                                + " offset 35 (0x23), in wap-provisioningdoc / NAPDEF 2 / "),
                errors);
        assertTrue(
                errors.contains(
                        """
                            001B  87 11 06 03 4E 00 01 87 30 06 03 78 00 01 01 01
                                                          ^^
                        """),
                errors);
        assertTrue(words.contains(" NAME=text (0x05), NAME (0x07), "), errors);
        assertTrue(errors.lines().allMatch(line -> line.length() <= 80), errors);
    }

    @Test
    void explainsABodyThatEnds() {
        byte[] message = push(BODY);
        assertEquals(1, run(Arrays.copyOf(message, message.length - 4)));
        assertTrue(errors.contains("  4103 QVS_ERROR_WBXML_NO_DATA, body offset 17 "), errors);
        assertTrue(errors.matches("(?s).* refused: .*\\bends?\\b.*"), errors);
    }

    @Test
    void explainsADocumentThatIsEmpty() {
        assertEquals(1, run(push(HexFormat.of().parseHex("030b6a0045" + "01"))));
        assertTrue(errors.contains("empty"), errors);
        assertTrue(errors.contains("body offset 5 (0x5)"), errors);
    }

    @Test
    void showsTheHeaderOfAMessageWhoseBodyCannotBeRead() {
        assertEquals(1, run(withShortType(0xC4, new byte[] {1, 5, 3, 0}).sec(0x80).bytes()));
        assertTrue(output.startsWith("Content type    application/vnd.syncml.notification (68)\n"), output);
        assertTrue(errors.contains("body offset 1 (0x1), message offset"), errors);
    }

    @Test
    void explainsInJson() throws Exception {
        String refused = file("refused", REFUSED);
        String good = file("good", push(BODY));
        assertEquals(1, run(new byte[0], "--json", refused, good));
        List<?> array = (List<?>) Json.parse(output);
        assertEquals(2, array.size());
        Map<?, ?> first = (Map<?, ?>) array.get(0);
        assertEquals(refused, first.get("file"));
        Map<?, ?> verdict = (Map<?, ?>) first.get("verdict");
        assertEquals(false, verdict.get("accepted"));
        assertEquals(4101, verdict.get("code"));
        assertEquals("QVS_ERROR_WBXML_UNKNOWN_ELEMENT", verdict.get("codeName"));
        assertTrue(verdict.get("path").toString().startsWith("wap-provisioningdoc / NAPDEF 2 / "));
        assertEquals(31, verdict.get("offset"));
        assertTrue(((List<?>) verdict.get("expected")).size() > 20, output);
        assertEquals(2, ((List<?>) ((Map<?, ?>) first.get("document")).get("children")).size());
        Map<?, ?> second = (Map<?, ?>) array.get(1);
        assertEquals(good, second.get("file"));
        assertEquals(true, ((Map<?, ?>) second.get("verdict")).get("accepted"));
    }

    @Test
    void printsAnObjectOnALineForEachFile() throws Exception {
        String refused = file("refused", REFUSED);
        String missing = directory.resolve("missing").toString();
        assertEquals(2, run(new byte[0], "--json-lines", refused, missing, file("good", push(BODY))));
        List<String> lines = output.lines().toList();
        assertEquals(3, lines.size());
        assertEquals(refused, ((Map<?, ?>) Json.parse(lines.get(0))).get("file"));
        assertEquals(
                Map.of("file", missing, "error", "no such file"), Json.parse(lines.get(1)));
        assertTrue(((Map<?, ?>) Json.parse(lines.get(2))).containsKey("document"));
    }

    @Test
    void tellsInJsonWhatEachItemIs() {
        String parms = "8711060361" + "0001" + "870701" + "8706036200" + "01" + "036300";
        run(HexFormat.of().parseHex("030b6a0045c601" + parms + "01" + "01"), "--json");
        Map<?, ?> document = (Map<?, ?>) ((Map<?, ?>) Json.parse(output)).get("document");
        Map<?, ?> characteristic = (Map<?, ?>) ((List<?>) document.get("children")).get(0);
        assertTrue(characteristic.containsKey("type"));
        assertNull(characteristic.get("type"));
        List<?> children = (List<?>) characteristic.get("children");
        assertMembers(children.get(0), "name", "NAPID", "value", "a");
        assertMembers(children.get(1), "name", "NAME", "value", null);
        assertMembers(children.get(2), "name", null, "value", "b");
        assertMembers(children.get(3), "other", "text", "text", "c");
    }

    private static void assertMembers(Object item, Object... members) {
        for (int i = 0; i < members.length; i += 2) {
            assertTrue(((Map<?, ?>) item).containsKey(members[i]), item.toString());
            assertEquals(members[i + 1], ((Map<?, ?>) item).get(members[i]));
        }
    }

    @Test
    void saysInJsonWhatCannotBeRead() throws Exception {
        String missing = directory.resolve("missing").toString();
        assertEquals(2, run(new byte[0], "--json", missing));
        assertEquals(Map.of("error", "no such file"), Json.parse(output));
        String good = file("good", push(BODY));
        assertEquals(2, run(new byte[0], "--json", missing, good, directory.toString()));
        List<?> array = (List<?>) Json.parse(output);
        assertEquals(Map.of("file", missing, "error", "no such file"), array.get(0));
        assertTrue(((Map<?, ?>) array.get(1)).containsKey("document"));
        assertEquals("is a directory", ((Map<?, ?>) array.get(2)).get("error"));
    }

    /** Where both go to one terminal, what is wrong stands on lines of its own. */
    @Test
    void complainsBetweenTheLinesOfJson() throws Exception {
        ByteArrayOutputStream both = new ByteArrayOutputStream();
        String missing = directory.resolve("missing").toString();
        String good = file("good", push(BODY));
        Main.run(
                new ByteArrayInputStream(new byte[0]),
                both,
                both,
                Terminal.NONE,
                "--json",
                missing,
                good,
                missing);
        String complaint = "omacp: " + missing + ": no such file\n";
        String json = both.toString(StandardCharsets.UTF_8);
        assertEquals(3, json.split("(?m)^" + Pattern.quote(complaint), -1).length, json);
        assertEquals(3, ((List<?>) Json.parse(json.replace(complaint, ""))).size());
    }

    // ---- Input

    @Test
    void showsThePushThatThePartsOfAnSmsCarryOverFiles() throws Exception {
        byte[] push = push(BODY);
        assertEquals(0, run(push));
        String shown = output;
        List<byte[]> parts = Sms.parts(push, 12, false, 7);
        assertEquals(3, parts.size());
        String[] files = new String[parts.size()];
        for (int i = 0; i < files.length; ++i) {
            files[files.length - 1 - i] = file("part" + i, parts.get(i));
        }
        assertEquals(0, run(new byte[0], files), errors);
        assertTrue(output.endsWith(" <==\n" + shown), output);
        assertEquals(1, output.split("==>", -1).length - 1);
        assertEquals(1, run(new byte[0], files[0], files[1]));
        assertEquals("", output);
        assertTrue(errors.startsWith("omacp: "), errors);
        assertEquals(0, run(new byte[0], merged(array("--json"), files)), errors);
        assertEquals(1, ((List<?>) Json.parse(output)).size());
        assertEquals(0, run(new byte[0], merged(array("verify", "--pin=1"), files)) & 2, errors);
    }

    /** Several messages in one file are shown as those of several files are. */
    @Test
    void showsTheMessagesOfALog() throws Exception {
        String log = HexFormat.of().formatHex(push(BODY)) + "\n" + HexFormat.of().formatHex(REFUSED) + "\n";
        assertEquals(1, run(log.getBytes(StandardCharsets.US_ASCII), "--json"));
        List<?> array = (List<?>) Json.parse(output);
        assertEquals("standard input, line 1", ((Map<?, ?>) array.get(0)).get("file"));
        assertEquals("standard input, line 2", ((Map<?, ?>) array.get(1)).get("file"));
        run(log.getBytes(StandardCharsets.US_ASCII));
        assertTrue(output.startsWith("==> standard input, line 1 <==\n"), output);
        assertTrue(errors.startsWith("omacp: standard input, line 2: refused: "), errors);
    }

    private static String[] array(String... elements) {
        return elements;
    }

    private static String[] merged(String[] first, String[] second) {
        String[] all = Arrays.copyOf(first, first.length + second.length);
        System.arraycopy(second, 0, all, first.length, second.length);
        return all;
    }

    @Test
    void readsBase64() throws Exception {
        byte[] message = push(BODY);
        assertEquals(0, run(message));
        String shown = output;
        for (Base64.Encoder encoder :
                List.of(
                        Base64.getEncoder(),
                        Base64.getUrlEncoder(),
                        Base64.getMimeEncoder(16, new byte[] {'\n'}))) {
            assertEquals(0, run(encoder.encode(message)), errors);
            assertEquals(shown, output);
        }
        assertEquals(0, run(Base64.getEncoder().encode(BODY)), errors);
        assertTrue(output.startsWith("Body length     21 bytes, without a push header\n"), output);
    }

    @Test
    void readsABodyAlone() {
        assertEquals(0, run(BODY));
        assertEquals(
                """
                Body length     21 bytes, without a push header

                NAPDEF
                  NAME  abc
                """,
                output);
        assertEquals(0, run(HexFormat.of().formatHex(BODY).getBytes(), "--json"));
        assertNull(((Map<?, ?>) Json.parse(output)).get("header"));
        assertEquals(1, run(BODY, "--header"));
        assertEquals("omacp: standard input: has no push header\n", errors);
    }

    @Test
    void showsTheHeaderAlone() {
        byte[] message = withShortType(0xB6, new byte[] {7, 7}).sec(0x80).bytes();
        assertEquals(0, run(message, "--header"), errors);
        assertEquals(
                """
                Content type    application/vnd.wap.connectivity-wbxml (54)
                Header length   6 bytes
                Body length     2 bytes
                SEC             NETWPIN
                """,
                output);
        assertEquals(0, run(message, "--header", "--json"), errors);
        Map<?, ?> header = (Map<?, ?>) ((Map<?, ?>) Json.parse(output)).get("header");
        assertEquals("NETWPIN", header.get("securityMethod"));
    }

    @Test
    void showsSeveralFiles() throws Exception {
        String good = file("good", push(BODY));
        String refused = file("refused", REFUSED);
        String missing = directory.resolve("missing").toString();
        String shown =
                """
                Content type    application/vnd.wap.connectivity-wbxml (54)
                Header length   4 bytes
                Body length     21 bytes

                NAPDEF
                  NAME  abc
                """;
        String twice = "==> " + good + " <==\n" + shown + "\n==> " + good + " <==\n" + shown;
        assertEquals(0, run(new byte[0], good, good));
        assertEquals(twice, output);
        assertEquals(2, run(new byte[0], "show", good, missing, good));
        assertEquals(twice, output);
        assertEquals(2, run(new byte[0], good, missing, refused));
        assertTrue(errors.startsWith("omacp: " + missing + ": no such file\n"), errors);
    }

    // ---- Colours

    @Test
    void usesColoursOnATerminalAlone() {
        Terminal terminal = new Terminal(true, true, true);
        run(REFUSED, "--bytes", "--color=always");
        assertTrue(output.contains("\u001b[32m\"abc\", inline\u001b[0m"), output);
        run(terminal, REFUSED, "--bytes");
        assertTrue(output.contains("\u001b[32m"), output);
        run(terminal, REFUSED, "--bytes", "--color=never");
        assertFalse(output.contains("\u001b"), output);
        run(new Terminal(true, false, true), REFUSED);
        assertFalse(errors.contains("\u001b"), errors);
        run(new Terminal(false, true, false), REFUSED);
        assertTrue(errors.startsWith("omacp: standard input: \u001b[1;31mrefused: "), errors);
        run(new Terminal(false, true, false), REFUSED, "--bytes");
        assertFalse(output.contains("\u001b"), output);
    }

    @Test
    void honoursNoColor() {
        assertTrue(Terminal.wantsColor(Map.of("TERM", "xterm")));
        assertTrue(Terminal.wantsColor(Map.of("TERM", "xterm", "NO_COLOR", "")));
        assertFalse(Terminal.wantsColor(Map.of("TERM", "xterm", "NO_COLOR", "1")));
        assertFalse(Terminal.wantsColor(Map.of("TERM", "dumb")));
        assertFalse(Terminal.wantsColor(Map.of()));
    }

    // ---- XML

    @Test
    void printsXml() {
        byte[] push = withShortType(0xB6, BODY).sec(0x81).mac("AB12").bytes();
        assertEquals(0, run(push, "--xml"), errors);
        assertEquals("", errors);
        assertEquals(
                """
                <?xml version="1.0" encoding="UTF-8"?>
                <?omacp-push content-type="short" sec="userpin"?>
                <!DOCTYPE wap-provisioningdoc PUBLIC "-//WAPFORUM//DTD PROV 1.0//EN" "http://www.wapforum.org/DTD/prov.dtd">
                <wap-provisioningdoc version="1.0">
                  <characteristic type="NAPDEF">
                    <parm name="NAME" value="abc"/>
                  </characteristic>
                </wap-provisioningdoc>
                """,
                output);
    }

    @Test
    void sendsNothingOfXmlToATerminalThatItObeys() {
        String hostile = "a\u009b31m\u202e\u2028\t\r\n\ufeff\u00e9";
        byte[] body = Document.document(characteristic("NAPDEF", parm("NAME", hostile)));
        assertEquals(0, run(body, "--xml"), errors);
        assertTrue(
                output.contains("\"a&#155;31m&#8238;&#8232;&#9;&#13;&#10;&#65279;\u00e9\""), output);
    }

    @Test
    void tellsWhatXmlCannotHoldWithItsPath() {
        byte[] body = Document.document(characteristic("NAPDEF", parm("NAME", "\u001b[31m")));
        assertEquals(1, run(body, "--xml"));
        assertEquals("", output);
        assertEquals(
                "omacp: standard input: XML has no character U+001B, in wap-provisioningdoc / NAPDEF"
                        + " 1\n",
                errors);
    }

    @Test
    void printsXmlOfARefusedMessageAndSaysWhyItIsRefused() {
        assertEquals(1, run(REFUSED, "--xml"));
        assertTrue(output.endsWith("</wap-provisioningdoc>\n"), output);
        assertTrue(errors.startsWith("omacp: standard input: refused: "), errors);
    }

    @Test
    void printsXmlInNoOtherForm() {
        for (String other : List.of("--json", "--json-lines", "--bytes", "--header", "--answers")) {
            assertEquals(2, run(BODY, "--xml", other));
            assertEquals("", output);
        }
    }
}
