package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.util.Arrays;
import java.util.List;

/** Which types, names and values are written as tokens, and as which. */
final class WritingTokens {
    /** In place of page and token. */
    static final int NONE = -1;

    private static final int PAGES = 2;

    /** Of page 1, the native library knows no type behind RESOURCE, and no name behind RULE. */
    private static final int LAST_TYPE = 0x59;

    private static final int LAST_NAME = 0x3B;

    /** What values tokens stand for: a page, the first and the last token, and the parameters. */
    private static final Object[][] VALUES = {
        {0, 0x85, 0x8C, "NAP-ADDRTYPE", "LOCAL-ADDRTYPE", "PXADDRTYPE"},
        {0, 0x90, 0x95, "CALLTYPE"},
        {0, 0x9A, 0x9F, "AUTHTYPE", "PXAUTH-TYPE", "PPGAUTH-TYPE"},
        {0, 0xA2, 0xBC, "BEARER"},
        {0, 0xC5, 0xC5, "LINKSPEED", "DNLINKSPEED"},
        {0, 0xCA, 0xD3, "SERVICE"},
        {0, 0xE0, 0xE1, "AUTH-ENTITY"},
        {1, 0x86, 0x88, "ADDRTYPE"},
        {1, 0x8D, 0x8E, "AAUTHLEVEL"},
        {1, 0x91, 0x93, "AAUTHTYPE"},
    };

    /** Page and token of those for which the library answers another text than theirs, or none. */
    private static final List<Integer> ANSWERED_OTHERWISE =
            Arrays.asList(0x91, 0x92, 0x93, 0x9E, 0xC5, 0xE0, 0xE1, 0x18E, 0x191);

    /** The parameter that may hold several values, and what the tokens between and in them say. */
    private static final String JOINED = "AAUTHTYPE";

    private static final int COMMA = 0x90;
    private static final String SCHEME = "HTTP-";

    /** Where the library takes several. */
    private static final String JOINING = "APPAUTH";

    private final boolean library;
    private final boolean none;

    /** The tokens that an option names: {@link EncodeOption#TOKENS}. */
    WritingTokens(String option) {
        library = option.equals("library");
        none = option.equals("none");
    }

    /** Page and token (page * 256 + token) of a type, of this page rather than the other. */
    int type(String type, int page) {
        return start(Attribute.TYPE, type, page, LAST_TYPE);
    }

    /** Page and token (page * 256 + token) of a name, of this page rather than the other. */
    int name(String name, int page) {
        return start(Attribute.NAME, name, page, LAST_NAME);
    }

    private int start(Attribute attribute, String text, int page, int lastOfLibrary) {
        for (int i = 0; i < PAGES && !none; ++i) {
            int candidate = page ^ i;
            int token = CodePage.of(candidate).token(attribute, text);
            if (token >= 0 && (!library || candidate == 0 || token <= lastOfLibrary)) {
                return candidate << 8 | token;
            }
        }
        return NONE;
    }

    /**
     * Writes the tokens of a value.
     *
     * @param type of the characteristic in which the parameter stands
     * @return what has to follow as text; null for nothing
     */
    String writeValue(String type, String name, String value, int page, ByteArrayOutputStream out) {
        Object[] row = row(name, page);
        if (row == null) {
            return value;
        }
        String rest = value;
        if (name.equals(JOINED) && (!library || JOINING.equals(type))) {
            ByteArrayOutputStream first = new ByteArrayOutputStream();
            int comma = rest.indexOf(',');
            while (comma >= 0 && writePiece(row, page, rest.substring(0, comma), first)) {
                first.write(COMMA);
                rest = rest.substring(comma + 1);
                comma = rest.indexOf(',');
            }
            if (comma >= 0) {
                return value;
            }
            out.write(first.toByteArray(), 0, first.size());
        }
        return writePiece(row, page, rest, out) ? null : rest;
    }

    private Object[] row(String name, int page) {
        for (Object[] row : VALUES) {
            if (!none && row[0].equals(page) && Arrays.asList(row).contains(name)) {
                return row;
            }
        }
        return null;
    }

    /** Writes a text as a token, or as two that join; false when there are none for it. */
    private boolean writePiece(Object[] row, int page, String text, ByteArrayOutputStream out) {
        int token = token(row, page, text);
        if (token != NONE) {
            out.write(token);
            return true;
        }
        int scheme = token(row, page, SCHEME);
        if (scheme == NONE || !text.startsWith(SCHEME)) {
            return false;
        }
        token = token(row, page, text.substring(SCHEME.length()));
        if (token != NONE) {
            out.write(scheme);
            out.write(token);
        }
        return token != NONE;
    }

    private int token(Object[] row, int page, String text) {
        for (int token = (Integer) row[1]; token <= (Integer) row[2]; ++token) {
            if (text.equals(CodePage.of(page).value(token))
                    && !(library && ANSWERED_OTHERWISE.contains(page << 8 | token))) {
                return token;
            }
        }
        return NONE;
    }
}
