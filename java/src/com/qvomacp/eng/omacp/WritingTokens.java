package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;

/** Which types, names and values are written as tokens, and as which. */
final class WritingTokens {
    /** In place of a token. */
    static final int NONE = -1;

    private static final int PAGES = 2;
    private static final int COMMA = 0x90;

    /** On page 1 the native library knows no name behind RULE and no type behind RESOURCE. */
    private static final int LAST_NAME = 0x3B;

    private static final int LAST_TYPE = 0x59;

    /** What the format writes as tokens: a page, a parameter, its first and its last token. */
    private static final Object[][] VALUES = {
        {0, "NAP-ADDRTYPE", 0x85, 0x8C},
        {0, "LOCAL-ADDRTYPE", 0x85, 0x8C},
        {0, "PXADDRTYPE", 0x85, 0x8C},
        {0, "CALLTYPE", 0x90, 0x95},
        {0, "AUTHTYPE", 0x9A, 0x9F},
        {0, "PXAUTH-TYPE", 0x9A, 0x9F},
        {0, "PPGAUTH-TYPE", 0x9A, 0x9F},
        {0, "BEARER", 0xA2, 0xBC},
        {0, "LINKSPEED", 0xC5, 0xC5},
        {0, "DNLINKSPEED", 0xC5, 0xC5},
        {0, "SERVICE", 0xCA, 0xD3},
        {0, "AUTH-ENTITY", 0xE0, 0xE1},
        {1, "ADDRTYPE", 0x86, 0x88},
        {1, "AAUTHLEVEL", 0x8D, 0x8E},
        {1, "AAUTHTYPE", 0x91, 0x93},
    };

    /** For these tokens the library answers something else, or nothing: a page and tokens. */
    private static final int[][] ANSWERED_OTHERWISE = {
        {0x91, 0x92, 0x93, 0x9E, 0xC5, 0xE0, 0xE1}, {0x8E, 0x91}
    };

    private final boolean all;
    private final boolean any;

    private WritingTokens(boolean all, boolean any) {
        this.all = all;
        this.any = any;
    }

    /** The tokens that an option names: {@link EncodeOption#TOKENS}. */
    static WritingTokens named(String option) {
        return new WritingTokens(option.equals("oma"), !option.equals("none"));
    }

    /** Page and token of a type, of the current page rather than another; {@link #NONE} without. */
    int type(String type, int page) {
        return first(page, CodePage.TYPES, type, LAST_TYPE);
    }

    /** Page and token of a name, of the current page rather than another; {@link #NONE} without. */
    int name(String name, int page) {
        return first(page, CodePage.NAMES, name, LAST_NAME);
    }

    private int first(int page, CodePage[] pages, String text, int lastOfLibrary) {
        for (int i = 0; i < PAGES && any; ++i) {
            int candidate = page ^ i;
            int token = pages[candidate].token(text);
            if (token >= 0 && (all || candidate == 0 || token <= lastOfLibrary)) {
                return candidate << 8 | token;
            }
        }
        return NONE;
    }

    /**
     * Writes the part of a value that is tokens, from its start.
     *
     * @param type of the characteristic, or null
     * @return what is left to be written as text; null when nothing is
     */
    String writeValue(String type, String name, String value, int page, ByteArrayOutputStream out) {
        for (Object[] row : VALUES) {
            if (any && (Integer) row[0] == page && row[1].equals(name)) {
                String rest = value;
                // An APPAUTH may have several, with a comma in between.
                int comma = type != null && type.equals("APPAUTH") ? rest.indexOf(',') : -1;
            }
        }
        return value;
    }
}
