package com.qvomacp.eng.parser;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.parms;
import static com.qvomacp.support.Push.push;
import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Everything;
import com.qvomacp.support.Natives;
import java.util.function.BiFunction;
import java.util.function.IntUnaryOperator;
import org.junit.jupiter.api.Test;

/** BOOTSTRAP, CLIENTIDENTITY, VENDORCONFIG, ACCESS, WI-FI and voice over Wi-Fi. */
class OtherCharacteristicsTest extends Natives {
    @Test
    void answerTheirArrays() {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        assertArrayEquals(
                array("b-NAME", "b-COUNTRY", "b-PROVURL", "b-CONTEXT-ALLOW", null),
                bootstraps.qvomacp_GetBootstrapData(1));
        assertArrayEquals(
                array("v-NAME", "Vendor's own", "v-Vendor's own", null),
                vendorConfigs.qvomacp_GetPxVenderConfigData(1));
        assertArrayEquals(
                array(
                        "w-NETSSID",
                        "w-SECMODE",
                        "w-EAPMETHOD",
                        "w-EAPTYPE",
                        "w-USERNAME",
                        "w-ANONUSERNAME",
                        "w-PASSWORD",
                        "w-CACERT",
                        "w-USERCERT",
                        "w-PHASE1",
                        "w-AUTHALGORITHM",
                        "w-PRIORITY",
                        null),
                wifis.qvomacp_GetPxWifiData(1));
        assertArrayEquals(array("o-ePDG FQDN", null), voWifis.qvomacp_GetPxVoWifiData(1));
    }

    @Test
    void answerNullForWhatIsNotSet() {
        parse(
                characteristic("BOOTSTRAP"),
                characteristic("VENDORCONFIG"),
                characteristic("CLIENTIDENTITY"),
                characteristic("ACCESS"),
                characteristic("WI-FI"),
                characteristic("Vodafone VoWiFi"));
        assertArrayEquals(new String[5], bootstraps.qvomacp_GetBootstrapData(1));
        assertArrayEquals(new String[4], vendorConfigs.qvomacp_GetPxVenderConfigData(1));
        assertArrayEquals(new String[13], wifis.qvomacp_GetPxWifiData(1));
        assertArrayEquals(new String[2], voWifis.qvomacp_GetPxVoWifiData(1));
        assertNull(identity.qvomacp_GetPxClientIdentityData());
        assertEquals(1, accesses.qvomacp_GetPxCtxAccessCount());
        assertEquals(0, accesses.qvomacp_GetPxRuleCount(1));
    }

    @Test
    void areCounted() {
        parse(
                characteristic("BOOTSTRAP"),
                characteristic("BOOTSTRAP", parm("NAME", "B2")),
                characteristic("VENDORCONFIG"),
                characteristic("VENDORCONFIG", parm("NAME", "V2")),
                characteristic("WI-FI"),
                characteristic("WI-FI", named("NETSSID", "W2")),
                characteristic("Vodafone VoWiFi"),
                characteristic("Vodafone VoWiFi", named("ePDG FQDN", "O2")));
        assertEquals(2, bootstraps.qvomacp_GetPxBootstrapCount());
        assertEquals("B2", bootstraps.qvomacp_GetBootstrapData(2)[0]);
        assertEquals(2, vendorConfigs.qvomacp_GetPxVenderConfigCount());
        assertEquals("V2", vendorConfigs.qvomacp_GetPxVenderConfigData(2)[0]);
        assertEquals(2, wifis.qvomacp_GetPxWifiCount());
        assertEquals("W2", wifis.qvomacp_GetPxWifiData(2)[0]);
        assertEquals(2, voWifis.qvomacp_GetPxVoWifiCount());
        assertEquals("O2", voWifis.qvomacp_GetPxVoWifiData(2)[0]);
    }

    @Test
    void keepTheListsOfABootstrap() {
        parse(
                characteristic("BOOTSTRAP"),
                characteristic(
                        "BOOTSTRAP",
                        parms("1", "PROXY-ID", "NETWORK"),
                        parms("2", "PROXY-ID", "NETWORK"),
                        parms("3", "NETWORK")));
        assertList(
                bootstraps::qvomacp_GetPxProxyIdCount,
                bootstraps::qvomacp_GetPxProxyIdData,
                "1PROXY-ID",
                "2PROXY-ID");
        assertList(
                bootstraps::qvomacp_GetPxNetworkCount,
                bootstraps::qvomacp_GetPxNetworkData,
                "1NETWORK",
                "2NETWORK",
                "3NETWORK");
    }

    @Test
    void keepTheListsOfAnAccess() {
        parse(
                characteristic("ACCESS"),
                characteristic(
                        "ACCESS",
                        parms("1", "RULE", "APPID", "PORTNBR", "DOMAIN", "TO-NAPID", "TO-PROXY"),
                        parms("2", "RULE", "APPID", "PORTNBR", "DOMAIN", "TO-NAPID", "TO-PROXY"),
                        parms("3", "APPID")));
        assertEquals(2, accesses.qvomacp_GetPxCtxAccessCount());
        assertList(
                accesses::qvomacp_GetPxRuleCount,
                accesses::qvomacp_GetPxRuleData,
                "1RULE",
                "2RULE");
        assertList(
                accesses::qvomacp_GetPxAppIdCount,
                accesses::qvomacp_GetPxAppIdData,
                "1APPID",
                "2APPID",
                "3APPID");
        assertList(
                accesses::qvomacp_GetPxPortNbrCount,
                accesses::qvomacp_GetPxPortNbrData,
                "1PORTNBR",
                "2PORTNBR");
        assertList(
                accesses::qvomacp_GetPxAccessDomainCount,
                accesses::qvomacp_GetPxAccessDomainData,
                "1DOMAIN",
                "2DOMAIN");
        assertList(
                accesses::qvomacp_GetPxAccessToNapIdCount,
                accesses::qvomacp_GetPxAccessToNapIdData,
                "1TO-NAPID",
                "2TO-NAPID");
        assertList(
                accesses::qvomacp_GetPxAccessToProxyCount,
                accesses::qvomacp_GetPxAccessToProxyData,
                "1TO-PROXY",
                "2TO-PROXY");
    }

    /** The list of the second record is as given, and the first record has an empty one. */
    private static void assertList(
            IntUnaryOperator count, BiFunction<Integer, Integer, String> at, String... texts) {
        assertEquals(0, count.applyAsInt(0));
        assertEquals(0, count.applyAsInt(1));
        assertEquals(texts.length, count.applyAsInt(2));
        assertEquals(0, count.applyAsInt(3));
        for (int i = 1; i <= texts.length; ++i) {
            assertEquals(texts[i - 1], at.apply(2, i));
        }
        assertNull(at.apply(1, 1));
        assertNull(at.apply(3, 1));
        for (int never : new int[] {0, -1, texts.length + 1, Integer.MAX_VALUE}) {
            assertNull(at.apply(2, never), "element " + never);
        }
    }

    @Test
    void keepTheFirstClientIdentityAlone() {
        parse(
                characteristic("CLIENTIDENTITY", parm("CLIENT-ID", "first")),
                characteristic("CLIENTIDENTITY", parm("CLIENT-ID", "second")));
        assertEquals("first", identity.qvomacp_GetPxClientIdentityData());
    }

    @Test
    void keepTheLastParameterOfAVendor() {
        parse(
                characteristic("VENDORCONFIG", named("A", "1"), named("B", "2")),
                characteristic("VENDORCONFIG", named("A", "1"), named("B")),
                characteristic("VENDORCONFIG", named("C")));
        assertArrayEquals(
                array(null, "B", "2", null), vendorConfigs.qvomacp_GetPxVenderConfigData(1));
        assertArrayEquals(
                array(null, "B", "1", null), vendorConfigs.qvomacp_GetPxVenderConfigData(2));
        assertArrayEquals(
                array(null, "C", null, null), vendorConfigs.qvomacp_GetPxVenderConfigData(3));
    }

    @Test
    void refuseUnknownNamesOfTheExtensions() {
        for (String type : new String[] {"WI-FI", "Vodafone VoWiFi"}) {
            byte[] message = push(characteristic(type, named("netssid", "x")));
            assertFalse(parse(message, WHOLE_MESSAGE), type);
        }
        byte[] unnamed = push(characteristic("wi-fi", named("NETSSID", "x")));
        assertFalse(parse(unnamed, WHOLE_MESSAGE));
    }
}
