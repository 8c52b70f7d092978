package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.List;
import java.util.Random;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.MethodSource;

/** Documents as bodies, pushes and XML, and back. */
class EncodingTest {
    private static final int TREES = 10_000;

    private static final EncodeOptions[] WRITINGS = {
        EncodeOptions.NONE,
        EncodeOptions.NONE.with(EncodeOption.TOKENS, "oma"),
        EncodeOptions.NONE.with(EncodeOption.TOKENS, "none"),
        EncodeOptions.NONE.with(EncodeOption.STRINGS, "table").with(EncodeOption.IDENTIFIER, "table"),
        EncodeOptions.NONE.with(EncodeOption.CHARSET, "UTF-16"),
        EncodeOptions.NONE.with(EncodeOption.CHARSET, "UTF-16LE").with(EncodeOption.STRINGS, "table"),
    };

    static List<Path> samples() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".xml")).sorted().toList();
        }
    }

    private static byte[] push(Path xml) throws Exception {
        return Files.readAllBytes(Path.of(xml.toString().replace(".xml", ".push")));
    }

    private static ProvisioningEncoder ofXml(String xml) throws EncodingException {
        return ofXml(xml, EncodeOptions.NONE);
    }

    private static ProvisioningEncoder ofXml(String xml, EncodeOptions options)
            throws EncodingException {
        return ProvisioningEncoder.ofXml(xml.getBytes(StandardCharsets.UTF_8), options);
    }

    /** A document with one characteristic. */
    private static String xml(String type, String parms) {
        return "<wap-provisioningdoc><characteristic type=\""
                + type
                + "\">"
                + parms
                + "</characteristic></wap-provisioningdoc>";
    }

    private static byte[] value(String type, String name, String value, String tokens)
            throws Exception {
        String parm = "<parm name=\"" + name + "\" value=\"" + value + "\"/>";
        EncodeOptions options = EncodeOptions.NONE.with(EncodeOption.TOKENS, tokens);
        byte[] body = ofXml(xml(type, parm), options).body();
        int at = new String(body, StandardCharsets.ISO_8859_1).lastIndexOf('\u0006') + 1;
        return Arrays.copyOfRange(body, at, body.length - 3);
    }

    private static String hexadecimal(byte[] bytes) {
        StringBuilder text = new StringBuilder();
        for (byte b : bytes) {
            text.append(String.format("%02X", b));
        }
        return text.toString();
    }

    @ParameterizedTest
    @MethodSource("samples")
    void aSampleIsItsDocumentEncoded(Path xml) throws Exception {
        byte[] expected = push(xml);
        byte[] encoded =
                ProvisioningEncoder.ofXml(Files.readAllBytes(xml), EncodeOptions.NONE).push();
        assertArrayEquals(expected, encoded);
    }

    @Test
    void everySampleHasItsDocument() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            assertEquals(
                    samples().size(), files.filter(file -> file.toString().endsWith(".push")).count());
        }
    }

    @ParameterizedTest
    @MethodSource("samples")
    void aSampleComesBackFromItsXmlInEveryWriting(Path xml) throws Exception {
        byte[] push = push(xml);
        int header = PushHeader.parse(push).length();
        byte[] body = Arrays.copyOfRange(push, header, push.length);
        assertComesBack(ProvisioningDocument.parse(body));
    }

    private static void assertComesBack(ProvisioningDocument document) throws Exception {
        String xml = ProvisioningEncoder.of(document, EncodeOptions.NONE).xml();
        for (EncodeOptions options : WRITINGS) {
            ProvisioningDocument back = ProvisioningDocument.parse(ofXml(xml, options).body());
            assertEquals(document, back, () -> options + "\n" + xml);
            assertEquals(List.of(), back.deviations(), () -> options + "\n" + xml);
        }
    }

    @Test
    void generatedTreesComeBackFromTheirXmlInEveryWriting() throws Exception {
        Random random = new Random(14);
        for (int i = 0; i < TREES; ++i) {
            String xml = generated(random);
            ProvisioningDocument document =
                    ProvisioningDocument.parse(
                            ofXml(xml, WRITINGS[random.nextInt(WRITINGS.length)]).body());
            String back = ProvisioningEncoder.of(document, EncodeOptions.NONE).xml();
            EncodeOptions options = WRITINGS[random.nextInt(WRITINGS.length)];
            assertEquals(document, ProvisioningDocument.parse(ofXml(back, options).body()));
        }
    }

    private static final String[] TYPES = {
        "PXLOGICAL", "PORT", "NAPDEF", "APPLICATION", "APPAUTH", "RESOURCE", "ACCESS", "WLAN",
        "SEC-SSID", "WI-FI", "x", "", "&#xE4;&amp;&quot;"
    };

    private static final String[] NAMES = {
        "NAME", "NAPID", "BEARER", "SERVICE", "AAUTHTYPE", "AUTHTYPE", "CALLTYPE", "NAP-ADDRTYPE",
        "ADDRTYPE", "AAUTHLEVEL", "LINKSPEED", "AUTH-ENTITY", "SSID", "TO-NAPID", "", "caf&#xE9;"
    };

    private static final String[] VALUES = {
        "", " ", "GSM-GPRS", "CO-WSP", "HTTP-BASIC", "HTTP,BASIC", "BASIC,DIGEST", "HTTP-,BASIC", ",",
        "BASIC,x", "x,BASIC", "HTTP-DIGEST,BASIC,HMAC", "WTLS-SS", "V.110", "IPV4", "E164", "APPSRV",
        "OBEX", "AUTOBAUDING", "AAA", "a&#13;&#10;b&#9;", "&#x1F600;", "&lt;&gt;&amp;&quot;&apos;",
        "internet", "internet", "&#xFFFD;"
    };

    private static String generated(Random random) {
        StringBuilder xml = new StringBuilder("<wap-provisioningdoc");
        xml.append(new String[] {"", " version=\"1.0\"", " version=\"1.1\""}[random.nextInt(3)]).append('>');
        int depth = 0;
        for (int i = random.nextInt(20); i > 0; --i) {
            switch (random.nextInt(4)) {
                case 0:
                    xml.append("<characteristic type=\"").append(one(TYPES, random)).append("\">");
                    ++depth;
                    break;
                case 1:
                    if (depth > 0) {
                        xml.append("</characteristic>");
                        --depth;
                    }
                    break;
                default:
                    xml.append("<parm name=\"").append(one(NAMES, random)).append('"');
                    if (random.nextInt(8) > 0) {
                        xml.append(" value=\"").append(one(VALUES, random)).append('"');
                    }
                    xml.append("/>");
            }
        }
        for (; depth > 0; --depth) {
            xml.append("</characteristic>");
        }
        return xml.append("</wap-provisioningdoc>").toString();
    }

    private static String one(String[] texts, Random random) {
        return texts[random.nextInt(texts.length)];
    }

    @ParameterizedTest
    @CsvSource({
        "NAPDEF, BEARER, GSM-GPRS, AB, AB",
        "NAPDEF, NAP-ADDRTYPE, APN, 89, 89",
        "NAPDEF, CALLTYPE, ANALOG-MODEM, 90, 90",
        "NAPDEF, CALLTYPE, V.110, 03562E31313000, 92",
        "NAPDEF, LINKSPEED, AUTOBAUDING, 034155544F42415544494E4700, C5",
        "NAPAUTHINFO, AUTHTYPE, CHAP, 9B, 9B",
        "NAPAUTHINFO, AUTHTYPE, WTLS-SS, 0357544C532D535300, 9E",
        "NAPAUTHINFO, AUTH-ENTITY, AAA, 0341414100, E0",
        "PORT, SERVICE, CO-WSP, CB, CB",
        "PORT, SERVICE, HTTPS, 03485454505300, 03485454505300",
        "APPAUTH, AAUTHLEVEL, APPSRV, 8D, 8D",
        "APPAUTH, AAUTHLEVEL, OBEX, 034F42455800, 8E",
        "APPAUTH, AAUTHTYPE, BASIC, 92, 92",
        "APPAUTH, AAUTHTYPE, 'BASIC,DIGEST', 929093, 929093",
        "RESOURCE, AAUTHTYPE, 'BASIC,DIGEST', 0342415349432C44494745535400, 929093",
        "APPAUTH, AAUTHTYPE, HTTP-BASIC, 03485454502D424153494300, 9192",
        "APPAUTH, AAUTHTYPE, 'BASIC,X', 9290035800, 9290035800",
        "APPAUTH, AAUTHTYPE, 'X,BASIC', 03582C424153494300, 03582C424153494300",
    })
    void aValueIsATokenWhereThatSaysTheSame(
            String type, String name, String value, String library, String oma) throws Exception {
        assertEquals(library, hexadecimal(value(type, name, value, "library")));
        assertEquals(oma, hexadecimal(value(type, name, value, "oma")));
        assertEquals(
                "03" + hexadecimal(value.getBytes(StandardCharsets.UTF_8)) + "00",
                hexadecimal(value(type, name, value, "none")));
    }

    @Test
    void aTypeThatTheLibraryTakesForAnotherIsText() throws Exception {
        byte[] library = ofXml(xml("WLAN", "")).body();
        assertEquals("030B6A0045C65003574C414E00010101", hexadecimal(library));
        byte[] oma =
                ofXml(xml("WLAN", ""), EncodeOptions.NONE.with(EncodeOption.TOKENS, "oma")).body();
        assertEquals("030B6A0045C600015A010101", hexadecimal(oma));
    }

    @Test
    void aParameterWithoutAValueAndAnEmptyValueStayTwoThings() throws Exception {
        ProvisioningDocument document =
                ProvisioningDocument.parse(
                        ofXml(xml("NAPDEF", "<parm name=\"INTERNET\"/><parm name=\"NAME\" value=\"\"/>"))
                                .body());
        Characteristic napDef = document.characteristics().get(0);
        assertNull(napDef.parameter("INTERNET").value());
        assertEquals("", napDef.parameter("NAME").value());
    }

    @Test
    void aTextThatTheCharacterSetLacksIsToldWithItsPath() {
        EncodeOptions ascii = EncodeOptions.NONE.with(EncodeOption.CHARSET, "US-ASCII");
        String xml = xml("NAPDEF", "<characteristic type=\"PORT\"/><parm name=\"NAME\" value=\"\u00E9\"/>");
        EncodingException e =
                assertThrows(EncodingException.class, () -> ofXml(xml, ascii).body());
        assertEquals("wap-provisioningdoc / NAPDEF 1", e.path());
        EncodeOptions unknown = EncodeOptions.NONE.with(EncodeOption.CHARSET, "UTF-9");
        assertThrows(EncodingException.class, () -> ofXml(xml, unknown).body());
    }

    @Test
    void whatXmlCannotHoldIsToldWithItsPath() throws Exception {
        byte[] control = {0x03, 0x0B, 0x6A, 0x00, 0x45, (byte) 0xC6, 0x55, 0x01,
            (byte) 0x87, 0x07, 0x06, 0x03, 0x07, 0x00, 0x01, 0x01, 0x01};
        EncodingException e =
                assertThrows(
                        EncodingException.class,
                        () ->
                                ProvisioningEncoder.of(
                                                ProvisioningDocument.parse(control),
                                                EncodeOptions.NONE)
                                        .xml());
        assertEquals("wap-provisioningdoc / NAPDEF 1", e.path());
        assertTrue(e.getMessage().contains("U+0007"), e.getMessage());
    }

    @Test
    void thePathOfADocumentWithoutItsElementIsThatOfItsItems() throws Exception {
        byte[] control = {0x03, 0x0B, 0x6A, 0x00, (byte) 0xC6, 0x55, 0x01,
            (byte) 0x87, 0x07, 0x06, 0x03, 0x07, 0x00, 0x01, 0x01};
        ProvisioningDocument document = ProvisioningDocument.parse(control);
        ProvisioningEncoder encoder = ProvisioningEncoder.of(document, EncodeOptions.NONE);
        EncodingException e = assertThrows(EncodingException.class, encoder::xml);
        assertEquals(document.path(document.children().get(0)), e.path());
    }

    @Test
    void aMessageWhoseDocumentTypeCannotBeHadIsEncoded() throws Exception {
        byte[] body = {0x03, 0x00, 0x05, 0x6A, 0x00, 0x45, (byte) 0xC6, 0x55, 0x01, 0x01, 0x01};
        ProvisioningMessage message = ProvisioningMessage.parseBody(body);
        assertNull(message.document().documentType());
        ProvisioningEncoder encoder = ProvisioningEncoder.of(message, EncodeOptions.NONE);
        assertEquals("table", encoder.options().value(EncodeOption.IDENTIFIER));
        assertEquals(message.document(), ProvisioningDocument.parse(encoder.body()));
    }

    @Test
    void contentThatIsNoElementOfTheDocumentTypeIsToldWithItsPath() throws Exception {
        byte[] text = {0x03, 0x0B, 0x6A, 0x00, 0x45, (byte) 0xC6, 0x55, 0x01, 0x03, 'x', 0x00, 0x01, 0x01};
        ProvisioningDocument document = ProvisioningDocument.parse(text);
        EncodingException e =
                assertThrows(
                        EncodingException.class,
                        () -> ProvisioningEncoder.of(document, EncodeOptions.NONE));
        assertTrue(e.path().startsWith("wap-provisioningdoc / NAPDEF 1"), e.path());
    }

    @Test
    void anOptionWinsOverTheInstruction() throws Exception {
        String xml =
                "<?omacp-push sec=\"userpin\" pin=\"1234\" tid='2A'?>" + xml("NAPDEF", "");
        byte[] push = ofXml(xml, EncodeOptions.NONE.with(EncodeOption.SEC, "netwpin")
                .with(EncodeOption.IMSI, "001010123456789")).push();
        PushHeader header = PushHeader.parse(push);
        assertEquals(SecurityMethod.NETWPIN, header.securityMethod());
        assertEquals(0x2A, header.transactionIdentifier());
        byte[] body = Arrays.copyOfRange(push, header.length(), push.length);
        assertEquals(
                MacResult.RIGHT,
                ProvisioningMac.verify(
                        SecurityMethod.NETWPIN, header.mac(), body, null, "001010123456789"));
    }

    @Test
    void aMacNeedsAPinAnImsiOrAKey() throws Exception {
        ProvisioningEncoder encoder =
                ofXml(xml("NAPDEF", ""), EncodeOptions.NONE.with(EncodeOption.SEC, "usernetwpin"));
        EncodingException e = assertThrows(EncodingException.class, encoder::push);
        assertEquals(List.of("pin", "imsi", "key"), e.expected());
        byte[] push =
                ofXml(
                                xml("NAPDEF", ""),
                                EncodeOptions.NONE
                                        .with(EncodeOption.SEC, "usernetwpin")
                                        .with(EncodeOption.KEY, "31323334"))
                        .push();
        PushHeader header = PushHeader.parse(push);
        byte[] body = Arrays.copyOfRange(push, header.length(), push.length);
        assertEquals(
                MacResult.RIGHT,
                ProvisioningMac.verify(
                        SecurityMethod.USERNETWPIN, header.mac(), body, "1234".getBytes()));
    }

    @Test
    void theDigitsThatAUserIsToldVerifyTheMessage() throws Exception {
        ProvisioningEncoder encoder =
                ofXml(
                        xml("NAPDEF", ""),
                        EncodeOptions.NONE
                                .with(EncodeOption.SEC, "userpinmac")
                                .with(EncodeOption.PIN, "12345"));
        String digits = encoder.digitsToTell();
        assertEquals(10, digits.length());
        assertTrue(digits.startsWith("12345"));
        assertEquals(
                MacResult.RIGHT,
                ProvisioningMac.verify(
                        SecurityMethod.USERPINMAC, null, encoder.body(), digits, null));
        assertNull(ofXml(xml("NAPDEF", "")).digitsToTell());
    }

    @Test
    void optionsShowNoSecrets() {
        EncodeOptions options =
                EncodeOptions.NONE
                        .with(EncodeOption.SEC, "userpin")
                        .with(EncodeOption.PIN, "9876")
                        .with(EncodeOption.KEY, "AB");
        assertEquals("EncodeOptions{sec=userpin, pin, key}", options.toString());
        assertThrows(
                IllegalArgumentException.class, () -> options.with(EncodeOption.SEC, "none"));
        assertEquals(options, options.with(EncodeOption.SEC, "userpin"));
        assertFalse(options.equals(EncodeOptions.NONE));
    }

    @Test
    void nestingCostsNoStack() throws Exception {
        int depth = 100_000;
        StringBuilder xml = new StringBuilder("<wap-provisioningdoc>");
        for (int i = 0; i < depth; ++i) {
            xml.append("<characteristic type='PORT'>");
        }
        for (int i = 0; i < depth; ++i) {
            xml.append("</characteristic>");
        }
        byte[] body = ofXml(xml.append("</wap-provisioningdoc>").toString()).body();
        ProvisioningDocument document =
                ProvisioningDocument.parse(body, ReadOptions.DEFAULT.withInputLimit(1 << 20));
        ProvisioningEncoder encoder = ProvisioningEncoder.of(document, EncodeOptions.NONE);
        assertArrayEquals(body, encoder.body());
        assertArrayEquals(body, ofXml(encoder.xml()).body());
    }
}
