package com.qvomacp.eng.omacp;

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
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.HashSet;
import java.util.List;
import java.util.Set;

/** Parses a message with the library and asks the natives once for everything that it sets. */
final class MessageReader {
    /** Held around every call of a native: the library holds one message for the whole process. */
    static final Object LOCK = XCPCtxParser.class;

    private static final int WHOLE_MESSAGE = 0;
    private static final int HEADER_ONLY = 1;

    /** How many names the natives have for the services of a proxy's port. */
    private static final int SERVICE_NAMES = 10;

    private static final int NAP_ADDRTYPE = 4;

    /** Every answer about a bearer that stands for a token. */
    private static final Set<String> BEARERS =
            new HashSet<>(
                    Arrays.asList(
                            "GSM-USSD",
                            "GSM-SMS",
                            "ANSI-136-GUTS",
                            "IS-95-CDMA-SMS",
                            "IS-95-CDMA-CSD",
                            "IS-95-CDMA-PACKET",
                            "ANSI-136-CSD",
                            "ANSI-136-GPRS",
                            "GSM-CSD",
                            "GSM-GPRS",
                            "AMPS-CDPD",
                            "PDC-CSD",
                            "PDC-PACKET",
                            "IDEN-SMS",
                            "IDEN-CSD",
                            "IDEN-PACKET",
                            "FLEX/REFLEX",
                            "PHS-SMS",
                            "PHS-CSD",
                            "TETRA-SDS",
                            "TETRA-PACKET",
                            "ANSI-136-GHOST",
                            "MOBITEX-MPAK",
                            "CDMA2000-1X-SIMPLE-IP",
                            "CDMA2000-1X-MOBILE-IP",
                            "3G-GSM",
                            "WLAN",
                            "Unkown Bearer"));

    /** What a native answers for an index, counted from 1. */
    private interface Query<T> {
        T at(int index);
    }

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

    ProvisioningMessage parse(byte[] message) throws ProvisioningException {
        prepare(message);
        synchronized (LOCK) {
            try {
                if (parser.qvomacp_parser(message, message.length, WHOLE_MESSAGE)) {
                    return message(header());
                }
                if (parser.qvomacp_parser(message, message.length, HEADER_ONLY)) {
                    PushHeader header = header();
                    throw Refusal.ofBody(header, NativeDecoder.ask(header.getBody()));
                }
                throw Refusal.ofHeader(message);
            } finally {
                parser.qvomacp_parser_del();
            }
        }
    }

    PushHeader parseHeader(byte[] message) throws ProvisioningException {
        prepare(message);
        synchronized (LOCK) {
            try {
                if (parser.qvomacp_parser(message, message.length, HEADER_ONLY)) {
                    return header();
                }
                throw Refusal.ofHeader(message);
            } finally {
                parser.qvomacp_parser_del();
            }
        }
    }

    private static void prepare(byte[] message) throws ProvisioningException {
        ProvisioningException refusal = Refusal.ofOutline(message);
        if (refusal != null) {
            throw refusal;
        }
        NativeLibrary.load();
    }

    private PushHeader header() {
        byte[] mac = parser.qvomacp_GetParserMAC();
        return new PushHeader(
                ContentType.ofCode(parser.qvomacp_GetParserContentType()),
                parser.qvomacp_GetParserHeaderLen(),
                parser.qvomacp_GetParserSEC(),
                mac.length == 0 ? null : new String(mac, StandardCharsets.ISO_8859_1),
                parser.qvomacp_GetParserBody());
    }

    private ProvisioningMessage message(PushHeader header) {
        return new ProvisioningMessage(
                header,
                identity.qvomacp_GetPxClientIdentityData(),
                list(proxies.qvomacp_GetPxLogicalCount(), this::proxy),
                list(napDefs.qvomacp_GetPxNapDefCount(), this::accessPoint),
                list(bootstraps.qvomacp_GetPxBootstrapCount(), this::bootstrap),
                list(
                        vendorConfigs.qvomacp_GetPxVenderConfigCount(),
                        v -> new VendorConfiguration(
                                vendorConfigs.qvomacp_GetPxVenderConfigData(v))),
                list(applications.qvomacp_GetPxApplicationCount(), this::application),
                list(accesses.qvomacp_GetPxCtxAccessCount(), this::accessRule),
                list(
                        wifis.qvomacp_GetPxWifiCount(),
                        w -> new Wifi(wifis.qvomacp_GetPxWifiData(w))),
                list(
                        voWifis.qvomacp_GetPxVoWifiCount(),
                        v -> new VoWifi(voWifis.qvomacp_GetPxVoWifiData(v))));
    }

    /** Everything that a query answers for 1 to {@code count}, but for null. */
    private static <T> List<T> list(int count, Query<T> query) {
        if (count <= 0) {
            return Collections.emptyList();
        }
        List<T> answers = new ArrayList<>(count);
        for (int i = 1; i <= count; ++i) {
            T answer = query.at(i);
            if (answer != null) {
                answers.add(answer);
            }
        }
        return Collections.unmodifiableList(answers);
    }

    private Proxy proxy(int p) {
        return new Proxy(
                proxies.qvomacp_GetProxyData(p),
                list(
                        proxies.qvomacp_GetPxDomainCount(p),
                        d -> proxies.qvomacp_GetPxDomainData(p, d)),
                list(
                        proxies.qvomacp_GetPxAuthInfoCount(p),
                        a -> new ProxyAuthentication(proxies.qvomacp_GetPxAuthInfoData(p, a))),
                list(
                        proxies.qvomacp_GetPxPortCount(p),
                        t -> proxyPort(
                                proxies.qvomacp_GetPxPortData(p, t),
                                proxies.qvomacp_GetPxPortServiceCount(p, t),
                                s -> proxies.qvomacp_GetPxPortServiceData(p, t, s))),
                list(proxies.qvomacp_GetPxPhysicalCount(p), h -> physicalProxy(p, h)));
    }

    private PhysicalProxy physicalProxy(int p, int h) {
        return new PhysicalProxy(
                proxies.qvomacp_GetPxPhysicalData(p, h),
                list(
                        proxies.qvomacp_GetPxPhysicalDomainCount(p, h),
                        d -> proxies.qvomacp_GetPxPhsicalDomainData(p, h, d)),
                list(
                        proxies.qvomacp_GetPxPhsicalNapIdCount(p, h),
                        n -> proxies.qvomacp_GetPxPhysicalNapIdData(p, h, n)),
                list(
                        proxies.qvomacp_GetPxPhysicalPortCount(p, h),
                        t -> proxyPort(
                                proxies.qvomacp_GetPxPhysicalPortData(p, h, t),
                                proxies.qvomacp_GetPxPhysicalPortServiceCount(p, h, t),
                                s -> proxies.qvomacp_GetPxPhysicalPortServiceData(p, h, t, s))));
    }

    private static ProxyPort proxyPort(String number, int serviceCount, Query<String> services) {
        int named = Math.min(serviceCount, SERVICE_NAMES);
        return new ProxyPort(new String[] {number}, serviceCount, list(named, services));
    }

    private AccessPoint accessPoint(int n) {
        String[] answered = napDefs.qvomacp_GetPxNapDefData(n);
        boolean addressTypeHidden = answered[answered.length - 1] != null;
        int bearerCount = napDefs.qvomacp_GetPxBearerCount(n);
        return new AccessPoint(
                addressTypeHidden ? withAddressTypePlace(answered) : answered,
                addressTypeHidden,
                bearerCount,
                list(bearerCount, b -> bearer(n, b)),
                list(
                        napDefs.qvomacp_GetPxDnsAddrCount(n),
                        d -> napDefs.qvomacp_GetPxDnsAddrData(n, d)),
                list(napDefs.qvomacp_GetPxNapAuthInfoCount(n), a -> authentication(n, a)),
                list(
                        napDefs.qvomacp_GetPxNapValidityCount(n),
                        v -> new Validity(napDefs.qvomacp_GetPxValidityData(n, v))));
    }

    /**
     * The array of an access point whose address type is held as a text: there is no element for it
     * then, so that the later parameters stand one element earlier.
     */
    private static String[] withAddressTypePlace(String[] answered) {
        String[] values = new String[answered.length];
        System.arraycopy(answered, 0, values, 0, NAP_ADDRTYPE);
        int later = answered.length - NAP_ADDRTYPE - 2;
        System.arraycopy(answered, NAP_ADDRTYPE, values, NAP_ADDRTYPE + 1, later);
        return values;
    }

    /** The name of a bearer; null for one that is held as a text, whose answer is none. */
    private String bearer(int n, int b) {
        String answer = napDefs.qvomacp_GetPxBearerData(n, b);
        return BEARERS.contains(answer) ? answer : null;
    }

    private AccessPointAuthentication authentication(int n, int a) {
        return new AccessPointAuthentication(
                napDefs.qvomacp_GetPxNapAuthInfoData(n, a),
                list(
                        napDefs.qvomacp_GetPxNapAuthEntityCount(n, a),
                        e -> napDefs.qvomacp_GetPxAuthInfopAuthEntityData(n, a, e)));
    }

    private Bootstrap bootstrap(int b) {
        return new Bootstrap(
                bootstraps.qvomacp_GetBootstrapData(b),
                list(
                        bootstraps.qvomacp_GetPxProxyIdCount(b),
                        p -> bootstraps.qvomacp_GetPxProxyIdData(b, p)),
                list(
                        bootstraps.qvomacp_GetPxNetworkCount(b),
                        n -> bootstraps.qvomacp_GetPxNetworkData(b, n)));
    }

    private Application application(int a) {
        return new Application(
                applications.qvomacp_GetApplicationData(a),
                list(
                        applications.qvomacp_GetPxToProxyCount(a),
                        p -> applications.qvomacp_GetPxToProxyData(a, p)),
                list(
                        applications.qvomacp_GetPxNapIdCount(a),
                        n -> applications.qvomacp_GetPxNapIdData(a, n)),
                list(
                        applications.qvomacp_GetPxToAddrCount(a),
                        d -> applications.qvomacp_GetPxToAddrData(a, d)),
                list(applications.qvomacp_GetPxAppAddrCount(a), d -> applicationAddress(a, d)),
                list(
                        applications.qvomacp_GetPxAppAuthCount(a),
                        u -> new ApplicationAuthentication(
                                applications.qvomacp_GetPxAppAuthData(a, u))),
                list(
                        applications.qvomacp_GetPxResourceCount(a),
                        r -> new Resource(applications.qvomacp_GetPxResourceData(a, r))),
                a == 1 ? roaming() : null);
    }

    private ApplicationAddress applicationAddress(int a, int d) {
        return new ApplicationAddress(
                applications.qvomacp_GetPxAppAddrData(a, d),
                list(
                        applications.qvomacp_GetPxAppPortCount(a, d),
                        t -> new ApplicationPort(
                                new String[] {applications.qvomacp_GetPxAppPortData(a, d, t)},
                                list(
                                        applications.qvomacp_GetPxServiceCount(a, d, t),
                                        s -> applications.qvomacp_GetPxServiceData(
                                                a, d, t, s)))));
    }

    /** The one ROAMING that can be reached, which is the first application's. */
    private Roaming roaming() {
        String[] values = applications.qvomacp_GetPxRoamingData();
        return values == null ? null : new Roaming(values);
    }

    private AccessRule accessRule(int a) {
        return new AccessRule(
                list(
                        accesses.qvomacp_GetPxRuleCount(a),
                        r -> accesses.qvomacp_GetPxRuleData(a, r)),
                list(
                        accesses.qvomacp_GetPxAppIdCount(a),
                        i -> accesses.qvomacp_GetPxAppIdData(a, i)),
                list(
                        accesses.qvomacp_GetPxPortNbrCount(a),
                        t -> accesses.qvomacp_GetPxPortNbrData(a, t)),
                list(
                        accesses.qvomacp_GetPxAccessDomainCount(a),
                        d -> accesses.qvomacp_GetPxAccessDomainData(a, d)),
                list(
                        accesses.qvomacp_GetPxAccessToNapIdCount(a),
                        n -> accesses.qvomacp_GetPxAccessToNapIdData(a, n)),
                list(
                        accesses.qvomacp_GetPxAccessToProxyCount(a),
                        p -> accesses.qvomacp_GetPxAccessToProxyData(a, p)));
    }
}
