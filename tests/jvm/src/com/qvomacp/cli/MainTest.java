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
import com.qvomacp.support.Push;
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
import java.util.Set;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The command-line program. */
class MainTest {
    private static final byte[] SMALL =
            withShortType(0xB6, body("NAME", "Café")).sec(0x81).mac("AB12").bytes();

    private static final String SMALL_SHOWN =
            """
            Content type    application/vnd.wap.connectivity-wbxml (54)
            Header length   12 bytes
            Body length     23 bytes
            SEC             USERPIN
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
        Program program = Program.run(input, arguments);
        output = program.output();
        errors = program.errors();
        return program.status();
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
    @ValueSource(strings = {"", "\n", "01 06 0", "hello", "A", "<?xml version='1.0'?>"})
    void callsWhatItLooksLikeATextThatIsNoMessage(String text) {
        assertEquals(1, run(ascii(text)));
        assertEquals("", output);
        assertTrue(errors.startsWith("omacp: standard input: no message: this is "), errors);
        assertEquals(1, run(ascii(text), "--json"));
        assertEquals(Set.of("error"), ((Map<?, ?>) Json.parse(output)).keySet());
    }

    @Test
    void refusesAPushThatEnds() {
        for (String text : List.of("0106", "0x0106")) {
            assertEquals(1, run(ascii(text)));
            assertTrue(errors.startsWith("omacp: standard input: refused: "), errors);
            assertTrue(errors.contains(", in push header.\n"), errors);
        }
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

    @ParameterizedTest
    @CsvSource({"0x80, NETWPIN", "0x81, USERPIN", "0x82, USERNETWPIN", "0x83, USERPINMAC", "0x84, 4"})
    void namesTheSecurityMethod(String sent, String shown) {
        run(Push.secured(Integer.decode(sent), "AB", body("NAME", "x")));
        assertTrue(output.contains("\nSEC             " + shown + "\n"), output);
        assertTrue(output.contains("\nMAC             AB\n"), output);
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
    void showsTheMessageInItsOrder() {
        run(
                push(
                        characteristic(
                                "NAPDEF",
                                characteristic("VALIDITY", parm("COUNTRY", "001")),
                                parm("NAME", "n")),
                        characteristic("BOOTSTRAP"),
                        characteristic("NAPDEF")));
        assertTrue(
                output.endsWith(
                        """

                        NAPDEF
                          VALIDITY
                            COUNTRY  001
                          NAME  n

                        BOOTSTRAP

                        NAPDEF
                        """),
                output);
    }

    @Test
    void tellsNoValueFromAnEmptyOne() {
        assertEquals(
                "  INIT\n  NAME  \"\"\n",
                shownParms(named("INIT"), parm("NAME", "")));
        assertEquals(
                "  NAME  \" a \"\n  NAME  \"\\\"\\\"\"\n",
                shownParms(parm("NAME", " a "), parm("NAME", "\"\"")));
    }

    @Test
    void namesATokenAsTheStandardDoes() {
        assertEquals("  BEARER  GSM-GPRS\n", shownParms(parm("BEARER", token(0xAB))));
        assertEquals("  BEARER  LTE\n", shownParms(parm("BEARER", "LTE")));
    }

    @Test
    void showsNoControlCharacterOfAMessage() {
        assertEquals(
                "  NAME  a\\u001b[31m\\u000ab\\u202ec\\u0085\n",
                shownParms(parm("NAME", "a\u001b[31m\nb\u202ec\u0085")));
        assertEquals(
                "  NAME  a \"quoted\" \\\\ €\n",
                shownParms(parm("NAME", "a \"quoted\" \\ €")));
    }

    @Test
    void escapesInJsonWhatItAsksForAndWhatATerminalObeys() {
        String name = "\"q\" \\ /\b\f\n\r\t\u0001\u007f\u202e\u2028\udb40\udc01€ 中";
        run(push(body("NAME", name)), "--json");
        String escaped =
                "\"\\\"q\\\" \\\\ /\\u0008\\u000c\\n\\r\\t\\u0001\\u007f"
                        + "\\u202e\\u2028\\udb40\\udc01€ 中\"";
        assertTrue(output.contains(escaped), output);
        assertTrue(childrenOf(output).toString().contains("value=" + name), output);
    }

    @Test
    void refusesAMessageThatIsNoPush() {
        byte[] message = SMALL.clone();
        message[0] = 99;
        message[1] = 7;
        assertFails(
                1,
                "omacp: standard input: no message: this is a confirmed push of a provisioning"
                        + " document\n",
                message);
        assertEquals(1, run(message, "--as", "push"));
        assertTrue(
                errors.endsWith(
                        """
                          message offset 1 (0x1), in push header.
                            0000  63 07 09 B6 91 81 92 41 42
                                     ^^
                        """),
                errors);
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
                        array("--yaml"),
                        array("--limit=0"),
                        array("--limit=1G"),
                        array("--limit=9999999999M"),
                        array("--json", "--json-lines"),
                        array("--bytes", "--answers"),
                        array("--answers", "--header"),
                        array("--\u001b[2Jx"),
                        array("--limit", "\u001b"),
                        array("--color=\u001b"),
                        array("show", "--pin", "1"),
                        array("--bytes", "--json"),
                        array("--bytes", "--header"),
                        array("--color=blue"),
                        array("verify"),
                        array("verify", "--json"),
                        array("encode", "--\u001b[2Jx"),
                        array("encode", "--sms=\u001b"),
                        array("encode", "--to=\u001b", "--sms=submit"),
                        array("completion", "bash"))) {
            assertEquals(2, run(SMALL, arguments));
            assertEquals("", output);
            assertTrue(errors.startsWith("omacp: "), errors);
            assertTrue(errors.contains("\nUsage: omacp "), errors);
            assertTrue(errors.endsWith(" --help\" tells more.\n"), errors);
            assertTrue(errors.lines().count() < 7, errors);
            assertFalse(errors.contains("\u001b"), errors);
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
        for (String command : List.of("show", "verify", "encode", "completion")) {
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
                omacp: standard input: no message: this is no bytes at all
                """;
        assertEquals(new ChildVm.Result(1, "", refusal), child(new byte[0]));
        Path missing = directory.resolve("missing");
        assertEquals(
                new ChildVm.Result(2, "", "omacp: " + missing + ": no such file\n"),
                child(SMALL, missing.toString()));
        assertEquals(2, child(SMALL, "--yaml").status());
    }

    @Test
    void takesNoFileOfArguments() throws Exception {
        Path list = Files.writeString(directory.resolve("list"), "--help");
        assertFails(2, "omacp: @" + list + ": no such file\n", SMALL, "@" + list);
    }

    @Test
    void readsNoMoreThanTheLimit() throws Exception {
        byte[] message = push(body("NAME", "x".repeat(1 << 16)));
        assertFails(
                2,
                "omacp: standard input: is longer than 65536 bytes; --limit has more of them"
                        + " read\n",
                message);
        assertEquals(0, run(message, "--limit=128K"), errors);
        assertEquals(0, run(message, "--limit", "" + message.length), errors);
        Path file = Files.write(directory.resolve("long"), message);
        assertEquals(2, run(SMALL, "--limit", "" + (message.length - 1), file.toString()));
    }

    @Test
    void showsNoByteOfAFileNameThatATerminalObeys() throws Exception {
        String name = "loop\u001b[31m\u202e";
        assertFails(2, "omacp: loop\\u001b[31m\\u202e: no such file\n", SMALL, name);
        Path inFile = Files.createDirectory(directory.resolve("a\u001b[31m"));
        assertEquals(2, run(SMALL, inFile + "/.."  + "/a\u001b[31m"));
        assertFalse(errors.contains("\u001b"), errors);
        Path file = Files.write(directory.resolve("f\u001b[2J"), SMALL);
        for (String option : List.of("--json", "--bytes", "--color=never")) {
            assertEquals(0, run(SMALL, option, file.toString(), file.toString()), errors);
            assertFalse(output.contains("\u001b"), output);
        }
        run(SMALL, "verify", "--pin=1", file.toString());
        assertFalse(output.contains("\u001b"), output);
    }

    @Test
    void stopsWhenNobodyReadsOn() throws Exception {
        int[] blocks = {0};
        OutputStream closing =
                new OutputStream() {
                    @Override
                    public void write(int b) throws IOException {
                        throw new IOException("Broken pipe");
                    }

                    @Override
                    public void write(byte[] bytes, int from, int count) throws IOException {
                        if (++blocks[0] > 2) {
                            throw new IOException("Broken pipe");
                        }
                    }
                };
        byte[] message = push(body("NAME", "x".repeat(1 << 20)));
        int status =
                Main.run(
                        new ByteArrayInputStream(message),
                        closing,
                        OutputStream.nullOutputStream(),
                        Terminal.NONE,
                        "--bytes",
                        "--limit=2M");
        assertEquals(2, status);
        assertEquals(3, blocks[0]);
    }

    @Test
    void saysThatMemoryRunsOut() throws Exception {
        Path file = directory.resolve("huge");
        Files.write(file, new byte[40 << 20]);
        ChildVm.Result result =
                ChildVm.run(
                        List.of("-Xmx32m"),
                        new byte[0],
                        Main.class,
                        "--limit=100M",
                        file.toString());
        assertEquals(
                new ChildVm.Result(
                        2, "", "omacp: " + file + ": needs more memory than there is\n"),
                result);
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

    /** The children of the document of a JSON answer. */
    private static List<?> childrenOf(String json) {
        Map<?, ?> message = (Map<?, ?>) Json.parse(json);
        return (List<?>) ((Map<?, ?>) message.get("document")).get("children");
    }

    private static String[] array(String... elements) {
        return elements;
    }
}
