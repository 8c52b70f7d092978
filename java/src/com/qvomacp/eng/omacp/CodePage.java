package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.Collections;
import java.util.List;

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
                .starts(Attribute.VERSION, "46 1.0")
                .starts(Attribute.NAME,
                        "07 NAME 08 NAP-ADDRESS 09 NAP-ADDRTYPE 0A CALLTYPE 0B VALIDUNTIL"
                        + " 0C AUTHTYPE 0D AUTHNAME 0E AUTHSECRET 0F LINGER 10 BEARER 11 NAPID"
                        + " 12 COUNTRY 13 NETWORK 14 INTERNET 15 PROXY-ID 16 PROXY-PROVIDER-ID"
                        + " 17 DOMAIN 18 PROVURL 19 PXAUTH-TYPE 1A PXAUTH-ID 1B PXAUTH-PW"
                        + " 1C STARTPAGE 1D BASAUTH-ID 1E BASAUTH-PW 1F PUSHENABLED 20 PXADDR"
                        + " 21 PXADDRTYPE 22 TO-NAPID 23 PORTNBR 24 SERVICE 25 LINKSPEED"
                        + " 26 DNLINKSPEED 27 LOCAL-ADDR 28 LOCAL-ADDRTYPE 29 CONTEXT-ALLOW 2A TRUST"
                        + " 2B MASTER 2C SID 2D SOC 2E WSP-VERSION 2F PHYSICAL-PROXY-ID 30 CLIENT-ID"
                        + " 31 DELIVERY-ERR-SDU 32 DELIVERY-ORDER 33 TRAFFIC-CLASS 34 MAX-SDU-SIZE"
                        + " 35 MAX-BITRATE-UPLINK 36 MAX-BITRATE-DNLINK 37 RESIDUAL-BER"
                        + " 38 SDU-ERROR-RATIO 39 TRAFFIC-HANDL-PRIO 3A TRANSFER-DELAY"
                        + " 3B GUARANTEED-BITRATE-UPLINK 3C GUARANTEED-BITRATE-DNLINK 3D PXADDR-FQDN"
                        + " 3E PROXY-PW 3F PPGAUTH-TYPE 47 PULLENABLED 48 DNS-ADDR 49 MAX-NUM-RETRY"
                        + " 4A FIRST-RETRY-TIMEOUT 4B REREG-THRESHOLD 4C T-BIT 4E AUTH-ENTITY 4F SPI")
                .starts(Attribute.TYPE,
                        "51 PXLOGICAL 52 PXPHYSICAL 53 PORT 54 VALIDITY 55 NAPDEF 56 BOOTSTRAP"
                        + " 57 VENDORCONFIG 58 CLIENTIDENTITY 59 PXAUTHINFO 5A NAPAUTHINFO 5B ACCESS"
                        + " 5C BEARERINFO 5D DNS-ADDRINFO")
                .values(
                        "85 IPV4 86 IPV6 87 E164 88 ALPHA 89 APN 8A SCODE 8B TETRA-ITSI 8C MAN"
                        + " 90 ANALOG-MODEM 91 V.120 92 V.110 93 X.31 94 BIT-TRANSPARENT"
                        + " 95 DIRECT-ASYNCHRONOUS-DATA-SERVICE 9A PAP 9B CHAP 9C HTTP-BASIC"
                        + " 9D HTTP-DIGEST 9E WTLS-SS 9F MD5 A2 GSM-USSD A3 GSM-SMS A4 ANSI-136-GUTS"
                        + " A5 IS-95-CDMA-SMS A6 IS-95-CDMA-CSD A7 IS-95-CDMA-PACKET A8 ANSI-136-CSD"
                        + " A9 ANSI-136-GPRS AA GSM-CSD AB GSM-GPRS AC AMPS-CDPD AD PDC-CSD"
                        + " AE PDC-PACKET AF IDEN-SMS B0 IDEN-CSD B1 IDEN-PACKET B2 FLEX/REFLEX"
                        + " B3 PHS-SMS B4 PHS-CSD B5 TETRA-SDS B6 TETRA-PACKET B7 ANSI-136-GHOST"
                        + " B8 MOBITEX-MPAK B9 CDMA2000-1X-SIMPLE-IP BA CDMA2000-1X-MOBILE-IP"
                        + " BB 3G-GSM BC WLAN C5 AUTOBAUDING CA CL-WSP CB CO-WSP CC CL-SEC-WSP"
                        + " CD CO-SEC-WSP CE CL-SEC-WTA CF CO-SEC-WTA D0 OTA-HTTP-TO"
                        + " D1 OTA-HTTP-TLS-TO D2 OTA-HTTP-PO D3 OTA-HTTP-TLS-PO E0 AAA E1 HA"),
        new CodePage()
                .element(0x06, Element.CHARACTERISTIC)
                .element(0x07, Element.PARM)
                .attribute(0x05, Attribute.NAME)
                .attribute(0x06, Attribute.VALUE)
                .attribute(0x50, Attribute.TYPE)
                .starts(Attribute.NAME,
                        "07 NAME 14 INTERNET 1C STARTPAGE 22 TO-NAPID 23 PORTNBR 24 SERVICE"
                        + " 2E AACCEPT 2F AAUTHDATA 30 AAUTHLEVEL 31 AAUTHNAME 32 AAUTHSECRET"
                        + " 33 AAUTHTYPE 34 ADDR 35 ADDRTYPE 36 APPID 37 APROTOCOL 38 PROVIDER-ID"
                        + " 39 TO-PROXY 3A URI 3B RULE 3C APPREF 3D TO-APPREF 3E PRI-SSID"
                        + " 3F PRI-U-SSID 40 PRI-H-SSID 41 S-SSID 42 S-U-SSID 43 NETMODE 44 SECMODE"
                        + " 45 EAPTYPE 46 USERNAME 47 PASSWORD 48 REALM 49 USE-PSEUD"
                        + " 4C VER-SER-REALM 4D CLIENT-AUTH 4E SES-VAL-TIME 4F CIP-SUIT 60 PEAP-V0"
                        + " 61 PEAP-V1 62 PEAP-V2 63 ISS-NAME 64 SUB-NAME 65 CERT-TYPE 66 SER-NUM"
                        + " 67 SUB-KEY-ID 68 THUMBPRINT 69 WPA-PRES-KEY-ASC 6A WPA-PRES-KEY-HEX"
                        + " 6B WEPKEYIND 6C WEPAUTHMODE 6D LENGTH 6E INDEX 6F DATA 70 WLANHAND"
                        + " 71 EDIT-SET 72 VIEW-SET 73 FORW-SET")
                .starts(Attribute.TYPE,
                        "53 PORT 55 APPLICATION 56 APPADDR 57 APPAUTH 58 CLIENTIDENTITY"
                        + " 59 RESOURCE 5A WLAN 5B SEC-SSID 5C EAP 5D CERT 5E WEPKEY")
                .values(
                        "80 , 81 HTTP- 82 BASIC 83 DIGEST 86 IPV6 87 E164 88 ALPHA 8D APPSRV"
                        + " 8E OBEX 90 , 91 HTTP- 92 BASIC 93 DIGEST")
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

    /**
     * Rows of a token in hexadecimal and what the value of its attribute begins with. A name is the
     * literal of the same text, so that it takes one look to find it equal.
     */
    private CodePage starts(Attribute attribute, String rows) {
        String[] words = rows.split(" ");
        for (int i = 0; i < words.length; i += 2) {
            int token = Integer.parseInt(words[i], 16);
            put(attributes, token, attribute);
            put(begins, token, words[i + 1].intern());
        }
        return this;
    }

    /** Rows of a token in hexadecimal and the part of a value for which it stands. */
    private CodePage values(String rows) {
        String[] words = rows.split(" ");
        for (int i = 0; i < words.length; i += 2) {
            put(values, Integer.parseInt(words[i], 16) - FIRST_VALUE, words[i + 1].intern());
        }
        return this;
    }

    private static <T> void put(T[] table, int place, T entry) {
        if (table[place] != null) {
            throw new AssertionError("two rows for one token");
        }
        table[place] = entry;
    }

    /** The pages that the format has. */
    static List<CodePage> all() {
        return Collections.unmodifiableList(Arrays.asList(PAGES));
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

    /** The name of a parameter that a token below 80 hexadecimal stands for, or {@code null}. */
    String name(int token) {
        return attributes[token] == Attribute.NAME ? begins[token] : null;
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
