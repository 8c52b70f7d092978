package com.qvomacp.cli;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.withShortType;
import static com.qvomacp.support.Push.withTextType;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import com.qvomacp.support.Document;
import com.qvomacp.support.Json;
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
    private static final String EXPLAINED =
            """
            omacp: standard input: refused: CLIENT-ID (0x30) is no parameter of NAPDEF
              4101 QVS_ERROR_WBXML_UNKNOWN_ELEMENT, body offset 31 (0x1F), message offset 35
              (0x23), in wap-provisioningdoc / NAPDEF 2 / parm 2.
                001B  87 11 06 03 4E 00 01 87 30 06 03 78 00 01 01 01
                                              ^^
              Accepted here: NAME=text (0x05), NAME (0x07), NAP-ADDRESS (0x08), NAP-ADDRTYPE
            """;

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

    /** The meanings in a listing, without offsets and bytes. */
    private List<String> meanings(byte[] input) {
        run(input, "--bytes");
        return output.lines().map(line -> line.substring(Math.min(line.length(), 36)).strip()).toList();
    }

    private void assertMeans(byte[] input, String... expected) {
        List<String> meanings = meanings(input);
        int at = meanings.indexOf(expected[0]);
        assertTrue(at >= 0, output);
        assertEquals(List.of(expected), meanings.subList(at, at + expected.length), output);
    }

    // ---- Bytes

    @Test
    void listsEveryByte() {
        assertEquals(0, run(withShortType(0xB6, BODY).sec(0x81).mac("AB12").bytes(), "--bytes"));
        assertEquals("", errors);
        assertEquals(
                """
                msg  body  bytes                    meaning
                0000       01                       transaction identifier 0x01
                0001       06                       PDU type: Push
                0002       09                       headers: 9 bytes
                0003       B6                       content type 0x36:
                                                    application/vnd.wap.connectivity-wbxml
                0004       91                       parameter SEC
                0005       81                       security method: USERPIN (0x81)
                0006       92                       parameter MAC
                0007       41 42 31 32 00           MAC "AB12"
                000C 0000  03                       WBXML version 1.3
                000D 0001  0B                       public identifier 11: PROV 1.0
                000E 0002  6A                       charset 106: UTF-8
                000F 0003  00                       string table: 0 bytes
                0010 0004  C5                       <wap-provisioningdoc> attributes, content
                0011 0005  46                         VERSION=1.0
                0012 0006  01                         END of attributes
                0013 0007  C6                         <characteristic> attributes, content
                0014 0008  55                           TYPE=NAPDEF
                0015 0009  01                           END of attributes
                0016 000A  87                           <parm> attributes
                0017 000B  07                             NAME=NAME
                0018 000C  06                             VALUE
                0019 000D  03 61 62 63 00                 STR_I "abc"
                001E 0012  01                           END of parm
                001F 0013  01                         END of NAPDEF
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
                        0000  03                       WBXML version 1.3
                        """),
                output);
    }

    @Test
    void saysWhatValuesMean() {
        assertMeans(
                push(
                        characteristic(
                                "NAPDEF",
                                parm("BEARER", token(0xAB)),
                                parm("CALLTYPE", "a", token(0x85), token(0x9A)),
                                named("INIT"))),
                "NAME=BEARER",
                "VALUE",
                "value token 0xAB GSM-GPRS",
                "END of parm",
                "<parm> attributes",
                "NAME=CALLTYPE",
                "VALUE",
                "STR_I \"a\"",
                "value token 0x85 IPV4",
                "value token 0x9A PAP",
                "END of parm",
                "<parm> attributes",
                "NAME=text",
                "STR_I \"INIT\"",
                "END of parm");
    }

    @Test
    void saysWhatPagesAndTypesMean() {
        assertMeans(
                push(characteristic("APPLICATION", parm("APPID", "w2")), characteristic("WI-FI")),
                "<characteristic> attributes, content",
                "SWITCH_PAGE to code page 1",
                "TYPE=APPLICATION",
                "END of attributes",
                "<parm> attributes",
                "NAME=APPID",
                "VALUE",
                "STR_I \"w2\"",
                "END of parm",
                "END of APPLICATION",
                "<characteristic> attributes, content",
                "TYPE=text",
                "STR_I \"WI-FI\"",
                "END of attributes",
                "END of WI-FI");
    }

    @Test
    void saysWhatAStringTableHolds() {
        String hex =
                "030b6a05"
                        + "6162006300"
                        + "45c65501"
                        + "871106830301"
                        + "870706c30278790101"
                        + "01";
        byte[] body = HexFormat.of().parseHex(hex);
        run(body, "--bytes");
        for (String meaning :
                List.of(
                        "string table: 5 bytes",
                        "  [0] \"ab\"",
                        "  [3] \"c\"",
                        "STR_T [3] \"c\"",
                        "OPAQUE, 2 bytes: \"xy\"")) {
            assertTrue(output.contains(meaning + "\n"), output);
        }
    }

    @Test
    void saysWhatTextHeadersMean() {
        byte[] message =
                withTextType("application/vnd.wap.connectivity-wbxml", BODY)
                        .secNamed("SEC", 0x80)
                        .macNamed("mac", "F")
                        .bytes();
        List<String> meanings = meanings(message);
        for (String meaning :
                List.of("content type", "parameter SEC", "parameter MAC", "MAC \"F\"")) {
            assertTrue(meanings.contains(meaning), output);
        }
    }

    @Test
    void listsWhatIsNotRead() {
        byte[] message = push(BODY);
        byte[] longer = Arrays.copyOf(message, message.length + 2);
        assertEquals(0, run(longer, "--bytes"));
        assertTrue(output.endsWith("00 00                    behind the document, not read\n"));
    }

    @Test
    void listsAVersionGivenAsText() {
        byte[] body = HexFormat.of().parseHex("030b6a00c54503312e310001c6550101" + "01");
        assertEquals(0, run(body, "--bytes"));
        assertTrue(
                output.contains(
                        """
                        0005  45                         VERSION=
                        0006  03 31 2E 31 00 01          "1.1" and all up to an END, skipped
                        000C  C6                         <characteristic> attributes, content
                        """),
                output);
    }

    @Test
    void endsWithTheReason() {
        assertEquals(1, run(REFUSED, "--bytes"));
        assertEquals("", errors);
        String refused =
                """
                0023 001F  30                             refused: CLIENT-ID (0x30) is no
                                                          parameter of NAPDEF
                0024 0020  06 03 78 00 01 01 01     not read

                refused: CLIENT-ID (0x30) is no parameter of NAPDEF
                  4101 QVS_ERROR_WBXML_UNKNOWN_ELEMENT, body offset 31 (0x1F), message offset 35
                """;
        assertTrue(output.contains(refused), output);
    }

    @Test
    void showsNoControlCharacterInAListing() {
        run(push(characteristic("NAPDEF", parm("NAME", "a\u001b[31m\n\u202eb"))), "--bytes");
        assertTrue(output.contains("STR_I \"a\\u001b[31m\\u000a\\u202eb\"\n"), output);
        assertFalse(output.contains("\u001b"));
    }

    @Test
    void cutsLongTextsAndCountsWideCharacters() {
        run(push(characteristic("NAPDEF", parm("NAME", "中".repeat(200)))), "--bytes");
        assertTrue(output.contains("... (600 bytes)"), output);
        assertTrue(output.lines().allMatch(line -> Visible.columns(line) <= 80), output);
    }

    // ---- Refused messages

    @Test
    void explainsARefusedBody() {
        assertEquals(1, run(REFUSED));
        assertEquals("", output);
        assertTrue(errors.startsWith(EXPLAINED), errors);
        String words = errors.replaceAll("\\s+", " ");
        assertTrue(words.endsWith(" T-BIT (0x4C), END (0x01). "), errors);
        assertTrue(errors.lines().allMatch(line -> line.length() <= 80), errors);
    }

    @Test
    void explainsANestedCharacteristicAndAnUnknownName() {
        assertEquals(1, run(push(characteristic("BOOTSTRAP", characteristic("PORT")))));
        assertTrue(
                errors.contains("refused: no characteristic may stand in BOOTSTRAP\n"), errors);
        assertTrue(errors.contains("in wap-provisioningdoc / BOOTSTRAP 1.\n"), errors);
        assertEquals(1, run(push(characteristic("WI-FI", named("netssid", "x")))));
        assertTrue(errors.contains("the VALUE belongs to a name that WI-FI"), errors);
        assertTrue(errors.contains("NETSSID, SECMODE"), errors);
    }

    @Test
    void explainsABodyThatEnds() {
        byte[] message = push(BODY);
        assertEquals(1, run(Arrays.copyOf(message, message.length - 4)));
        assertTrue(errors.contains(": refused: the body ends within a value\n"), errors);
        assertTrue(errors.contains("  4103 QVS_ERROR_WBXML_NO_DATA, body offset 17 "), errors);
        assertEquals(1, run(push(new byte[0])));
        assertTrue(errors.contains(": refused: the body is empty\n"), errors);
        assertTrue(errors.contains("  2 QVS_ERROR_BAD_ARGUMENT, body offset 0"), errors);
    }

    @Test
    void explainsABodyWithoutADocument() {
        assertEquals(1, run(push(HexFormat.of().parseHex("030b6a0001"))));
        assertTrue(errors.contains(": refused: the body holds no document\n"), errors);
    }

    /** Without the library that asks the decoder, the program says that it is its own opinion. */
    @Test
    void saysWhenTheDecoderCannotBeAsked() throws Exception {
        Path library = Path.of(System.getProperty("java.library.path"), "libomacp.so");
        Files.copy(library, directory.resolve("libomacp.so"));
        ChildVm.Result result =
                ChildVm.run(
                        directory.toString(),
                        System.getProperty("java.class.path"),
                        REFUSED,
                        Main.class);
        assertEquals(1, result.status());
        assertTrue(result.errors().startsWith(EXPLAINED), result.errors());
        assertTrue(
                result.errors().endsWith("  asks the library, cannot be loaded.\n"),
                result.errors());
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
        Map<?, ?> why = (Map<?, ?>) first.get("refused");
        assertEquals("QVS_ERROR_WBXML_UNKNOWN_ELEMENT", why.get("name"));
        assertEquals("wap-provisioningdoc / NAPDEF 2 / parm 2", why.get("path"));
        assertEquals("31", String.valueOf(why.get("bodyOffset")).replace(".0", ""));
        assertEquals(good, ((Map<?, ?>) array.get(1)).get("file"));
        assertTrue(((Map<?, ?>) array.get(1)).containsKey("characteristics"));
    }

    @Test
    void explainsASingleMessageInJson() {
        assertEquals(1, run(new byte[] {1, 7, 1, 0}, "--json"));
        Map<?, ?> why = (Map<?, ?>) ((Map<?, ?>) Json.parse(output)).get("refused");
        assertEquals("PDU type 0x07 is no push", why.get("reason"));
        assertTrue(errors.startsWith("omacp: standard input: refused: PDU type 0x07"), errors);
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
        assertTrue(((Map<?, ?>) array.get(1)).containsKey("characteristics"));
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

    @ParameterizedTest
    @CsvSource(
            delimiter = '|',
            value = {
                "<?xml version='1.0'?>|This is XML. What is pushed to a handset is the WBXML",
                "0106 2|This is hexadecimal text with an odd number of digits: 5.",
                "01:06:2|This is hexadecimal text with an odd number of digits: 5.",
                "hello world|This is text, and neither hexadecimal nor base64 of a message.",
            })
    void saysWhatATextIsThatIsNoMessage(String text, String remark) {
        assertEquals(1, run(text.getBytes(StandardCharsets.US_ASCII)));
        assertTrue(errors.contains("\n  " + remark), errors);
        assertEquals(1, run(("\u0001" + text).getBytes(StandardCharsets.US_ASCII)));
        assertFalse(errors.contains("This is"), errors);
    }

    // ---- Input

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
                Header length   3 bytes
                Body length     2 bytes
                SEC             NETWPIN (0x80)
                """,
                output);
        assertEquals(0, run(message, "--header", "--json"), errors);
        Map<?, ?> header = (Map<?, ?>) ((Map<?, ?>) Json.parse(output)).get("header");
        assertEquals("NETWPIN", header.get("sec"));
    }

    @Test
    void showsSeveralFiles() throws Exception {
        String good = file("good", push(BODY));
        String refused = file("refused", REFUSED);
        String missing = directory.resolve("missing").toString();
        String shown =
                """
                Content type    application/vnd.wap.connectivity-wbxml (54)
                Header length   1 bytes
                Body length     21 bytes

                NAPDEF
                  NAME  abc
                """;
        String twice = "==> " + good + " <==\n" + shown + "\n==> " + good + " <==\n" + shown;
        assertEquals(0, run(new byte[0], good, good));
        assertEquals(twice, output);
        assertEquals(1, run(new byte[0], "show", good, refused, good));
        assertEquals(twice, output);
        assertTrue(errors.contains("refused: CLIENT-ID"), errors);
        assertEquals(2, run(new byte[0], good, missing, refused));
        assertTrue(errors.startsWith("omacp: " + missing + ": no such file\n"), errors);
    }

    // ---- Colours

    @Test
    void usesColoursOnATerminalAlone() {
        Terminal terminal = new Terminal(true, true);
        run(REFUSED, "--bytes", "--color=always");
        assertTrue(output.contains("\u001b[36m<parm> attributes\u001b[0m"), output);
        run(terminal, REFUSED, "--bytes");
        assertTrue(output.contains("\u001b[36m"), output);
        run(terminal, REFUSED, "--bytes", "--color=never");
        assertFalse(output.contains("\u001b"), output);
        run(new Terminal(true, false), REFUSED);
        assertFalse(errors.contains("\u001b"), errors);
        run(new Terminal(false, true), REFUSED);
        assertTrue(errors.startsWith("omacp: standard input: \u001b[1;31mrefused: "), errors);
        run(new Terminal(false, true), REFUSED, "--bytes");
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
}
