package com.qvomacp.eng.omacp;

import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import java.util.Locale;

/**
 * What the native library makes of a push header: PDU type, length, content type, SEC and MAC, which
 * it knows in a few forms only. The length of the headers bounds none of these, it only finds the
 * body.
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

    /** Where that stands which is refused; -1 when the header is taken. */
    final int offset;

    final String found;
    final List<String> expected;
    final String reason;

    private LibraryHeader(
            int bodyAt, int offset, String found, List<String> expected, String reason) {
        this.bodyAt = bodyAt;
        this.offset = offset;
        this.found = found;
        this.expected = expected;
        this.reason = reason;
    }

    private static LibraryHeader taken(int bodyAt) {
        return new LibraryHeader(bodyAt, -1, null, Collections.<String>emptyList(), null);
    }

    private static LibraryHeader refused(
            int offset, String found, List<String> expected, String reason) {
        return new LibraryHeader(0, offset, found, expected, reason);
    }

    private static LibraryHeader ended(byte[] push, List<String> expected, String reason) {
        return refused(push.length, Refusal.END_OF_DATA, expected, reason);
    }

    boolean isTaken() {
        return offset < 0;
    }

    /** Reads the header of a push. */
    static LibraryHeader of(byte[] push) {
        if (push.length > PDU_TYPE && push[PDU_TYPE] != PUSH) {
            String type = hex(push[PDU_TYPE]);
            return refused(
                    PDU_TYPE,
                    type,
                    Collections.singletonList("Push (0x06)"),
                    "PDU type " + type + " is no push");
        }
        if (push.length <= HEADERS) {
            return ended(
                    push,
                    Collections.<String>emptyList(),
                    push.length == 0
                            ? "the message is empty"
                            : "the message ends within its push header, after "
                                    + bytes(push.length));
        }
        int bodyAt = HEADERS + (push[LENGTH] & 0xFF);
        if (bodyAt > push.length) {
            return refused(
                    LENGTH,
                    hex(push[LENGTH]),
                    Collections.singletonList("at most " + (push.length - HEADERS)),
                    "headers of "
                            + bytes(push[LENGTH] & 0xFF)
                            + " are longer than the rest of the message");
        }
        int at = push[HEADERS] == LENGTH_QUOTE ? QUOTED_CONTENT_TYPE : HEADERS;
        int behind = behindContentType(push, at);
        return behind < 0 ? unknownContentType(push, at) : security(push, behind, bodyAt);
    }

    /** Where the content type ends: a name with its zero, or else a short code; -1 for neither. */
    private static int behindContentType(byte[] push, int at) {
        for (String type : MEDIA_TYPES) {
            int end = at + type.length();
            if (end < push.length && push[end] == 0 && isText(push, at, type)) {
                return end + 1;
            }
        }
        for (int code : CODES) {
            if (at < push.length && (push[at] & 0x7F) == code) {
                return at + 1;
            }
        }
        return -1;
    }

    private static boolean isText(byte[] push, int at, String text) {
        for (int i = 0; i < text.length(); ++i) {
            if (push[at + i] != text.charAt(i)) {
                return false;
            }
        }
        return true;
    }

    private static LibraryHeader unknownContentType(byte[] push, int at) {
        List<String> expected = new ArrayList<>();
        for (int i = 0; i < CODES.length; ++i) {
            expected.add(LibraryKind.withToken(MEDIA_TYPES[i], CODES[i] | 0x80));
        }
        expected = Collections.unmodifiableList(expected);
        if (at >= push.length) {
            return ended(push, expected, "the message ends in front of its content type");
        }
        int first = push[at] & 0xFF;
        String type = hex(push[at]);
        if (first >= 0x20 && first <= 0x7F) {
            int end = endOfText(push, at);
            if (end == push.length) {
                return refused(at, "a text", expected, "the message ends within its content type");
            }
            type = Refusal.quoted(push, at, end - at);
        }
        return refused(at, type, expected, "the content type " + type + " is not known");
    }

    /** SEC and MAC are looked for once each, in this order; anything else hides what follows. */
    private static LibraryHeader security(byte[] push, int behind, int bodyAt) {
        int at = valueOf(push, behind, SEC, "SEC");
        int nameAt = at < 0 ? behind : at + 1;
        at = valueOf(push, nameAt, MAC, "MAC");
        if (at < 0) {
            return taken(bodyAt);
        }
        int end = endOfText(push, at);
        List<String> expected =
                Collections.singletonList("at most " + LONGEST_MAC + " characters and a zero byte");
        if (end == push.length) {
            return refused(at, "a text", expected, "the message ends within its MAC");
        }
        if (end - at > LONGEST_MAC) {
            return refused(
                    at,
                    "a text",
                    expected,
                    "a MAC of " + (end - at) + " characters is too long");
        }
        return taken(bodyAt);
    }

    /** Where the value of the parameter begins, if that is what comes next; else -1. */
    private static int valueOf(byte[] push, int at, int token, String name) {
        int left = push.length - at;
        if (left > 1 && (push[at] & 0xFF) == token) {
            return at + 1;
        }
        int behind = NAME_LENGTH + 1;
        if (left > behind
                && new String(push, at, NAME_LENGTH, StandardCharsets.US_ASCII)
                        .equalsIgnoreCase(name)) {
            return at + behind;
        }
        return -1;
    }

    private static int endOfText(byte[] push, int at) {
        int end = at;
        while (end < push.length && push[end] != 0) {
            ++end;
        }
        return end;
    }

    private static String hex(int value) {
        return String.format(Locale.ROOT, "0x%02X", value & 0xFF);
    }

    private static String bytes(int count) {
        return count == 1 ? "1 byte" : count + " bytes";
    }
}
