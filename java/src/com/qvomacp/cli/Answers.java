package com.qvomacp.cli;

import com.qvomacp.eng.parser.NativeLibrary;
import com.qvomacp.eng.parser.XCPCtxAccess;
import com.qvomacp.eng.parser.XCPCtxApplication;
import com.qvomacp.eng.parser.XCPCtxBootstrap;
import com.qvomacp.eng.parser.XCPCtxClientIdentity;
import com.qvomacp.eng.parser.XCPCtxNapDef;
import com.qvomacp.eng.parser.XCPCtxParser;
import com.qvomacp.eng.parser.XCPCtxPxLogical;
import com.qvomacp.eng.parser.XCPCtxVendorConfig;
import com.qvomacp.eng.parser.XCPCtxVoWifi;
import com.qvomacp.eng.parser.XCPCtxWifi;
import java.nio.ByteBuffer;
import java.nio.charset.StandardCharsets;
import java.util.function.IntConsumer;
import java.util.function.IntFunction;

/** Has a message parsed by the native library, and asks its 87 natives; nothing is kept of it. */
final class Answers {
    /** A push header that says no more than that a body follows. */
    private static final byte[] BARE_HEADER = {0x01, 0x06, 0x01, (byte) 0xB6};

    // The names of the elements of each array that is answered; - stands for one without a name.

    private static final String METHODS = "NETWPIN USERPIN USERNETWPIN USERPINMAC";
    private static final String PXLOGICAL =
            "PROXY-ID PROXY-PW PPGAUTH-TYPE PROXY-PROVIDER-ID NAME TRUST MASTER STARTPAGE";
    private static final String PXAUTHINFO = "PXAUTH-TYPE PXAUTH-ID PXAUTH-PW";
    private static final String PXPHYSICAL =
            "PHYSICAL-PROXY-ID PXADDR PXADDRTYPE PXADDR-FQDN WSP-VERSION PUSHENABLED PULLENABLED";
    private static final String NAPDEF =
            "NAPID NAME INTERNET NAP-ADDRESS NAP-ADDRTYPE CALLTYPE LOCAL-ADDR LOCAL-ADDRTYPE"
                    + " LINKSPEED DNLINKSPEED LINGER DELIVERY-ERR-SDU DELIVERY-ORDER TRAFFIC-CLASS"
                    + " MAX-SDU-SIZE MAX-BITRATE-UPLINK MAX-BITRATE-DNLINK - - - - - -"
                    + " MAX-NUM-RETRY FIRST-RETRY-TIMEOUT REREG-THRESHOLD T-BIT INIT";
    private static final String NAPAUTHINFO = "AUTHTYPE AUTHNAME AUTHSECRET";
    private static final String VALIDITY = "COUNTRY NETWORK SID SOC VALIDUNTIL";
    private static final String BOOTSTRAP = "NAME COUNTRY PROVURL CONTEXT-ALLOW";
    private static final String APPLICATION =
            "APPID PROVIDER-ID FROM NAME AACCEPT APROTOCOL INTERNET XCAP_AUID_DCS XCAP_AUID_PMS"
                    + " XCAP_AUID_CDMS XCAP_IMEI_HEADER XCAP_TID_HEADER";
    private static final String APPADDR = "ADDR ADDRTYPE";
    private static final String APPAUTH = "AAUTHLEVEL AAUTHTYPE AAUTHNAME AAUTHSECRET AAUTHDATA";
    private static final String RESOURCE =
            "URI NAME AACCEPT AAUTHTYPE AAUTHNAME AAUTHSECRET AAUTHDATA STARTPAGE";
    private static final String ROAMING = "SYNC-ALLOWED SYNC-DEFAULT";
    private static final String WIFI =
            "NETSSID SECMODE EAPMETHOD EAPTYPE USERNAME ANONUSERNAME PASSWORD CACERT USERCERT"
                    + " PHASE1 AUTHALGORITHM PRIORITY";

    private final XCPCtxParser parser = new XCPCtxParser();
    private final XCPCtxPxLogical proxies = new XCPCtxPxLogical();
    private final XCPCtxNapDef napDefs = new XCPCtxNapDef();
    private final XCPCtxBootstrap bootstraps = new XCPCtxBootstrap();
    private final XCPCtxClientIdentity identity = new XCPCtxClientIdentity();
    private final XCPCtxVendorConfig vendorConfigs = new XCPCtxVendorConfig();
    private final XCPCtxApplication applications = new XCPCtxApplication();
    private final XCPCtxAccess accesses = new XCPCtxAccess();
    private final XCPCtxWifi wifis = new XCPCtxWifi();
    private final XCPCtxVoWifi voWifis = new XCPCtxVoWifi();

    private final Comparison comparison;

    private Answers(Comparison comparison) {
        this.comparison = comparison;
    }

    /**
     * Asks everything of a message; leaves nothing behind in the library.
     *
     * @return false when the library refuses the message, and so answers nothing
     * @throws UnsatisfiedLinkError when the library cannot be loaded
     */
    static boolean ask(Held held, Comparison comparison) {
        NativeLibrary.load();
        Answers answers = new Answers(comparison);
        int length = BARE_HEADER.length + held.bytes.length;
        byte[] push = held.isPush ? held.bytes
                : ByteBuffer.allocate(length).put(BARE_HEADER).put(held.bytes).array();
        try {
            if (!answers.parser.qvomacp_parser(push, push.length, 0)) {
                return false;
            }
            if (held.isPush) {
                answers.header();
            }
            answers.characteristics();
            comparison.rest();
            return true;
        } finally {
            answers.parser.qvomacp_parser_del();
        }
    }

    private void header() {
        comparison.begin(Comparison.HEADER);
        comparison.fact("Content type", "" + parser.qvomacp_GetParserContentType());
        comparison.fact("Header length", "" + parser.qvomacp_GetParserHeaderLen());
        comparison.fact("Body length", "" + parser.qvomacp_GetParserBodyLen());
        int sec = parser.qvomacp_GetParserSEC();
        if (sec != 0) {
            int method = sec & 0x7F;
            String[] methods = METHODS.split(" ");
            comparison.fact("SEC", method < methods.length ? methods[method] : "UNKNOWN");
        }
        byte[] mac = parser.qvomacp_GetParserMAC();
        if (mac.length > 0) {
            comparison.fact("MAC", new String(mac, StandardCharsets.ISO_8859_1));
        }
        comparison.end();
    }

    private void characteristics() {
        each("PXLOGICAL", proxies.qvomacp_GetPxLogicalCount(), this::pxLogical);
        each("NAPDEF", napDefs.qvomacp_GetPxNapDefCount(), this::napDef);
        each("BOOTSTRAP", bootstraps.qvomacp_GetPxBootstrapCount(), this::bootstrap);
        String id = identity.qvomacp_GetPxClientIdentityData();
        each("CLIENTIDENTITY", id == null ? 0 : 1, only -> comparison.single("CLIENT-ID", id));
        each("VENDORCONFIG", vendorConfigs.qvomacp_GetPxVenderConfigCount(), this::vendorConfig);
        each("APPLICATION", applications.qvomacp_GetPxApplicationCount(), this::application);
        each("ACCESS", accesses.qvomacp_GetPxCtxAccessCount(), this::access);
        each("WI-FI", wifis.qvomacp_GetPxWifiCount(),
                w -> array(WIFI, wifis.qvomacp_GetPxWifiData(w)));
        each("Vodafone VoWiFi", voWifis.qvomacp_GetPxVoWifiCount(),
                w -> single("ePDG FQDN", voWifis.qvomacp_GetPxVoWifiData(w)[0]));
    }

    /** Tells the characteristics of one kind; indexes count from 1. */
    private void each(String type, int count, IntConsumer tell) {
        for (int i = 1; i <= count; ++i) {
            comparison.begin(type);
            tell.accept(i);
            comparison.end();
        }
    }

    /** Tells a parameter that may occur several times; indexes count from 1. */
    private void list(String name, int count, IntFunction<String> valueAt) {
        for (int i = 1; i <= count; ++i) {
            comparison.listed(name, valueAt.apply(i));
        }
    }

    private void single(String name, String value) {
        if (value != null) {
            comparison.single(name, value);
        }
    }

    private void array(String names, String[] values) {
        String[] all = names.split(" ");
        for (int i = 0; i < all.length; ++i) {
            single(all[i], all[i].equals("-") ? null : values[i]);
        }
    }

    private void pxLogical(int p) {
        array(PXLOGICAL, proxies.qvomacp_GetProxyData(p));
        list("DOMAIN", proxies.qvomacp_GetPxDomainCount(p),
                d -> proxies.qvomacp_GetPxDomainData(p, d));
        each("PXAUTHINFO", proxies.qvomacp_GetPxAuthInfoCount(p),
                a -> array(PXAUTHINFO, proxies.qvomacp_GetPxAuthInfoData(p, a)));
        each("PORT", proxies.qvomacp_GetPxPortCount(p), t -> {
            single("PORTNBR", proxies.qvomacp_GetPxPortData(p, t));
            list("SERVICE", proxies.qvomacp_GetPxPortServiceCount(p, t),
                    s -> proxies.qvomacp_GetPxPortServiceData(p, t, s));
        });
        each("PXPHYSICAL", proxies.qvomacp_GetPxPhysicalCount(p), h -> pxPhysical(p, h));
    }

    private void pxPhysical(int p, int h) {
        array(PXPHYSICAL, proxies.qvomacp_GetPxPhysicalData(p, h));
        list("DOMAIN", proxies.qvomacp_GetPxPhysicalDomainCount(p, h),
                d -> proxies.qvomacp_GetPxPhsicalDomainData(p, h, d));
        list("TO-NAPID", proxies.qvomacp_GetPxPhsicalNapIdCount(p, h),
                d -> proxies.qvomacp_GetPxPhysicalNapIdData(p, h, d));
        each("PORT", proxies.qvomacp_GetPxPhysicalPortCount(p, h), t -> {
            single("PORTNBR", proxies.qvomacp_GetPxPhysicalPortData(p, h, t));
            list("SERVICE", proxies.qvomacp_GetPxPhysicalPortServiceCount(p, h, t),
                    s -> proxies.qvomacp_GetPxPhysicalPortServiceData(p, h, t, s));
        });
    }

    /**
     * When the NAP-ADDRTYPE is held as a text, the array has no element for it, the later ones
     * stand one earlier, and the last one is not null.
     */
    private void napDef(int n) {
        String[] values = napDefs.qvomacp_GetPxNapDefData(n);
        boolean isShifted = values[values.length - 1] != null;
        array(isShifted ? NAPDEF.replace("NAP-ADDRTYPE ", "") : NAPDEF, values);
        list("BEARER", napDefs.qvomacp_GetPxBearerCount(n),
                d -> napDefs.qvomacp_GetPxBearerData(n, d));
        list("DNS-ADDR", napDefs.qvomacp_GetPxDnsAddrCount(n),
                d -> napDefs.qvomacp_GetPxDnsAddrData(n, d));
        each("NAPAUTHINFO", napDefs.qvomacp_GetPxNapAuthInfoCount(n), a -> {
            array(NAPAUTHINFO, napDefs.qvomacp_GetPxNapAuthInfoData(n, a));
            list("AUTH-ENTITY", napDefs.qvomacp_GetPxNapAuthEntityCount(n, a),
                    e -> napDefs.qvomacp_GetPxAuthInfopAuthEntityData(n, a, e));
        });
        each("VALIDITY", napDefs.qvomacp_GetPxNapValidityCount(n),
                v -> array(VALIDITY, napDefs.qvomacp_GetPxValidityData(n, v)));
    }

    private void bootstrap(int b) {
        array(BOOTSTRAP, bootstraps.qvomacp_GetBootstrapData(b));
        list("PROXY-ID", bootstraps.qvomacp_GetPxProxyIdCount(b),
                d -> bootstraps.qvomacp_GetPxProxyIdData(b, d));
        list("NETWORK", bootstraps.qvomacp_GetPxNetworkCount(b),
                d -> bootstraps.qvomacp_GetPxNetworkData(b, d));
    }

    /** The second and third element are the name and value of the vendor's own. */
    private void vendorConfig(int v) {
        String[] values = vendorConfigs.qvomacp_GetPxVenderConfigData(v);
        single("NAME", values[0]);
        if (values[1] != null) {
            comparison.single(values[1], values[2]);
        }
    }

    private void application(int a) {
        array(APPLICATION, applications.qvomacp_GetApplicationData(a));
        list("TO-PROXY", applications.qvomacp_GetPxToProxyCount(a),
                d -> applications.qvomacp_GetPxToProxyData(a, d));
        list("TO-NAPID", applications.qvomacp_GetPxNapIdCount(a),
                d -> applications.qvomacp_GetPxNapIdData(a, d));
        list("ADDR", applications.qvomacp_GetPxToAddrCount(a),
                d -> applications.qvomacp_GetPxToAddrData(a, d));
        each("APPADDR", applications.qvomacp_GetPxAppAddrCount(a), r -> appAddr(a, r));
        each("APPAUTH", applications.qvomacp_GetPxAppAuthCount(a),
                r -> array(APPAUTH, applications.qvomacp_GetPxAppAuthData(a, r)));
        each("RESOURCE", applications.qvomacp_GetPxResourceCount(a),
                r -> array(RESOURCE, applications.qvomacp_GetPxResourceData(a, r)));
        // The one that can be reached is the first application's.
        String[] roaming = a == 1 ? applications.qvomacp_GetPxRoamingData() : null;
        each("ROAMING", roaming == null ? 0 : 1, only -> array(ROAMING, roaming));
    }

    private void appAddr(int a, int r) {
        array(APPADDR, applications.qvomacp_GetPxAppAddrData(a, r));
        each("PORT", applications.qvomacp_GetPxAppPortCount(a, r), t -> {
            single("PORTNBR", applications.qvomacp_GetPxAppPortData(a, r, t));
            list("SERVICE", applications.qvomacp_GetPxServiceCount(a, r, t),
                    s -> applications.qvomacp_GetPxServiceData(a, r, t, s));
        });
    }

    private void access(int a) {
        list("RULE", accesses.qvomacp_GetPxRuleCount(a), d -> accesses.qvomacp_GetPxRuleData(a, d));
        list("APPID", accesses.qvomacp_GetPxAppIdCount(a),
                d -> accesses.qvomacp_GetPxAppIdData(a, d));
        list("PORTNBR", accesses.qvomacp_GetPxPortNbrCount(a),
                d -> accesses.qvomacp_GetPxPortNbrData(a, d));
        list("DOMAIN", accesses.qvomacp_GetPxAccessDomainCount(a),
                d -> accesses.qvomacp_GetPxAccessDomainData(a, d));
        list("TO-NAPID", accesses.qvomacp_GetPxAccessToNapIdCount(a),
                d -> accesses.qvomacp_GetPxAccessToNapIdData(a, d));
        list("TO-PROXY", accesses.qvomacp_GetPxAccessToProxyCount(a),
                d -> accesses.qvomacp_GetPxAccessToProxyData(a, d));
    }
}
