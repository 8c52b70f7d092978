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
import org.junit.jupiter.api.Test;

/** The applications. */
class ApplicationTest extends Natives {
    @Test
    void answersTheArraysOfAnApplication() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertArrayEquals(
                array(
                        "a-APPID",
                        "a-PROVIDER-ID",
                        "a-FROM",
                        "a-NAME",
                        "a-AACCEPT",
                        "a-APROTOCOL",
                        "a-INTERNET",
                        "a-XCAP_AUID_DCS",
                        "a-XCAP_AUID_PMS",
                        "a-XCAP_AUID_CDMS",
                        "a-XCAP_IMEI_HEADER",
                        "a-XCAP_TID_HEADER",
                        null),
                applications.qvomacp_GetApplicationData(1));
        assertArrayEquals(
                array("aa-ADDR", "aa-ADDRTYPE", null), applications.qvomacp_GetPxAppAddrData(1, 1));
        assertArrayEquals(
                array(
                        "CLIENT",
                        "au-AAUTHTYPE",
                        "au-AAUTHNAME",
                        "au-AAUTHSECRET",
                        "au-AAUTHDATA",
                        null),
                applications.qvomacp_GetPxAppAuthData(1, 1));
        assertArrayEquals(
                array(
                        "ar-URI",
                        "ar-NAME",
                        "ar-AACCEPT",
                        "ar-AAUTHTYPE",
                        "ar-AAUTHNAME",
                        "ar-AAUTHSECRET",
                        "ar-AAUTHDATA",
                        "ar-STARTPAGE",
                        null),
                applications.qvomacp_GetPxResourceData(1, 1));
        assertArrayEquals(
                array("am-SYNC-ALLOWED", "am-SYNC-DEFAULT", null),
                applications.qvomacp_GetPxRoamingData());
    }

    @Test
    void answersTheTextsBelowAnApplication() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertEquals("a-TO-PROXY", applications.qvomacp_GetPxToProxyData(1, 1));
        assertEquals("a-TO-NAPID", applications.qvomacp_GetPxNapIdData(1, 1));
        assertEquals("a-ADDR", applications.qvomacp_GetPxToAddrData(1, 1));
        assertEquals("ap-PORTNBR", applications.qvomacp_GetPxAppPortData(1, 1, 1));
        assertEquals("ap-SERVICE", applications.qvomacp_GetPxServiceData(1, 1, 1, 1));
    }

    @Test
    void answersNullForWhatIsNotSet() {
        parse(
                characteristic(
                        "APPLICATION",
                        characteristic("APPADDR", characteristic("PORT")),
                        characteristic("APPAUTH"),
                        characteristic("RESOURCE"),
                        characteristic("ROAMING")));
        assertArrayEquals(new String[13], applications.qvomacp_GetApplicationData(1));
        assertArrayEquals(new String[3], applications.qvomacp_GetPxAppAddrData(1, 1));
        assertArrayEquals(new String[6], applications.qvomacp_GetPxAppAuthData(1, 1));
        assertArrayEquals(new String[9], applications.qvomacp_GetPxResourceData(1, 1));
        assertArrayEquals(new String[3], applications.qvomacp_GetPxRoamingData());
        assertNull(applications.qvomacp_GetPxAppPortData(1, 1, 1));
        assertEquals(0, applications.qvomacp_GetPxServiceCount(1, 1, 1));
        assertEquals(0, applications.qvomacp_GetPxToProxyCount(1));
        assertEquals(0, applications.qvomacp_GetPxNapIdCount(1));
        assertEquals(0, applications.qvomacp_GetPxToAddrCount(1));
    }

    @Test
    void answersNullForAnApplicationThatIsNotThere() {
        parse(characteristic("APPLICATION", parm("APPID", "w2")));
        assertNull(applications.qvomacp_GetApplicationData(0));
        assertNull(applications.qvomacp_GetApplicationData(2));
    }

    @Test
    void keepsEveryRecordInOrder() {
        parse(
                characteristic("APPLICATION", parm("APPID", "25")),
                characteristic(
                        "APPLICATION",
                        parms("1", "TO-PROXY", "TO-NAPID", "ADDR"),
                        parms("2", "TO-PROXY", "TO-NAPID", "ADDR"),
                        characteristic("APPADDR", parms("1", "ADDR")),
                        characteristic(
                                "APPADDR",
                                parms("2", "ADDR"),
                                characteristic("PORT", parms("1", "PORTNBR")),
                                characteristic(
                                        "PORT",
                                        parms("2", "PORTNBR", "SERVICE"),
                                        parms("3", "SERVICE"))),
                        characteristic("APPAUTH", parms("1", "AAUTHNAME")),
                        characteristic("APPAUTH", parms("2", "AAUTHNAME")),
                        characteristic("RESOURCE", parms("1", "URI")),
                        characteristic("RESOURCE", parms("2", "URI"))));
        assertEquals(2, applications.qvomacp_GetPxApplicationCount());
        assertEquals(2, applications.qvomacp_GetPxToProxyCount(2));
        assertEquals("2TO-PROXY", applications.qvomacp_GetPxToProxyData(2, 2));
        assertEquals(2, applications.qvomacp_GetPxNapIdCount(2));
        assertEquals("2TO-NAPID", applications.qvomacp_GetPxNapIdData(2, 2));
        assertEquals(2, applications.qvomacp_GetPxToAddrCount(2));
        assertEquals("2ADDR", applications.qvomacp_GetPxToAddrData(2, 2));
        assertEquals(2, applications.qvomacp_GetPxAppAddrCount(2));
        assertEquals("2ADDR", applications.qvomacp_GetPxAppAddrData(2, 2)[0]);
        assertEquals(2, applications.qvomacp_GetPxAppPortCount(2, 2));
        assertEquals("2PORTNBR", applications.qvomacp_GetPxAppPortData(2, 2, 2));
        assertEquals(2, applications.qvomacp_GetPxServiceCount(2, 2, 2));
        assertEquals("3SERVICE", applications.qvomacp_GetPxServiceData(2, 2, 2, 2));
        assertEquals(2, applications.qvomacp_GetPxAppAuthCount(2));
        assertEquals("2AAUTHNAME", applications.qvomacp_GetPxAppAuthData(2, 2)[2]);
        assertEquals(2, applications.qvomacp_GetPxResourceCount(2));
        assertEquals("2URI", applications.qvomacp_GetPxResourceData(2, 2)[0]);
    }

    @Test
    void namesTheAuthenticationLevel() {
        parse(
                characteristic(
                        "APPLICATION",
                        level("APPSRV"),
                        level("appsrv"),
                        level("CLIENT"),
                        level("client"),
                        level("OBEX"),
                        level(token(0x8D)),
                        level(token(0x8E)),
                        level((Object) new byte[] {(byte) 0x8D, 'x'})));
        String[] expected = {
            "APPSRV", null, "CLIENT", "CLIENT", null, "APPSRV", null, "APPSRV",
        };
        for (int i = 0; i < expected.length; ++i) {
            assertEquals(expected[i], applications.qvomacp_GetPxAppAuthData(1, i + 1)[0], "" + i);
        }
    }

    private static Element level(Object... value) {
        return characteristic("APPAUTH", parm("AAUTHLEVEL", value));
    }

    @Test
    void joinsTheAuthenticationTypes() {
        parse(
                characteristic(
                        "APPLICATION",
                        characteristic(
                                "APPAUTH", parm("AAUTHTYPE", token(0x91), token(0x90), "BASIC"))));
        assertEquals("HTTP,BASIC", applications.qvomacp_GetPxAppAuthData(1, 1)[1]);
    }

    @Test
    void marksAStartPageWithoutAValue() {
        parse(
                characteristic(
                        "APPLICATION",
                        characteristic("RESOURCE", parm("STARTPAGE")),
                        characteristic("RESOURCE", parm("STARTPAGE", ""))));
        assertEquals("startpage", applications.qvomacp_GetPxResourceData(1, 1)[7]);
        assertEquals("", applications.qvomacp_GetPxResourceData(1, 2)[7]);
    }

    @Test
    void dropsParametersWithUnknownNames() {
        parse(
                characteristic(
                        "APPLICATION", named("from", "x"), named("OTHER", "y"), named("FROM")));
        assertArrayEquals(new String[13], applications.qvomacp_GetApplicationData(1));
    }

    @Test
    void reachesTheFirstRoamingOfTheFirstApplicationAlone() {
        Element roaming = characteristic("ROAMING", named("SYNC-ALLOWED", "second"));
        parse(
                characteristic("APPLICATION", parm("APPID", "1")),
                characteristic("APPLICATION", roaming));
        assertNull(applications.qvomacp_GetPxRoamingData());
        delete();
        parse(
                characteristic(
                        "APPLICATION",
                        characteristic("ROAMING", named("SYNC-ALLOWED", "first")),
                        roaming),
                characteristic("APPLICATION", roaming));
        assertArrayEquals(array("first", null, null), applications.qvomacp_GetPxRoamingData());
    }
}
