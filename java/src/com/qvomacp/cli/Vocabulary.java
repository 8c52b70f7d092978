package com.qvomacp.cli;

/**
 * The names of the tokens of OMA Client Provisioning content and of the WBXML items around it. Null
 * for a token that has none.
 */
final class Vocabulary {
    static final String DOCUMENT_TYPE = "-//WAPFORUM//DTD PROV 1.0//EN";

    /** Attribute starts that mean {@code NAME=...}, by code page. */
    private static final String[][] NAMES = {
        table(
                "05 NAME=text 06 VALUE 07 NAME 08 NAP-ADDRESS 09 NAP-ADDRTYPE 0A CALLTYPE"
                        + " 0B VALIDUNTIL 0C AUTHTYPE 0D AUTHNAME 0E AUTHSECRET 0F LINGER"
                        + " 10 BEARER 11 NAPID 12 COUNTRY 13 NETWORK 14 INTERNET 15 PROXY-ID"
                        + " 16 PROXY-PROVIDER-ID 17 DOMAIN 18 PROVURL 19 PXAUTH-TYPE"
                        + " 1A PXAUTH-ID 1B PXAUTH-PW 1C STARTPAGE 1D BASAUTH-ID"
                        + " 1E BASAUTH-PW 1F PUSHENABLED 20 PXADDR 21 PXADDRTYPE 22 TO-NAPID"
                        + " 23 PORTNBR 24 SERVICE 25 LINKSPEED 26 DNLINKSPEED 27 LOCAL-ADDR"
                        + " 28 LOCAL-ADDRTYPE 29 CONTEXT-ALLOW 2A TRUST 2B MASTER 2C SID"
                        + " 2D SOC 2E WSP-VERSION 2F PHYSICAL-PROXY-ID 30 CLIENT-ID"
                        + " 31 DELIVERY-ERR-SDU 32 DELIVERY-ORDER 33 TRAFFIC-CLASS"
                        + " 34 MAX-SDU-SIZE 35 MAX-BITRATE-UPLINK 36 MAX-BITRATE-DNLINK"
                        + " 37 RESIDUAL-BER 38 SDU-ERROR-RATIO 39 TRAFFIC-HANDL-PRIO"
                        + " 3A TRANSFER-DELAY 3B GUARANTEED-BITRATE-UPLINK"
                        + " 3C GUARANTEED-BITRATE-DNLINK 3D PXADDR-FQDN 3E PROXY-PW"
                        + " 3F PPGAUTH-TYPE 45 VERSION 46 VERSION=1.0 47 PULLENABLED"
                        + " 48 DNS-ADDR 49 MAX-NUM-RETRY 4A FIRST-RETRY-TIMEOUT"
                        + " 4B REREG-THRESHOLD 4C T-BIT 4E AUTH-ENTITY 4F SPI 50 TYPE=text"
                        + " 51 TYPE=PXLOGICAL 52 TYPE=PXPHYSICAL 53 TYPE=PORT"
                        + " 54 TYPE=VALIDITY 55 TYPE=NAPDEF 56 TYPE=BOOTSTRAP"
                        + " 57 TYPE=VENDORCONFIG 58 TYPE=CLIENTIDENTITY 59 TYPE=PXAUTHINFO"
                        + " 5A TYPE=NAPAUTHINFO 5B TYPE=ACCESS"),
        table(
                "05 NAME=text 06 VALUE 07 NAME 14 INTERNET 17 DOMAIN 1C STARTPAGE 22 TO-NAPID"
                        + " 23 PORTNBR 24 SERVICE 2E AACCEPT 2F AAUTHDATA 30 AAUTHLEVEL"
                        + " 31 AAUTHNAME 32 AAUTHSECRET 33 AAUTHTYPE 34 ADDR 35 ADDRTYPE"
                        + " 36 APPID 37 APROTOCOL 38 PROVIDER-ID 39 TO-PROXY 3A URI 3B RULE"
                        + " 50 TYPE=text 51 TYPE=PXLOGICAL 52 TYPE=PXPHYSICAL 53 TYPE=PORT"
                        + " 54 TYPE=VALIDITY 55 TYPE=APPLICATION 56 TYPE=APPADDR"
                        + " 57 TYPE=APPAUTH 58 TYPE=CLIENTIDENTITY 59 TYPE=RESOURCE"
                        + " 5A TYPE=NAPAUTHINFO 5B TYPE=ACCESS"),
    };

    /** Value tokens that the decoder keeps as they are, to be named by whoever asks. */
    private static final String[] KEPT_VALUES =
            table(
                    "A2 GSM-USSD A3 GSM-SMS A4 ANSI-136-GUTS A5 IS-95-CDMA-SMS"
                            + " A6 IS-95-CDMA-CSD A7 IS-95-CDMA-PACKET A8 ANSI-136-CSD"
                            + " A9 ANSI-136-GPRS AA GSM-CSD AB GSM-GPRS AC AMPS-CDPD"
                            + " AD PDC-CSD AE PDC-PACKET AF IDEN-SMS B0 IDEN-CSD"
                            + " B1 IDEN-PACKET B2 FLEX/REFLEX B3 PHS-SMS B4 PHS-CSD"
                            + " B5 TETRA-SDS B6 TETRA-PACKET B7 ANSI-136-GHOST"
                            + " B8 MOBITEX-MPAK B9 CDMA2000-1X-SIMPLE-IP"
                            + " BA CDMA2000-1X-MOBILE-IP C5 AUTOBAUDING CA CL-WSP CB CO-WSP"
                            + " CC CL-SEC-WSP CD CO-SEC-WSP CE CL-SEC-WTA CF CO-SEC-WTA"
                            + " D0 OTA-HTTP-TO D1 OTA-HTTP-TLS-TO D2 OTA-HTTP-PO"
                            + " D3 OTA-HTTP-TLS-PO E0 AAA E1 HA");

    /** How the text of a value token joins a text that is already there. */
    enum Join {
        DIRECT,
        COMMA,
        HIDDEN
    }

    /** Value tokens that the decoder turns into text, each as the decoder has it. */
    private static final String[] DIRECT =
            table(
                    "85 IPV4 86 IPV6 87 E164 88 ALPHA 89 APN 8A SCODE 8B TETRA-ITSI 8C MAN");

    private static final String[] COMMA =
            table(
                    "91 HTTP 92 BASIC 93 DIGEST 9A PAP 9B CHAP 9C HTTP-BASIC 9D HTTP-DIGEST"
                            + " 9E WTLS_SS 9F MD5");

    private static final String[] HIDDEN =
            table(
                    "90 ANALOG-MODEM 94 BIT-TRANSPARENT 95 DIRECT-ASYNCHRONOUS-DATA-SERVICE");

    private Vocabulary() {}

    /** The table of {@code token name} pairs, the token in two hexadecimal digits. */
    private static String[] table(String pairs) {
        String[] words = pairs.split(" ");
        String[] names = new String[256];
        for (int i = 0; i < words.length; i += 2) {
            names[Integer.parseInt(words[i], 16)] = words[i + 1];
        }
        return names;
    }

    static String attribute(int page, int token) {
        return NAMES[page][token];
    }

    /** The text that the decoder makes of a value token. */
    static String valueText(int token) {
        if (DIRECT[token] != null) {
            return DIRECT[token];
        }
        return COMMA[token] != null ? COMMA[token] : HIDDEN[token];
    }

    static Join join(int token) {
        if (DIRECT[token] != null) {
            return Join.DIRECT;
        }
        return COMMA[token] != null ? Join.COMMA : Join.HIDDEN;
    }

    /** What a value token means that the decoder keeps as it is. */
    static String keptValue(int token) {
        return KEPT_VALUES[token];
    }

    static String charset(long number) {
        switch ((int) number) {
            case 3:
                return "US-ASCII";
            case 4:
                return "ISO-8859-1";
            case 106:
                return "UTF-8";
            case 1000:
                return "ISO-10646-UCS-2";
            case 1015:
                return "UTF-16";
            default:
                return null;
        }
    }

    static String publicIdentifier(long number) {
        switch ((int) number) {
            case 0:
                return "given as text";
            case 1:
                return "none";
            case 2:
                return "WML 1.0";
            case 4:
                return "WML 1.1";
            case 5:
                return "SI 1.0";
            case 6:
                return "SL 1.0";
            case 11:
                return "PROV 1.0";
            default:
                return null;
        }
    }

    /** The names of the library's result codes. */
    static String result(int code) {
        switch (code) {
            case 0:
                return "QVS_OK";
            case 1:
                return "QVS_ERROR_FAILED";
            case 2:
                return "QVS_ERROR_BAD_ARGUMENT";
            case 4101:
                return "QVS_ERROR_WBXML_UNKNOWN_ELEMENT";
            case 4103:
                return "QVS_ERROR_WBXML_NO_DATA";
            case 4106:
                return "QVS_ERROR_WBXML_NO_BUFFER";
            case 4107:
                return "QVS_ERROR_WBXML_DOCUMENT_TYPE";
            case 4111:
                return "QVS_ERROR_NO_MEMORY";
            default:
                return "QVS_ERROR";
        }
    }
}
