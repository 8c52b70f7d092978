package com.qvomacp.eng.omacp;

/**
 * What the native library makes of a push header: PDU type, length, content type, SEC and MAC,
 * which it knows in a few forms only. The length of the headers bounds none of these, it only finds
 * the body.
 */
final class LibraryHeader {
    private static final int PDU_TYPE = 1;
    private static final int LENGTH = 2;
    private static final int HEADERS = 3;
    private static final int QUOTED_CONTENT_TYPE = 5;

    private static final int PUSH = 0x06;
    private static final int LENGTH_QUOTE = 0x1F;
    private static final int SEC = 0x91;
    private static final int MAC = 0x92;
    private static final int NAME_LENGTH = 3;
    private static final int LONGEST_MAC = 43;

    /** The content types that it knows, by number, with or without its high bit, and by name. */
    private static final int[] CODES = {0x36, 0x35, 0x44, 0x4E, 0x42};

    private static final String[] MEDIA_TYPES = {
        "application/vnd.wap.connectivity-wbxml",
        "application/vnd.wap.connectivity-xml",
        "application/vnd.syncml.notification",
        "application/vnd.syncml.ds.notification",
        "application/vnd.syncml.dm+wbxml",
    };

    /** Where the body begins, when the header is taken. */
    final int bodyAt;

    /** Null when the header is taken. */
    final Refusal refusal;

    private LibraryHeader(int bodyAt, Refusal refusal) {
        this.bodyAt = bodyAt;
        this.refusal = refusal;
    }

    /** Reads the header of a push. */
    static LibraryHeader of(byte[] push) {
        Refusal refusal = refusal(push);
        return new LibraryHeader(refusal == null ? bodyAt(push) : 0, refusal);
    }

    private static int bodyAt(byte[] push) {
        return HEADERS + (push[LENGTH] & 0xFF);
    }

    private static Refusal refusal(byte[] push) {
        if (push.length > PDU_TYPE && push[PDU_TYPE] != PUSH) {
            String type = Refusal.hex(push[PDU_TYPE]);
            String reason = "PDU type " + type + " is no push";
            return Refusal.ofHeader(PDU_TYPE, type, reason, "Push (0x06)");
        }
        if (push.length <= HEADERS) {
            String within = "the message ends within its push header, after ";
            String reason =
                    push.length == 0 ? "the message is empty" : within + Refusal.bytes(push.length);
            return Refusal.ofHeader(push.length, Refusal.END_OF_DATA, reason);
        }
        if (bodyAt(push) > push.length) {
            String length = Refusal.bytes(push[LENGTH] & 0xFF);
            String reason = "headers of " + length + " are longer than the rest of the message";
            String most = "at most " + (push.length - HEADERS);
            return Refusal.ofHeader(LENGTH, Refusal.hex(push[LENGTH]), reason, most);
        }
        int at = push[HEADERS] == LENGTH_QUOTE ? QUOTED_CONTENT_TYPE : HEADERS;
        int behind = behindContentType(push, at);
        return behind < 0 ? unknownContentType(push, at) : refusedMac(push, behind);
    }

    /** Where the content type ends: a name with its zero, or else a short code; -1 for neither. */
    private static int behindContentType(byte[] push, int at) {
        for (String type : MEDIA_TYPES) {
            int end = at + type.length();
            if (end < push.length && push[end] == 0 && text(push, at, type.length()).equals(type)) {
                return end + 1;
            }
        }
        return at < push.length && isCode(push[at] & 0x7F) ? at + 1 : -1;
    }

    /** Whether a number is that of a content type that it knows. */
    static boolean isCode(int number) {
        for (int code : CODES) {
            if (number == code) {
                return true;
            }
        }
        return false;
    }

    private static Refusal unknownContentType(byte[] push, int at) {
        String[] expected = new String[CODES.length];
        for (int i = 0; i < CODES.length; ++i) {
            expected[i] = LibraryKind.withToken(MEDIA_TYPES[i], CODES[i] | 0x80);
        }
        if (at >= push.length) {
            String reason = "the message ends in front of its content type";
            return Refusal.ofHeader(push.length, Refusal.END_OF_DATA, reason, expected);
        }
        String found = Refusal.hex(push[at]);
        if (push[at] >= ' ') {
            int end = endOfText(push, at);
            if (end == push.length) {
                String reason = "the message ends within its content type";
                return Refusal.ofHeader(at, "a text", reason, expected);
            }
            found = Refusal.quoted(push, at, end);
        }
        String reason = "the content type " + found + " is not known";
        return Refusal.ofHeader(at, found, reason, expected);
    }

    /** SEC and MAC are looked for once each, in this order; anything else hides what follows. */
    private static Refusal refusedMac(byte[] push, int behind) {
        int at = valueOf(push, behind, SEC, "SEC");
        at = valueOf(push, at < 0 ? behind : at + 1, MAC, "MAC");
        if (at < 0) {
            return null;
        }
        int end = endOfText(push, at);
        String reason;
        if (end == push.length) {
            reason = "the message ends within its MAC";
        } else if (end - at > LONGEST_MAC) {
            reason = "a MAC of " + (end - at) + " characters is too long";
        } else {
            return null;
        }
        String expected = "at most " + LONGEST_MAC + " characters and a zero byte";
        return Refusal.ofHeader(at, "a text", reason, expected);
    }

    /** Where the value of the parameter begins, if that is what comes next; else -1. */
    private static int valueOf(byte[] push, int at, int token, String name) {
        int left = push.length - at;
        if (left > 1 && (push[at] & 0xFF) == token) {
            return at + 1;
        }
        int behind = NAME_LENGTH + 1;
        boolean isNamed = left > behind && text(push, at, NAME_LENGTH).equalsIgnoreCase(name);
        return isNamed ? at + behind : -1;
    }

    private static String text(byte[] push, int at, int length) {
        return CharacterSet.latin1(push, at, at + length);
    }

    private static int endOfText(byte[] push, int at) {
        return CharacterSet.UTF_8.zero(push, at, push.length);
    }
}
