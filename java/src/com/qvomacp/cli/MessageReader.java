package com.qvomacp.cli;

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
import java.nio.charset.StandardCharsets;
import java.util.List;
import java.util.function.IntFunction;

/** Parses a push with the library and asks the natives for everything that it sets. */
final class MessageReader {
    private static final int WHOLE_MESSAGE = 0;
    private static final int HEADER_ONLY = 1;

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

    /**
     * Reads a message; leaves nothing behind in the library, whether the message is taken or not.
     */
    Message read(Source source) throws RefusedException {
        byte[] push = source.push();
        try {
            if (!parser.qvomacp_parser(push, push.length, WHOLE_MESSAGE)) {
                throw new RefusedException(parser.qvomacp_parser(push, push.length, HEADER_ONLY));
            }
            Header header = header();
            return new Message(
                    source.isPush ? header : null, header.bodyLength, characteristics());
        } finally {
            parser.qvomacp_parser_del();
        }
    }

    /** Reads the push header alone. */
    Header readHeader(byte[] push) throws RefusedException {
        try {
            if (!parser.qvomacp_parser(push, push.length, HEADER_ONLY)) {
                throw new RefusedException(false);
            }
            return header();
        } finally {
            parser.qvomacp_parser_del();
        }
    }

    private Header header() {
        return new Header(
                parser.qvomacp_GetParserContentType(),
                parser.qvomacp_GetParserHeaderLen(),
                parser.qvomacp_GetParserBodyLen(),
                parser.qvomacp_GetParserSEC(),
                new String(parser.qvomacp_GetParserMAC(), StandardCharsets.ISO_8859_1));
    }

    private List<Characteristic> characteristics() {
        Characteristic document = new Characteristic("");
        document.nest(proxies.qvomacp_GetPxLogicalCount(), this::pxLogical);
        document.nest(napDefs.qvomacp_GetPxNapDefCount(), this::napDef);
        document.nest(bootstraps.qvomacp_GetPxBootstrapCount(), this::bootstrap);
        document.nest(clientIdentityCount(), this::clientIdentity);
        document.nest(vendorConfigs.qvomacp_GetPxVenderConfigCount(), this::vendorConfig);
        document.nest(applications.qvomacp_GetPxApplicationCount(), this::application);
        document.nest(accesses.qvomacp_GetPxCtxAccessCount(), this::access);
        document.nest(wifis.qvomacp_GetPxWifiCount(), this::wifi);
        document.nest(voWifis.qvomacp_GetPxVoWifiCount(), this::voWifi);
        return document.characteristics;
    }

    private Characteristic pxLogical(int p) {
        return new Characteristic("PXLOGICAL")
                .addAll(Layout.PXLOGICAL, proxies.qvomacp_GetProxyData(p))
                .addList(
                        "DOMAIN",
                        proxies.qvomacp_GetPxDomainCount(p),
                        d -> proxies.qvomacp_GetPxDomainData(p, d))
                .nest(proxies.qvomacp_GetPxAuthInfoCount(p), a -> pxAuthInfo(p, a))
                .nest(proxies.qvomacp_GetPxPortCount(p), t -> pxLogicalPort(p, t))
                .nest(proxies.qvomacp_GetPxPhysicalCount(p), h -> pxPhysical(p, h));
    }

    private Characteristic pxAuthInfo(int p, int a) {
        return new Characteristic("PXAUTHINFO")
                .addAll(Layout.PXAUTHINFO, proxies.qvomacp_GetPxAuthInfoData(p, a));
    }

    private Characteristic pxLogicalPort(int p, int t) {
        return port(
                proxies.qvomacp_GetPxPortData(p, t),
                proxies.qvomacp_GetPxPortServiceCount(p, t),
                s -> proxies.qvomacp_GetPxPortServiceData(p, t, s));
    }

    private Characteristic pxPhysical(int p, int h) {
        return new Characteristic("PXPHYSICAL")
                .addAll(Layout.PXPHYSICAL, proxies.qvomacp_GetPxPhysicalData(p, h))
                .addList(
                        "DOMAIN",
                        proxies.qvomacp_GetPxPhysicalDomainCount(p, h),
                        d -> proxies.qvomacp_GetPxPhsicalDomainData(p, h, d))
                .addList(
                        "TO-NAPID",
                        proxies.qvomacp_GetPxPhsicalNapIdCount(p, h),
                        d -> proxies.qvomacp_GetPxPhysicalNapIdData(p, h, d))
                .nest(proxies.qvomacp_GetPxPhysicalPortCount(p, h), t -> pxPhysicalPort(p, h, t));
    }

    private Characteristic pxPhysicalPort(int p, int h, int t) {
        return port(
                proxies.qvomacp_GetPxPhysicalPortData(p, h, t),
                proxies.qvomacp_GetPxPhysicalPortServiceCount(p, h, t),
                s -> proxies.qvomacp_GetPxPhysicalPortServiceData(p, h, t, s));
    }

    /** A PORT, wherever it stands. */
    private static Characteristic port(
            String portNbr, int serviceCount, IntFunction<String> serviceAt) {
        return new Characteristic("PORT")
                .addAll(Layout.PORT, new String[] {portNbr})
                .addList("SERVICE", serviceCount, serviceAt);
    }

    private Characteristic napDef(int n) {
        Characteristic napDef = new Characteristic("NAPDEF");
        addNapDefParms(napDef, napDefs.qvomacp_GetPxNapDefData(n));
        return napDef
                .addList(
                        "BEARER",
                        napDefs.qvomacp_GetPxBearerCount(n),
                        d -> napDefs.qvomacp_GetPxBearerData(n, d))
                .addList(
                        "DNS-ADDR",
                        napDefs.qvomacp_GetPxDnsAddrCount(n),
                        d -> napDefs.qvomacp_GetPxDnsAddrData(n, d))
                .nest(napDefs.qvomacp_GetPxNapAuthInfoCount(n), a -> napAuthInfo(n, a))
                .nest(napDefs.qvomacp_GetPxNapValidityCount(n), v -> validity(n, v));
    }

    /**
     * Adds the parameters of an access point. When its NAP-ADDRTYPE is held as a text, the array
     * has no element for it, the later parameters stand one element earlier, and the last element
     * is not null: the type is then set, but not told.
     */
    private static void addNapDefParms(Characteristic napDef, String[] values) {
        boolean shifted = values[values.length - 1] != null;
        int at = 0;
        for (int i = 0; i < Layout.NAPDEF.length; ++i) {
            String name = Layout.NAPDEF[i];
            if (shifted && i == Layout.NAP_ADDRTYPE) {
                napDef.add(name, null);
                continue;
            }
            String value = values[at++];
            if (name != null && value != null) {
                napDef.add(name, value);
            }
        }
    }

    private Characteristic napAuthInfo(int n, int a) {
        return new Characteristic("NAPAUTHINFO")
                .addAll(Layout.NAPAUTHINFO, napDefs.qvomacp_GetPxNapAuthInfoData(n, a))
                .addList(
                        "AUTH-ENTITY",
                        napDefs.qvomacp_GetPxNapAuthEntityCount(n, a),
                        e -> napDefs.qvomacp_GetPxAuthInfopAuthEntityData(n, a, e));
    }

    private Characteristic validity(int n, int v) {
        return new Characteristic("VALIDITY")
                .addAll(Layout.VALIDITY, napDefs.qvomacp_GetPxValidityData(n, v));
    }

    private Characteristic bootstrap(int b) {
        return new Characteristic("BOOTSTRAP")
                .addAll(Layout.BOOTSTRAP, bootstraps.qvomacp_GetBootstrapData(b))
                .addList(
                        "PROXY-ID",
                        bootstraps.qvomacp_GetPxProxyIdCount(b),
                        d -> bootstraps.qvomacp_GetPxProxyIdData(b, d))
                .addList(
                        "NETWORK",
                        bootstraps.qvomacp_GetPxNetworkCount(b),
                        d -> bootstraps.qvomacp_GetPxNetworkData(b, d));
    }

    /** The library counts no CLIENTIDENTITY; there is one when it answers a CLIENT-ID. */
    private int clientIdentityCount() {
        return identity.qvomacp_GetPxClientIdentityData() == null ? 0 : 1;
    }

    private Characteristic clientIdentity(int only) {
        return new Characteristic("CLIENTIDENTITY")
                .add("CLIENT-ID", identity.qvomacp_GetPxClientIdentityData());
    }

    /** A VENDORCONFIG; the second and third element are the name and value of the vendor's own. */
    private Characteristic vendorConfig(int v) {
        String[] values = vendorConfigs.qvomacp_GetPxVenderConfigData(v);
        Characteristic vendorConfig = new Characteristic("VENDORCONFIG");
        vendorConfig.addAll(Layout.VENDORCONFIG, values);
        if (values[1] != null) {
            vendorConfig.add(values[1], values[2]);
        }
        return vendorConfig;
    }

    private Characteristic application(int a) {
        Characteristic application = new Characteristic("APPLICATION");
        application
                .addAll(Layout.APPLICATION, applications.qvomacp_GetApplicationData(a))
                .addList(
                        "TO-PROXY",
                        applications.qvomacp_GetPxToProxyCount(a),
                        d -> applications.qvomacp_GetPxToProxyData(a, d))
                .addList(
                        "TO-NAPID",
                        applications.qvomacp_GetPxNapIdCount(a),
                        d -> applications.qvomacp_GetPxNapIdData(a, d))
                .addList(
                        "ADDR",
                        applications.qvomacp_GetPxToAddrCount(a),
                        d -> applications.qvomacp_GetPxToAddrData(a, d))
                .nest(applications.qvomacp_GetPxAppAddrCount(a), r -> appAddr(a, r))
                .nest(applications.qvomacp_GetPxAppAuthCount(a), r -> appAuth(a, r))
                .nest(applications.qvomacp_GetPxResourceCount(a), r -> resource(a, r));
        if (a == 1) {
            addRoaming(application);
        }
        return application;
    }

    private Characteristic appAddr(int a, int r) {
        return new Characteristic("APPADDR")
                .addAll(Layout.APPADDR, applications.qvomacp_GetPxAppAddrData(a, r))
                .nest(applications.qvomacp_GetPxAppPortCount(a, r), t -> appAddrPort(a, r, t));
    }

    private Characteristic appAddrPort(int a, int r, int t) {
        return port(
                applications.qvomacp_GetPxAppPortData(a, r, t),
                applications.qvomacp_GetPxServiceCount(a, r, t),
                s -> applications.qvomacp_GetPxServiceData(a, r, t, s));
    }

    private Characteristic appAuth(int a, int r) {
        return new Characteristic("APPAUTH")
                .addAll(Layout.APPAUTH, applications.qvomacp_GetPxAppAuthData(a, r));
    }

    private Characteristic resource(int a, int r) {
        return new Characteristic("RESOURCE")
                .addAll(Layout.RESOURCE, applications.qvomacp_GetPxResourceData(a, r));
    }

    /** Adds the one ROAMING that can be reached, which is the first application's. */
    private void addRoaming(Characteristic firstApplication) {
        String[] values = applications.qvomacp_GetPxRoamingData();
        if (values != null) {
            firstApplication.characteristics.add(
                    new Characteristic("ROAMING").addAll(Layout.ROAMING, values));
        }
    }

    private Characteristic access(int a) {
        return new Characteristic("ACCESS")
                .addList(
                        "RULE",
                        accesses.qvomacp_GetPxRuleCount(a),
                        d -> accesses.qvomacp_GetPxRuleData(a, d))
                .addList(
                        "APPID",
                        accesses.qvomacp_GetPxAppIdCount(a),
                        d -> accesses.qvomacp_GetPxAppIdData(a, d))
                .addList(
                        "PORTNBR",
                        accesses.qvomacp_GetPxPortNbrCount(a),
                        d -> accesses.qvomacp_GetPxPortNbrData(a, d))
                .addList(
                        "DOMAIN",
                        accesses.qvomacp_GetPxAccessDomainCount(a),
                        d -> accesses.qvomacp_GetPxAccessDomainData(a, d))
                .addList(
                        "TO-NAPID",
                        accesses.qvomacp_GetPxAccessToNapIdCount(a),
                        d -> accesses.qvomacp_GetPxAccessToNapIdData(a, d))
                .addList(
                        "TO-PROXY",
                        accesses.qvomacp_GetPxAccessToProxyCount(a),
                        d -> accesses.qvomacp_GetPxAccessToProxyData(a, d));
    }

    private Characteristic wifi(int w) {
        return new Characteristic("WI-FI").addAll(Layout.WIFI, wifis.qvomacp_GetPxWifiData(w));
    }

    private Characteristic voWifi(int w) {
        return new Characteristic("Vodafone VoWiFi")
                .addAll(Layout.VOWIFI, voWifis.qvomacp_GetPxVoWifiData(w));
    }
}
