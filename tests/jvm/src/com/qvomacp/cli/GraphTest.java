package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** The command that draws which application goes through which proxies to which access point. */
class GraphTest {
    private static final Pattern LABEL = Pattern.compile("label=\"((?:[^\"\\\\]|\\\\.)*)\"");

    @TempDir Path directory;

    private static String in(String type, String... content) {
        return "<characteristic type='" + type + "'>" + String.join("", content) + "</characteristic>";
    }

    private static String parm(String name, String value) {
        return "<parm name='" + name + "' value='" + value + "'/>";
    }

    private static Program graph(String content) {
        String xml = "<wap-provisioningdoc>" + content + "</wap-provisioningdoc>";
        return Program.run(xml.getBytes(StandardCharsets.UTF_8), "graph");
    }

    @Test
    void drawsTheWayFromApplicationToAccessPoint() throws Exception {
        Program program = Program.run(Files.readAllBytes(Path.of("samples/mms.push")), "graph");
        assertEquals(
                new Program(
                        0,
                        """
                        digraph "standard input" {
                          rankdir=LR;
                          node [shape=box, fontname="sans-serif"];
                          n1 [label="NAPDEF\\nmms\\nExample MMS\\nmms.example.com"];
                          n2 [label="PXLOGICAL\\nmms-proxy\\nExample MMS proxy"];
                          n3 [label="PXPHYSICAL\\nmms-proxy-1\\n192.0.2.80"];
                          n2 -> n3;
                          n3 -> n1;
                          n4 [label="APPLICATION\\nw4\\nMMS"];
                          n4 -> n2;
                        }
                        """,
                        ""),
                program);
    }

    @Test
    void marksReferencesThatLeadNowhere() {
        String machine = in("PXPHYSICAL", parm("TO-NAPID", "gone"), parm("TO-NAPID", "INTERNET"));
        Program program =
                graph(
                        in("PXLOGICAL", parm("PROXY-ID", "p"), machine)
                                + in("APPLICATION", parm("TO-PROXY", "gone"), parm("TO-NAPID", "gone"))
                                + in("APPLICATION", parm("TO-PROXY", "p"), parm("TO-PROXY", "gone")));
        assertEquals(0, program.status());
        String dashed = " [style=dashed, color=red, fontcolor=red];\n";
        for (String part :
                List.of(
                        "  n3 [label=\"TO-NAPID\\ngone\\nnot in this document\"];\n  n3" + dashed + "  n2 -> n3" + dashed,
                        "  n4 [label=\"INTERNET\\nany access point\"];\n  n4 [shape=ellipse];\n  n2 -> n4;\n",
                        "  n6 [label=\"TO-PROXY\\ngone\\nnot in this document\"];\n  n6" + dashed + "  n5 -> n6" + dashed,
                        "  n5 -> n3" + dashed,
                        "  n7 -> n1;\n  n7 -> n6" + dashed)) {
            assertTrue(program.output().contains(part), part + program.output());
        }
        String named = graph(in("NAPDEF", parm("NAPID", "INTERNET")) + in("APPLICATION", parm("TO-NAPID", "INTERNET"))).output();
        assertTrue(named.contains("  n2 -> n1;\n") && !named.contains("ellipse"), named);
    }

    @Test
    void labelsAreQuotedWhateverTheyHold() {
        String hostile = "&quot;];x->y;//\\&#10;\u202e&amp;amp;&lt;b&gt;\\N\\";
        Program program = graph(in("NAPDEF", parm("NAPID", hostile), parm("NAME", hostile)));
        assertEquals(0, program.status());
        assertEquals(5, program.output().split("\n").length, program.output());
        Matcher label = LABEL.matcher(program.output());
        assertTrue(label.find(), program.output());
        String shown = "\\\"];x->y;//\\\\\\\\\\\\u000a\\\\u202e&amp;amp;<b>\\\\\\\\N\\\\\\\\";
        assertEquals("NAPDEF\\n" + shown + "\\n" + shown, label.group(1));
        assertFalse(program.output().codePoints().anyMatch(c -> c != '\n' && !Visible.isVisible(c)));
    }

    @Test
    void severalMessagesAreGraphsOfTheirOwn() throws Exception {
        Program program = Program.run(new byte[0], "graph", "samples/mms.push", "samples/mms.xml");
        assertEquals(0, program.status());
        String first = program.output().substring(0, program.output().indexOf("digraph", 1));
        assertEquals(first + first.replace("mms.push", "mms.xml"), program.output());
    }

    @Test
    void whatCannotBeReadEndsWithTwo() throws Exception {
        for (byte[] unreadable : List.of(new byte[0], new byte[] {3, 9, 9, 9}, "<x/>".getBytes(StandardCharsets.US_ASCII))) {
            Program program = Program.run(unreadable, "graph");
            assertEquals(2, program.status());
            assertEquals("", program.output());
            assertTrue(program.errors().startsWith("omacp: standard input"), program.errors());
        }
        assertEquals(2, Program.run(new byte[0], "graph", directory + "/none").status());
        byte[] refused = Push.push(new byte[] {3, 0x0B, 0x6A, 0, 0x45, 1});
        assertEquals(0, Program.run(refused, "graph").status(), "the library refuses it, and it can be read");
    }
}
