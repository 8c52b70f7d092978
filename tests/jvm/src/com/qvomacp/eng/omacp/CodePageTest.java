package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.Bytes;
import com.qvomacp.support.TreeText;
import com.qvomacp.support.Wbxml2Xml;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeSet;
import org.junit.jupiter.api.Test;
import org.w3c.dom.Element;

/** The vocabulary, held against the published table of both code pages. */
class CodePageTest {
    /** The tokens that {@code wbxml2xml} does not read as the table has them, and why. */
    private static final Map<String, String> OTHERWISE_IN_WBXML2XML =
            Map.of(
                    "attribute start 0 5[CD]", "it has not the types of content 1.1",
                    "attribute start 1 3[C-F]", "it has not the names of content 1.1",
                    "attribute start 1 [467].", "it has not the names of content 1.1",
                    "attribute start 1 5[A-E]", "it has not the types of content 1.1",
                    "attribute value 0 B[56]", "it writes them TRETRA",
                    "attribute value 0 B[BC]", "it has not the bearers of content 1.1",
                    "attribute value 1 8[0-3]", "WBXML has other meanings for them");

    /** A row of the published table. */
    private record Row(String kind, int page, int token, String text) {}

    private static List<Row> rows() throws Exception {
        List<Row> rows = new ArrayList<>();
        try (var table = CodePageTest.class.getResourceAsStream("provisioning-tokens.tsv")) {
            assertNotNull(table);
            String text = new String(table.readAllBytes(), StandardCharsets.UTF_8);
            text.lines().skip(1).map(line -> line.split("\t")).forEach(fields ->
                    rows.add(
                            new Row(
                                    fields[0],
                                    Integer.parseInt(fields[1]),
                                    Integer.parseInt(fields[2], 16),
                                    fields[3])));
        }
        assertEquals(233, rows.size());
        return rows;
    }

    /** A document with the token, on its page. */
    private static byte[] body(Row row) {
        String token = String.format("%02X ", row.token);
        String onPage = String.format("00 %02X ", row.page);
        if (row.kind.equals("element")) {
            boolean root = row.text.equals("wap-provisioningdoc");
            return Bytes.of("03 0B 6A 00" + (root ? onPage + token : "45" + onPage + token + "01"));
        }
        if (row.kind.equals("attribute value")) {
            return Bytes.of("03 0B 6A 00 45 87" + onPage + "06" + token + "01 01");
        }
        String attribute = onPage + token + (row.text.contains("=") ? "" : "03 'x' 00") + "01";
        if (row.text.startsWith("VERSION")) {
            return Bytes.of("03 0B 6A 00 85" + attribute);
        }
        String element = row.text.startsWith("TYPE") ? "86" : "87";
        return Bytes.of("03 0B 6A 00 45" + element + attribute + "01");
    }

    /** What a document says that has the token. */
    private static String expected(Row row) {
        if (row.kind.equals("element")) {
            boolean root = row.text.equals("wap-provisioningdoc");
            String child = row.text.equals("parm") ? "  [parm] - - \n" : "  [" + row.text + "] - \n";
            return "[document] - \n" + (root ? "" : child);
        }
        String[] pair = row.text.split("=");
        String text = pair.length == 2 ? "[" + pair[1].replace("\"", "") + "]" : "[x]";
        if (row.kind.equals("attribute value")) {
            return "[document] - \n  [parm] - [" + row.text + "] \n";
        }
        switch (pair[0]) {
            case "VERSION":
                return "[document] " + text + " \n";
            case "TYPE":
                return "[document] - \n  [characteristic] " + text + " \n";
            case "NAME":
                return "[document] - \n  [parm] " + text + " - \n";
            default:
                return "[document] - \n  [parm] - " + text + " \n";
        }
    }

    @Test
    void everyTokenOfThePublishedTableIsReadAsWhatItStandsFor() throws Exception {
        for (Row row : rows()) {
            ProvisioningDocument document = ProvisioningDocument.parse(body(row));
            assertEquals(expected(row), TreeText.of(document), row.toString());
            for (Deviation deviation : document.deviations()) {
                assertNotEquals(Deviation.Kind.UNKNOWN_TOKEN, deviation.kind(), row.toString());
                assertNotEquals(Deviation.Kind.OTHER_PAGE, deviation.kind(), row.toString());
            }
        }
    }

    @Test
    void noOtherTokenStandsForAnything() throws Exception {
        Set<String> published = new HashSet<>();
        for (Row row : rows()) {
            
            published.add(row.kind + row.page + " " + row.token);
        }
        for (int page = 0; page < 4; ++page) {
            CodePage vocabulary = CodePage.of(page);
            for (int token = 5; token < 0x100; ++token) {
                Object found =
                        token < 0x80 ? vocabulary.attribute(token) : vocabulary.value(token);
                String kind = token < 0x80 ? "attribute start" : "attribute value";
                assertEquals(
                        published.contains(kind + page + " " + token), found != null, kind + token);
                if (token < 0x40) {
                    assertEquals(
                            published.contains("element" + page + " " + token),
                            vocabulary.element(token) != null,
                            "element " + token);
                }
            }
        }
    }

    @Test
    void aTokenUnknownOnPageOneIsReadByPageZeroAndTold() throws Exception {
        for (Row row : rows()) {
            if (row.page == 0 && !row.kind.equals("element") && !hasOnPageOne(row)) {
                Row there = new Row(row.kind, 1, row.token, row.text);
                ProvisioningDocument document = ProvisioningDocument.parse(body(there));
                assertEquals(expected(row), TreeText.of(document), row.toString());
                assertEquals(
                        1,
                        document.deviations().stream()
                                .filter(d -> d.kind() == Deviation.Kind.OTHER_PAGE)
                                .count(),
                        row.toString());
            }
        }
    }

    private static boolean hasOnPageOne(Row row) {
        CodePage one = CodePage.of(1);
        return row.token < 0x80 ? one.attribute(row.token) != null : one.value(row.token) != null;
    }

    @Test
    void wbxml2xmlReadsEveryTokenThatItKnowsAsTheSame() throws Exception {
        assumeTrue(Wbxml2Xml.isInstalled(), "libwbxml2-utils is not installed");
        Set<String> exceptions = new TreeSet<>(OTHERWISE_IN_WBXML2XML.keySet());
        for (Row row : rows()) {
            byte[] body = body(row);
            Element peer = Wbxml2Xml.read(body);
            String tree = TreeText.of(ProvisioningDocument.parse(body));
            if (peer == null || !TreeText.of(peer).equals(tree)) {
                String token = String.format("%s %d %02X", row.kind, row.page, row.token);
                String exception =
                        OTHERWISE_IN_WBXML2XML.keySet().stream()
                                .filter(token::matches)
                                .findFirst()
                                .orElse(null);
                assertNotNull(exception, token + " " + row.text);
                exceptions.remove(exception);
            }
        }
        assertEquals(Set.of(), exceptions, "no exceptions any more");
    }
}
