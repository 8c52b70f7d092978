package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.BodyGenerator;
import com.qvomacp.support.FieldMessage;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.EnumSet;
import java.util.HexFormat;
import java.util.List;
import java.util.Random;
import java.util.Set;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.condition.EnabledIfEnvironmentVariable;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.Arguments;
import org.junit.jupiter.params.provider.MethodSource;

/** What is found in messages that are wrong, and left alone in those that are right. */
class LintTest {
    private static final ReadOptions LARGE = ReadOptions.DEFAULT.withInputLimit(1 << 20);
    private static final Set<Rule> LIBRARY = EnumSet.of(Rule.LIBRARY_DROPS, Rule.LIBRARY_REFUSES);

    /** A characteristic; the content may hold others. */
    private static String in(String type, String... content) {
        return "<characteristic type='" + type + "'>" + String.join("", content) + "</characteristic>";
    }

    private static String parm(String name, String value) {
        return "<parm name='" + name + "' value='" + value + "'/>";
    }

    private static String napdef(String... content) {
        return in("NAPDEF", parm("NAPID", "nap"), String.join("", content));
    }

    private static String proxy(String... content) {
        return in("PXLOGICAL", parm("PROXY-ID", "proxy"), String.join("", content));
    }

    private static String application(String... content) {
        return in("APPLICATION", parm("APPID", "w2"), String.join("", content));
    }

    private static String machine(String id, String... content) {
        return in("PXPHYSICAL", parm("PHYSICAL-PROXY-ID", id), String.join("", content));
    }

    private static String port(String number) {
        return in("PORT", parm("PORTNBR", number));
    }

    private static String pxaddr(String type, String address) {
        return proxy(machine("1", parm("PXADDR", address),
                type.isEmpty() ? "" : parm("PXADDRTYPE", type)));
    }

    private static String nap(String type, String address) {
        return napdef(parm("NAP-ADDRESS", address), parm("NAP-ADDRTYPE", type));
    }

    private static byte[] xml(String content) {
        String document = "<wap-provisioningdoc version='1.0'>" + content + "</wap-provisioningdoc>";
        return document.getBytes(StandardCharsets.UTF_8);
    }

    /** The rules that find something, as often as they do. */
    private static List<Rule> rules(List<Finding> findings) {
        return findings.stream().map(Finding::rule).toList();
    }

    private static List<Rule> found(String content) throws Exception {
        List<Rule> found = rules(ProvisioningEncoder.lint(xml(content)));
        try {
            byte[] body = ProvisioningEncoder.ofXml(xml(content), EncodeOptions.NONE).body();
            assertEquals(found, rules(ProvisioningDocument.parse(body, LARGE).lint()), content);
        } catch (EncodingException lenient) {
            assertTrue(lenient.getMessage().contains("> without "), lenient.getMessage());
        }
        return found;
    }

    /** A rule, a document in which it finds something, and one beside it that it leaves alone. */
    static Stream<Arguments> documents() {
        return Stream.of(
                of(Rule.NUMBER, proxy(port("80a")), proxy(port("80"))),
                of(Rule.NUMBER, proxy(port("")), proxy(port("00080"))),
                of(Rule.NUMBER, proxy(port("-1")), proxy(port("1"))),
                of(Rule.NUMBER, proxy(port(" 80")), proxy(port("65535"))),
                of(Rule.NUMBER, napdef(parm("LINGER", "1 h")), napdef(parm("LINGER", "0"))),
                of(Rule.NUMBER, napdef("<parm name='LINGER'/>"), napdef("<parm name='INTERNET'/>")),
                of(Rule.NUMBER, napdef(parm("LINKSPEED", "fast")), napdef(parm("LINKSPEED", "AUTOBAUDING"))),
                of(Rule.NUMBER, napdef(parm("MAX-NUM-RETRY", "two")), napdef(parm("MAX-NUM-RETRY", "2"))),
                of(Rule.NUMBER, napdef(parm("TRAFFIC-CLASS", "6G")), napdef(parm("TRAFFIC-CLASS", "6f"))),
                of(Rule.NUMBER, in("ACCESS", parm("PORTNBR", "http")), in("ACCESS", parm("PORTNBR", "80"))),
                of(Rule.NUMBER, napdef(parm("LINGER", "\u0661")), napdef(parm("LINGER", "1"))),
                of(Rule.PORT, proxy(port("0")), proxy(port("1"))),
                of(Rule.PORT, proxy(port("65536")), proxy(port("65535"))),
                of(Rule.PORT, proxy(port("99999999999999999999")), proxy(port("0000000000000000000009"))),
                of(Rule.PORT, in("ACCESS", parm("PORTNBR", "70000")), in("ACCESS", parm("PORTNBR", "443"))),
                of(Rule.PORT, proxy(machine("1", parm("PXADDR", "10.0.0.1"), port("0"))),
                        proxy(machine("1", parm("PXADDR", "10.0.0.1"), port("8080")))),
                of(Rule.PORT, application(in("APPADDR", parm("ADDR", "a.example"), port("0"))),
                        application(in("APPADDR", parm("ADDR", "a.example"), port("25")))),
                of(Rule.NO_PROXY, proxy(port("0"), machine("1", parm("PXADDR", "0.0.0.0"))),
                        proxy(port("80"), machine("1", parm("PXADDR", "0.0.0.0")))),
                of(Rule.NO_PROXY, proxy(machine("1", parm("PXADDR", "0.0.0.0"), port("0"))),
                        proxy(machine("1", parm("PXADDR", "0.0.0.0")))),
                of(Rule.TYPE_MISSING, "<characteristic/>", in("PORT")),
                of(Rule.NAME_MISSING, napdef("<parm value='x'/>"), napdef(parm("NAME", "x"))),
                of(Rule.NAME_MISSING, napdef("<parm/>"), napdef(parm("NAME", ""))),
                of(Rule.NAPID_MISSING, in("NAPDEF", parm("NAME", "x")), napdef(parm("NAME", "x"))),
                of(Rule.NAPID_MISSING, in("NAPDEF", parm("NAPID", "")), in("BOOTSTRAP")),
                of(Rule.PROXY_ID_MISSING, in("PXLOGICAL"), proxy()),
                of(Rule.APPID_MISSING, in("APPLICATION", parm("NAME", "x")), application()),
                of(Rule.NAPID_TWICE, napdef() + napdef(), napdef() + in("NAPDEF", parm("NAPID", "NAP"))),
                of(Rule.PROXY_ID_TWICE, proxy() + proxy(),
                        proxy() + in("BOOTSTRAP", parm("PROXY-ID", "proxy"))),
                of(Rule.PHYSICAL_PROXY_ID_TWICE, proxy(machine("1"), machine("1")),
                        proxy(machine("1"), machine("2"))
                                + in("PXLOGICAL", parm("PROXY-ID", "other"), machine("1"))),
                of(Rule.TO_NAPID, proxy(machine("1", parm("TO-NAPID", "other"))) + napdef(),
                        proxy(machine("1", parm("TO-NAPID", "nap"))) + napdef()),
                of(Rule.TO_NAPID, application(parm("TO-NAPID", "internet")),
                        application(parm("TO-NAPID", "INTERNET"))),
                of(Rule.TO_NAPID, in("ACCESS", "<parm name='TO-NAPID'/>"),
                        in("ACCESS", parm("TO-NAPID", "nap")) + napdef()),
                of(Rule.TO_PROXY, application(parm("TO-PROXY", "INTERNET")),
                        application(parm("TO-PROXY", "proxy")) + proxy()),
                of(Rule.TO_PROXY, in("ACCESS", parm("TO-PROXY", "nap")) + napdef(),
                        in("ACCESS", parm("TO-PROXY", "proxy")) + proxy()),
                of(Rule.ADDRESS, pxaddr("IPV4", "010.000.000.001"), pxaddr("IPV4", "10.0.0.1")),
                of(Rule.ADDRESS, pxaddr("", "010.000.000.001"), pxaddr("", "proxy.example")),
                of(Rule.ADDRESS, pxaddr("IPV4", "10.0.0.256"), pxaddr("IPV4", "255.255.255.255")),
                of(Rule.ADDRESS, pxaddr("IPV4", "10.0.0"), pxaddr("IPV4", "0.0.0.0")),
                of(Rule.ADDRESS, pxaddr("IPV4", "proxy.example"), pxaddr("ALPHA", "proxy.example")),
                of(Rule.ADDRESS, pxaddr("IPV6", "10.0.0.1"), pxaddr("IPV6", "::ffff:10.0.0.1")),
                of(Rule.ADDRESS, pxaddr("IPV6", "1::2::3"), pxaddr("IPV6", "::")),
                of(Rule.ADDRESS, pxaddr("IPV6", "1:2:3:4:5:6:7"), pxaddr("IPV6", "1:2:3:4:5:6:7:8")),
                of(Rule.ADDRESS, pxaddr("IPV6", "1:2:3:4:5:6:7:8::"), pxaddr("IPV6", "1:2:3:4:5:6:7::")),
                of(Rule.ADDRESS, pxaddr("IPV6", "2001:db8::12345"), pxaddr("IPV6", "2001:DB8::1234")),
                of(Rule.ADDRESS, pxaddr("IPV6", ":1"), pxaddr("IPV6", "::1")),
                of(Rule.ADDRESS, pxaddr("ipv4", "10.0.0.1"), pxaddr("IPV4", "10.0.0.1")),
                of(Rule.ADDRESS, nap("E164", "internet"), nap("E164", "+35808124002")),
                of(Rule.ADDRESS, nap("APN", "+35808124002"), nap("APN", "MYISP.gprs")),
                of(Rule.ADDRESS, nap("APN", "10.0.0.1"), nap("APN", "10.example")),
                of(Rule.ADDRESS, nap("APN", "an apn"), nap("APN", "an_apn-1")),
                of(Rule.ADDRESS, nap("SCODE", "x"), nap("SCODE", "*100#")),
                of(Rule.ADDRESS, nap("MAN", "x"), nap("MAN", "15112345")),
                of(Rule.ADDRESS, nap("TETRA-ITSI", ""), nap("TETRA-ITSI", "26201700001234")),
                of(Rule.ADDRESS, nap("ALPHA", ""), nap("ALPHA", "whatever it is")),
                of(Rule.ADDRESS, napdef(parm("DNS-ADDR", "193.254.160.001")),
                        napdef(parm("DNS-ADDR", "193.254.160.1"), parm("DNS-ADDR", "2001:db8::53"))),
                of(Rule.ADDRESS, napdef(parm("LOCAL-ADDR", "me"), parm("LOCAL-ADDRTYPE", "IPV4")),
                        napdef(parm("LOCAL-ADDR", "192.0.2.7"), parm("LOCAL-ADDRTYPE", "IPV4"))),
                of(Rule.ADDRESS, application(in("APPADDR", parm("ADDRTYPE", "IPV4"), parm("ADDR", "x"))),
                        application(in("APPADDR", parm("ADDRTYPE", "APPSRV"), parm("ADDR", "x")))),
                of(Rule.ADDRESS_EXCHANGED, nap("internet", "APN"), nap("APN", "internet")),
                of(Rule.ADDRESS_EXCHANGED, pxaddr("10.0.0.1", "IPV4"), pxaddr("ALPHA", "IPV4")),
                of(Rule.LETTER_CASE, in("ACCESS", parm("rule", "x")), in("ACCESS", parm("RULE", "x"))),
                of(Rule.LETTER_CASE, in("ACCESS", parm("Rule", "x")),
                        in("VENDORCONFIG", parm("NAME", "x"), parm("rule", "x"))),
                of(Rule.UNKNOWN_NAME, application(parm("MAX-BANDWIDTH", "1")), application(parm("FROM", "x"))),
                of(Rule.UNKNOWN_NAME, napdef(parm("HomeScreen", "x")),
                        in("VENDORCONFIG", parm("NAME", "x"), parm("HomeScreen", "x"))));
    }

    private static Arguments of(Rule rule, String bad, String good) {
        return Arguments.of(rule, bad, good);
    }

    @ParameterizedTest
    @MethodSource("documents")
    void findsWhatIsWrongAndLeavesWhatIsRightAlone(Rule rule, String bad, String good) throws Exception {
        List<Rule> found = new ArrayList<>(found(bad));
        assertTrue(found.remove(rule), bad + found);
        found.removeAll(LIBRARY); // which may have its own difficulties with it
        assertEquals(List.of(), found, "one fault is told once");
        assertEquals(List.of(), found(good));
    }

    @Test
    void namesInLowerCaseAreToldOnceAndMeanWhatTheyMean() throws Exception {
        List<Rule> found = new ArrayList<>(found(
                in("napdef", parm("napid", "nap"), parm("linger", "x"))
                        + application(parm("to-napid", "nap"))));
        found.removeAll(LIBRARY);
        assertEquals(List.of(Rule.LETTER_CASE, Rule.LETTER_CASE, Rule.LETTER_CASE, Rule.NUMBER,
                Rule.LETTER_CASE), found);
        found = new ArrayList<>(found(in("MYTYPE", parm("anything", "x"), in("INNER", port("x")))));
        found.removeAll(LIBRARY);
        assertEquals(List.of(Rule.UNKNOWN_NAME), found, "what stands in it is its own");
        found = new ArrayList<>(found(in("VENDORCONFIG", parm("NAME", "x"), parm("LINGER", "long"))));
        found.removeAll(LIBRARY);
        assertEquals(List.of(), found, "a vendor's numbers are the vendor's");
    }

    private static List<Finding> ofBody(String hex) throws Exception {
        return ProvisioningDocument.parse(HexFormat.of().parseHex(hex.replace(" ", ""))).lint();
    }

    @Test
    void findsWhatTheLibraryDropsReadsOtherwiseOrRefuses() throws Exception {
        // On code page 0 the token means MAX-BITRATE-DNLINK; the library takes it for APPID.
        List<Finding> findings = ofBody("030b6a00 45 c65b01 87360603 3700 01 01 01");
        assertEquals(List.of(Rule.LIBRARY_DROPS), rules(findings));
        assertEquals(8, findings.get(0).offset());
        assertEquals("wap-provisioningdoc / ACCESS 1 / MAX-BITRATE-DNLINK", findings.get(0).path());
        assertEquals(List.of(), ofBody("030b6a00 45 c65501 87360603 3700 01 87110603 6e00 01 01 01"));
        // A characteristic of a type that the library does not know, with all that is in it.
        assertEquals(List.of(Rule.UNKNOWN_NAME, Rule.LIBRARY_DROPS),
                rules(ofBody("030b6a00 45 c6500341505053525600 01 01 c65301 87230603 3100 01 01 01")));
        findings = ofBody("030b6a00 45 c65301 87110603 6e00 01 01 01");
        assertEquals(List.of(Rule.LIBRARY_REFUSES), rules(findings));
        assertTrue(findings.get(0).sentence().contains("NAPID (0x11) is no parameter of PORT"),
                findings.get(0).sentence());
        assertTrue(findings.get(0).remedy().contains("PORTNBR (0x23)"), findings.get(0).remedy());
    }

    @Test
    void findsWhatDepartsFromTheFormat() throws Exception {
        List<Finding> findings = ofBody("030b6a00 45 c65301 87230603 3100 01 01 01 00");
        assertEquals(List.of(Rule.FORMAT), rules(findings));
        assertEquals(17, findings.get(0).offset());
        assertEquals("these bytes stand behind the end of the document", findings.get(0).sentence());
        assertEquals(List.of(), ofBody("030b6a00 45 c65301 87230603 3100 01 01 01"));
        List<Rule> found = new ArrayList<>(rules(ofBody("030b6a00 45 46 070101 01 01")));
        found.remove(Rule.LIBRARY_REFUSES);
        assertTrue(found.contains(Rule.TYPE_MISSING) && found.contains(Rule.NAME_MISSING), found::toString);
    }

    @Test
    void aPushWithoutMacIsNotedUnlessTheUserTypesIt() throws Exception {
        byte[] body = ProvisioningEncoder.ofXml(xml(napdef()), EncodeOptions.NONE).body();
        List<Finding> findings = ProvisioningMessage.parsePush(Push.push(body)).lint();
        assertEquals(List.of(Rule.NO_MAC), rules(findings));
        assertEquals("push header", findings.get(0).path());
        assertEquals(-1, findings.get(0).offset());
        byte[] netwpin = Push.withShortType(0xB6, body).sec(0x80).bytes();
        assertEquals(List.of(Rule.NO_MAC), rules(ProvisioningMessage.parsePush(netwpin).lint()));
        byte[] userPinMac = Push.withShortType(0xB6, body).sec(0x83).bytes();
        assertEquals(List.of(), ProvisioningMessage.parsePush(userPinMac).lint());
        byte[] signed = Push.secured(0x81, "0".repeat(40), body);
        assertEquals(List.of(), ProvisioningMessage.parsePush(signed).lint());
        assertEquals(List.of(), ProvisioningMessage.parseBody(body).lint());
        List<Finding> refused = ProvisioningMessage.parsePush(Push.secured(0x81, "0", body)).lint();
        assertEquals(List.of(), rules(refused));
        byte[] other = Push.withShortType(0xB7, body).bytes();
        assertEquals(List.of(Rule.NO_MAC, Rule.LIBRARY_REFUSES), rules(ProvisioningMessage.parsePush(other).lint()));
    }

    @Test
    void tellsWhereAndWhatWouldBeRight() throws Exception {
        String document = "<wap-provisioningdoc>\n  " + pxaddr("IPV4", "010.0.20.001") + "\n</wap-provisioningdoc>";
        Finding finding = ProvisioningEncoder.lint(document.getBytes(StandardCharsets.UTF_8)).get(0);
        assertEquals(2, finding.line());
        assertEquals(1 + document.split("\n")[1].indexOf("<parm name='PXADDR'"), finding.column());
        assertEquals(-1, finding.offset());
        assertEquals("10.0.20.1", finding.remedy());
        assertEquals("PXADDR \"010.0.20.001\" is no address of IPV4", finding.sentence());
        assertEquals("wap-provisioningdoc / PXLOGICAL 1 / PXPHYSICAL 1 / PXADDR", finding.path());
        byte[] body = ProvisioningEncoder.ofXml(xml(proxy(port("x"))), EncodeOptions.NONE).body();
        ProvisioningDocument read = ProvisioningDocument.parse(body);
        finding = read.lint().get(0);
        Item parameter = read.characteristics().get(0).characteristics().get(0).parameters().get(0);
        assertEquals(parameter.offset(), finding.offset());
        assertEquals(0, finding.line());
        assertEquals(0, finding.column());
        assertEquals(finding, ProvisioningDocument.parse(body).lint().get(0));
        assertEquals(finding.hashCode(), ProvisioningDocument.parse(body).lint().get(0).hashCode());
        assertNotEquals(finding, ProvisioningEncoder.lint(xml(proxy(port("x")))).get(0));
        assertNotEquals(finding, ProvisioningDocument.parse(
                ProvisioningEncoder.ofXml(xml(proxy(port("y"))), EncodeOptions.NONE).body()).lint().get(0));
        assertFalse(finding.toString().contains("\"x\""), finding.toString());
        assertThrows(UnsupportedOperationException.class, () -> read.lint().clear());
    }

    @Test
    void theRulesHaveNamesOfTheirOwn() {
        for (Rule rule : Rule.values()) {
            assertEquals(rule, Rule.named(rule.ruleName()));
            assertTrue(rule.ruleName().matches("[a-z-]+"), rule.ruleName());
            assertTrue(rule.reference().contains("OMA"), rule.reference());
        }
        assertNull(Rule.named("NAPID_TWICE"));
    }

    /** In their structure, as the OMA documents show it: what they say is made up. */
    @Test
    void theStructuresOfTheOmaDocumentsGiveNoError() throws Exception {
        String port = in("PORT", parm("PORTNBR", "9203"), parm("SERVICE", "CO-SEC-WSP"));
        String account = in("NAPAUTHINFO", parm("AUTHTYPE", "PAP"), parm("AUTHNAME", "somebody"),
                parm("AUTHSECRET", "secret"));
        String validity = in("VALIDITY", parm("COUNTRY", "001"), parm("NETWORK", "01"));
        String dialled = in("NAPDEF", parm("NAPID", "dialled"), parm("BEARER", "GSM-CSD"),
                parm("NAME", "Dialled"), parm("NAP-ADDRESS", "+15550100"), parm("NAP-ADDRTYPE", "E164"),
                parm("CALLTYPE", "ANALOG-MODEM"), parm("LINKSPEED", "AUTOBAUDING"), account, validity);
        String messages = in("NAPDEF", parm("NAPID", "messages"), parm("BEARER", "GSM-SMS"),
                parm("NAME", "By message"), parm("NAP-ADDRESS", "+15550101"));
        String packets = in("NAPDEF", parm("NAPID", "INTERNET"), parm("BEARER", "GSM-GPRS"),
                parm("NAME", "By packets"), parm("NAP-ADDRESS", "packets.example"),
                parm("NAP-ADDRTYPE", "APN"), parm("DELIVERY-ERR-SDU", "3"), parm("SDU-ERROR-RATIO", "7A"),
                parm("TRAFFIC-CLASS", "60"), parm("MAX-BITRATE-DNLINK", "8"), account);
        String proxies = in("PXLOGICAL", parm("PROXY-ID", "www.example"), parm("NAME", "Proxy"),
                "<parm name='MASTER'/>", parm("STARTPAGE", "http://www.example/start"),
                in("PXAUTHINFO", parm("PXAUTH-TYPE", "HTTP-BASIC"), parm("PXAUTH-ID", "somebody"),
                        parm("PXAUTH-PW", "secret")),
                machine("one", parm("DOMAIN", " "), parm("PXADDR", "192.0.2.5"), parm("PXADDRTYPE", "IPV4"),
                        parm("TO-NAPID", "INTERNET"), parm("TO-NAPID", "dialled"), port),
                machine("two", parm("DOMAIN", "/SMS/"), parm("PXADDR", "15550102"),
                        parm("PXADDRTYPE", "E164"), parm("TO-NAPID", "messages"), port));
        String moving = in("NAPDEF", parm("NAPID", "moving"), parm("BEARER", "CDMA2000-1X-MOBILE-IP"),
                parm("NAME", "Moving"), parm("NAP-ADDRESS", "192.0.2.1"), parm("NAP-ADDRTYPE", "IPV4"),
                parm("MAX-NUM-RETRY", "2"), parm("FIRST-RETRY-TIMEOUT", "6"),
                parm("REREG-THRESHOLD", "30"), "<parm name='T-BIT'/>",
                in("NAPAUTHINFO", parm("AUTHTYPE", "MD5"), parm("AUTHNAME", "x@example"),
                        parm("AUTHSECRET", "y"), parm("AUTH-ENTITY", "HA"), parm("AUTH-ENTITY", "AAA")));
        String bootstrap = in("BOOTSTRAP", parm("CONTEXT-ALLOW", "0"), parm("PROVURL", "http://www.example/"));
        String vendor = in("VENDORCONFIG", parm("NAME", "PRODUCT"), parm("RINGTONES", "http://x.example/"));
        String mail = in("APPLICATION", parm("APPID", "25"), parm("PROVIDER-ID", "p"), parm("TO-NAPID", "moving"),
                in("APPADDR", parm("ADDR", "mail.example"), in("PORT", parm("PORTNBR", "25"), parm("SERVICE", "25"))),
                in("APPAUTH", parm("AAUTHTYPE", "LOGIN"), parm("AAUTHNAME", "x"), parm("AAUTHSECRET", "y")));
        String browser = in("APPLICATION", parm("APPID", "w2"), parm("TO-PROXY", "www.example"),
                in("RESOURCE", parm("URI", "http://x.example"), "<parm name='STARTPAGE'/>"));
        // The library knows the bearers of OMA, and not all of the quality of service.
        assertEquals(List.of(Rule.LIBRARY_REFUSES), found(proxies + dialled + messages + packets + vendor));
        assertEquals(List.of(), found(moving + bootstrap + mail));
        assertEquals(List.of(), found(proxies + dialled + messages + browser));
        for (String alone : new String[] {proxies, bootstrap + packets, mail, browser}) {
            assertNoError(alone, ProvisioningEncoder.lint(xml(alone)));
        }
    }

    @Test
    void theSamplesGiveNoError() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            for (Path file : files.toList()) {
                if (file.toString().endsWith(".push")) {
                    assertNoError(file.toString(),
                            ProvisioningMessage.parsePush(Files.readAllBytes(file)).lint());
                }
            }
        }
    }

    @Test
    @EnabledIfEnvironmentVariable(named = FieldMessage.VARIABLE, matches = ".+")
    void messagesFromElsewhereGiveNoError() throws Exception {
        for (FieldMessage field : FieldMessage.all()) {
            if (field.bytes != null) {
                assertNoError(field.id, ProvisioningMessage.parsePush(field.push()).lint());
            }
        }
    }

    private static void assertNoError(String name, List<Finding> findings) {
        for (Finding finding : findings) {
            assertNotEquals(Rule.Severity.ERROR, finding.rule().severity(), name + ": " + finding.sentence());
        }
    }

    @Test
    void anythingThatCanBeReadCanBeLookedThrough() throws Exception {
        Random random = new Random(16);
        int lookedThrough = 0;
        for (int i = 0; i < 3000; ++i) {
            byte[] body = new BodyGenerator(i, EnumSet.allOf(BodyGenerator.Part.class)).body();
            if (i % 2 == 0) {
                body[random.nextInt(body.length)] = (byte) random.nextInt();
            }
            try {
                int last = -1;
                for (Finding finding : ProvisioningDocument.parse(body).lint()) {
                    assertTrue(finding.offset() >= last && finding.offset() <= body.length);
                    assertFalse(finding.sentence().chars().anyMatch(c -> c < ' '), finding.sentence());
                    assertFalse(finding.sentence().contains("null") || finding.remedy().isEmpty());
                    assertTrue(finding.sentence().length() < 1000, finding.sentence());
                    last = finding.offset();
                }
                ++lookedThrough;
            } catch (ProvisioningException unreadable) {
                assertFalse(unreadable.getMessage().isEmpty());
            }
        }
        assertTrue(lookedThrough > 300, "bodies that could be read: " + lookedThrough);
    }

    /** Ports of 0 in a proxy of many machines, and paths among many: no pair of them is looked at. */
    @Test
    void manyFaultsTakeNoLongerThanTheyAre() throws Exception {
        String[] many = new String[4000];
        Arrays.setAll(many, i -> i % 2 == 0 ? port("0") : machine("m" + i, parm("PXADDR", "0.0.0.0")));
        assertEquals(2000, ProvisioningEncoder.lint(xml(proxy(many))).size());
        Arrays.setAll(many, i -> parm("ADDR", "010.0.0.1") + parm("TO-NAPID", "n" + i));
        assertEquals(8000, ProvisioningEncoder.lint(xml(application(many))).size());
        String dotted = "a.".repeat(20000) + "a";
        String numbers = "0".repeat(20000) + ":".repeat(20000);
        assertEquals(List.of(), found(nap("APN", dotted)));
        assertEquals(List.of(Rule.ADDRESS), found(nap("IPV6", numbers)));
        String deep = "<characteristic type='PXLOGICAL'>".repeat(8000) + "</characteristic>".repeat(8000);
        assertTrue(ProvisioningEncoder.lint(xml(deep)).size() >= 8000);
    }
}
