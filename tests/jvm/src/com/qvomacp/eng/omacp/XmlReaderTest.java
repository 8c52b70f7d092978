package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** Documents in XML as they are found, and what is refused of them, with its place. */
class XmlReaderTest {
    private static final String PLAIN =
            "<wap-provisioningdoc version=\"1.0\"><characteristic type=\"NAPDEF\">"
                    + "<parm name=\"NAME\" value=\"caf\u00E9\"/></characteristic></wap-provisioningdoc>";

    private static byte[] body(byte[] xml) throws EncodingException {
        return ProvisioningEncoder.ofXml(xml, EncodeOptions.NONE).body();
    }

    private static byte[] body(String xml) throws EncodingException {
        return body(xml.getBytes(StandardCharsets.UTF_8));
    }

    private static EncodingException refusal(String xml) {
        return assertThrows(EncodingException.class, () -> body(xml), xml);
    }

    private static String inNapDef(String content) {
        return PLAIN.replaceFirst("<parm.*/>", content);
    }

    private static String nameOf(String value) throws Exception {
        return ProvisioningDocument.parse(
                        body(inNapDef("<parm name='NAME' value='" + value + "'/>")))
                .characteristics()
                .get(0)
                .value("NAME");
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "<?xml version=\"1.0\"?>\n@",
                "<?xml version='1.0' encoding='utf-8' standalone='yes'?>@",
                "<!DOCTYPE wap-provisioningdoc PUBLIC \"-//WAPFORUM//DTD PROV 1.0//EN\" \"x.dtd\">@",
                "<!DOCTYPE wap-provisioningdoc>@",
                "<!DOCTYPE x [<!ELEMENT x (y)> <!-- ]> --> <?a ]>?> <!ENTITY e \"]>\">]>@",
                "<!-- c --> @ <!-- c --><?pi?>\n",
                " \n@",
                "\uFEFF@",
            })
    void readsWhatStandsAroundADocument(String around) throws Exception {
        assertArrayEquals(body(PLAIN), body(around.replace("@", PLAIN)));
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "<!-- c --><parm name='NAME' value='caf\u00E9'/>",
                "<parm  value = \"caf\u00E9\"\n name='NAME' />",
                "<parm name='NAME' value='caf&#xE9;'></parm>",
                "<parm name='NAME' value='caf&#233;'> <!-- c --> </parm >",
                "<![CDATA[ \n]]><parm name='NAME' value='caf\u00E9'/>&#32;&#xA;",
                "<parm xmlns='urn:x' name='NAME' value='caf\u00E9'/>",
                "<?pi d?><parm name='NAME' value='caf\u00E9'/>",
            })
    void readsAnElementHoweverItIsWritten(String content) throws Exception {
        assertArrayEquals(body(PLAIN), body(inNapDef(content)));
    }

    @ParameterizedTest
    @ValueSource(strings = {"UTF-16", "UTF-16BE", "UTF-16LE", "ISO-8859-1", "UTF-8"})
    void readsTheEncodingThatIsStated(String name) throws Exception {
        String stated = "<?xml version=\"1.0\" encoding=\"" + name + "\"?>" + PLAIN;
        assertArrayEquals(body(PLAIN), body(stated.getBytes(Charset.forName(name))));
    }

    @Test
    void readsUtf16WithAndWithoutAByteOrderMark() throws Exception {
        assertArrayEquals(body(PLAIN), body(PLAIN.getBytes(StandardCharsets.UTF_16)));
        assertArrayEquals(body(PLAIN), body(PLAIN.getBytes(StandardCharsets.UTF_16LE)));
        assertArrayEquals(body(PLAIN), body(("\uFEFF" + PLAIN).getBytes(StandardCharsets.UTF_16LE)));
    }

    @Test
    void refusesBytesThatAreNotOfTheEncoding() {
        byte[] xml = PLAIN.getBytes(StandardCharsets.ISO_8859_1);
        EncodingException e = assertThrows(EncodingException.class, () -> body(xml));
        assertEquals(1, e.line());
        assertEquals(PLAIN.indexOf('\u00E9') + 1, e.column());
        String unknown = "<?xml version='1.0' encoding='none-such'?>" + PLAIN;
        assertEquals(1, refusal(unknown).line());
    }

    @Test
    void readsReferencesAndBlanksOfAValueAsXmlSays() throws Exception {
        assertEquals("<>&\"'", nameOf("&lt;&gt;&amp;&quot;&apos;"));
        assertEquals("a b c d", nameOf("a\nb\tc\r\nd"));
        assertEquals("a\nb\tc\rd", nameOf("a&#10;b&#9;c&#xD;d"));
        assertEquals("\uD83D\uDE00", nameOf("&#x1F600;"));
        assertEquals("\uD83D\uDE00", nameOf("\uD83D\uDE00"));
        assertEquals("\u00E9", nameOf("\u00E9"));
    }

    @ParameterizedTest
    @CsvSource(
            delimiter = '|',
            quoteCharacter = '`',
            value = {
                "<p:characteristic type='A'/>                  | 1 | an element with a prefix",
                "<Characteristic type='A'/>                    | 1 | element names are in lower case",
                "<PARM name='A'/>                              | 1 | element names are in lower case",
                "<characteristic-query type='A'/>              | 1 | no element of a provisioning document",
                "<parm-query name='A'/>                        | 1 | no element of a provisioning document",
                "<noparm name='A'/>                            | 1 | no element of a provisioning document",
                "<parm name='A'>x</parm>                       | 16 | text stands in <parm>",
                "<parm name='A'><parm name='B'/></parm>        | 16 | a parm has no content",
                "<parm value='A'/>                             | 1 | <parm> without name",
                "<characteristic/>                             | 1 | <characteristic> without type",
                "<parm name='A' p:value='B'/>                  | 1 | an attribute with a prefix",
                "<parm name='A' xmlns:p='B'/>                  | 1 | an attribute with a prefix",
                "<parm name='A' datatype='B'/>                 | 1 | no attribute of <parm>",
                "<parm name='A' name='B'/>                     | 16 | an attribute stands twice",
                "<parm name='A'value='B'/>                     | 15 | no attribute",
                "<parm name=A/>                                | 12 | a value without quotes",
                "<parm name='<'/>                              | 13 | a value with <",
                "<parm name='&#0;'/>                           | 13 | a character that XML does not have",
                "<parm name='&#xD800;'/>                       | 13 | a character that XML does not have",
                "<parm name='&#x110000;'/>                     | 13 | a character that XML does not have",
                "<parm name='&#99999999999999999999;'/>        | 13 | a character that XML does not have",
                "<parm name='&e;'/>                            | 13 | a reference that is none",
                "<parm name='&amp'/>                           | 13 | a reference that is none",
                "<parm name='&#;'/>                            | 13 | a reference that is none",
                "x                                             | 1 | text stands in <characteristic>",
                "&e;                                           | 1 | a reference that is none",
                "<![CDATA[x]]>                                 | 1 | text stands in <characteristic>",
                "</parm>                                       | 1 | another element is open",
                "< parm name='A'/>                             | 1 | a tag without a name",
            })
    void refusesWithLineColumnAndWhatWasExpected(String content, int column, String sentence) {
        EncodingException e = refusal(PLAIN.replaceFirst("<parm.*/>", "\n" + content));
        assertEquals(2, e.line(), content);
        assertEquals(column, e.column(), content);
        assertTrue(e.getMessage().startsWith(sentence), e.getMessage());
    }

    @Test
    void namesWhatWasExpected() {
        assertEquals(List.of("<characteristic>", "<parm>"), refusal(inNapDef("<noparm/>")).expected());
        assertEquals(List.of("</parm>"), refusal(inNapDef("<parm name='A'>x</parm>")).expected());
        assertEquals(List.of("name", "value"), refusal(inNapDef("<parm x=''/>")).expected());
        assertEquals(List.of("<wap-provisioningdoc>"), refusal("<html/>").expected());
    }

    @ParameterizedTest
    @ValueSource(strings = {"", " ", "x", "<wap-provisioningdoc>", "<!-- ", "<!DOCTYPE x [", "<wap",
        "<wap-provisioningdoc><characteristic type='A'></wap-provisioningdoc>",
        "<wap-provisioningdoc/>x", "<wap-provisioningdoc/><wap-provisioningdoc/>",
        "<wap-provisioningdoc/><?xml version='1.0'?>", "<wap-provisioningdoc/><!DOCTYPE x>",
        "<wap-provisioningdoc a='", "<wap-provisioningdoc><parm name='a' value='\u0000'/>"})
    void refusesWhatIsNotOneDocument(String xml) {
        EncodingException e = refusal(xml);
        assertTrue(e.line() == 1 && e.column() >= 1);
        assertFalse(e.getMessage().isEmpty());
    }

    @Test
    void countsLinesHoweverTheyEnd() {
        EncodingException e = refusal("<!-- \r\n \r \n -->\r\n <x/>");
        assertEquals(5, e.line());
        assertEquals(2, e.column());
    }

    /** Nothing that a document names is opened: what it would bring in is an error. */
    @Test
    void opensNothing(@TempDir Path folder) throws Exception {
        Path secret = Files.writeString(folder.resolve("secret"), "secret");
        String[] subsets = {
            "<!ENTITY e SYSTEM '" + secret.toUri() + "'>",
            "<!ENTITY e SYSTEM 'http://192.0.2.1/'>",
            "<!ENTITY % p SYSTEM '" + secret.toUri() + "'> %p; <!ENTITY e 'x'>",
            "<!ENTITY a 'aaaaaaaaaa'><!ENTITY e '&a;&a;&a;&a;&a;&a;&a;&a;&a;&a;'>",
        };
        for (String subset : subsets) {
            String doctype =
                    "<!DOCTYPE wap-provisioningdoc SYSTEM '" + secret.toUri() + "' [" + subset + "]>";
            assertArrayEquals(body(PLAIN), body(doctype + PLAIN));
            EncodingException e = refusal(doctype + PLAIN.replace("caf", "&e;"));
            assertEquals(doctype.length() + PLAIN.indexOf("caf") + 1, e.column());
        }
    }

    @Test
    void everyPrefixOfADocumentIsRefusedCleanly() throws Exception {
        String xml = Files.readString(Path.of("samples/mms.xml")).trim();
        for (int end = 0; end < xml.length(); ++end) {
            refusal(xml.substring(0, end));
        }
    }
}
