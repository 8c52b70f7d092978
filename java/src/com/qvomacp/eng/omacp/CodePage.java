package com.qvomacp.eng.omacp;

/**
 * The vocabulary of one code page, for elements and for attributes: a row is a token with what it
 * stands for, as the OMA's tables have it. A document switches the page of its elements and that of
 * its attributes apart.
 */
final class CodePage {
    private static final int FIRST_VALUE = 0x80;

    private final Element[] elements = new Element[0x40];
    private final Attribute[] attributes = new Attribute[FIRST_VALUE];
    private final String[] begins = new String[FIRST_VALUE];
    private final String[] values = new String[0x100 - FIRST_VALUE];

    private static final CodePage NONE = new CodePage();

    /** The pages that the format has. */
    private static final CodePage[] PAGES = {
        new CodePage()
                .element(0x05, Element.DOCUMENT)
                .element(0x06, Element.CHARACTERISTIC)
                .element(0x07, Element.PARM)
                .attribute(0x05, Attribute.NAME)
                .attribute(0x06, Attribute.VALUE)
                .attribute(0x45, Attribute.VERSION)
                .attribute(0x50, Attribute.TYPE)
                .starts(
                        Attribute.VERSION,
                        0x46, "1.0")
                .starts(
                        Attribute.NAME,
                        0x07, "NAME", 0x08, "NAP-ADDRESS", 0x09, "NAP-ADDRTYPE", 0x0A, "CALLTYPE",
                        0x0B, "VALIDUNTIL", 0x0C, "AUTHTYPE", 0x0D, "AUTHNAME", 0x0E, "AUTHSECRET",
                        0x0F, "LINGER", 0x10, "BEARER", 0x11, "NAPID", 0x12, "COUNTRY",
                        0x13, "NETWORK", 0x14, "INTERNET", 0x15, "PROXY-ID",
                        0x16, "PROXY-PROVIDER-ID", 0x17, "DOMAIN", 0x18, "PROVURL",
                        0x19, "PXAUTH-TYPE", 0x1A, "PXAUTH-ID", 0x1B, "PXAUTH-PW",
                        0x1C, "STARTPAGE", 0x1D, "BASAUTH-ID", 0x1E, "BASAUTH-PW",
                        0x1F, "PUSHENABLED", 0x20, "PXADDR", 0x21, "PXADDRTYPE", 0x22, "TO-NAPID",
                        0x23, "PORTNBR", 0x24, "SERVICE", 0x25, "LINKSPEED", 0x26, "DNLINKSPEED",
                        0x27, "LOCAL-ADDR", 0x28, "LOCAL-ADDRTYPE", 0x29, "CONTEXT-ALLOW",
                        0x2A, "TRUST", 0x2B, "MASTER", 0x2C, "SID", 0x2D, "SOC",
                        0x2E, "WSP-VERSION", 0x2F, "PHYSICAL-PROXY-ID", 0x30, "CLIENT-ID",
                        0x31, "DELIVERY-ERR-SDU", 0x32, "DELIVERY-ORDER", 0x33, "TRAFFIC-CLASS",
                        0x34, "MAX-SDU-SIZE", 0x35, "MAX-BITRATE-UPLINK",
                        0x36, "MAX-BITRATE-DNLINK", 0x37, "RESIDUAL-BER", 0x38, "SDU-ERROR-RATIO",
                        0x39, "TRAFFIC-HANDL-PRIO", 0x3A, "TRANSFER-DELAY",
                        0x3B, "GUARANTEED-BITRATE-UPLINK", 0x3C, "GUARANTEED-BITRATE-DNLINK",
                        0x3D, "PXADDR-FQDN", 0x3E, "PROXY-PW", 0x3F, "PPGAUTH-TYPE",
                        0x47, "PULLENABLED", 0x48, "DNS-ADDR", 0x49, "MAX-NUM-RETRY",
                        0x4A, "FIRST-RETRY-TIMEOUT", 0x4B, "REREG-THRESHOLD", 0x4C, "T-BIT",
                        0x4E, "AUTH-ENTITY", 0x4F, "SPI")
                .starts(
                        Attribute.TYPE,
                        0x51, "PXLOGICAL", 0x52, "PXPHYSICAL", 0x53, "PORT", 0x54, "VALIDITY",
                        0x55, "NAPDEF", 0x56, "BOOTSTRAP", 0x57, "VENDORCONFIG",
                        0x58, "CLIENTIDENTITY", 0x59, "PXAUTHINFO", 0x5A, "NAPAUTHINFO",
                        0x5B, "ACCESS", 0x5C, "BEARERINFO", 0x5D, "DNS-ADDRINFO")
                .values(
                        0x85, "IPV4", 0x86, "IPV6", 0x87, "E164", 0x88, "ALPHA", 0x89, "APN",
                        0x8A, "SCODE", 0x8B, "TETRA-ITSI", 0x8C, "MAN", 0x90, "ANALOG-MODEM",
                        0x91, "V.120", 0x92, "V.110", 0x93, "X.31", 0x94, "BIT-TRANSPARENT",
                        0x95, "DIRECT-ASYNCHRONOUS-DATA-SERVICE", 0x9A, "PAP", 0x9B, "CHAP",
                        0x9C, "HTTP-BASIC", 0x9D, "HTTP-DIGEST", 0x9E, "WTLS-SS", 0x9F, "MD5",
                        0xA2, "GSM-USSD", 0xA3, "GSM-SMS", 0xA4, "ANSI-136-GUTS",
                        0xA5, "IS-95-CDMA-SMS", 0xA6, "IS-95-CDMA-CSD", 0xA7, "IS-95-CDMA-PACKET",
                        0xA8, "ANSI-136-CSD", 0xA9, "ANSI-136-GPRS", 0xAA, "GSM-CSD",
                        0xAB, "GSM-GPRS", 0xAC, "AMPS-CDPD", 0xAD, "PDC-CSD", 0xAE, "PDC-PACKET",
                        0xAF, "IDEN-SMS", 0xB0, "IDEN-CSD", 0xB1, "IDEN-PACKET",
                        0xB2, "FLEX/REFLEX", 0xB3, "PHS-SMS", 0xB4, "PHS-CSD", 0xB5, "TETRA-SDS",
                        0xB6, "TETRA-PACKET", 0xB7, "ANSI-136-GHOST", 0xB8, "MOBITEX-MPAK",
                        0xB9, "CDMA2000-1X-SIMPLE-IP", 0xBA, "CDMA2000-1X-MOBILE-IP",
                        0xBB, "3G-GSM", 0xBC, "WLAN", 0xC5, "AUTOBAUDING", 0xCA, "CL-WSP",
                        0xCB, "CO-WSP", 0xCC, "CL-SEC-WSP", 0xCD, "CO-SEC-WSP", 0xCE, "CL-SEC-WTA",
                        0xCF, "CO-SEC-WTA", 0xD0, "OTA-HTTP-TO", 0xD1, "OTA-HTTP-TLS-TO",
                        0xD2, "OTA-HTTP-PO", 0xD3, "OTA-HTTP-TLS-PO", 0xE0, "AAA", 0xE1, "HA"),
        new CodePage()
                .element(0x06, Element.CHARACTERISTIC)
                .element(0x07, Element.PARM)
                .attribute(0x05, Attribute.NAME)
                .attribute(0x06, Attribute.VALUE)
                .attribute(0x50, Attribute.TYPE)
                .starts(
                        Attribute.NAME,
                        0x07, "NAME", 0x14, "INTERNET", 0x1C, "STARTPAGE", 0x22, "TO-NAPID",
                        0x23, "PORTNBR", 0x24, "SERVICE", 0x2E, "AACCEPT", 0x2F, "AAUTHDATA",
                        0x30, "AAUTHLEVEL", 0x31, "AAUTHNAME", 0x32, "AAUTHSECRET",
                        0x33, "AAUTHTYPE", 0x34, "ADDR", 0x35, "ADDRTYPE", 0x36, "APPID",
                        0x37, "APROTOCOL", 0x38, "PROVIDER-ID", 0x39, "TO-PROXY", 0x3A, "URI",
                        0x3B, "RULE", 0x3C, "APPREF", 0x3D, "TO-APPREF", 0x3E, "PRI-SSID",
                        0x3F, "PRI-U-SSID", 0x40, "PRI-H-SSID", 0x41, "S-SSID", 0x42, "S-U-SSID",
                        0x43, "NETMODE", 0x44, "SECMODE", 0x45, "EAPTYPE", 0x46, "USERNAME",
                        0x47, "PASSWORD", 0x48, "REALM", 0x49, "USE-PSEUD", 0x4C, "VER-SER-REALM",
                        0x4D, "CLIENT-AUTH", 0x4E, "SES-VAL-TIME", 0x4F, "CIP-SUIT",
                        0x60, "PEAP-V0", 0x61, "PEAP-V1", 0x62, "PEAP-V2", 0x63, "ISS-NAME",
                        0x64, "SUB-NAME", 0x65, "CERT-TYPE", 0x66, "SER-NUM", 0x67, "SUB-KEY-ID",
                        0x68, "THUMBPRINT", 0x69, "WPA-PRES-KEY-ASC", 0x6A, "WPA-PRES-KEY-HEX",
                        0x6B, "WEPKEYIND", 0x6C, "WEPAUTHMODE", 0x6D, "LENGTH", 0x6E, "INDEX",
                        0x6F, "DATA", 0x70, "WLANHAND", 0x71, "EDIT-SET", 0x72, "VIEW-SET",
                        0x73, "FORW-SET")
                .starts(
                        Attribute.TYPE,
                        0x53, "PORT", 0x55, "APPLICATION", 0x56, "APPADDR", 0x57, "APPAUTH",
                        0x58, "CLIENTIDENTITY", 0x59, "RESOURCE", 0x5A, "WLAN", 0x5B, "SEC-SSID",
                        0x5C, "EAP", 0x5D, "CERT", 0x5E, "WEPKEY")
                .values(
                        0x80, ",", 0x81, "HTTP-", 0x82, "BASIC", 0x83, "DIGEST", 0x86, "IPV6",
                        0x87, "E164", 0x88, "ALPHA", 0x8D, "APPSRV", 0x8E, "OBEX", 0x90, ",",
                        0x91, "HTTP-", 0x92, "BASIC", 0x93, "DIGEST")
    };

    private CodePage() {}

    private CodePage element(int token, Element element) {
        put(elements, token, element);
        return this;
    }

    private CodePage attribute(int token, Attribute attribute) {
        put(attributes, token, attribute);
        return this;
    }

    private CodePage starts(Attribute attribute, Object... rows) {
        for (int i = 0; i < rows.length; i += 2) {
            put(attributes, (Integer) rows[i], attribute);
            put(begins, (Integer) rows[i], (String) rows[i + 1]);
        }
        return this;
    }

    private CodePage values(Object... rows) {
        for (int i = 0; i < rows.length; i += 2) {
            put(values, (Integer) rows[i] - FIRST_VALUE, (String) rows[i + 1]);
        }
        return this;
    }

    private static <T> void put(T[] table, int place, T entry) {
        if (table[place] != null) {
            throw new AssertionError("two rows for one token");
        }
        table[place] = entry;
    }

    /** A page; an empty one for a number that the format does not have. */
    static CodePage of(int page) {
        return page < PAGES.length ? PAGES[page] : NONE;
    }

    /** What a token without its bits for attributes and content stands for, or {@code null}. */
    Element element(int token) {
        return elements[token];
    }

    /** The attribute that a token below 80 hexadecimal begins, or {@code null}. */
    Attribute attribute(int token) {
        return attributes[token];
    }

    /** What the value begins with of an attribute that a token begins; {@code null} for nothing. */
    String begin(int token) {
        return begins[token];
    }

    /** The part of a value that a token from 80 hexadecimal on stands for, or {@code null}. */
    String value(int token) {
        return values[token - FIRST_VALUE];
    }

    /** The token that begins an attribute with a value, or -1 when there is none. */
    int token(Attribute attribute, String value) {
        for (int token = 0; token < attributes.length; ++token) {
            if (attributes[token] == attribute && value.equals(begins[token])) {
                return token;
            }
        }
        return -1;
    }
}
