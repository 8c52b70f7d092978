package com.qvomacp.support;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.parms;
import static com.qvomacp.support.Document.token;

/** A message that sets every parameter that the library keeps; each one is its prefix and name. */
public final class Everything {
    public static final String MAC = "0123456789ABCDEF0123456789ABCDEF01234567";

    private Everything() {}

    public static byte[] push() {
        return Push.secured(Push.SEC_USERPIN, MAC, body());
    }

    public static byte[] body() {
        return document(elements(parms("n-", "NAP-ADDRTYPE")));
    }

    /** The same document without NAP-ADDRTYPE, whose array has no shift then. */
    public static Document.Element[] withoutNapAddrType() {
        return elements(parms("n-"));
    }

    private static Document.Element[] elements(Document.Element napAddrType) {
        return new Document.Element[] {
            pxLogical(),
            napDef(napAddrType),
            characteristic(
                    "BOOTSTRAP",
                    parms(
                            "b-",
                            "NAME",
                            "COUNTRY",
                            "PROVURL",
                            "CONTEXT-ALLOW",
                            "PROXY-ID",
                            "NETWORK")),
            characteristic("CLIENTIDENTITY", parms("c-", "CLIENT-ID")),
            characteristic("VENDORCONFIG", parms("v-", "NAME", "Vendor's own")),
            application(),
            characteristic(
                    "ACCESS",
                    parms(
                            "x-",
                            "RULE",
                            "APPID",
                            "PORTNBR",
                            "DOMAIN",
                            "TO-NAPID",
                            "TO-PROXY")),
            characteristic(
                    "WI-FI",
                    parms(
                            "w-",
                            "NETSSID",
                            "SECMODE",
                            "EAPMETHOD",
                            "EAPTYPE",
                            "USERNAME",
                            "ANONUSERNAME",
                            "PASSWORD",
                            "CACERT",
                            "USERCERT",
                            "PHASE1",
                            "AUTHALGORITHM",
                            "PRIORITY")),
            characteristic("Vodafone VoWiFi", parms("o-", "ePDG FQDN"))
        };
    }

    private static Document.Element pxLogical() {
        return characteristic(
                "PXLOGICAL",
                parms(
                        "p-",
                        "PROXY-ID",
                        "PROXY-PW",
                        "PPGAUTH-TYPE",
                        "PROXY-PROVIDER-ID",
                        "NAME",
                        "TRUST",
                        "MASTER",
                        "STARTPAGE",
                        "DOMAIN"),
                characteristic(
                        "PXAUTHINFO", parms("pa-", "PXAUTH-TYPE", "PXAUTH-ID", "PXAUTH-PW")),
                characteristic("PORT", parms("pp-", "PORTNBR", "SERVICE")),
                characteristic(
                        "PXPHYSICAL",
                        parms(
                                "h-",
                                "PHYSICAL-PROXY-ID",
                                "PXADDR",
                                "PXADDRTYPE",
                                "PXADDR-FQDN",
                                "WSP-VERSION",
                                "PUSHENABLED",
                                "PULLENABLED",
                                "DOMAIN",
                                "TO-NAPID"),
                        characteristic("PORT", parms("hp-", "PORTNBR", "SERVICE"))));
    }

    private static Document.Element napDef(Document.Element napAddrType) {
        return characteristic(
                "NAPDEF",
                parms(
                        "n-",
                        "NAPID",
                        "NAME",
                        "INTERNET",
                        "NAP-ADDRESS",
                        "CALLTYPE",
                        "LOCAL-ADDR",
                        "LOCAL-ADDRTYPE",
                        "LINKSPEED",
                        "DNLINKSPEED",
                        "LINGER",
                        "DELIVERY-ERR-SDU",
                        "DELIVERY-ORDER",
                        "TRAFFIC-CLASS",
                        "MAX-SDU-SIZE",
                        "MAX-BITRATE-UPLINK",
                        "MAX-BITRATE-DNLINK",
                        "MAX-NUM-RETRY",
                        "FIRST-RETRY-TIMEOUT",
                        "REREG-THRESHOLD",
                        "T-BIT",
                        "DNS-ADDR"),
                napAddrType,
                named("INIT"),
                parm("BEARER", token(0xAB)),
                characteristic(
                        "NAPAUTHINFO",
                        parms("na-", "AUTHTYPE", "AUTHNAME", "AUTHSECRET", "AUTH-ENTITY")),
                characteristic(
                        "VALIDITY",
                        parms("nv-", "COUNTRY", "NETWORK", "SID", "SOC", "VALIDUNTIL")));
    }

    private static Document.Element application() {
        return characteristic(
                "APPLICATION",
                parms(
                        "a-",
                        "APPID",
                        "PROVIDER-ID",
                        "FROM",
                        "NAME",
                        "AACCEPT",
                        "APROTOCOL",
                        "INTERNET",
                        "XCAP_AUID_DCS",
                        "XCAP_AUID_PMS",
                        "XCAP_AUID_CDMS",
                        "XCAP_IMEI_HEADER",
                        "XCAP_TID_HEADER",
                        "TO-PROXY",
                        "TO-NAPID",
                        "ADDR"),
                characteristic(
                        "APPADDR",
                        parms("aa-", "ADDR", "ADDRTYPE"),
                        characteristic("PORT", parms("ap-", "PORTNBR", "SERVICE"))),
                characteristic(
                        "APPAUTH",
                        parm("AAUTHLEVEL", "CLIENT"),
                        parms("au-", "AAUTHTYPE", "AAUTHNAME", "AAUTHSECRET", "AAUTHDATA")),
                characteristic(
                        "RESOURCE",
                        parms(
                                "ar-",
                                "URI",
                                "NAME",
                                "AACCEPT",
                                "AAUTHTYPE",
                                "AAUTHNAME",
                                "AAUTHSECRET",
                                "AAUTHDATA",
                                "STARTPAGE")),
                characteristic("ROAMING", parms("am-", "SYNC-ALLOWED", "SYNC-DEFAULT")));
    }
}
