package com.qvomacp.eng.parser;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.parms;
import static com.qvomacp.support.Document.token;
import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document.Element;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Natives;
import java.util.Arrays;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The network access points. */
class NapDefTest extends Natives {
    private static final String[] BEFORE_TYPE = {"NAPID", "NAME", "INTERNET", "NAP-ADDRESS"};

    /** What follows the address type, reserved elements included. */
    private static final String[] BEHIND_TYPE = {
        "n-CALLTYPE",
        "n-LOCAL-ADDR",
        "n-LOCAL-ADDRTYPE",
        "n-LINKSPEED",
        "n-DNLINKSPEED",
        "n-LINGER",
        "n-DELIVERY-ERR-SDU",
        "n-DELIVERY-ORDER",
        "n-TRAFFIC-CLASS",
        "n-MAX-SDU-SIZE",
        "n-MAX-BITRATE-UPLINK",
        "n-MAX-BITRATE-DNLINK",
        null,
        null,
        null,
        null,
        null,
        null,
        "n-MAX-NUM-RETRY",
        "n-FIRST-RETRY-TIMEOUT",
        "n-REREG-THRESHOLD",
        "n-T-BIT",
        "empty",
    };

    /** The array of the full access point, with {@code type} on the element of its address type. */
    private static String[] napDef(String... typeAndEnd) {
        Stream<String> before = Arrays.stream(BEFORE_TYPE).map(name -> "n-" + name);
        Stream<String> type = Arrays.stream(typeAndEnd, 0, typeAndEnd.length - 1);
        Stream<String> end = Arrays.stream(typeAndEnd, typeAndEnd.length - 1, typeAndEnd.length);
        return Stream.of(before, type, Arrays.stream(BEHIND_TYPE), end)
                .flatMap(part -> part)
                .toArray(String[]::new);
    }

    private static Element accessPoint(String id, Element... content) {
        return characteristic("NAPDEF", parm("NAPID", id), every(content));
    }

    private static Element every(Element... content) {
        return document -> {
            for (Element element : content) {
                element.write(document);
            }
        };
    }

    @Test
    void keepsElementFourFreeForAnAddressTypeThatIsNotSet() {
        parse(Everything.withoutNapAddrType());
        String[] expected = napDef(null, null);
        assertEquals(29, expected.length);
        assertArrayEquals(expected, napDefs.qvomacp_GetPxNapDefData(1));
    }

    @Test
    void movesTheElementsDownForAnAddressTypeHeldAsText() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        String[] expected = Arrays.copyOf(napDef((String) null), 29);
        expected[27] = null;
        expected[28] = "";
        assertArrayEquals(expected, napDefs.qvomacp_GetPxNapDefData(1));
    }

    @ParameterizedTest
    @CsvSource({
        "0x85, 0x85", "0x86, 0x86", "0x87, 0x87", "0x88, 0x88",
        "0x89, 0x89", "0x8A, 0x8a", "0x8B, 0x8b", "0x8C, 0x8c",
    })
    void answersTheCodeOfAnAddressTypeHeldAsToken(String held, String code) {
        byte[] type = {Integer.decode(held).byteValue()};
        parse(accessPoint("A", parm("NAP-ADDRTYPE", (Object) type), parms("n-", "CALLTYPE")));
        String[] answer = napDefs.qvomacp_GetPxNapDefData(1);
        assertEquals(29, answer.length);
        assertEquals(code, answer[4]);
        assertEquals("n-CALLTYPE", answer[5]);
        assertNull(answer[28]);
    }

    @ParameterizedTest
    @ValueSource(ints = {0x85, 0x87, 0x89, 0x8C})
    void holdsTheNameOfAnAddressTypeSentAsToken(int sent) {
        parse(accessPoint("A", parm("NAP-ADDRTYPE", token(sent)), parms("n-", "CALLTYPE")));
        String[] answer = napDefs.qvomacp_GetPxNapDefData(1);
        assertEquals("n-CALLTYPE", answer[4]);
        assertEquals("", answer[28]);
    }

    @ParameterizedTest
    @ValueSource(ints = {0x84, 0x8D})
    void movesTheElementsDownForBytesBesideTheAddressTypes(int held) {
        byte[] type = {(byte) held};
        parse(accessPoint("A", parm("NAP-ADDRTYPE", (Object) type), parms("n-", "CALLTYPE")));
        String[] answer = napDefs.qvomacp_GetPxNapDefData(1);
        assertEquals("n-CALLTYPE", answer[4]);
        assertEquals("", answer[28]);
    }

    @Test
    void answersNullForWhatIsNotSet() {
        parse(
                characteristic(
                        "NAPDEF", characteristic("NAPAUTHINFO"), characteristic("VALIDITY")));
        assertArrayEquals(new String[29], napDefs.qvomacp_GetPxNapDefData(1));
        assertArrayEquals(new String[5], napDefs.qvomacp_GetPxNapAuthInfoData(1, 1));
        assertArrayEquals(new String[6], napDefs.qvomacp_GetPxValidityData(1, 1));
        assertEquals(0, napDefs.qvomacp_GetPxDnsAddrCount(1));
        assertEquals(0, napDefs.qvomacp_GetPxBearerCount(1));
        assertEquals(0, napDefs.qvomacp_GetPxNapAuthEntityCount(1, 1));
    }

    @Test
    void keepsInitWithoutAValueAlone() {
        parse(accessPoint("A", named("INIT")), accessPoint("B", named("INIT", "1")));
        assertEquals("empty", napDefs.qvomacp_GetPxNapDefData(1)[27]);
        assertNull(napDefs.qvomacp_GetPxNapDefData(2)[27]);
    }

    @Test
    void answersTheArraysBelowAnAccessPoint() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertArrayEquals(
                array("NONE", "na-AUTHNAME", "na-AUTHSECRET", null, null),
                napDefs.qvomacp_GetPxNapAuthInfoData(1, 1));
        assertEquals("na-AUTH-ENTITY", napDefs.qvomacp_GetPxAuthInfopAuthEntityData(1, 1, 1));
        assertArrayEquals(
                array("nv-COUNTRY", "nv-NETWORK", "nv-SID", "nv-SOC", "nv-VALIDUNTIL", null),
                napDefs.qvomacp_GetPxValidityData(1, 1));
        assertEquals("n-DNS-ADDR", napDefs.qvomacp_GetPxDnsAddrData(1, 1));
    }

    @Test
    void keepsEveryRecordInOrder() {
        parse(
                accessPoint("A"),
                accessPoint(
                        "B",
                        parms("1", "DNS-ADDR"),
                        parms("2", "DNS-ADDR"),
                        parm("BEARER", token(0xAA)),
                        parm("BEARER", token(0xBC)),
                        characteristic("NAPAUTHINFO", parms("1", "AUTHNAME")),
                        characteristic(
                                "NAPAUTHINFO",
                                parms("2", "AUTHNAME", "AUTH-ENTITY"),
                                parms("3", "AUTH-ENTITY")),
                        characteristic("VALIDITY", parms("1", "COUNTRY")),
                        characteristic("VALIDITY", parms("2", "COUNTRY"))));
        assertEquals(2, napDefs.qvomacp_GetPxNapDefCount());
        assertEquals(2, napDefs.qvomacp_GetPxDnsAddrCount(2));
        assertEquals("2DNS-ADDR", napDefs.qvomacp_GetPxDnsAddrData(2, 2));
        assertEquals(2, napDefs.qvomacp_GetPxBearerCount(2));
        assertEquals("GSM-CSD", napDefs.qvomacp_GetPxBearerData(2, 1));
        assertEquals("WLAN", napDefs.qvomacp_GetPxBearerData(2, 2));
        assertEquals(2, napDefs.qvomacp_GetPxNapAuthInfoCount(2));
        assertEquals("2AUTHNAME", napDefs.qvomacp_GetPxNapAuthInfoData(2, 2)[1]);
        assertEquals(2, napDefs.qvomacp_GetPxNapAuthEntityCount(2, 2));
        assertEquals("3AUTH-ENTITY", napDefs.qvomacp_GetPxAuthInfopAuthEntityData(2, 2, 2));
        assertEquals(2, napDefs.qvomacp_GetPxNapValidityCount(2));
        assertEquals("2COUNTRY", napDefs.qvomacp_GetPxValidityData(2, 2)[0]);
    }

    @Test
    void countsTheBearersOfTheFirstAccessPointForIndexesBelowOne() {
        parse(accessPoint("A", parm("BEARER", token(0xAA)), parm("BEARER", token(0xAB))));
        assertEquals(2, napDefs.qvomacp_GetPxBearerCount(1));
        assertEquals(2, napDefs.qvomacp_GetPxBearerCount(0));
        assertEquals(2, napDefs.qvomacp_GetPxBearerCount(-7));
        assertEquals(0, napDefs.qvomacp_GetPxBearerCount(2));
        assertNull(napDefs.qvomacp_GetPxBearerData(0, 1));
    }

    @ParameterizedTest
    @CsvSource({
        "0xA2, GSM-USSD",
        "0xA3, GSM-SMS",
        "0xA4, ANSI-136-GUTS",
        "0xA5, IS-95-CDMA-SMS",
        "0xA6, IS-95-CDMA-CSD",
        "0xA7, IS-95-CDMA-PACKET",
        "0xA8, ANSI-136-CSD",
        "0xA9, ANSI-136-GPRS",
        "0xAA, GSM-CSD",
        "0xAB, GSM-GPRS",
        "0xAC, AMPS-CDPD",
        "0xAD, PDC-CSD",
        "0xAE, PDC-PACKET",
        "0xAF, IDEN-SMS",
        "0xB0, IDEN-CSD",
        "0xB1, IDEN-PACKET",
        "0xB2, FLEX/REFLEX",
        "0xB3, PHS-SMS",
        "0xB4, PHS-CSD",
        "0xB5, TETRA-SDS",
        "0xB6, TETRA-PACKET",
        "0xB7, ANSI-136-GHOST",
        "0xB8, MOBITEX-MPAK",
        "0xB9, CDMA2000-1X-SIMPLE-IP",
        "0xBA, CDMA2000-1X-MOBILE-IP",
        "0xBB, 3G-GSM",
        "0xBC, WLAN",
        "0xA1, Unkown Bearer",
        "0xBD, Unkown Bearer",
        "0xFE, Unkown Bearer",
    })
    void namesABearerSentAsToken(String sent, String name) {
        parse(accessPoint("A", parm("BEARER", token(Integer.decode(sent)))));
        assertEquals(name, napDefs.qvomacp_GetPxBearerData(1, 1));
    }

    @Test
    void answersTheAddressForABearerSentAsText() {
        String address = "a".repeat(300);
        parse(
                accessPoint("A", parm("BEARER", "GSM-GPRS"), parm("NAP-ADDRESS", address)),
                accessPoint("B", parm("BEARER", "GSM-GPRS")));
        assertEquals(address, napDefs.qvomacp_GetPxBearerData(1, 1));
        assertNull(napDefs.qvomacp_GetPxBearerData(2, 1));
    }

    @ParameterizedTest
    @CsvSource({
        "0x9A, PAP, PAP",
        "0x9B, CHAP, CHAP",
        "0x9C, HTTP-BASIC, HTTP-BASIC",
        "0x9D, HTTP-DIGEST, HTTP-DIGEST",
        "0x9E, WTLS-SS, WTLS-SS",
        "0x9F, MD5, MD5",
        "0x99, pap, NONE",
        "0xA0, PAP2, NONE",
    })
    void namesAnAuthenticationType(String held, String text, String name) {
        byte[] type = {Integer.decode(held).byteValue()};
        parse(
                accessPoint(
                        "A",
                        characteristic("NAPAUTHINFO", parm("AUTHTYPE", text)),
                        characteristic("NAPAUTHINFO", parm("AUTHTYPE", (Object) type))));
        assertEquals(name, napDefs.qvomacp_GetPxNapAuthInfoData(1, 1)[0]);
        assertEquals(name, napDefs.qvomacp_GetPxNapAuthInfoData(1, 2)[0]);
    }

    @Test
    void namesAnAuthenticationTypeSentAsToken() {
        parse(
                accessPoint(
                        "A",
                        characteristic("NAPAUTHINFO", parm("AUTHTYPE", token(0x9B))),
                        characteristic("NAPAUTHINFO", parm("AUTHTYPE", token(0x9E)))));
        assertEquals("CHAP", napDefs.qvomacp_GetPxNapAuthInfoData(1, 1)[0]);
        assertEquals("NONE", napDefs.qvomacp_GetPxNapAuthInfoData(1, 2)[0], "held as WTLS_SS");
    }

    @Test
    void movesTheFirstAccessPoint() {
        parse(accessPoint("A"), accessPoint("B"), accessPoint("C"));
        napDefs.qvomacp_SetPxNapDefIndex(1);
        assertEquals(3, napDefs.qvomacp_GetPxNapDefCount());
        napDefs.qvomacp_SetPxNapDefIndex(2);
        assertEquals(2, napDefs.qvomacp_GetPxNapDefCount());
        assertEquals("B", napDefs.qvomacp_GetPxNapDefData(1)[0]);
        napDefs.qvomacp_SetPxNapDefIndex(2);
        assertEquals(1, napDefs.qvomacp_GetPxNapDefCount());
        assertEquals("C", napDefs.qvomacp_GetPxNapDefData(1)[0]);
        napDefs.qvomacp_SetPxNapDefIndex(5);
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
        napDefs.qvomacp_SetPxNapDefIndex(1);
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
    }

    @ParameterizedTest
    @ValueSource(ints = {0, -1, 4, Integer.MIN_VALUE, Integer.MAX_VALUE})
    void losesAllAccessPointsForAnIndexThatIsNotThere(int index) {
        parse(accessPoint("A"), accessPoint("B"), accessPoint("C"));
        napDefs.qvomacp_SetPxNapDefIndex(index);
        assertEquals(0, napDefs.qvomacp_GetPxNapDefCount());
        assertNull(napDefs.qvomacp_GetPxNapDefData(1));
        assertEquals(0, napDefs.qvomacp_GetPxBearerCount(0));
    }
}
