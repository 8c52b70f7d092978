package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** The kinds of characteristic that the decoder knows, and what each of them takes. */
enum Kind {
    PXLOGICAL(
            0x51,
            Pages.BOTH,
            Nests.YES,
            "07 NAME 15 PROXY-ID 16 PROXY-PROVIDER-ID 17 DOMAIN* 1C STARTPAGE 2A TRUST 2B MASTER"
                    + " 3E PROXY-PW 3F PPGAUTH-TYPE"),
    PXPHYSICAL(
            0x52,
            Pages.BOTH,
            Nests.YES,
            "17 DOMAIN* 1F PUSHENABLED 20 PXADDR 21 PXADDRTYPE 22 TO-NAPID* 2E WSP-VERSION"
                    + " 2F PHYSICAL-PROXY-ID 3D PXADDR-FQDN 47 PULLENABLED"),
    PORT(0x53, Pages.BOTH, Nests.NO, "23 PORTNBR 24 SERVICE*"),
    VALIDITY(
            0x54, Pages.BOTH, Nests.NO, "0B VALIDUNTIL 12 COUNTRY 13 NETWORK 2C SID 2D SOC"),
    NAPDEF(
            0x55,
            Pages.FIRST,
            Nests.YES,
            "05 NAME= 07 NAME 08 NAP-ADDRESS 09 NAP-ADDRTYPE 0A CALLTYPE 0F LINGER 10 BEARER*"
                    + " 11 NAPID 14 INTERNET 25 LINKSPEED 26 DNLINKSPEED 27 LOCAL-ADDR"
                    + " 28 LOCAL-ADDRTYPE 31 DELIVERY-ERR-SDU 32 DELIVERY-ORDER"
                    + " 33 TRAFFIC-CLASS 34 MAX-SDU-SIZE 35 MAX-BITRATE-UPLINK"
                    + " 36 MAX-BITRATE-DNLINK 48 DNS-ADDR* 49 MAX-NUM-RETRY"
                    + " 4A FIRST-RETRY-TIMEOUT 4B REREG-THRESHOLD 4C T-BIT"),
    APPLICATION(
            0x55,
            Pages.SECOND,
            Nests.YES,
            "05 NAME= 07 NAME 14 INTERNET 22 TO-NAPID* 2E AACCEPT 34 ADDR* 36 APPID"
                    + " 37 APROTOCOL 38 PROVIDER-ID 39 TO-PROXY*"),
    BOOTSTRAP(
            0x56,
            Pages.FIRST,
            Nests.NO,
            "07 NAME 12 COUNTRY 13 NETWORK* 15 PROXY-ID* 18 PROVURL 29 CONTEXT-ALLOW"),
    APPADDR(0x56, Pages.SECOND, Nests.YES, "34 ADDR 35 ADDRTYPE"),
    VENDORCONFIG(0x57, Pages.FIRST, Nests.NO, "05 NAME= 07 NAME"),
    APPAUTH(
            0x57,
            Pages.SECOND,
            Nests.NO,
            "2F AAUTHDATA 30 AAUTHLEVEL 31 AAUTHNAME 32 AAUTHSECRET 33 AAUTHTYPE 90 ,"),
    CLIENTIDENTITY(0x58, Pages.BOTH, Nests.NO, "30 CLIENT-ID"),
    PXAUTHINFO(0x59, Pages.FIRST, Nests.NO, "19 PXAUTH-TYPE 1A PXAUTH-ID 1B PXAUTH-PW"),
    RESOURCE(
            0x59,
            Pages.SECOND,
            Nests.NO,
            "07 NAME 1C STARTPAGE 2E AACCEPT 2F AAUTHDATA 31 AAUTHNAME 32 AAUTHSECRET"
                    + " 33 AAUTHTYPE 3A URI"),
    NAPAUTHINFO(
            0x5A, Pages.BOTH, Nests.NO, "0C AUTHTYPE 0D AUTHNAME 0E AUTHSECRET 4E AUTH-ENTITY*"),
    ACCESS(
            0x5B,
            Pages.BOTH,
            Nests.NO,
            "17 DOMAIN* 22 TO-NAPID* 23 PORTNBR* 36 APPID* 39 TO-PROXY* 3B RULE*"),
    ROAMING("ROAMING", "SYNC-ALLOWED", "SYNC-DEFAULT"),
    WIFI(
            "WI-FI",
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
            "PRIORITY"),
    VOWIFI("Vodafone VoWiFi", "ePDG FQDN");

    /** The TYPE whose name follows as text. */
    static final int TYPE_AS_TEXT = 0x50;

    /** The code pages on which a TYPE token stands for a kind. */
    private enum Pages {
        FIRST,
        SECOND,
        BOTH
    }

    private enum Nests {
        YES,
        NO
    }

    /** How a parameter is read. */
    enum Shape {
        TEXT,
        LIST,
        NAMED,
        COMMA
    }

    /** One parameter: the token that announces it. */
    static final class Parm {
        final int token;
        final String name;
        final Shape shape;

        private Parm(int token, String marked) {
            this.token = token;
            if (marked.equals(",")) {
                shape = Shape.COMMA;
                name = "comma";
            } else if (marked.endsWith("=")) {
                shape = Shape.NAMED;
                name = marked + "text";
            } else if (marked.endsWith("*")) {
                shape = Shape.LIST;
                name = marked.substring(0, marked.length() - 1);
            } else {
                shape = Shape.TEXT;
                name = marked;
            }
        }
    }

    private static final String[] ACCEPTED =
            Arrays.stream(values()).map(Kind::describe).toArray(String[]::new);

    private static final String[] ACCEPTED_TYPES = {describeTypes(0), describeTypes(1)};

    /** As the message names it. */
    final String type;

    private final int token;
    private final Pages pages;

    /** Whether other characteristics may stand inside. */
    final boolean nests;

    final List<Parm> parms = new ArrayList<>();

    /** The names that a parameter named by text may have; null where any name is read. */
    final List<String> names;

    /** Parameters as {@code token name} pairs, * behind a list, = behind a name given as text. */
    Kind(int token, Pages pages, Nests nests, String pairs) {
        this.type = name();
        this.token = token;
        this.pages = pages;
        this.nests = nests == Nests.YES;
        this.names = null;
        String[] words = pairs.split(" ");
        for (int i = 0; i < words.length; i += 2) {
            parms.add(new Parm(Integer.parseInt(words[i], 16), words[i + 1]));
        }
    }

    Kind(String type, String... names) {
        this.type = type;
        this.token = TYPE_AS_TEXT;
        this.pages = Pages.BOTH;
        this.nests = false;
        this.names = Arrays.asList(names);
        parms.add(new Parm(0x05, "NAME="));
    }

    /** The kind of a TYPE token on a code page; null for none. */
    static Kind of(int token, int page) {
        Pages own = page == 0 ? Pages.FIRST : Pages.SECOND;
        for (Kind kind : values()) {
            if (kind.token == token
                    && token != TYPE_AS_TEXT
                    && (kind.pages == own || kind.pages == Pages.BOTH)) {
                return kind;
            }
        }
        return null;
    }

    /** The kind whose TYPE is given as text; null for none. */
    static Kind named(Value name) {
        for (Kind kind : values()) {
            if (kind.token == TYPE_AS_TEXT && name.is(kind.type)) {
                return kind;
            }
        }
        return null;
    }

    /** The parameter that a token announces; null for none. */
    Parm parm(int announced) {
        for (Parm parm : parms) {
            if (parm.token == announced) {
                return parm;
            }
        }
        return null;
    }

    /** Whether the token behind a page switch is looked at with all its bits. */
    boolean readsTokenAfresh() {
        return this == APPAUTH || this == RESOURCE;
    }

    /** For people: the parameters, with their tokens. */
    String accepted() {
        return ACCEPTED[ordinal()];
    }

    private String describe() {
        StringBuilder list = new StringBuilder();
        for (Parm parm : parms) {
            list.append(String.format("%s (0x%02X), ", parm.name, parm.token));
        }
        return list + "END (0x01)";
    }

    /** For people: the TYPE tokens of a code page and the types given as text. */
    static String acceptedTypes(int page) {
        return ACCEPTED_TYPES[page];
    }

    private static String describeTypes(int page) {
        StringBuilder list = new StringBuilder();
        StringBuilder texts = new StringBuilder();
        for (Kind kind : values()) {
            if (kind.token == TYPE_AS_TEXT) {
                texts.append(texts.length() == 0 ? "" : ", ").append('"').append(kind.type);
                texts.append('"');
            } else if (of(kind.token, page) == kind) {
                list.append(String.format("TYPE=%s (0x%02X), ", kind.type, kind.token));
            }
        }
        return list + "TYPE=text (0x50) with " + texts + ", SWITCH_PAGE (0x00), END (0x01)";
    }
}
