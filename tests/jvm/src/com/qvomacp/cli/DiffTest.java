package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.BodyGenerator;
import com.qvomacp.support.Json;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.EnumSet;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** The command that tells what differs between two messages. */
class DiffTest {
    private static final String NAP =
            in("NAPDEF", parm("NAPID", "nap"), parm("NAME", "Internet"), parm("BEARER", "GSM-GPRS"));
    private static final String MMS =
            in("NAPDEF", parm("NAPID", "mms"), parm("NAME", "Pictures"), parm("BEARER", "GSM-CSD"));
    private static final String PROXY =
            in("PXLOGICAL", parm("PROXY-ID", "p"), in("PORT", parm("PORTNBR", "80")), in("PORT", parm("PORTNBR", "443")));

    @TempDir Path directory;

    private static String in(String type, String... content) {
        return "<characteristic type='" + type + "'>" + String.join("", content) + "</characteristic>";
    }

    private static String parm(String name, String value) {
        return "<parm name='" + name + "' value='" + value + "'/>";
    }

    private String file(String name, byte[] content) throws Exception {
        return Files.write(directory.resolve(name), content).toString();
    }

    private String file(String name, String content) throws Exception {
        String document = "<wap-provisioningdoc>" + content + "</wap-provisioningdoc>";
        return file(name, document.getBytes(StandardCharsets.UTF_8));
    }

    private static Program diff(String... arguments) {
        return diff(new byte[0], arguments);
    }

    private static Program diff(byte[] input, String... arguments) {
        String[] all = new String[arguments.length + 1];
        all[0] = "diff";
        System.arraycopy(arguments, 0, all, 1, arguments.length);
        return Program.run(input, all);
    }

    /** The lines behind the names of the files, in JSON the changes alike. */
    private String differences(String before, String after) throws Exception {
        String left = file("before", before);
        String right = file("after", after);
        Program program = diff(left, right);
        assertEquals("", program.errors());
        String output = program.output();
        List<?> changes = (List<?>) diff("--json", left, right).json().get("changes");
        assertEquals(changes.isEmpty() ? 0 : 1, program.status());
        if (output.isEmpty()) {
            assertEquals(List.of(), changes);
            return output;
        }
        String heading = "--- " + left + "\n+++ " + right + "\n";
        assertTrue(output.startsWith(heading), output);
        String[] told = output.substring(heading.length()).lines().filter(l -> !l.startsWith(" ")).toArray(String[]::new);
        for (int i = 0; i < told.length; ++i) {
            Map<?, ?> change = (Map<?, ?>) changes.get(i);
            assertEquals(told[i], change.get("change") + ": " + change.get("path"));
        }
        assertEquals(told.length, changes.size());
        return output.substring(heading.length()).replace("wap-provisioningdoc / ", "");
    }

    @Test
    void messagesThatSayTheSameDifferInNothing() throws Exception {
        assertEquals("", differences(NAP + PROXY, NAP + PROXY));
        byte[] push = Files.readAllBytes(Path.of("samples/everything.push"));
        String hex = Program.run(push, "encode", "--hex", "--tokens=none", "--strings=table",
                "--identifier=table", "--imsi=001010123456789", "--pin=1234").output();
        String left = file("a.push", push);
        Program program = diff("--json", left, file("a.hex", hex.getBytes(StandardCharsets.US_ASCII)));
        // The MAC is that of other bytes.
        List<?> changes = (List<?>) program.json().get("changes");
        assertEquals(1, changes.size(), program.output());
        assertEquals("push header / MAC", ((Map<?, ?>) changes.get(0)).get("path"));
        assertEquals(new Program(0, "", ""), diff(left, "samples/everything.push"));
    }

    @Test
    void everyFormOfInputCanStandOnEitherSide() throws Exception {
        byte[] push = Files.readAllBytes(Path.of("samples/mms.push"));
        String[] parts = Program.run(push, "encode", "--sms=ud", "--pin=1234").output().split("\n");
        assertTrue(parts.length > 1);
        String first = file("first", parts[0].getBytes(StandardCharsets.US_ASCII));
        String rest = file("rest", String.join("\n", parts).substring(parts[0].length())
                .getBytes(StandardCharsets.US_ASCII));
        assertEquals(new Program(0, "", ""), diff(push, "-", first, rest));
        String note = "omacp: samples/mms.xml: note: has no push header; the documents alone are compared\n";
        assertEquals(new Program(0, "", note), diff("samples/mms.push", "samples/mms.xml"));
        assertEquals(new Program(0, "", note), diff(push, "samples/mms.xml", "-"));
        Program body = Program.run(push, "encode", "--body", "--base64");
        assertEquals(0, diff(body.output().getBytes(StandardCharsets.US_ASCII), "samples/mms.xml", "-").status());
    }

    @Test
    void tellsWhatWasAddedAndRemoved() throws Exception {
        String added =
                """
                added: NAPDEF 2
                  + NAPDEF
                  +   NAPID  mms
                  +   NAME  Pictures
                  +   BEARER  GSM-CSD
                """;
        assertEquals(added, differences(NAP, NAP + MMS));
        assertEquals(added.replace("added", "removed").replace('+', '-'), differences(NAP + MMS, NAP));
        assertEquals("added: NAPDEF 1 / INTERNET\n  + (no value)\n",
                differences(NAP, NAP.replace("</char", "<parm name='INTERNET'/></char")));
        assertEquals("removed: NAPDEF 1 / NAME\n  - Internet\n",
                differences(NAP, NAP.replace(parm("NAME", "Internet"), "")));
    }

    @Test
    void tellsWhatWasChanged() throws Exception {
        assertEquals("changed: NAPDEF 1 / NAME\n  - Internet\n  + \" x \"\n",
                differences(NAP, NAP.replace("Internet", " x ")));
        assertEquals("changed: NAPDEF 1 / NAME\n  - Internet\n  + (no value)\n",
                differences(NAP, NAP.replace(" value='Internet'", "")));
        assertEquals("changed: PXLOGICAL 1 / PORT 2 / PORTNBR\n  - 443\n  + 8443\n",
                differences(PROXY, PROXY.replace("443", "8443")));
        String left = file("left", "");
        String right = file("right", "<wap-provisioningdoc version='1.1'/>".getBytes(StandardCharsets.UTF_8));
        assertTrue(diff(left, right).output().endsWith(
                "changed: wap-provisioningdoc / version\n  - (no value)\n  + 1.1\n"));
    }

    @Test
    void tellsWhatWasMoved() throws Exception {
        assertEquals("moved: NAPDEF 1\n  from place 1 to place 2\n", differences(NAP + MMS, MMS + NAP));
        assertEquals("moved: PXLOGICAL 1\n  from place 3 to place 1\n",
                differences(NAP + MMS + PROXY, PROXY + NAP + MMS));
        assertEquals("moved: NAPDEF 1\n  from place 1 to place 2\nchanged: NAPDEF 1 / NAME\n  - Internet\n  + Net\n",
                differences(NAP + MMS, MMS + NAP.replace("Internet", "Net")));
        assertEquals("", differences(MMS + NAP + PROXY, MMS + NAP + PROXY));
        assertEquals("added: BOOTSTRAP 1\n  + BOOTSTRAP\n",
                differences(NAP + MMS, in("BOOTSTRAP") + NAP + MMS), "what follows is not moved by it");
        String dns = parm("DNS-ADDR", "192.0.2.1") + parm("DNS-ADDR", "192.0.2.2");
        String other = parm("DNS-ADDR", "192.0.2.2") + parm("DNS-ADDR", "192.0.2.1");
        assertTrue(differences(in("NAPDEF", dns), in("NAPDEF", other)).startsWith("moved: NAPDEF 1 / DNS-ADDR\n"));
    }

    @Test
    void counterpartsAreFoundByTheirIdentifiersThenByTheirOrder() throws Exception {
        String w2 = in("APPLICATION", parm("APPID", "w2"), parm("NAME", "one"), parm("ADDR", "a"));
        String second = in("APPLICATION", parm("APPID", "w2"), parm("NAME", "two"), parm("ADDR", "b"));
        assertEquals("removed: APPLICATION 1\n  - APPLICATION\n  -   APPID  w2\n  -   NAME  one\n  -   ADDR  a\n",
                differences(w2 + second, second));
        assertEquals("changed: APPLICATION 2 / NAME\n  - two\n  + three\n",
                differences(w2 + second, w2 + second.replace("two", "three")));
        assertEquals("removed: PXLOGICAL 1 / PORT 1\n  - PORT\n  -   PORTNBR  80\n",
                differences(PROXY, PROXY.replace(in("PORT", parm("PORTNBR", "80")), "")));
        assertEquals("changed: NAPDEF 1 / NAPID\n  - nap\n  + net\n", differences(NAP, NAP.replace("'nap'", "'net'")));
        String replaced = differences(NAP, MMS);
        assertTrue(replaced.startsWith("removed: NAPDEF 1\n") && replaced.contains("\nadded: NAPDEF 1\n"), replaced);
        assertEquals("changed: ACCESS 2 / RULE\n  - b\n  + c\n",
                differences(in("ACCESS", parm("RULE", "a")) + in("ACCESS", parm("RULE", "b")),
                        in("ACCESS", parm("RULE", "a")) + in("ACCESS", parm("RULE", "c"))));
    }

    @Test
    void pushHeadersAreCompared() throws Exception {
        String hex = Program.run(new byte[0], "encode", "--body", "--hex", file("x", NAP)).output();
        byte[] body = HexFormat.of().parseHex(hex.trim());
        String plain = file("plain", Push.push(body));
        Program program = diff(plain, file("signed", Push.secured(0x81, "AB", body)));
        assertEquals(1, program.status());
        assertTrue(program.output().endsWith(
                "added: push header / SEC\n  + USERPIN\nadded: push header / MAC\n  + AB\n"), program.output());
        byte[] other = Push.push(body);
        other[0] = 9;
        program = diff("--json", plain, file("other", other));
        assertEquals(List.of(Map.of("change", "changed", "path", "push header / transaction identifier",
                "before", "1", "after", "9")), program.json().get("changes"));
        program = diff(plain, file("type", Push.withTextType("text/plain", body).bytes()));
        assertTrue(program.output().contains("changed: push header / content type\n"), program.output());
    }

    @Test
    void whatAreNotTwoMessagesEndsWithTwo() throws Exception {
        String nap = file("nap", NAP);
        Program one = diff(nap);
        assertEquals(2, one.status());
        assertEquals("omacp: diff: two messages are compared, and here are 1\n", one.errors());
        assertEquals(2, diff(nap, nap, nap).status());
        assertEquals(2, diff(nap, nap + ".missing").status());
        for (byte[] unreadable : List.of(new byte[0], new byte[] {3, 9, 9, 9}, "<x/>".getBytes(StandardCharsets.US_ASCII))) {
            Program program = diff(unreadable, nap, "-");
            assertEquals(2, program.status());
            assertEquals("", program.output());
            assertTrue(program.errors().startsWith("omacp: standard input"), program.errors());
            List<?> json = (List<?>) Json.parse(diff(unreadable, "--json", nap, "-").output());
            assertTrue(((Map<?, ?>) json.get(0)).containsKey("error"));
        }
        assertEquals(2, diff(nap, nap, "--no-such-option").status());
    }

    @Test
    void jsonHasWhatWasAddedWithEverythingInIt() throws Exception {
        Map<?, ?> json = diff("--json", file("a", NAP), file("b", NAP + PROXY)).json();
        assertEquals(List.of(directory + "/a", directory + "/b"), json.get("files"));
        Map<?, ?> change = (Map<?, ?>) ((List<?>) json.get("changes")).get(0);
        Map<?, ?> item = (Map<?, ?>) ((List<?>) change.get("items")).get(0);
        assertEquals("PXLOGICAL", item.get("type"));
        assertEquals(3, ((List<?>) item.get("children")).size());
        assertEquals(1, diff("--json-lines", directory + "/a", directory + "/b").output().split("\n").length);
    }

    @Test
    void nothingHostileReachesATerminal() throws Exception {
        String hostile = "&#x1F600;\u202e\u2028&#x9b;&#10;\"\\";
        String output = diff(file("a", NAP),
                file("b", in("NAPDEF", parm(hostile.replace("\"", ""), "x"), parm("NAPID", "nap")) + in(hostile))).output();
        assertFalse(output.codePoints().anyMatch(c -> c != '\n' && !Visible.isVisible(c)), output);
        Program painted = diff("--color=always", file("a", NAP), file("b", MMS));
        assertTrue(painted.output().contains("\u001b[32m  + NAPDEF"), painted.output());
    }

    /** Messages differ in something exactly when their documents are not equal. */
    @Test
    void findsADifferenceWhereThereIsOne() throws Exception {
        Random random = new Random(7);
        int equal = 0;
        int different = 0;
        for (int i = 0; i < 1500; ++i) {
            byte[] body = new BodyGenerator(i, EnumSet.allOf(BodyGenerator.Part.class)).body();
            byte[] other = body.clone();
            for (int n = random.nextInt(3); n > 0; --n) {
                other[4 + random.nextInt(body.length - 4)] = (byte) random.nextInt(0x90);
            }
            Reading left = new Reading(Held.message("", body, false), 1 << 20);
            Reading right = new Reading(Held.message("", other, false), 1 << 20);
            if (left.document != null && right.document != null) {
                boolean isEqual = left.document.equals(right.document);
                assertEquals(isEqual, Differences.of(left, right).isEmpty(), "body " + i);
                equal += isEqual ? 1 : 0;
                different += isEqual ? 0 : 1;
            }
        }
        assertTrue(equal > 100 && different > 100, equal + " equal, " + different + " different");
    }

    @Test
    void manyAndDeepItemsAreCompared() throws Exception {
        String deep = "<characteristic type='PORT'>".repeat(3000);
        String end = "</characteristic>".repeat(3000);
        assertEquals(1, diff(file("a", deep + end), file("b", deep + parm("PORTNBR", "1") + end), "--limit=1M").status());
        StringBuilder many = new StringBuilder();
        for (int i = 0; i < 3000; ++i) {
            many.insert(i % 2 == 0 ? 0 : many.length(), in("PORT", parm("PORTNBR", String.valueOf(i))));
        }
        assertEquals(0, diff(file("a", many.toString()), file("b", many.toString()), "--limit=1M").status());
    }
}
