package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import java.nio.charset.StandardCharsets;
import java.util.Locale;

/**
 * Finds out from a message why the library has refused it, since the library itself only says that
 * it has. The push header is looked at in the order in which the library reads it.
 */
final class Refusal {
    private static final int PDU_TYPE = 1;
    private static final int HEADERS_LENGTH = 2;
    private static final int HEADERS = 3;
    private static final int QUOTED_CONTENT_TYPE = 5;

    private static final int PUSH = 0x06;
    private static final int LENGTH_QUOTE = 0x1F;
    private static final int FIRST_TEXT = 0x20;
    private static final int LAST_TEXT = 0x7F;
    private static final int LONGEST_SHOWN = 60;

    private Refusal() {}

    /** Says what a message lacks before the library need be asked; null when it lacks nothing. */
    static ProvisioningException ofOutline(byte[] message) {
        if (message == null || message.length == 0) {
            return exception(Reason.NO_MESSAGE, "there is no message");
        }
        if (message.length > PDU_TYPE && unsigned(message, PDU_TYPE) != PUSH) {
            return exception(
                    Reason.NOT_A_PUSH,
                    "not a push: PDU type %s in place of 0x06",
                    hex(unsigned(message, PDU_TYPE)));
        }
        if (message.length <= HEADERS) {
            return exception(
                    Reason.HEADER_CUT_OFF,
                    "the message ends within its push header, after %d bytes",
                    message.length);
        }
        int end = HEADERS + unsigned(message, HEADERS_LENGTH);
        if (message.length < end) {
            return exception(
                    Reason.HEADER_CUT_OFF,
                    "the push header is %d bytes long, but the message ends after %d",
                    end,
                    message.length);
        }
        return null;
    }

    /** Says why the library refuses the push header of a message whose outline is in order. */
    static ProvisioningException ofHeader(byte[] message) {
        int at = unsigned(message, HEADERS) == LENGTH_QUOTE ? QUOTED_CONTENT_TYPE : HEADERS;
        if (at >= message.length) {
            return exception(
                    Reason.HEADER_CUT_OFF, "the message ends in front of the content type");
        }
        int first = unsigned(message, at);
        String name = null;
        if (first >= FIRST_TEXT && first <= LAST_TEXT) {
            int end = endOfText(message, at);
            if (end == message.length) {
                return exception(
                        Reason.HEADER_CUT_OFF, "the message ends within its content type");
            }
            name = new String(message, at, end - at, StandardCharsets.ISO_8859_1);
        }
        if (ContentType.named(name) == null && ContentType.ofCode(first & 0x7F) == null) {
            return exception(
                    Reason.UNKNOWN_CONTENT_TYPE,
                    "unknown content type %s",
                    name == null ? hex(first) : '"' + shown(name) + '"');
        }
        return exception(
                Reason.BAD_MAC, "the MAC of the push header does not end, or is too long");
    }

    /**
     * Says why the library refuses a body whose push header it has taken.
     *
     * @param decoder the decoder's word on the body; null without it
     */
    static ProvisioningException ofBody(PushHeader header, NativeDecoder decoder) {
        String mediaType = header.getContentType().getMediaType();
        if (header.getBodyLength() == 0) {
            return new ProvisioningException(
                    Reason.EMPTY_BODY,
                    text("the message (%s) ends with its push header: it has no body", mediaType),
                    decoder);
        }
        return new ProvisioningException(
                Reason.BODY_REFUSED,
                text(
                        "the body (%s, %d bytes) is not a provisioning document that can be"
                                + " decoded%s",
                        mediaType, header.getBodyLength(), detail(header, decoder)),
                decoder);
    }

    private static String detail(PushHeader header, NativeDecoder decoder) {
        if (header.firstBodyByte() == '<') {
            return ": it is XML, not WBXML";
        }
        if (decoder == null) {
            return "";
        }
        return decoder.code == 0
                ? ": it holds no document"
                : text(": result code %d behind %d bytes of it", decoder.code, decoder.read);
    }

    private static ProvisioningException exception(Reason reason, String text, Object... values) {
        return new ProvisioningException(reason, text(text, values));
    }

    private static String text(String text, Object... values) {
        return String.format(Locale.ROOT, text, values);
    }

    private static int unsigned(byte[] message, int at) {
        return message[at] & 0xFF;
    }

    private static String hex(int value) {
        return String.format(Locale.ROOT, "0x%02X", value);
    }

    /** Where the zero behind a text stands; the length of the message when there is none. */
    private static int endOfText(byte[] message, int at) {
        int end = at;
        while (end < message.length && message[end] != 0) {
            ++end;
        }
        return end;
    }

    /** A text of the message as one line of plain characters, not too long. */
    private static String shown(String text) {
        String start = text.length() > LONGEST_SHOWN ? text.substring(0, LONGEST_SHOWN) : text;
        return start.replaceAll("[^ -~]", "?") + (start.length() < text.length() ? "..." : "");
    }
}
