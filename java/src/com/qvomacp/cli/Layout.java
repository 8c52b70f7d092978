package com.qvomacp.cli;

/**
 * The names of the elements of each array that the natives answer. Null stands for an element that
 * no parameter fills; elements behind the last name have none.
 */
final class Layout {
    static final String[] PXLOGICAL = {
        "PROXY-ID",
        "PROXY-PW",
        "PPGAUTH-TYPE",
        "PROXY-PROVIDER-ID",
        "NAME",
        "TRUST",
        "MASTER",
        "STARTPAGE",
    };

    static final String[] PXAUTHINFO = {"PXAUTH-TYPE", "PXAUTH-ID", "PXAUTH-PW"};

    static final String[] PORT = {"PORTNBR"};

    static final String[] PXPHYSICAL = {
        "PHYSICAL-PROXY-ID",
        "PXADDR",
        "PXADDRTYPE",
        "PXADDR-FQDN",
        "WSP-VERSION",
        "PUSHENABLED",
        "PULLENABLED",
    };

    /** The element of {@link #NAPDEF} that is left out when the type is held as a text. */
    static final int NAP_ADDRTYPE = 4;

    static final String[] NAPDEF = {
        "NAPID",
        "NAME",
        "INTERNET",
        "NAP-ADDRESS",
        "NAP-ADDRTYPE",
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
        null,
        null,
        null,
        null,
        null,
        null,
        "MAX-NUM-RETRY",
        "FIRST-RETRY-TIMEOUT",
        "REREG-THRESHOLD",
        "T-BIT",
        "INIT",
    };

    static final String[] NAPAUTHINFO = {"AUTHTYPE", "AUTHNAME", "AUTHSECRET"};

    static final String[] VALIDITY = {"COUNTRY", "NETWORK", "SID", "SOC", "VALIDUNTIL"};

    static final String[] BOOTSTRAP = {"NAME", "COUNTRY", "PROVURL", "CONTEXT-ALLOW"};

    static final String[] VENDORCONFIG = {"NAME"};

    static final String[] APPLICATION = {
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
    };

    static final String[] APPADDR = {"ADDR", "ADDRTYPE"};

    static final String[] APPAUTH = {
        "AAUTHLEVEL", "AAUTHTYPE", "AAUTHNAME", "AAUTHSECRET", "AAUTHDATA",
    };

    static final String[] RESOURCE = {
        "URI",
        "NAME",
        "AACCEPT",
        "AAUTHTYPE",
        "AAUTHNAME",
        "AAUTHSECRET",
        "AAUTHDATA",
        "STARTPAGE",
    };

    static final String[] ROAMING = {"SYNC-ALLOWED", "SYNC-DEFAULT"};

    static final String[] WIFI = {
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
        "PRIORITY",
    };

    static final String[] VOWIFI = {"ePDG FQDN"};

    private Layout() {}
}
