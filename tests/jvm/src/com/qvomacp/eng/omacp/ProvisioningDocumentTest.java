package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Bytes;
import com.qvomacp.support.TreeText;
import java.util.Arrays;
import java.util.List;
import java.util.stream.Collectors;
import org.junit.jupiter.api.Test;

/** What a body says, as a tree. */
class ProvisioningDocumentTest {
    private static final String HEADER = "03 0B 6A 00 ";

    private static ProvisioningDocument read(String body) throws ProvisioningException {
        return ProvisioningDocument.parse(Bytes.of(body));
    }

    private static void says(String body, String... lines) throws ProvisioningException {
        assertEquals(String.join("\n", lines), TreeText.of(read(body)).stripTrailing().replace(" \n", "\n"));
    }

    /** The deviations of a body: their offsets and kinds. */
    private static String deviations(String body) throws ProvisioningException {
        return read(body).deviations().stream()
                .map(deviation -> deviation.offset() + " " + deviation.kind())
                .collect(Collectors.joining(", "));
    }

    private static ProvisioningException refused(String body) {
        return assertThrows(ProvisioningException.class, () -> read(body));
    }

    // --- What the format has ---------------------------------------------------------------------

    @Test
    void itemsStandInTheOrderOfTheMessage() throws Exception {
        says(
                HEADER + "C5 46 01 C6 55 01 87 11 06 03 'N1' 00 01 C6 5A 01 01 87 10 06 AB 01 01 C6 51 01 01 01",
                "[document] [1.0]",
                "  [characteristic] [NAPDEF]",
                "    [parm] [NAPID] [N1]",
                "    [characteristic] [NAPAUTHINFO]",
                "    [parm] [BEARER] [GSM-GPRS]",
                "  [characteristic] [PXLOGICAL]");
    }

    @Test
    void aValueThatIsEmptyIsNotOneThatIsAbsent() throws Exception {
        says(
                HEADER + "45 C6 55 01 87 14 01 87 14 06 01 87 14 06 03 00 01 01 01",
                "[document] -",
                "  [characteristic] [NAPDEF]",
                "    [parm] [INTERNET] -",
                "    [parm] [INTERNET] []",
                "    [parm] [INTERNET] []");
    }

    @Test
    void piecesOfAValueAreJoinedWithoutASeparator() throws Exception {
        says(
                "03 0B 6A 03 'ab' 00 45 87 00 01 33 06 91 92 01 87 33 06 03 'x' 00 83 00 02 41 C3 02 'yz' 90 01 01",
                "[document] -",
                "  [parm] [AAUTHTYPE] [HTTP-BASIC]",
                "  [parm] [AAUTHTYPE] [xabAyz,]");
    }

    @Test
    void whatFollowsTheTokenOfANameBelongsToTheName() throws Exception {
        says(HEADER + "45 87 08 03 '-2' 00 06 85 01 01", "[document] -", "  [parm] [NAP-ADDRESS-2] [IPV4]");
    }

    @Test
    void elementsAndAttributesHaveAPageEach() throws Exception {
        // The page of the attributes outlasts the element; that of the elements is left alone by it.
        says(
                HEADER + "45 C6 00 01 55 01 87 36 06 03 'w2' 00 01 01 00 01 C6 55 01 01 00 00 C6 00 00 55 01 01 01",
                "[document] -",
                "  [characteristic] [APPLICATION]",
                "    [parm] [APPID] [w2]",
                "  [characteristic] [APPLICATION]",
                "  [characteristic] [NAPDEF]");
        assertEquals("", deviations(HEADER + "45 C6 00 01 55 01 87 36 01 01 00 01 C6 55 01 01 01"));
    }

    @Test
    void literalsAreReadByTheirTexts() throws Exception {
        String table = "'wap-provisioningdoc' 00 'characteristic' 00 'type' 00 'parm' 00 'name' 00 'value' 00 'version' 00 'X' 00";
        says(
                "03 0B 6A 42" + table + " C4 00 04 38 83 40 01 C4 14 04 23 03 'T' 00 01 84 28 04 2D 83 40 04 32 03 'v' 00 01 01 01",
                "[document] [X]",
                "  [characteristic] [T]",
                "    [parm] [X] [v]");
    }

    @Test
    void versionOneHasNoCharacterSet() throws Exception {
        String body = "00 0B 00 45 C6 55 01 87 11 06 03 'x' 00 01 01 01";
        says(body, "[document] -", "  [characteristic] [NAPDEF]", "    [parm] [NAPID] [x]");
        assertEquals("1.0", read(body).wbxmlVersion());
        assertEquals(0, read(body).charset());
        assertEquals("", deviations(body));
    }

    @Test
    void theHeaderIsTold() throws Exception {
        ProvisioningDocument document = read("02 0B 04 03 'ab' 00 45 01");
        assertEquals("1.2", document.wbxmlVersion());
        assertEquals(11, document.publicIdentifier());
        assertEquals("-//WAPFORUM//DTD PROV 1.0//EN", document.documentType());
        assertEquals(4, document.charset());
        assertEquals("ISO-8859-1", document.charsetName());
        assertArrayEquals(Bytes.of("'ab' 00"), document.stringTable());
        assertArrayEquals(Bytes.of("02 0B 04 03 'ab' 00 45 01"), document.body());
    }

    @Test
    void theDocumentTypeMayBeGivenAsText() throws Exception {
        String body = "03 00 00 6A 1E '-//WAPFORUM//DTD PROV 1.0//EN' 00 45 87 11 01 01";
        says(body, "[document] -", "  [parm] [NAPID] -");
        assertEquals(0, read(body).publicIdentifier());
        assertEquals("-//WAPFORUM//DTD PROV 1.0//EN", read(body).documentType());
    }

    @Test
    void instructionsAreKeptWhereTheyStand() throws Exception {
        says(
                "03 0B 6A 03 'pi' 00 43 04 00 03 'a' 00 01 45 43 05 03 'b' 00 01 87 11 01 01 43 04 00 01",
                "[document] -",
                "  [instruction] [pi] [a]",
                "  [instruction] [NAME] [b]",
                "  [parm] [NAPID] -",
                "  [instruction] [pi] []");
        assertEquals("", deviations("03 0B 6A 03 'pi' 00 43 04 00 01 45 01 43 04 00 01"));
    }

    @Test
    void howTextsAreWrittenIsTold() throws Exception {
        ProvisioningDocument document =
                read("03 0B 6A 02 'T' 00 45 C6 55 01 87 05 03 'a' 00 06 85 01 87 05 83 00 06 C3 01 'o' 01 87 11 03 'b' 00 06 02 41 01 87 11 06 01 87 14 01 01 01");
        Characteristic napDef = document.characteristics().get(0);
        assertEquals(Writing.TOKEN, napDef.typeWriting());
        assertEquals(
                "INLINE TOKEN, TABLE OPAQUE, JOINED ENTITY, TOKEN JOINED, TOKEN null",
                napDef.parameters().stream()
                        .map(parameter -> parameter.nameWriting() + " " + parameter.valueWriting())
                        .collect(Collectors.joining(", ")));
        assertNull(new Characteristic(0, 1, Item.NONE, null, null).typeWriting());
    }

    @Test
    void eachItemHasItsPlaceAndItsBytes() throws Exception {
        ProvisioningDocument document = read(HEADER + "45 C6 55 01 87 11 06 03 'x' 00 01 01 01");
        Characteristic napDef = document.characteristics().get(0);
        assertEquals(5, napDef.offset());
        assertEquals(11, napDef.length());
        Parameter napId = napDef.parameter("NAPID");
        assertArrayEquals(Bytes.of("87 11 06 03 'x' 00 01"), document.bytes(napId));
        assertEquals("wap-provisioningdoc / NAPDEF 1 / NAPID", document.path(napId));
    }

    @Test
    void questionsAreAnsweredByTypeAndByName() throws Exception {
        ProvisioningDocument document =
                read(HEADER + "45 C6 55 01 87 10 06 AA 01 87 10 01 87 10 06 AB 01 01 C6 51 01 01 C6 55 01 01 01");
        List<Characteristic> napDefs = document.characteristics("NAPDEF");
        assertEquals(2, napDefs.size());
        assertEquals(3, document.characteristics().size());
        assertEquals("GSM-CSD", napDefs.get(0).value("BEARER"));
        assertEquals(List.of("GSM-CSD", "GSM-GPRS"), napDefs.get(0).values("BEARER"));
        assertEquals(3, napDefs.get(0).parameters().size());
        assertNull(napDefs.get(1).value("BEARER"));
        assertNull(napDefs.get(1).parameter("BEARER"));
        assertEquals(List.of(), napDefs.get(1).values("BEARER"));
        assertThrows(UnsupportedOperationException.class, () -> napDefs.remove(0));
        assertThrows(UnsupportedOperationException.class, () -> document.children().set(0, null));
    }

    // --- What the format has not -----------------------------------------------------------------

    @Test
    void whatTheFormatHasNotIsKeptAndTold() throws Exception {
        String body = HEADER + "45 03 'a' 00 02 42 47 86 51 01 03 't' 00 01 C8 05 03 'n' 00 01 87 11 01 01 87 11 50 01 01";
        says(
                body,
                "[document] -",
                "  [text] - [aB]",
                "  [parm] - -",
                "    [characteristic] [PXLOGICAL]",
                "    [text] - [t]",
                "  [element] [unknown-0-08] -",
                "    [attribute] [name] [n]",
                "    [parm] [NAPID] -",
                "  [parm] [NAPID] -",
                "    [attribute] [type] []");
        assertEquals(
                "5 TEXT, 8 TEXT, 10 PARM_OUTSIDE, 10 NAME_MISSING, 11 IN_PARM, 14 TEXT,"
                        + " 18 UNKNOWN_TOKEN, 18 OTHER_ELEMENT, 19 OTHER_ATTRIBUTE, 28 PARM_OUTSIDE,"
                        + " 30 OTHER_ATTRIBUTE",
                deviations(body));
        int before = 0;
        for (Deviation deviation : read(body).deviations()) {
            assertTrue(before <= deviation.offset());
            before = deviation.offset();
        }
    }

    @Test
    void theFirstOfTwoAttributesCounts() throws Exception {
        String body = HEADER + "45 C6 55 51 01 87 11 05 03 'n' 00 06 03 'v' 00 06 85 01 01 01";
        says(
                body,
                "[document] -",
                "  [characteristic] [NAPDEF]",
                "    [attribute] [type] [PXLOGICAL]",
                "    [parm] [NAPID] [v]",
                "      [attribute] [name] [n]",
                "      [attribute] [value] [IPV4]");
        assertEquals(
                "7 SECOND_ATTRIBUTE, 11 SECOND_ATTRIBUTE, 19 SECOND_ATTRIBUTE", deviations(body));
    }

    @Test
    void tokensThatStandForNothingHavePrintableNames() throws Exception {
        String body = HEADER + "45 C6 7E 01 87 6F 06 FE 01 01 01";
        says(
                body,
                "[document] -",
                "  [characteristic] [unknown-0-7E]",
                "    [parm] [unknown-0-6F] [unknown-0-FE]");
        assertEquals("6 UNKNOWN_TOKEN, 9 UNKNOWN_TOKEN, 11 UNKNOWN_TOKEN", deviations(body));
    }

    @Test
    void tokensOfAPageThatThereIsNotAreReadByPageZero() throws Exception {
        String body = HEADER + "45 00 07 C6 00 09 55 01 87 11 06 85 01 01 01";
        says(body, "[document] -", "  [characteristic] [NAPDEF]", "    [parm] [NAPID] [IPV4]");
        assertEquals(
                "7 OTHER_PAGE, 10 OTHER_PAGE, 12 OTHER_PAGE, 13 OTHER_PAGE, 14 OTHER_PAGE, 15 OTHER_PAGE",
                deviations(body));
    }

    @Test
    void tokensOfPageOneThatWbxmlGivesAnotherMeaningAreThoseOfThePage() throws Exception {
        says(HEADER + "45 87 00 01 40 06 81 83 01 01", "[document] -", "  [parm] [PRI-H-SSID] [HTTP-DIGEST]");
        says("03 0B 6A 02 'T' 00 45 87 00 01 40 06 81 83 00 01 01", "[document] -", "  [parm] [PRI-H-SSID] [HTTP-T]");
        says(HEADER + "45 87 11 06 40 'a' 00 81 81 00 C0 01 01", "[document] -", "  [parm] [NAPID] [a128]");
    }

    @Test
    void anEmptyDocumentIsOne() throws Exception {
        says(HEADER + "45 01", "[document] -");
        says(HEADER + "05", "[document] -");
        assertEquals("", deviations(HEADER + "45 01"));
        says(HEADER, "[document] -");
        assertEquals("4 NO_ROOT", deviations(HEADER));
        assertEquals("document", read(HEADER).deviations().get(0).path());
    }

    @Test
    void aDocumentMayEndAnywhere() throws Exception {
        String whole = "C5 46 01 C6 55 01 87 11 06 03 'x' 00 01 87 10 06 AB 01 01 01";
        says(
                HEADER + "45 C6 55 01 87 11 06 03 'x'",
                "[document] -",
                "  [characteristic] [NAPDEF]",
                "    [parm] [NAPID] [x]");
        assertEquals("11 CUT_OFF, 13 END_MISSING", deviations(HEADER + "45 C6 55 01 87 11 06 03 'x'"));
        assertEquals("8 END_MISSING", deviations(HEADER + "45 C6 55 01"));
        assertEquals("5 PARM_OUTSIDE, 6 END_MISSING, 6 NAME_MISSING", deviations(HEADER + "45 87"));
        byte[] bytes = Bytes.of(HEADER + whole);
        for (int length = 4; length < bytes.length; ++length) {
            ProvisioningDocument cut = ProvisioningDocument.parse(Arrays.copyOf(bytes, length));
            assertFalse(cut.deviations().isEmpty());
        }
    }

    @Test
    void whatFollowsTheDocumentIsKept() throws Exception {
        String body = HEADER + "45 87 11 01 01 00 00 45";
        says(body, "[document] -", "  [parm] [NAPID] -", "  [trailing] - -");
        assertEquals("5 PARM_OUTSIDE, 9 TRAILING", deviations(body));
        List<Item> children = read(body).children();
        assertArrayEquals(Bytes.of("00 00 45"), read(body).bytes(children.get(1)));
    }

    @Test
    void aRootThatIsAnotherElementIsPartOfTheDocument() throws Exception {
        String body = HEADER + "C6 55 01 87 11 01 01";
        says(body, "[document] -", "  [characteristic] [NAPDEF]", "    [parm] [NAPID] -");
        assertEquals("4 OTHER_ROOT", deviations(body));
        assertEquals("document / NAPDEF 1", read(body).path(read(body).children().get(0)));
    }

    @Test
    void mistakesInNumbersAndTextsAreTold() throws Exception {
        assertEquals("5 PARM_OUTSIDE, 8 REFERENCE", deviations(HEADER + "45 87 11 06 83 05 01 01"));
        assertEquals(
                "5 PARM_OUTSIDE, 8 NUMBER, 15 NO_CHARACTER",
                deviations(HEADER + "45 87 11 06 02 9F FF FF FF FF 7F 02 C4 80 00 01 01"));
        says(HEADER + "45 87 11 06 02 83 B0 00 01 01", "[document] -", "  [parm] [NAPID] [\uFFFD]");
        assertEquals("5 PARM_OUTSIDE, 8 BAD_TEXT", deviations(HEADER + "45 87 11 06 03 FF 00 01 01"));
        assertEquals("5 PARM_OUTSIDE, 8 CUT_OFF, 10 END_MISSING", deviations(HEADER + "45 87 11 06 C3 05"));
        assertEquals("5 PARM_OUTSIDE, 8 CUT_OFF, 9 END_MISSING", deviations(HEADER + "45 87 11 06 83"));
        assertEquals("5 CUT_OFF, 6 END_MISSING", deviations(HEADER + "45 00"));
        says(HEADER + "45 84 07 01 01", "[document] -", "  [element] [unknown-literal] -");
    }

    @Test
    void bodiesOfOtherKindsAreNamed() {
        ProvisioningException empty = refused("");
        assertEquals(ProvisioningException.Reason.NO_WBXML, empty.reason());
        assertEquals("the body is empty", empty.getMessage());
        assertEquals(ProvisioningException.Reason.NO_WBXML, refused("'<?xml'").reason());
        assertEquals(ProvisioningException.Reason.NO_WBXML, refused("03").reason());
        assertEquals(ProvisioningException.Reason.NO_WBXML, refused("03 0B 6A 05 'ab'").reason());
        ProvisioningException other = refused("03 05 6A 00 05");
        assertEquals(ProvisioningException.Reason.OTHER_DOCUMENT_TYPE, other.reason());
        assertTrue(other.getMessage().contains("-//WAPFORUM//DTD SI 1.0//EN"), other.getMessage());
        other = refused("03 00 00 6A 04 'OEM' 00 05");
        assertEquals(ProvisioningException.Reason.OTHER_DOCUMENT_TYPE, other.reason());
        assertTrue(other.getMessage().contains("OEM"), other.getMessage());
        other = refused("03 A0 01 6A 00 05");
        assertEquals(ProvisioningException.Reason.OTHER_DOCUMENT_TYPE, other.reason());
        assertTrue(other.getMessage().contains("4097"), other.getMessage());
    }

    @Test
    void aDocumentTypeThatIsNotStatedIsReadWhenItsRootMayBeOne() throws Exception {
        says("03 01 6A 00 45 87 11 01 01", "[document] -", "  [parm] [NAPID] -");
        assertEquals("1 DOCUMENT_TYPE", deviations("03 01 6A 00 45 01"));
        assertEquals("1 DOCUMENT_TYPE", deviations("03 00 07 6A 00 45 01"));
        assertEquals(
                ProvisioningException.Reason.OTHER_DOCUMENT_TYPE, refused("03 01 6A 00 6D 01").reason());
    }

    // --- Limits ----------------------------------------------------------------------------------

    @Test
    void inputOverTheLimitIsRefused() throws Exception {
        byte[] body = Bytes.repeated(65536, HEADER + "45", "07");
        ProvisioningDocument.parse(body);
        byte[] longer = Bytes.repeated(65537, HEADER + "45", "07");
        ProvisioningException refused =
                assertThrows(ProvisioningException.class, () -> ProvisioningDocument.parse(longer));
        assertEquals(ProvisioningException.Reason.INPUT_TOO_LONG, refused.reason());
        ProvisioningDocument.parse(longer, ReadOptions.DEFAULT.withInputLimit(65537));
    }

    @Test
    void textsCountEachTimeThatTheyAreReferredTo() throws Exception {
        byte[] body = Bytes.of("03 0B 6A 0B '0123456789' 00 45 87 11 06 83 00 83 00 83 05 03 'abc' 00 01 01");
        ReadOptions enough = ReadOptions.DEFAULT.withTextLimit(28);
        assertEquals(
                "0123456789012345678956789abc",
                ((Parameter) ProvisioningDocument.parse(body, enough).children().get(0)).value());
        ProvisioningException refused =
                assertThrows(
                        ProvisioningException.class,
                        () -> ProvisioningDocument.parse(body, ReadOptions.DEFAULT.withTextLimit(27)));
        assertEquals(ProvisioningException.Reason.TEXT_TOO_LONG, refused.reason());
    }

    // --- Values ----------------------------------------------------------------------------------

    @Test
    void itemsAreEqualWhenTheySayTheSameHoweverTheyAreWritten() throws Exception {
        String tokens = HEADER + "45 C6 55 01 87 11 06 85 01 01 01";
        String texts = "03 0B 6A 0A 'ignored' 00 'N' 00 45 C6 50 03 'NAPDEF' 00 01 87 05 03 'NAPID' 00 06 03 'IPV4' 00 01 01 01";
        ProvisioningDocument one = read(tokens);
        ProvisioningDocument same = read(texts);
        assertEquals(one, same);
        assertEquals(one.hashCode(), same.hashCode());
        assertEquals(one.children(), same.children());
        for (String other :
                List.of(
                        HEADER + "C5 46 01 C6 55 01 87 11 06 85 01 01 01",
                        HEADER + "45 C6 56 01 87 11 06 85 01 01 01",
                        HEADER + "45 C6 55 01 87 11 06 86 01 01 01",
                        HEADER + "45 C6 55 01 87 12 06 85 01 01 01",
                        HEADER + "45 C6 55 01 87 11 06 85 01 07 01 01",
                        HEADER + "45 C6 55 01 01 87 11 06 85 01 01",
                        HEADER + "45 C6 55 01 01 01")) {
            assertNotEquals(one, read(other), other);
        }
    }

    @Test
    void whatIsShownHoldsNoValueAndBreaksNoLine() throws Exception {
        ProvisioningDocument document =
                read(HEADER + "45 C6 50 03 'T' 0A 'x' 00 01 87 05 03 'N' 0D 'y' 00 06 03 'secret' 00 01 03 'secret' 00 01 01");
        Characteristic characteristic = document.characteristics().get(0);
        for (Object shown :
                List.of(
                        document,
                        characteristic,
                        characteristic.children().get(0),
                        characteristic.children().get(1),
                        document.deviations())) {
            String line = shown.toString();
            assertFalse(line.contains("secret"), line);
            assertFalse(line.chars().anyMatch(c -> c < ' '), line);
        }
        assertEquals("Parameter{name=N\\u000Dy, a value}", characteristic.children().get(0).toString());
    }

    @Test
    void pathsNumberCharacteristicsByTheirTypes() throws Exception {
        ProvisioningDocument document =
                read(HEADER + "45 C6 55 01 01 C6 51 01 01 C6 55 01 06 86 51 01 01 01");
        Characteristic second = document.characteristics("NAPDEF").get(1);
        assertEquals("wap-provisioningdoc / NAPDEF 2", document.path(second));
        assertEquals(
                "wap-provisioningdoc / NAPDEF 2 / characteristic 1",
                document.path(second.children().get(0)));
        assertEquals(
                "wap-provisioningdoc / NAPDEF 2 / PXLOGICAL 1", document.path(second.children().get(1)));
        assertEquals("wap-provisioningdoc", document.path(document.root()));
    }

    @Test
    void aPathTellsTheInnermostEightElements() throws Exception {
        ProvisioningDocument document = read(HEADER + "45" + "C6 51 01".repeat(9) + "87 11");
        Deviation deviation = document.deviations().get(0);
        assertEquals(
                "... / " + "PXLOGICAL 1 / ".repeat(7) + "NAPID",
                deviation.path());
        document = read(HEADER + "45" + "C6 51 01".repeat(6) + "87 11");
        assertEquals(
                "wap-provisioningdoc / " + "PXLOGICAL 1 / ".repeat(6) + "NAPID",
                document.deviations().get(0).path());
    }
}
