package com.qvomacp.cli;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static com.qvomacp.support.Push.push;
import static com.qvomacp.support.Push.withShortType;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import com.qvomacp.support.Document;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Json;
import com.qvomacp.support.Natives;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The command-line program. */
class MainTest extends Natives {
    private static final byte[] SMALL =
            withShortType(0xB6, body("NAME", "Café")).sec(0x81).mac("AB12").bytes();

    private static final String SMALL_SHOWN =
            """
            Content type    application/vnd.wap.connectivity-wbxml (54)
            Header length   9 bytes
            Body length     23 bytes
            SEC             USERPIN (0x81)
            MAC             AB12

            NAPDEF
              NAME  Café
            """;

    @TempDir Path directory;

    private String output;
    private String errors;

    private static byte[] body(String parm, String value) {
        return Document.document(characteristic("NAPDEF", parm(parm, value)));
    }

    private int run(byte[] input, String... arguments) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        int status = Main.run(
                        new ByteArrayInputStream(input), out, err, Terminal.NONE, arguments);
        output = out.toString(StandardCharsets.UTF_8);
        errors = err.toString(StandardCharsets.UTF_8);
        assertEquals(-1, parser.qvomacp_GetParserContentType(), "a header is left behind");
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount(), "a context is left behind");
        return status;
    }

    private void assertShows(String shown, byte[] input, String... arguments) {
        int status = run(input, arguments);
        assertEquals("", errors);
        assertEquals(shown, output);
        assertEquals(0, status);
    }

    private void assertFails(int status, String message, byte[] input, String... arguments) {
        assertEquals(status, run(input, arguments), errors);
        assertEquals("", output);
        assertEquals(message, errors);
    }

    private String shownParms(Document.Element... parms) {
        assertEquals(0, run(push(characteristic("NAPDEF", parms))), errors);
        return output.substring(output.indexOf("NAPDEF\n") + "NAPDEF\n".length());
    }

    @Test
    void readsStandardInput() {
        assertShows(SMALL_SHOWN, SMALL);
        assertShows(SMALL_SHOWN, SMALL, "-");
    }

    @Test
    void readsAFile() throws IOException {
        Path file = Files.write(directory.resolve("message"), SMALL);
        assertShows(SMALL_SHOWN, new byte[0], file.toString());
    }

    @Test
    void readsHexadecimalText() throws IOException {
        String hex = HexFormat.of().formatHex(SMALL);
        assertShows(SMALL_SHOWN, ascii(hex));
        assertShows(SMALL_SHOWN, ascii(hex.toUpperCase() + "\n"));
        assertShows(SMALL_SHOWN, ascii(HexFormat.ofDelimiter(" ").formatHex(SMALL)));
        assertShows(SMALL_SHOWN, ascii("\t" + hex.replaceAll("(.{7})", "$1\r\n") + "\f"));
        assertShows(SMALL_SHOWN, ascii(HexFormat.ofDelimiter(":").formatHex(SMALL)));
        assertShows(SMALL_SHOWN, ascii(HexFormat.ofDelimiter(", ").withPrefix("0x").formatHex(SMALL)));
        Path file = Files.writeString(directory.resolve("message.hex"), hex);
        assertShows(SMALL_SHOWN, new byte[0], file.toString());
    }

    @ParameterizedTest
    @ValueSource(strings = {"", "\n", "0106", "01 06 0", "0x0106", "hello", "A"})
    void refusesTextThatIsNoMessage(String text) {
        assertEquals(1, run(ascii(text)));
        assertEquals("", output);
        assertTrue(errors.startsWith("omacp: standard input: refused: "), errors);
        assertTrue(errors.contains(", in push header.\n"), errors);
    }

    @Test
    void showsEverythingAsText() throws IOException {
        assertShows(resource("everything.txt"), Everything.push());
    }

    @Test
    void showsEverythingAsJson() throws IOException {
        assertShows(resource("everything.json"), Everything.push(), "--json");
        Json.parse(output);
    }

    /** A PORT outside a proxy or an address is decoded and dropped. */
    @Test
    void showsADocumentThatSetsNothing() {
        assertShows(
                """
                Content type    application/vnd.wap.connectivity-wbxml (54)
                Header length   1 bytes
                Body length     12 bytes
                """,
                push(characteristic("PORT")));
        assertShows(
                """
                {
                  "header": {
                    "contentType": "application/vnd.wap.connectivity-wbxml",
                    "contentTypeCode": 54,
                    "headerLength": 1,
                    "bodyLength": 12
                  },
                  "characteristics": []
                }
                """,
                push(characteristic("PORT")),
                "--json");
        Json.parse(output);
    }

    @ParameterizedTest
    @CsvSource({
        "0xB5, application/vnd.wap.connectivity-xml (53)",
        "0xB6, application/vnd.wap.connectivity-wbxml (54)",
        "0xC2, application/vnd.syncml.dm+wbxml (66)",
        "0xC4, application/vnd.syncml.notification (68)",
        "0xCE, application/vnd.syncml.ds.notification (78)",
    })
    void namesTheContentType(String sent, String shown) {
        assertEquals(0, run(withShortType(Integer.decode(sent), body("NAME", "x")).bytes()));
        assertEquals("Content type    " + shown, output.lines().findFirst().orElseThrow());
    }

    @ParameterizedTest
    @CsvSource({
        "0x80, NETWPIN (0x80)",
        "0x81, USERPIN (0x81)",
        "0x82, USERNETWPIN (0x82)",
        "0x83, USERPINMAC (0x83)",
        "0x01, USERPIN (0x01)",
        "0x84, unknown (0x84)",
        "0xFF, unknown (0xFF)",
    })
    void namesTheSecurityMethod(String sent, String shown) {
        byte[] message = withShortType(0xB6, body("NAME", "x")).sec(Integer.decode(sent)).bytes();
        assertEquals(0, run(message));
        assertTrue(output.contains("\nSEC             " + shown + "\n"), output);
        assertFalse(output.contains("\nMAC"), output);
    }

    @Test
    void linesUpTheValuesOfACharacteristic() {
        assertEquals(
                """
                  NAPID        N1
                  NAP-ADDRESS  apn.example
                  DNS-ADDR     192.0.2.1
                  DNS-ADDR     192.0.2.2
                """,
                shownParms(
                        parm("NAPID", "N1"),
                        parm("NAP-ADDRESS", "apn.example"),
                        parm("DNS-ADDR", "192.0.2.1"),
                        parm("DNS-ADDR", "192.0.2.2")));
    }

    @Test
    void showsThatAnAddressTypeIsSet() {
        assertEquals(
                """
                  NAP-ADDRTYPE  (set, value not answered)
                  CALLTYPE      ANALOG-MODEM
                """,
                shownParms(parm("NAP-ADDRTYPE", token(0x89)), parm("CALLTYPE", token(0x90))));
        assertEquals(
                "  NAP-ADDRTYPE  0x89\n",
                shownParms(parm("NAP-ADDRTYPE", (Object) new byte[] {(byte) 0x89})));
    }

    @Test
    void showsABearerAsTheLibraryAnswersIt() {
        assertEquals("  BEARER  GSM-GPRS\n", shownParms(parm("BEARER", token(0xAB))));
        assertEquals(
                """
                  NAP-ADDRESS  apn.example
                  BEARER       apn.example
                """,
                shownParms(parm("NAP-ADDRESS", "apn.example"), parm("BEARER", "GSM-GPRS")));
        assertEquals(
                "  BEARER  (set, value not answered)\n", shownParms(parm("BEARER", "GSM-GPRS")));
    }

    @Test
    void showsNoControlCharacterOfAMessage() {
        assertEquals(
                "  NAME  a\\u001b[31m\\u000ab\\u202ec\\u0085\n",
                shownParms(parm("NAME", "a\u001b[31m\nb\u202ec\u0085")));
        assertEquals(
                "  NAME  \"quoted\" \\ €\n", shownParms(parm("NAME", "\"quoted\" \\ €")));
    }

    @Test
    void escapesWhatJsonAsksFor() {
        String name = "\"q\" \\ /\b\f\n\r\t\u0001\u007f€ 中";
        assertEquals(0, run(push(body("NAME", name)), "--json"));
        assertTrue(
                output.contains(
                        "\"\\\"q\\\" \\\\ /\\u0008\\u000c\\n\\r\\t\\u0001\\u007f€ 中\""),
                output);
        assertEquals(name, parmsOf(output, 0).get(0).get("value"));
    }

    @Test
    void escapesSurrogatesWithoutAPartner() {
        byte[] lone = {(byte) 0xED, (byte) 0xA0, (byte) 0x80};
        byte[] message = push(characteristic("NAPDEF", parm("NAME", (Object) lone)));
        assertEquals(0, run(message, "--json"));
        assertTrue(output.contains("\"value\": \"\\ud800\""), output);
        assertEquals(0, run(message));
        assertTrue(output.contains("NAME  \\ud800\n"), output);
    }

    @Test
    void writesNullForAValueThatIsNotAnswered() {
        assertEquals(
                0,
                run(
                        push(
                                characteristic("NAPDEF", parm("NAP-ADDRTYPE", "APN")),
                                characteristic("VENDORCONFIG", named("Own"))),
                        "--json"));
        assertTrue(output.contains("{\"name\": \"NAP-ADDRTYPE\", \"value\": null}"), output);
        assertTrue(output.contains("{\"name\": \"Own\", \"value\": null}"), output);
    }

    @Test
    void showsTheRoamingOfTheFirstApplication() {
        Document.Element roaming = characteristic("ROAMING", named("SYNC-DEFAULT", "1"));
        Document.Element application = characteristic("APPLICATION", roaming);
        assertEquals(0, run(push(application, application)));
        assertEquals(1, output.split("ROAMING", -1).length - 1, output);
        assertTrue(
                output.endsWith(
                        """

                        APPLICATION
                          ROAMING
                            SYNC-DEFAULT  1

                        APPLICATION
                        """),
                output);
    }

    @Test
    void refusesAMessageThatIsNoPush() {
        byte[] message = SMALL.clone();
        message[1] = 7;
        assertFails(
                1,
                """
                omacp: standard input: refused: PDU type 0x07 is no push
                  message offset 1 (0x1), in push header.
                    0000  01 07 09 B6 91 81 92 41 42
                             ^^
                  Accepted here: 0x06 (Push).
                """,
                message);
    }

    @Test
    void refusesABodyThatCannotBeDecoded() {
        assertFails(
                1,
                """
                omacp: standard input: refused: public identifier 2 (WML 1.0) is no
                  provisioning document
                  4107 QVS_ERROR_WBXML_DOCUMENT_TYPE, body offset 1 (0x1), message offset 5
                  (0x5).
                    0000  01 06 01 C4 01 02 03
                                         ^^^^^
                  Accepted here: public identifier 11, or 0 with a string table that begins with
                  "-//WAPFORUM//DTD PROV 1.0//EN".
                """,
                withShortType(0xC4, new byte[] {1, 2, 3}).bytes());
    }

    @Test
    void cannotReadAFileThatIsNotThere() {
        Path file = directory.resolve("missing");
        assertFails(2, "omacp: " + file + ": no such file\n", SMALL, file.toString());
    }

    @Test
    void cannotReadADirectory() {
        assertEquals(2, run(SMALL, directory.toString()));
        assertEquals("", output);
        assertTrue(errors.startsWith("omacp: " + directory + ": is a directory\n"), errors);
    }

    @Test
    void cannotReadABrokenInput() {
        InputStream broken =
                new InputStream() {
                    @Override
                    public int read() throws IOException {
                        throw new IOException("it broke");
                    }
                };
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        assertEquals(2, Main.run(broken, OutputStream.nullOutputStream(), err, Terminal.NONE));
        assertEquals(
                "omacp: standard input: cannot be read: it broke\n",
                err.toString(StandardCharsets.UTF_8));
    }

    @Test
    void saysThatItCannotWrite() {
        OutputStream full =
                new OutputStream() {
                    @Override
                    public void write(int b) throws IOException {
                        throw new IOException("full");
                    }
                };
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        assertEquals(2, Main.run(new ByteArrayInputStream(SMALL), full, err, Terminal.NONE));
        assertEquals(
                "omacp: the output cannot be written\n", err.toString(StandardCharsets.UTF_8));
    }

    @Test
    void isSilentWhenNobodyReadsOn() {
        OutputStream closed =
                new OutputStream() {
                    @Override
                    public void write(int b) throws IOException {
                        throw new IOException("Broken pipe");
                    }
                };
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        assertEquals(
                2, Main.run(new ByteArrayInputStream(SMALL), closed, err, Terminal.NONE));
        assertEquals("", err.toString(StandardCharsets.UTF_8));
    }

    @Test
    void refusesWrongUsage() {
        for (String[] arguments :
                List.of(
                        array("--xml"),
                        array("show", "--pin", "1"),
                        array("--bytes", "--json"),
                        array("--bytes", "--header"),
                        array("--color=blue"),
                        array("verify"),
                        array("verify", "--json"),
                        array("completion", "bash"))) {
            assertEquals(2, run(SMALL, arguments));
            assertEquals("", output);
            assertTrue(errors.startsWith("omacp: "), errors);
            assertTrue(errors.contains("\nUsage: omacp "), errors);
            assertTrue(errors.endsWith(" --help\" tells more.\n"), errors);
            assertTrue(errors.lines().count() < 6, errors);
        }
    }

    @Test
    void helps() {
        for (String option : List.of("-h", "--help")) {
            assertEquals(0, run(new byte[0], option));
            assertEquals("", errors);
            assertTrue(output.startsWith("Usage: omacp [show] [OPTION...] [FILE...]\n"), output);
            assertTrue(output.contains("Exit status:\n"), output);
        }
        for (String command : List.of("show", "verify", "completion")) {
            assertEquals(0, run(new byte[0], command, "--help"));
            assertEquals("", errors);
            assertTrue(output.startsWith("Usage: omacp " + command + " [-h]"), output);
            assertTrue(output.lines().allMatch(line -> line.length() <= 80), output);
        }
    }

    @Test
    void tellsItsVersion() throws Exception {
        for (String option : List.of("-V", "--version")) {
            ChildVm.Result result =
                    ChildVm.run(
                            "none",
                            "build/java/omacp.jar:/usr/share/java/picocli.jar",
                            new byte[0],
                            Main.class,
                            option);
            assertTrue(result.output().matches("omacp \\d+\\.\\d+\\.\\d+\n"), result.output());
        }
    }

    @Test
    void worksAsAProgram() throws Exception {
        assertEquals(new ChildVm.Result(0, SMALL_SHOWN, ""), child(SMALL));
        assertEquals(new ChildVm.Result(0, SMALL_SHOWN, ""), child(SMALL, "-"));
        ChildVm.Result json = child(Everything.push(), "--json");
        assertEquals(new ChildVm.Result(0, resource("everything.json"), ""), json);
        String refusal =
                """
                omacp: standard input: refused: there is no message, not a single byte
                  message offset 0 (0x0), in push header.
                """;
        assertEquals(new ChildVm.Result(1, "", refusal), child(new byte[0]));
        Path missing = directory.resolve("missing");
        assertEquals(
                new ChildVm.Result(2, "", "omacp: " + missing + ": no such file\n"),
                child(SMALL, missing.toString()));
        assertEquals(2, child(SMALL, "--xml").status());
    }

    @Test
    void saysThatItCannotLoadTheLibrary() throws Exception {
        String classPath = System.getProperty("java.class.path");
        ChildVm.Result result =
                ChildVm.run(directory.toString(), classPath, SMALL, Main.class);
        assertEquals(2, result.status());
        assertEquals("", result.output());
        String start = "omacp: standard input: The library omacp cannot be loaded: ";
        assertTrue(result.errors().startsWith(start), result.errors());
    }

    private ChildVm.Result child(byte[] input, String... arguments) throws Exception {
        return ChildVm.run(
                System.getProperty("java.library.path"),
                System.getProperty("java.class.path"),
                input,
                Main.class,
                arguments);
    }

    private String resource(String name) throws IOException {
        try (InputStream in = getClass().getResourceAsStream(name)) {
            return new String(in.readAllBytes(), StandardCharsets.UTF_8);
        }
    }

    private static byte[] ascii(String text) {
        return text.getBytes(StandardCharsets.US_ASCII);
    }

    /** The parms of one top-level characteristic of a JSON answer. */
    @SuppressWarnings("unchecked")
    private static List<Map<String, Object>> parmsOf(String json, int index) {
        Map<String, Object> message = (Map<String, Object>) Json.parse(json);
        List<Object> characteristics = (List<Object>) message.get("characteristics");
        return (List<Map<String, Object>>)
                ((Map<String, Object>) characteristics.get(index)).get("parms");
    }
}
