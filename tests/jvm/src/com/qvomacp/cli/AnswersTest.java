package com.qvomacp.cli;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static com.qvomacp.support.Push.push;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import com.qvomacp.support.Document;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Json;
import com.qvomacp.support.Natives;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/** What the library answers stands beside what the message says. */
class AnswersTest extends Natives {
    private static final String TITLE =
            "The native library answers (! otherwise than the message says, - not at all):\n";

    @TempDir Path directory;

    static List<Path> pushes() throws Exception {
        return SamplesTest.pushes();
    }

    /** What stands below the title, without the push header. */
    private static String answers(Document.Element... elements) {
        Program program = Program.run(push(elements), "--answers");
        assertEquals("", program.errors());
        assertEquals(0, program.status());
        assertEquals(-1, parser.qvomacp_GetParserContentType(), "a header is left behind");
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount(), "a context is left behind");
        String output = program.output();
        int from = output.indexOf("\n\n", output.indexOf(TITLE) + TITLE.length() + 1);
        return output.substring(from + 1);
    }

    @Test
    void standBelowTheMessage() {
        byte[] message = push(characteristic("NAPDEF", parm("NAME", "abc")));
        Program program = Program.run(message, "--answers");
        assertEquals(
                Program.run(message).output()
                        + "\n"
                        + TITLE
                        + """

                          push header
                            Content type    54
                            Header length   1
                            Body length     21

                          NAPDEF
                            NAME  abc
                        """,
                program.output());
    }

    @Test
    void areMarkedWhereTheyDiffer() {
        assertEquals(
                """

                  PXLOGICAL
                    PORT
                !     SERVICE  CO-WSP  (the message says "HTTPS")
                    PXPHYSICAL
                !     PXADDRTYPE  NET_ADDR_IPV4  (the message says "E164")

                  NAPDEF
                    NAP-ADDRESS  apn.example
                !   INIT         empty  (the message gives no value)
                !   BEARER       apn.example  (the message says "LTE")
                """,
                answers(
                        characteristic(
                                "PXLOGICAL",
                                characteristic("PORT", parm("SERVICE", "HTTPS")),
                                characteristic("PXPHYSICAL", parm("PXADDRTYPE", "E164"))),
                        characteristic(
                                "NAPDEF",
                                parm("NAP-ADDRESS", "apn.example"),
                                parm("BEARER", "LTE"),
                                named("INIT"))));
    }

    @Test
    void areMissedWhereThereAreNone() {
        Document.Element roaming = characteristic("ROAMING", named("SYNC-DEFAULT", "1"));
        assertEquals(
                """

                  NAPDEF
                    NAPID         1
                -   NAPID         2
                -   NAP-ADDRTYPE  APN

                  APPLICATION
                    ROAMING
                      SYNC-DEFAULT  1

                  APPLICATION
                -   ROAMING

                - PORT
                """,
                answers(
                        characteristic(
                                "NAPDEF",
                                parm("NAPID", "2"),
                                parm("NAP-ADDRTYPE", token(0x89)),
                                parm("NAPID", "1")),
                        characteristic("APPLICATION", roaming),
                        characteristic("APPLICATION", roaming),
                        characteristic("PORT")));
    }

    @Test
    void areComparedInJson() {
        Program program =
                Program.run(
                        push(
                                characteristic(
                                        "PXLOGICAL",
                                        parm("NAME", "n"),
                                        characteristic(
                                                "PXPHYSICAL", parm("PXADDRTYPE", token(0x85))))),
                        "--answers",
                        "--json");
        List<?> answers = (List<?>) program.json().get("answers");
        Map<?, ?> proxy = (Map<?, ?>) answers.get(1);
        assertEquals("PXLOGICAL", proxy.get("type"));
        List<?> children = (List<?>) proxy.get("children");
        assertEquals(Map.of("name", "NAME", "value", "n", "same", true), children.get(0));
        assertEquals(
                List.of(
                        Map.of(
                                "name", "PXADDRTYPE",
                                "value", "NET_ADDR_IPV4",
                                "same", false,
                                "said", "IPV4")),
                ((Map<?, ?>) children.get(1)).get("children"));
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void areThereForEveryParameterOfASample(Path push) throws Exception {
        Program program = Program.run(Files.readAllBytes(push), "--answers");
        assertEquals(0, program.status(), program.errors());
        String answers = program.output().substring(program.output().indexOf(TITLE));
        for (String line : answers.lines().skip(1).toList()) {
            // A type of address is not answered, nor most of what has no value.
            assertFalse(line.matches("- +[A-Z-]+  .*") && !line.contains("NAP-ADDRTYPE"), line);
        }
    }

    @Test
    void differForTheseAloneOfEverythingThatCanBeSet() {
        Program program = Program.run(Everything.push(), "--answers");
        assertEquals(0, program.status(), program.errors());
        String answers = program.output().substring(program.output().indexOf(TITLE));
        // The token of ACCESS is that of SEC-SSID on the code page that is in force by then.
        assertEquals(
                """
                !     SERVICE  CO-WSP  (the message says "pp-SERVICE")
                !     PXADDRTYPE         NET_ADDR_IPV4  (the message says "h-PXADDRTYPE")
                !       SERVICE  CO-WSP  (the message says "hp-SERVICE")
                !   INIT                 empty  (the message gives no value)
                !     AUTHTYPE     NONE  (the message says "na-AUTHTYPE")
                -   NAP-ADDRTYPE         n-NAP-ADDRTYPE
                !   RULE  x-RULE  (the message does not say it)
                !   APPID  x-APPID  (the message does not say it)
                !   PORTNBR  x-PORTNBR  (the message does not say it)
                !   DOMAIN  x-DOMAIN  (the message does not say it)
                !   TO-NAPID  x-TO-NAPID  (the message does not say it)
                !   TO-PROXY  x-TO-PROXY  (the message does not say it)
                - SEC-SSID
                """,
                String.join(
                        "\n",
                        answers.lines().filter(line -> line.matches("[!-] .*")).toList())
                        + "\n");
    }

    @Test
    void areNoneWhereTheLibraryRefuses() {
        byte[] body = HexFormat.of().parseHex("030b6a0045c6550187300601" + "0101");
        Program program = Program.run(body, "--answers");
        assertEquals(1, program.status());
        String nothing = "\nThe native library answers nothing: it refuses the message.\n";
        assertTrue(program.output().endsWith(nothing), program.output());
        program = Program.run(body, "--answers", "--json-lines");
        assertEquals("it refuses the message", program.json().get("unanswered"));
    }

    @Test
    void areNoneWhereNothingCanBeRead() {
        byte[] push = HexFormat.of().parseHex("010601b6" + "09090909");
        Program program = Program.run(push, "--answers");
        assertEquals(1, program.status());
        String nothing = "\nThe native library answers nothing: it refuses the message.\n";
        assertTrue(program.output().endsWith(nothing), program.output());
        program = Program.run(push, "--answers", "--json");
        assertEquals("it refuses the message", program.json().get("unanswered"));
    }

    @Test
    void areNoneWithoutTheLibrary() throws Exception {
        byte[] message = push(characteristic("NAPDEF", parm("NAME", "abc")));
        String classPath = System.getProperty("java.class.path");
        ChildVm.Result result =
                ChildVm.run(directory.toString(), classPath, message, Main.class, "--answers");
        assertEquals(2, result.status());
        String nothing = "\nThe native library answers nothing: the library cannot be loaded.\n";
        assertTrue(result.output().endsWith("  NAME  abc\n" + nothing), result.output());
        String start = "omacp: standard input: The library omacp cannot be loaded: ";
        assertTrue(result.errors().startsWith(start), result.errors());
        result =
                ChildVm.run(
                        directory.toString(), classPath, message, Main.class, "--answers", "--json");
        assertTrue(((Map<?, ?>) Json.parse(result.output())).containsKey("unanswered"));
    }
}
