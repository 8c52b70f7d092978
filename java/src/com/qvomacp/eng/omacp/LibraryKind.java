package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.Locale;

/** The kinds of characteristic that the native library knows, and what it takes in each of them. */
enum LibraryKind {
    PXLOGICAL(0x51, Pages.BOTH, Nests.YES,
            "07 NAME 15 PROXY-ID 16 PROXY-PROVIDER-ID 17 DOMAIN* 1C STARTPAGE 2A TRUST 2B MASTER"
                    + " 3E PROXY-PW 3F PPGAUTH-TYPE"),
    PXPHYSICAL(0x52, Pages.BOTH, Nests.YES,
            "17 DOMAIN? 1F PUSHENABLED 20 PXADDR 21 PXADDRTYPE 22 TO-NAPID* 2E WSP-VERSION"
                    + " 2F PHYSICAL-PROXY-ID 3D PXADDR-FQDN 47 PULLENABLED"),
    PORT(0x53, Pages.BOTH, Nests.NO, "23 PORTNBR 24 SERVICE*"),
    VALIDITY(0x54, Pages.BOTH, Nests.NO, "0B VALIDUNTIL 12 COUNTRY 13 NETWORK 2C SID 2D SOC"),
    NAPDEF(0x55, Pages.FIRST, Nests.YES,
            "05 = 07 NAME 08 NAP-ADDRESS 09 NAP-ADDRTYPE 0A CALLTYPE 0F LINGER 10 BEARER*"
                    + " 11 NAPID 14 INTERNET 25 LINKSPEED 26 DNLINKSPEED 27 LOCAL-ADDR"
                    + " 28 LOCAL-ADDRTYPE 31 DELIVERY-ERR-SDU 32 DELIVERY-ORDER 33 TRAFFIC-CLASS"
                    + " 34 MAX-SDU-SIZE 35 MAX-BITRATE-UPLINK 36 MAX-BITRATE-DNLINK 48 DNS-ADDR*"
                    + " 49 MAX-NUM-RETRY 4A FIRST-RETRY-TIMEOUT 4B REREG-THRESHOLD 4C T-BIT"),
    APPLICATION(0x55, Pages.SECOND, Nests.YES,
            "05 = 07 NAME 14 INTERNET 22 TO-NAPID* 2E AACCEPT 34 ADDR* 36 APPID 37 APROTOCOL"
                    + " 38 PROVIDER-ID 39 TO-PROXY*"),
    BOOTSTRAP(0x56, Pages.FIRST, Nests.NO,
            "07 NAME 12 COUNTRY 13 NETWORK* 15 PROXY-ID* 18 PROVURL 29 CONTEXT-ALLOW"),
    APPADDR(0x56, Pages.SECOND, Nests.YES, "34 ADDR 35 ADDRTYPE"),
    VENDORCONFIG(0x57, Pages.FIRST, Nests.NO, "05 = 07 NAME"),
    APPAUTH(0x57, Pages.SECOND, Nests.NO,
            "2F AAUTHDATA 30 AAUTHLEVEL 31 AAUTHNAME 32 AAUTHSECRET 33 AAUTHTYPE+ 90 ,"),
    CLIENTIDENTITY(0x58, Pages.BOTH, Nests.NO, "30 CLIENT-ID"),
    PXAUTHINFO(0x59, Pages.FIRST, Nests.NO, "19 PXAUTH-TYPE 1A PXAUTH-ID 1B PXAUTH-PW"),
    RESOURCE(0x59, Pages.SECOND, Nests.NO,
            "07 NAME 1C STARTPAGE 2E AACCEPT 2F AAUTHDATA 31 AAUTHNAME 32 AAUTHSECRET"
                    + " 33 AAUTHTYPE 3A URI"),
    NAPAUTHINFO(0x5A, Pages.BOTH, Nests.NO,
            "0C AUTHTYPE 0D AUTHNAME 0E AUTHSECRET 4E AUTH-ENTITY*"),
    ACCESS(0x5B, Pages.BOTH, Nests.NO,
            "17 DOMAIN* 22 TO-NAPID* 23 PORTNBR* 36 APPID* 39 TO-PROXY* 3B RULE*"),
    ROAMING("ROAMING", "SYNC-ALLOWED", "SYNC-DEFAULT"),
    WIFI("WI-FI",
            "NETSSID", "SECMODE", "EAPMETHOD", "EAPTYPE", "USERNAME", "ANONUSERNAME", "PASSWORD",
            "CACERT", "USERCERT", "PHASE1", "AUTHALGORITHM", "PRIORITY"),
    VOWIFI("Vodafone VoWiFi", "ePDG FQDN");

    /** The code pages on which a TYPE token stands for a kind. */
    private enum Pages { FIRST, SECOND, BOTH }

    private enum Nests { YES, NO }

    /** The TYPE whose name follows as text. */
    static final int TYPE_AS_TEXT = 0x50;

    // How a parameter is read, by `shapes`.

    static final byte UNKNOWN = 0;
    static final byte TEXT = 1;
    static final byte LIST = 2;
    static final byte OPTIONAL_LIST = 3; // left out when it cannot be read
    static final byte CONTINUED_TEXT = 4; // commas go on with it
    static final byte NAMED = 5; // the name is given as text
    static final byte COMMA = 6; // one more value of the text that goes on

    private static final String MARKS = "*?+";
    private static final int LAST_TYPE = 0x5B;
    private static final LibraryKind[] ALL = values();
    private static final LibraryKind[][] BY_TOKEN = byToken();

    /** As the message names it. */
    final String type;

    /** Whether other characteristics may stand inside. */
    final boolean nests;

    /** How the parameter of each token is read. */
    final byte[] shapes = new byte[256];

    private final int token;
    private final Pages pages;
    private final String[] parms = new String[256];

    /** The names that are known; null where any name is taken. */
    private final List<String> names;

    /**
     * Parameters as pairs of token and name: * stands behind a list, ? behind one that may fail, +
     * behind a text that commas go on with, = for a name given as text, a comma for itself.
     */
    LibraryKind(int token, Pages pages, Nests nests, String pairs) {
        this.type = name();
        this.token = token;
        this.pages = pages;
        this.nests = nests == Nests.YES;
        this.names = null;
        String[] words = pairs.split(" ");
        for (int i = 0; i < words.length; i += 2) {
            put(Integer.parseInt(words[i], 16), words[i + 1]);
        }
    }

    /** A kind whose TYPE is given as text, and so are the names of its parameters. */
    LibraryKind(String type, String... names) {
        this.type = type;
        this.token = TYPE_AS_TEXT;
        this.pages = Pages.BOTH;
        this.nests = false;
        this.names = Collections.unmodifiableList(Arrays.asList(names));
        put(0x05, "=");
    }

    private void put(int announced, String marked) {
        String name = marked;
        if (marked.equals(",")) {
            shapes[announced] = COMMA;
            name = "comma";
        } else if (marked.equals("=")) {
            shapes[announced] = NAMED;
            name = "NAME";
        } else {
            int mark = MARKS.indexOf(marked.charAt(marked.length() - 1));
            shapes[announced] = (byte) (TEXT + 1 + mark);
            name = mark < 0 ? marked : marked.substring(0, marked.length() - 1);
        }
        parms[announced] = name;
    }

    private static LibraryKind[][] byToken() {
        LibraryKind[][] kinds = new LibraryKind[2][LAST_TYPE - TYPE_AS_TEXT + 1];
        for (LibraryKind kind : ALL) {
            for (int page = 0; page < 2 && kind.token != TYPE_AS_TEXT; ++page) {
                if (kind.pages == Pages.BOTH || kind.pages.ordinal() == page) {
                    kinds[page][kind.token - TYPE_AS_TEXT] = kind;
                }
            }
        }
        return kinds;
    }

    /** The kind of a TYPE token on a code page; null for none. */
    static LibraryKind of(int token, int page) {
        return token < TYPE_AS_TEXT || token > LAST_TYPE
                ? null
                : BY_TOKEN[page][token - TYPE_AS_TEXT];
    }

    /** The kind whose TYPE is given as the text of so many bytes; null for none. */
    static LibraryKind named(byte[] text, int length) {
        for (LibraryKind kind : ALL) {
            if (kind.token == TYPE_AS_TEXT && is(kind.type, text, length)) {
                return kind;
            }
        }
        return null;
    }

    private static boolean is(String known, byte[] text, int length) {
        boolean isSame = known.length() == length;
        for (int i = 0; isSame && i < length; ++i) {
            isSame = known.charAt(i) == text[i];
        }
        return isSame;
    }

    /** Whether the value of a parameter of this name is read. */
    boolean takesName(byte[] text, int length) {
        boolean isTaken = names == null;
        for (int i = 0; !isTaken && i < names.size(); ++i) {
            isTaken = is(names.get(i), text, length);
        }
        return isTaken;
    }

    /** Whether a parameter may have the empty name. */
    boolean takesEmptyName() {
        return this == VENDORCONFIG;
    }

    /** Whether the token behind a page switch is looked at with all its bits. */
    boolean readsTokenAfresh() {
        return this == APPAUTH || this == RESOURCE;
    }

    /** What a token is called where a parameter begins; null for one that is none. */
    String parm(int announced) {
        return parms[announced];
    }

    /** The names that are known; null where any name is taken. */
    List<String> names() {
        return names;
    }

    /** For people: the names that are known. */
    List<String> expectedNames() {
        List<String> expected = new ArrayList<>();
        if (names == null) {
            expected.add("a name");
        } else {
            for (String name : names) {
                expected.add("NAME=\"" + name + '"');
            }
        }
        return expected;
    }

    /** For people: the parameters, with their tokens. */
    List<String> expectedParms() {
        List<String> expected = new ArrayList<>();
        for (int i = 0; i < parms.length; ++i) {
            if (parms[i] != null) {
                expected.add(withToken(shapes[i] == NAMED ? "NAME=text" : parms[i], i));
            }
        }
        return expected;
    }

    /** For people: the types that a code page has, with their tokens. */
    static List<String> expectedTypes(int page) {
        List<String> expected = new ArrayList<>();
        for (LibraryKind kind : ALL) {
            if (kind.token == TYPE_AS_TEXT) {
                expected.add(withToken("TYPE=\"" + kind.type + '"', TYPE_AS_TEXT));
            }
        }
        for (LibraryKind kind : BY_TOKEN[page]) {
            if (kind != null) {
                expected.add(withToken("TYPE=" + kind.type, kind.token));
            }
        }
        return expected;
    }

    /** For people: a name with the token that stands for it. */
    static String withToken(String name, int token) {
        return name + String.format(Locale.ROOT, " (0x%02X)", token);
    }
}
