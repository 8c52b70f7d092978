package com.qvomacp.eng.parser;

import static com.qvomacp.support.Document.characteristic;
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
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** The proxies. */
class PxLogicalTest extends Natives {
    private static final String[] SERVICES = {
        "CO-WSP",
        "CL-SEC-WSP",
        "CO-SEC-WSP",
        "CL-SEC-WTA",
        "CO-SEC-WTA",
        "OTA-HTTP-TO",
        "OTA-HTTP-TLS-TO",
        "OTA-HTTP-PO",
        "OTA-HTTP-TLS-PO",
        "Unkown Service",
    };

    private static Element proxy(String id, Element... content) {
        return characteristic("PXLOGICAL", parm("PROXY-ID", id), every(content));
    }

    private static Element every(Element... content) {
        return document -> {
            for (Element element : content) {
                element.write(document);
            }
        };
    }

    @Test
    void answersTheArraysOfAProxy() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertArrayEquals(
                array(
                        "p-PROXY-ID",
                        "p-PROXY-PW",
                        "p-PPGAUTH-TYPE",
                        "p-PROXY-PROVIDER-ID",
                        "p-NAME",
                        "p-TRUST",
                        "p-MASTER",
                        "p-STARTPAGE",
                        null,
                        null,
                        null,
                        null,
                        null,
                        null),
                proxies.qvomacp_GetProxyData(1));
        assertArrayEquals(
                array("pa-PXAUTH-TYPE", "pa-PXAUTH-ID", "pa-PXAUTH-PW", null),
                proxies.qvomacp_GetPxAuthInfoData(1, 1));
        assertArrayEquals(
                array(
                        "h-PHYSICAL-PROXY-ID",
                        "h-PXADDR",
                        "NET_ADDR_IPV4",
                        "h-PXADDR-FQDN",
                        "h-WSP-VERSION",
                        "h-PUSHENABLED",
                        "h-PULLENABLED",
                        null),
                proxies.qvomacp_GetPxPhysicalData(1, 1));
    }

    @Test
    void answersTheTextsBelowAProxy() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertEquals("p-DOMAIN", proxies.qvomacp_GetPxDomainData(1, 1));
        assertEquals("pp-PORTNBR", proxies.qvomacp_GetPxPortData(1, 1));
        assertEquals("h-DOMAIN", proxies.qvomacp_GetPxPhsicalDomainData(1, 1, 1));
        assertEquals("h-TO-NAPID", proxies.qvomacp_GetPxPhysicalNapIdData(1, 1, 1));
        assertEquals("hp-PORTNBR", proxies.qvomacp_GetPxPhysicalPortData(1, 1, 1));
    }

    @Test
    void answersNullForWhatIsNotSet() {
        parse(
                characteristic(
                        "PXLOGICAL",
                        characteristic("PXAUTHINFO"),
                        characteristic("PORT"),
                        characteristic("PXPHYSICAL", characteristic("PORT"))));
        assertArrayEquals(new String[14], proxies.qvomacp_GetProxyData(1));
        assertArrayEquals(new String[4], proxies.qvomacp_GetPxAuthInfoData(1, 1));
        assertArrayEquals(new String[8], proxies.qvomacp_GetPxPhysicalData(1, 1));
        assertNull(proxies.qvomacp_GetPxPortData(1, 1));
        assertNull(proxies.qvomacp_GetPxPhysicalPortData(1, 1, 1));
        assertEquals(0, proxies.qvomacp_GetPxDomainCount(1));
        assertEquals(0, proxies.qvomacp_GetPxPortServiceCount(1, 1));
        assertEquals(0, proxies.qvomacp_GetPxPhysicalPortServiceCount(1, 1, 1));
        assertEquals(0, proxies.qvomacp_GetPxPhsicalNapIdCount(1, 1));
    }

    @Test
    void answersFourteenEmptyTextsForAProxyThatIsNotThere() {
        parse(proxy("A"), proxy("B"), proxy("C"));
        assertEquals(3, proxies.qvomacp_GetPxLogicalCount());
        assertEquals("C", proxies.qvomacp_GetProxyData(3)[0]);
        assertArrayEquals("\0".repeat(13).split("\0", -1), proxies.qvomacp_GetProxyData(4));
        assertArrayEquals("\0".repeat(13).split("\0", -1), proxies.qvomacp_GetProxyData(0));
    }

    @Test
    void answersNullForADomainOfAProxyThatIsNotThere() {
        parse(proxy("A", parm("DOMAIN", "d")));
        assertNull(proxies.qvomacp_GetPxDomainData(2, 1));
        assertNull(proxies.qvomacp_GetPxDomainData(0, 1));
        assertNull(proxies.qvomacp_GetPxDomainData(1, 2));
    }

    @Test
    void keepsEveryRecordInOrder() {
        parse(
                proxy("A"),
                proxy(
                        "B",
                        parms("1", "DOMAIN"),
                        parms("2", "DOMAIN"),
                        characteristic("PXAUTHINFO", parms("1", "PXAUTH-ID")),
                        characteristic("PXAUTHINFO", parms("2", "PXAUTH-ID")),
                        characteristic("PORT", parms("1", "PORTNBR")),
                        characteristic("PORT", parms("2", "PORTNBR")),
                        characteristic("PXPHYSICAL", parms("1", "PXADDR")),
                        characteristic(
                                "PXPHYSICAL",
                                parms("2", "PXADDR", "DOMAIN", "TO-NAPID"),
                                parms("3", "DOMAIN", "TO-NAPID"),
                                characteristic("PORT", parms("1", "PORTNBR")),
                                characteristic(
                                        "PORT", parms("2", "PORTNBR"), parms("x", "SERVICE")))));
        assertEquals(2, proxies.qvomacp_GetPxDomainCount(2));
        assertEquals("2DOMAIN", proxies.qvomacp_GetPxDomainData(2, 2));
        assertEquals(2, proxies.qvomacp_GetPxAuthInfoCount(2));
        assertEquals("2PXAUTH-ID", proxies.qvomacp_GetPxAuthInfoData(2, 2)[1]);
        assertEquals(2, proxies.qvomacp_GetPxPortCount(2));
        assertEquals("2PORTNBR", proxies.qvomacp_GetPxPortData(2, 2));
        assertEquals(2, proxies.qvomacp_GetPxPhysicalCount(2));
        assertEquals("2PXADDR", proxies.qvomacp_GetPxPhysicalData(2, 2)[1]);
        assertEquals(2, proxies.qvomacp_GetPxPhysicalDomainCount(2, 2));
        assertEquals("3DOMAIN", proxies.qvomacp_GetPxPhsicalDomainData(2, 2, 2));
        assertEquals(2, proxies.qvomacp_GetPxPhsicalNapIdCount(2, 2));
        assertEquals("3TO-NAPID", proxies.qvomacp_GetPxPhysicalNapIdData(2, 2, 2));
        assertEquals(2, proxies.qvomacp_GetPxPhysicalPortCount(2, 2));
        assertEquals("2PORTNBR", proxies.qvomacp_GetPxPhysicalPortData(2, 2, 2));
        assertEquals(1, proxies.qvomacp_GetPxPhysicalPortServiceCount(2, 2, 2));
    }

    @ParameterizedTest
    @CsvSource({
        "IPV4, NET_ADDR_IPV4",
        "IPV6, NET_ADDR_IPV6",
        "ipv6, NET_ADDR_IPV4",
        "IPV60, NET_ADDR_IPV4",
        "E164, NET_ADDR_IPV4",
        "'', NET_ADDR_IPV4",
    })
    void namesTheAddressType(String sent, String name) {
        parse(proxy("A", characteristic("PXPHYSICAL", parm("PXADDRTYPE", sent))));
        assertEquals(name, proxies.qvomacp_GetPxPhysicalData(1, 1)[2]);
    }

    @Test
    void namesTheAddressTypeOfAToken() {
        parse(
                proxy(
                        "A",
                        characteristic("PXPHYSICAL", parm("PXADDRTYPE", token(0x85))),
                        characteristic("PXPHYSICAL", parm("PXADDRTYPE", token(0x86))),
                        characteristic("PXPHYSICAL", parm("PXADDRTYPE", token(0x87))),
                        characteristic(
                                "PXPHYSICAL",
                                parm("PXADDRTYPE", (Object) new byte[] {(byte) 0x86}))));
        assertEquals("NET_ADDR_IPV4", proxies.qvomacp_GetPxPhysicalData(1, 1)[2]);
        assertEquals("NET_ADDR_IPV6", proxies.qvomacp_GetPxPhysicalData(1, 2)[2]);
        assertEquals("NET_ADDR_IPV4", proxies.qvomacp_GetPxPhysicalData(1, 3)[2]);
        assertEquals("NET_ADDR_IPV6", proxies.qvomacp_GetPxPhysicalData(1, 4)[2]);
    }

    @Test
    void namesServicesByTheirIndex() {
        Element[] services = new Element[12];
        Arrays.fill(services, parm("SERVICE", token(0xCA)));
        Element port = characteristic("PORT", parm("PORTNBR", "80"), every(services));
        parse(proxy("A", port, characteristic("PXPHYSICAL", port)));
        assertEquals(12, proxies.qvomacp_GetPxPortServiceCount(1, 1));
        assertEquals(12, proxies.qvomacp_GetPxPhysicalPortServiceCount(1, 1, 1));
        for (int s = 1; s <= SERVICES.length; ++s) {
            String name = SERVICES[s - 1];
            assertEquals(name, proxies.qvomacp_GetPxPortServiceData(1, 1, s));
            assertEquals(name, proxies.qvomacp_GetPxPhysicalPortServiceData(1, 1, 1, s));
        }
        assertNull(proxies.qvomacp_GetPxPortServiceData(1, 1, 11));
        assertNull(proxies.qvomacp_GetPxPortServiceData(1, 1, 12));
        assertNull(proxies.qvomacp_GetPxPhysicalPortServiceData(1, 1, 1, 11));
    }

    @Test
    void namesNoServiceThatIsNotThere() {
        parse(proxy("A", characteristic("PORT", parm("SERVICE", "OTA-HTTP-TO"))));
        assertEquals("CO-WSP", proxies.qvomacp_GetPxPortServiceData(1, 1, 1));
        assertNull(proxies.qvomacp_GetPxPortServiceData(1, 1, 2));
        assertNull(proxies.qvomacp_GetPxPortServiceData(1, 1, 0));
    }
}
