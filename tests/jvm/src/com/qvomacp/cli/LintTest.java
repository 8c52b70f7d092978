package com.qvomacp.cli;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.parm;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.Rule;
import com.qvomacp.support.Json;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.List;
import java.util.Map;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** The command that tells what is wrong with messages. */
class LintTest {
    private static final byte[] BAD_PORT =
            document(characteristic("PORT", parm("PORTNBR", "70000")));
    private static final byte[] DANGLING =
            document(characteristic("PXPHYSICAL", parm("TO-NAPID", "nowhere")));

    @TempDir Path directory;

    private static Program lint(byte[] input, String... arguments) {
        String[] all = new String[arguments.length + 1];
        all[0] = "lint";
        System.arraycopy(arguments, 0, all, 1, arguments.length);
        return Program.run(input, all);
    }

    private static byte[] xml(String text) {
        return text.getBytes(StandardCharsets.UTF_8);
    }

    @Test
    void tellsAFaultAsACompilerDoes() {
        Program program = lint(BAD_PORT);
        assertEquals(1, program.status());
        assertEquals("", program.errors());
        assertEquals(
                """
                standard input:10: error: PORTNBR "70000" is no port [port]
                  in wap-provisioningdoc / PORT 1 / PORTNBR; right: a number from 1 to 65535;
                  see OMA-WAP-TS-ProvCont, PORTNBR of PORT and of ACCESS
                """,
                program.output());
    }

    @Test
    void tellsLineAndColumnOfXml() throws Exception {
        byte[] document =
                xml("""
                    <wap-provisioningdoc>
                      <characteristic type="NAPDEF">
                        <parm name="NAPID" value="a"/> <parm value="b"/>
                      </characteristic>
                    </wap-provisioningdoc>
                    """);
        Path file = Files.write(directory.resolve("a.xml"), document);
        Program program = lint(new byte[0], file.toString(), "--no=library-refuses,library-drops");
        assertEquals(1, program.status());
        String flat = program.output().replace("\n  ", " ");
        assertTrue(flat.startsWith(file + ":3:36: error: the parm has no NAME [name-missing]"), flat);
        Map<?, ?> json = lint(document, "--json").json();
        Map<?, ?> finding = (Map<?, ?>) ((List<?>) json.get("findings")).get(0);
        assertEquals(3, finding.get("line"));
        assertEquals(36, finding.get("column"));
        assertTrue(!finding.containsKey("offset"));
    }

    @Test
    void errorsAloneEndWithOneAndWarningsWhenThatIsAskedFor() {
        assertEquals(1, lint(BAD_PORT).status());
        assertEquals(0, lint(DANGLING).status());
        assertEquals(1, lint(DANGLING, "--strict").status());
        byte[] noted = Push.push(document(characteristic("PORT", parm("PORTNBR", "80"))));
        Program note = lint(noted, "--strict");
        assertEquals(0, note.status());
        assertTrue(note.output().startsWith("standard input: note: the push has no MAC [no-mac]\n"));
        assertEquals(new Program(0, "", ""), lint(document(characteristic("PORT", parm("PORTNBR", "80")))));
    }

    @Test
    void eachRuleCanBeSwitchedOff() {
        for (Rule rule : Rule.values()) {
            assertEquals(0, lint(document(), "--no", rule.ruleName()).status(), rule.ruleName());
        }
        assertEquals(new Program(0, "", ""), lint(BAD_PORT, "--no=port"));
        assertEquals(new Program(0, "", ""), lint(BAD_PORT, "--disable=number,port", "--strict"));
        assertEquals(new Program(0, "", ""), lint(BAD_PORT, "--no", "number", "--no", "port"));
        assertEquals(1, lint(BAD_PORT, "--no=number").status());
        Program wrong = lint(BAD_PORT, "--no=ports");
        assertEquals(2, wrong.status());
        assertTrue(wrong.errors().startsWith("omacp: --no is given what is no rule: ports\n"));
    }

    @Test
    void whatCannotBeReadEndsWithTwo() throws Exception {
        String port = Files.write(directory.resolve("port"), BAD_PORT).toString();
        for (byte[] unreadable :
                List.of(xml("nothing"), new byte[] {3, 9, 9, 9}, xml("<wap-provisioningdoc>"), new byte[0])) {
            Program program = lint(unreadable, port, "-");
            assertEquals(2, program.status(), program.errors());
            assertTrue(program.output().contains("[port]"), program.output());
            assertTrue(program.errors().startsWith("omacp: standard input"), program.errors());
            program = lint(unreadable, "--json", port, "-");
            Map<?, ?> second = (Map<?, ?>) ((List<?>) Json.parse(program.output())).get(1);
            assertEquals(2, program.status());
            assertTrue(second.containsKey("error"));
        }
        assertEquals(2, lint(new byte[0], port + ".missing").status());
    }

    @Test
    void tellsItAsJson() throws Exception {
        String port = Files.write(directory.resolve("port"), BAD_PORT).toString();
        Program program = lint(Push.push(DANGLING), "--json", port, "-");
        assertEquals(1, program.status());
        List<?> files = (List<?>) Json.parse(program.output());
        Map<?, ?> first = (Map<?, ?>) files.get(0);
        assertEquals(port, first.get("file"));
        assertEquals(
                List.of(
                        Map.of(
                                "rule", "port",
                                "severity", "error",
                                "path", "wap-provisioningdoc / PORT 1 / PORTNBR",
                                "offset", 10,
                                "sentence", "PORTNBR \"70000\" is no port",
                                "remedy", "a number from 1 to 65535",
                                "reference", "OMA-WAP-TS-ProvCont, PORTNBR of PORT and of ACCESS")),
                first.get("findings"));
        List<?> second = (List<?>) ((Map<?, ?>) files.get(1)).get("findings");
        assertEquals(2, second.size());
        assertNull(((Map<?, ?>) second.get(0)).get("offset"), "the push header has none");
        assertEquals(Map.of("findings", List.of()), lint(document(), "--json", "--no", "library-refuses").json());
        assertEquals(2, lint(BAD_PORT, "--json-lines", port, "-").output().split("\n").length);
    }

    @Test
    void nothingHostileReachesATerminalAndNoLineIsTooWide() {
        String hostile = "\u001b[31m\u202e\n\"\\" + "\u65e5".repeat(500);
        byte[] body =
                document(
                        characteristic(
                                "PXPHYSICAL",
                                parm("TO-NAPID", hostile),
                                parm("PXADDR", hostile),
                                parm("PXADDRTYPE", hostile)),
                        characteristic("X" + hostile, parm("PORTNBR", hostile)),
                        characteristic("PORT", parm("PORTNBR", hostile)));
        Program program = lint(body);
        assertEquals(1, program.status());
        for (String line : program.output().split("\n")) {
            assertTrue(Visible.columns(line) <= 80, line);
            assertTrue(line.codePoints().allMatch(Visible::isVisible), line);
        }
        assertTrue(lint(body, "--json").output().codePoints().allMatch(c -> c == '\n' || Visible.isVisible(c)));
        Program painted = lint(body, "--color=always");
        assertTrue(painted.output().contains(": \u001b[1;31merror:\u001b[0m "), painted.output());
    }
}
