import com.qvomacp.eng.parser.*;

/** Asks the natives everything that there is to ask about the message that was parsed. */
final class Queries {
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

    private int answers;

    /** Parses a message, asks all queries, each for every index, and lets go of it. */
    int all(byte[] message) {
        if (!parser.qvomacp_parser(message, message.length, 0)) {
            throw new IllegalStateException("the message is refused");
        }
        answers = 0;
        header();
        for (int p = proxies.qvomacp_GetPxLogicalCount(); p > 0; --p) {
            proxy(p);
        }
        for (int n = napDefs.qvomacp_GetPxNapDefCount(); n > 0; --n) {
            napDef(n);
        }
        for (int b = bootstraps.qvomacp_GetPxBootstrapCount(); b > 0; --b) {
            bootstrap(b);
        }
        take(identity.qvomacp_GetPxClientIdentityData());
        for (int v = vendorConfigs.qvomacp_GetPxVenderConfigCount(); v > 0; --v) {
            take(vendorConfigs.qvomacp_GetPxVenderConfigData(v));
        }
        for (int a = applications.qvomacp_GetPxApplicationCount(); a > 0; --a) {
            application(a);
        }
        take(applications.qvomacp_GetPxRoamingData());
        for (int a = accesses.qvomacp_GetPxCtxAccessCount(); a > 0; --a) {
            access(a);
        }
        for (int w = wifis.qvomacp_GetPxWifiCount(); w > 0; --w) {
            take(wifis.qvomacp_GetPxWifiData(w));
        }
        for (int v = voWifis.qvomacp_GetPxVoWifiCount(); v > 0; --v) {
            take(voWifis.qvomacp_GetPxVoWifiData(v));
        }
        parser.qvomacp_parser_del();
        return answers;
    }

    private void take(Object answer) {
        answers += answer == null ? 0 : 1;
    }

    private void header() {
        answers +=
                parser.qvomacp_GetParserContentType()
                        + parser.qvomacp_GetParserHeaderLen()
                        + parser.qvomacp_GetParserBodyLen()
                        + parser.qvomacp_GetParserMACLen()
                        + parser.qvomacp_GetParserSEC();
        take(parser.qvomacp_GetParserMAC());
        take(parser.qvomacp_GetParserBody());
    }

    private void proxy(int p) {
        take(proxies.qvomacp_GetProxyData(p));
        for (int d = proxies.qvomacp_GetPxDomainCount(p); d > 0; --d) {
            take(proxies.qvomacp_GetPxDomainData(p, d));
        }
        for (int a = proxies.qvomacp_GetPxAuthInfoCount(p); a > 0; --a) {
            take(proxies.qvomacp_GetPxAuthInfoData(p, a));
        }
        for (int t = proxies.qvomacp_GetPxPortCount(p); t > 0; --t) {
            take(proxies.qvomacp_GetPxPortData(p, t));
            for (int s = proxies.qvomacp_GetPxPortServiceCount(p, t); s > 0; --s) {
                take(proxies.qvomacp_GetPxPortServiceData(p, t, s));
            }
        }
        for (int h = proxies.qvomacp_GetPxPhysicalCount(p); h > 0; --h) {
            take(proxies.qvomacp_GetPxPhysicalData(p, h));
            for (int d = proxies.qvomacp_GetPxPhysicalDomainCount(p, h); d > 0; --d) {
                take(proxies.qvomacp_GetPxPhsicalDomainData(p, h, d));
            }
            for (int n = proxies.qvomacp_GetPxPhsicalNapIdCount(p, h); n > 0; --n) {
                take(proxies.qvomacp_GetPxPhysicalNapIdData(p, h, n));
            }
            for (int t = proxies.qvomacp_GetPxPhysicalPortCount(p, h); t > 0; --t) {
                take(proxies.qvomacp_GetPxPhysicalPortData(p, h, t));
                for (int s = proxies.qvomacp_GetPxPhysicalPortServiceCount(p, h, t); s > 0;
                        --s) {
                    take(proxies.qvomacp_GetPxPhysicalPortServiceData(p, h, t, s));
                }
            }
        }
    }

    private void napDef(int n) {
        take(napDefs.qvomacp_GetPxNapDefData(n));
        for (int b = napDefs.qvomacp_GetPxBearerCount(n); b > 0; --b) {
            take(napDefs.qvomacp_GetPxBearerData(n, b));
        }
        for (int d = napDefs.qvomacp_GetPxDnsAddrCount(n); d > 0; --d) {
            take(napDefs.qvomacp_GetPxDnsAddrData(n, d));
        }
        for (int a = napDefs.qvomacp_GetPxNapAuthInfoCount(n); a > 0; --a) {
            take(napDefs.qvomacp_GetPxNapAuthInfoData(n, a));
            for (int e = napDefs.qvomacp_GetPxNapAuthEntityCount(n, a); e > 0; --e) {
                take(napDefs.qvomacp_GetPxAuthInfopAuthEntityData(n, a, e));
            }
        }
        for (int v = napDefs.qvomacp_GetPxNapValidityCount(n); v > 0; --v) {
            take(napDefs.qvomacp_GetPxValidityData(n, v));
        }
    }

    private void bootstrap(int b) {
        take(bootstraps.qvomacp_GetBootstrapData(b));
        for (int p = bootstraps.qvomacp_GetPxProxyIdCount(b); p > 0; --p) {
            take(bootstraps.qvomacp_GetPxProxyIdData(b, p));
        }
        for (int n = bootstraps.qvomacp_GetPxNetworkCount(b); n > 0; --n) {
            take(bootstraps.qvomacp_GetPxNetworkData(b, n));
        }
    }

    private void application(int a) {
        take(applications.qvomacp_GetApplicationData(a));
        for (int p = applications.qvomacp_GetPxToProxyCount(a); p > 0; --p) {
            take(applications.qvomacp_GetPxToProxyData(a, p));
        }
        for (int n = applications.qvomacp_GetPxNapIdCount(a); n > 0; --n) {
            take(applications.qvomacp_GetPxNapIdData(a, n));
        }
        for (int d = applications.qvomacp_GetPxToAddrCount(a); d > 0; --d) {
            take(applications.qvomacp_GetPxToAddrData(a, d));
        }
        for (int d = applications.qvomacp_GetPxAppAddrCount(a); d > 0; --d) {
            take(applications.qvomacp_GetPxAppAddrData(a, d));
            for (int t = applications.qvomacp_GetPxAppPortCount(a, d); t > 0; --t) {
                take(applications.qvomacp_GetPxAppPortData(a, d, t));
                for (int s = applications.qvomacp_GetPxServiceCount(a, d, t); s > 0; --s) {
                    take(applications.qvomacp_GetPxServiceData(a, d, t, s));
                }
            }
        }
        for (int u = applications.qvomacp_GetPxAppAuthCount(a); u > 0; --u) {
            take(applications.qvomacp_GetPxAppAuthData(a, u));
        }
        for (int r = applications.qvomacp_GetPxResourceCount(a); r > 0; --r) {
            take(applications.qvomacp_GetPxResourceData(a, r));
        }
    }

    private void access(int a) {
        for (int r = accesses.qvomacp_GetPxRuleCount(a); r > 0; --r) {
            take(accesses.qvomacp_GetPxRuleData(a, r));
        }
        for (int i = accesses.qvomacp_GetPxAppIdCount(a); i > 0; --i) {
            take(accesses.qvomacp_GetPxAppIdData(a, i));
        }
        for (int t = accesses.qvomacp_GetPxPortNbrCount(a); t > 0; --t) {
            take(accesses.qvomacp_GetPxPortNbrData(a, t));
        }
        for (int d = accesses.qvomacp_GetPxAccessDomainCount(a); d > 0; --d) {
            take(accesses.qvomacp_GetPxAccessDomainData(a, d));
        }
        for (int n = accesses.qvomacp_GetPxAccessToNapIdCount(a); n > 0; --n) {
            take(accesses.qvomacp_GetPxAccessToNapIdData(a, n));
        }
        for (int p = accesses.qvomacp_GetPxAccessToProxyCount(a); p > 0; --p) {
            take(accesses.qvomacp_GetPxAccessToProxyData(a, p));
        }
    }
}
