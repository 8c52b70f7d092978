package com.qvomacp.eng.omacp;

import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.EnumMap;
import java.util.List;
import java.util.Map;

/**
 * Writes bodies of every kind of characteristic, in pieces: each is a token with what belongs to it,
 * so that a change can work on tokens.
 */
final class DocumentGenerator {
    private static final String[] WORDS = {
        "internet", "proxy", "w2", "143", "10.0.0.1", "http://mms.example.net/", "APN", "IPV4",
        "PAP", "HTTP-DIGEST", "APPSRV", "INIT", "startpage", "\u0085", "\u0086x", "\u00ab",
        "\u00c3\u00a4", "\u0001\u0006", " ", "~", "\u00ff\u00fe"
    };
    private static final String[] NAMES = {
        "XCAP_AUID_DCS", "XCAP_AUID_PMS", "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER", "XCAP_TID_HEADER",
        "FROM", "SYNC-ALLOWED", "SYNC-DEFAULT", "NETSSID", "SECMODE", "EAPMETHOD", "EAPTYPE",
        "USERNAME", "ANONUSERNAME", "PASSWORD", "CACERT", "USERCERT", "PHASE1", "AUTHALGORITHM",
        "PRIORITY", "ePDG FQDN", "INIT", "init", "from", "netssid", "X-VENDOR", ""
    };
    private static final String[] ODD_TYPES = {"wi-fi", "ROAMIN", "", "Vodafone", "APPSRV"};
    private static final int[] VALUE_TOKENS = {
        0x85, 0x86, 0x87, 0x88, 0x89, 0x8A, 0x8B, 0x8C, 0x90, 0x91, 0x92, 0x93, 0x94, 0x95, 0x9A,
        0x9B, 0x9C, 0x9D, 0x9E, 0x9F
    };
    private static final LibraryKind[] KINDS = LibraryKind.values();

    /** The kinds that a context has at the top are drawn more often there. */
    private static final LibraryKind[] TOP = {
        LibraryKind.PXLOGICAL, LibraryKind.PXLOGICAL, LibraryKind.NAPDEF, LibraryKind.NAPDEF,
        LibraryKind.APPLICATION, LibraryKind.APPLICATION, LibraryKind.BOOTSTRAP,
        LibraryKind.CLIENTIDENTITY, LibraryKind.VENDORCONFIG, LibraryKind.ACCESS, LibraryKind.WIFI,
        LibraryKind.VOWIFI
    };
    private static final Map<LibraryKind, LibraryKind[]> CHILDREN =
            new EnumMap<>(LibraryKind.class);

    static {
        CHILDREN.put(
                LibraryKind.PXLOGICAL,
                new LibraryKind[] {
                    LibraryKind.PXAUTHINFO, LibraryKind.PXPHYSICAL, LibraryKind.PORT
                });
        CHILDREN.put(LibraryKind.PXPHYSICAL, new LibraryKind[] {LibraryKind.PORT});
        CHILDREN.put(
                LibraryKind.NAPDEF,
                new LibraryKind[] {LibraryKind.NAPAUTHINFO, LibraryKind.VALIDITY});
        CHILDREN.put(
                LibraryKind.APPLICATION,
                new LibraryKind[] {
                    LibraryKind.APPADDR,
                    LibraryKind.APPAUTH,
                    LibraryKind.RESOURCE,
                    LibraryKind.ROAMING
                });
        CHILDREN.put(LibraryKind.APPADDR, new LibraryKind[] {LibraryKind.PORT});
    }

    private final Draw draw;

    /** How often something unusual is done. */
    private final double odd;

    private final List<byte[]> pieces = new ArrayList<>();
    private byte[] table = {};
    private int page;

    DocumentGenerator(Draw draw, double odd) {
        this.draw = draw;
        this.odd = odd;
        if (draw.chance(0.5)) {
            StringBuilder texts = new StringBuilder(draw.one(WORDS));
            for (int more = draw.below(5); more > 0; --more) {
                texts.append('\0').append(draw.one(WORDS));
            }
            table = latin(texts + (draw.chance(0.8) ? "\0" : ""));
        }
    }

    private static byte[] latin(String text) {
        return text.getBytes(StandardCharsets.ISO_8859_1);
    }

    private boolean oddly(double part) {
        return draw.chance(odd * part);
    }

    private void put(int... bytes) {
        byte[] piece = new byte[bytes.length];
        for (int i = 0; i < bytes.length; ++i) {
            piece[i] = (byte) bytes[i];
        }
        pieces.add(piece);
    }

    private void put(int token, byte[] rest) {
        byte[] piece = new byte[1 + rest.length];
        piece[0] = (byte) token;
        System.arraycopy(rest, 0, piece, 1, rest.length);
        pieces.add(piece);
    }

    private void switchPage(int wanted) {
        put(0x00, wanted);
        if ((wanted & 0x3F) < 2) {
            page = wanted & 0x3F;
        }
    }

    // ---- Values

    private String text() {
        double how = draw.part();
        if (how < 0.75) {
            return draw.one(WORDS);
        }
        if (how < 0.95) {
            StringBuilder text = new StringBuilder();
            for (int more = draw.below(13); more > 0; --more) {
                text.append((char) draw.between(1, 255));
            }
            return text.toString();
        }
        StringBuilder text = new StringBuilder();
        String word = draw.one(WORDS);
        for (int more = draw.between(2, 40); more > 0; --more) {
            text.append(word);
        }
        return text.toString();
    }

    private void inline(String text) {
        put(0x03, latin(text + "\0"));
    }

    private void reference() {
        long index = table.length == 0 ? draw.below(2) : draw.below(table.length);
        if (oddly(0.3)) {
            index =
                    draw.one(
                            (long) table.length,
                            table.length + 1L,
                            table.length + 2L,
                            0x7FL,
                            0xFFFFFFFFL);
        }
        put(0x83, Draw.integer(index, draw.chance(0.25) ? 1 : 0));
    }

    private void opaque(String text) {
        byte[] data = latin(oddly(0.5) ? text + "\0" + text() : text);
        byte[] length = Draw.integer(data.length, draw.chance(0.25) ? 2 : 0);
        byte[] rest = new byte[length.length + data.length];
        System.arraycopy(length, 0, rest, 0, length.length);
        System.arraycopy(data, 0, rest, length.length, data.length);
        put(0xC3, rest);
    }

    private void string() {
        if (draw.chance(0.7)) {
            inline(text());
        } else {
            reference();
        }
    }

    private int unknownToken() {
        for (; ; ) {
            int token =
                    draw.chance(0.6) ? draw.between(0xA2, 0xD3) : draw.between(0x80, 0xFF);
            boolean known = token == 0x83 || token == 0xC3;
            for (int value : VALUE_TOKENS) {
                known |= value == token;
            }
            if (!known) {
                return token;
            }
        }
    }

    /** What stands behind VALUE; true when it lasts up to END or VALUE. */
    private boolean value() {
        if (draw.chance(0.03)) {
            switchPage(draw.below(2));
        }
        double how = draw.part();
        if (how < 0.55) {
            string();
            for (int more = draw.chance(0.3) ? draw.below(4) : 0; more > 0; --more) {
                if (draw.chance(0.5)) {
                    string();
                } else {
                    put(draw.of(VALUE_TOKENS));
                }
            }
            return true;
        }
        if (how < 0.68) {
            opaque(text());
        } else if (how < 0.80) {
            put(draw.of(VALUE_TOKENS));
        } else if (how < 0.94) {
            put(unknownToken());
        } else if (how >= 0.96 && odd > 0) {
            // A low token, skipped up to the END that closes it.
            put(draw.of(0x02, 0x2A, 0x10, 0x50));
            return true;
        } else {
            return true;
        }
        return false;
    }

    // ---- Parameters

    private boolean pair(int token) {
        put(token);
        if (draw.chance(0.06)) {
            return true;
        }
        if (draw.chance(0.04)) {
            switchPage(draw.below(2));
        }
        put(0x06);
        return value();
    }

    private void list(int token) {
        boolean lasts = pair(token);
        while (oddly(0.6)) {
            // Behind a string only VALUE's own byte can stand as the next NAME.
            lasts = pair(lasts ? 0x06 : draw.of(token, 0x06, 0x9A, 0x30));
        }
    }

    private void named(LibraryKind kind) {
        String name =
                kind.names() == null
                        ? draw.one("INIT", "X-NAME", "PROFILE", "FROM", "XCAP_AUID_DCS")
                        : kind.names().get(draw.below(kind.names().size()));
        if (oddly(0.5)) {
            name = draw.one(NAMES);
        }
        put(0x05);
        if (draw.chance(0.8)) {
            inline(name);
        } else {
            opaque(name);
        }
        if (draw.chance(0.9)) {
            put(0x06);
            value();
        }
    }

    private int parmOf(LibraryKind kind) {
        if (oddly(0.1)) {
            return draw.between(0x05, 0x5B);
        }
        for (; ; ) {
            int token = draw.between(0x05, 0x4E);
            if (kind.parm(token) != null) {
                return token;
            }
        }
    }

    private void parm(LibraryKind kind) {
        put(oddly(0.2) ? draw.of(0x07, 0x47, 0xC7) : 0x87);
        int token = parmOf(kind);
        boolean masked = token >= 0x40 && !kind.readsTokenAfresh();
        if (draw.chance(0.03) && (!masked || oddly(1))) {
            switchPage(oddly(1) ? draw.of(0, 1, 2, 0x41) : draw.below(2));
        }
        switch (kind.shapes[token]) {
            case LibraryKind.LIST:
            case LibraryKind.OPTIONAL_LIST:
                list(token);
                break;
            case LibraryKind.NAMED:
                named(kind);
                break;
            default:
                pair(token);
                break;
        }
        if (kind == LibraryKind.APPAUTH && token == 0x33 && draw.chance(0.4)) {
            commas();
        }
        put(oddly(0.05) ? 0x41 : 0x01);
    }

    private void commas() {
        for (int more = draw.between(1, 3); more > 0; --more) {
            put(0x90);
            double how = draw.part();
            if (how < 0.3) {
                string();
                return;
            }
            if (how < 0.4) {
                switchPage(draw.below(2));
            }
            put(how < 0.8 ? draw.of(VALUE_TOKENS) : unknownToken());
        }
    }

    // ---- Characteristics

    private static boolean isNamed(LibraryKind kind) {
        return kind.names() != null;
    }

    private void type(LibraryKind kind) {
        if (isNamed(kind)) {
            String name = oddly(0.1) ? draw.one(ODD_TYPES) : kind.type;
            put(LibraryKind.TYPE_AS_TEXT);
            if (draw.chance(0.7)) {
                inline(name);
            } else {
                opaque(name);
            }
            return;
        }
        for (int token = 0x51; ; ++token) {
            for (int own = 0; own < 2; ++own) {
                if (LibraryKind.of(token, own) == kind) {
                    if (LibraryKind.of(token, page) != kind) {
                        switchPage(own);
                    } else if (draw.chance(0.1)) {
                        switchPage(page);
                    }
                    put(token);
                    return;
                }
            }
        }
    }

    private void attributes(LibraryKind kind) {
        while (oddly(0.3)) {
            LibraryKind first = draw.one(KINDS);
            if (isNamed(first)) {
                put(LibraryKind.TYPE_AS_TEXT);
                opaque(first.type);
            } else {
                type(first);
            }
        }
        type(kind);
        if (oddly(0.05)) {
            switchPage(draw.below(3));
        }
        put(0x01);
    }

    /** What may stand between the parts of an element without a meaning. */
    private void between() {
        if (draw.chance(0.02)) {
            inline(" \n");
        }
        if (draw.chance(0.02)) {
            put(0x00, draw.below(4));
        }
        if (oddly(0.01)) {
            reference();
        }
    }

    private void characteristic(LibraryKind kind, int depth) {
        if (draw.chance(0.02)) {
            put(draw.chance(0.1) ? 0x86 : 0x06);
            if (draw.chance(0.5)) {
                put(0x01);
            }
            return;
        }
        put(oddly(0.05) ? 0x46 : 0xC6);
        attributes(kind);
        between();
        for (int more = draw.of(0, 1, 2, 3, 3, 4, 6); more > 0; --more) {
            parm(kind);
            between();
        }
        LibraryKind[] children = CHILDREN.get(kind);
        int count = 0;
        if (children != null && depth < 6) {
            count = draw.of(0, 1, 1, 2, 3);
        } else if (oddly(0.1)) {
            count = 1;
        }
        for (; count > 0; --count) {
            boolean any = children == null || draw.chance(0.03);
            characteristic(any ? draw.one(KINDS) : draw.one(children), depth + 1);
            if (draw.chance(0.02)) {
                inline("\n");
            }
        }
        put(oddly(0.05) ? 0x41 : 0x01);
    }

    private void characteristics() {
        for (int more = draw.of(1, 1, 2, 2, 3, 4, 6); more > 0; --more) {
            characteristic(draw.chance(0.8) ? draw.one(TOP) : draw.one(KINDS), 0);
            if (draw.chance(0.02)) {
                inline("\n");
            }
        }
    }

    private void document() {
        if (!draw.chance(0.05)) {
            switch (draw.below(3)) {
                case 0:
                    put(0xC5, 0x46, 0x01);
                    break;
                case 1:
                    put(0xC5, 0x45, 0x03, '1', '.', '0', 0x00, 0x01);
                    break;
                default:
                    put(0x45);
                    break;
            }
            between();
        }
        characteristics();
        put(0x01);
        if (draw.chance(0.05)) {
            pieces.add(draw.bytes(draw.between(1, 5)));
        }
    }

    private List<byte[]> header() {
        List<byte[]> header = new ArrayList<>();
        header.add(new byte[] {(byte) draw.of(3, 3, 3, 1, 2, 0, 0xFF)});
        if (draw.chance(0.15)) {
            table = latin("-//WAPFORUM//DTD PROV 1.0//EN\0" + new String(table, StandardCharsets.ISO_8859_1));
            header.add(new byte[] {0});
            header.add(Draw.integer(draw.of(0, 0, 5, 1000), 0));
        } else {
            header.add(Draw.integer(11, draw.of(0, 0, 0, 1, 4)));
        }
        header.add(Draw.integer(draw.of(0, 3, 0x6A, 0x6A, 1000), 0));
        header.add(Draw.integer(table.length, 0));
        header.add(table);
        return header;
    }

    /** The pieces of a run of characteristics. */
    List<byte[]> run() {
        characteristics();
        return pieces;
    }

    /** The pieces of a body. */
    List<byte[]> body() {
        List<byte[]> body = header();
        document();
        body.addAll(pieces);
        return body;
    }
}
