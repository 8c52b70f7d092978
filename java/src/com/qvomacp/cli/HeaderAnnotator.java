package com.qvomacp.cli;

import java.nio.charset.StandardCharsets;

/**
 * Says what the bytes of a push header mean, as the library reads them: PDU type, length, content
 * type, SEC, MAC; whatever else stands there is skipped. The length of the headers bounds none of
 * these, it only finds the body.
 */
final class HeaderAnnotator extends Cursor {
    private static final int FIXED = 3;
    private static final int PUSH = 0x06;
    private static final int LENGTH_QUOTE = 0x1F;
    private static final int SEC = 0x91;
    private static final int MAC = 0x92;
    private static final int LONGEST_MAC = 43;
    private static final int NAME_LENGTH = 3;

    private static final int[] CODES = {54, 53, 68, 78, 66};

    private HeaderAnnotator(byte[] message) {
        super(message, Math.min(message.length, endOf(message)));
    }

    /** Where the body starts by what the header says. */
    private static int endOf(byte[] message) {
        return message.length < FIXED ? message.length : FIXED + (message[2] & 0xFF);
    }

    /** Annotates a message up to its body, or all of it when the header is refused. */
    static Annotation.Section annotate(byte[] message) {
        HeaderAnnotator annotator = new HeaderAnnotator(message);
        Stop stop = null;
        try {
            annotator.read();
        } catch (Stop refused) {
            stop = refused;
            stop.read = Math.min(annotator.at, message.length);
            stop.path = "push header";
            annotator.size = message.length;
        }
        annotator.finish(stop, stop == null ? "other headers, not examined" : "not read");
        return new Annotation.Section(annotator.notes, annotator.size, stop);
    }

    private void read() throws Stop {
        if (data.length <= FIXED) {
            throw new Stop(
                    0,
                    data.length,
                    0,
                    data.length == 0
                            ? "there is no message, not a single byte"
                            : "the message ends within its push header, after "
                                    + data.length
                                    + " bytes",
                    null);
        }
        if ((data[1] & 0xFF) != PUSH) {
            throw new Stop(
                    0, 1, 1, String.format("PDU type 0x%02X is no push", data[1]), "0x06 (Push)");
        }
        if (endOf(data) > data.length) {
            throw new Stop(
                    0,
                    2,
                    1,
                    "headers of " + (data[2] & 0xFF) + " bytes are longer than the message",
                    "at most " + (data.length - FIXED));
        }
        at = 1;
        note(String.format("transaction identifier 0x%02X", data[0]));
        at = 2;
        note("PDU type: Push");
        at = FIXED;
        note("headers: " + (data[2] & 0xFF) + " bytes");
        if (next() == LENGTH_QUOTE) {
            ++at;
            say("length quote");
            if (at < data.length) {
                ++at;
                say("content type value: " + (data[at - 1] & 0xFF) + " bytes, not examined");
            }
        }
        contentType();
        security();
    }

    /** A note that may reach into the body, whose bytes have notes of their own. */
    private void say(String text) {
        if (at <= size) {
            note(text);
        } else {
            int before = notes.size();
            note(text + " (reaches into the body)");
            if (notes.size() == before) {
                remark(text + " (in bytes of the body)");
            }
        }
    }

    private void contentType() throws Stop {
        if (at >= data.length) {
            throw new Stop(0, at, 0, "the message ends in front of its content type", null);
        }
        for (int code : CODES) {
            String type = Header.mediaType(code);
            if (isText(type)) {
                at += type.length() + 1;
                say("content type \"" + type + '"');
                return;
            }
        }
        int first = next();
        int code = first & 0x7F;
        if (Header.mediaType(code) == null) {
            int end = at;
            boolean named = first >= 0x20 && first < 0x80;
            while (named && end < data.length && data[end] != 0) {
                ++end;
            }
            throw new Stop(
                    0,
                    at,
                    named ? end - at : 1,
                    "unknown content type "
                            + (named
                                    ? Visible.quoted(data, at, end)
                                    : String.format("0x%02X", first)),
                    accepted());
        }
        ++at;
        say(String.format("content type 0x%02X: %s", code, Header.mediaType(code)));
    }

    private static String accepted() {
        StringBuilder list = new StringBuilder();
        for (int code : CODES) {
            list.append(list.length() == 0 ? "" : ", ").append(Header.mediaType(code));
            list.append(String.format(" (0x%02X)", code | 0x80));
        }
        return list.toString();
    }

    /** Whether the text stands next, with the zero behind it. */
    private boolean isText(String text) {
        int end = at + text.length();
        return end < data.length
                && data[end] == 0
                && new String(data, at, text.length(), StandardCharsets.ISO_8859_1).equals(text);
    }

    private void security() throws Stop {
        if (findValue(SEC, "SEC")) {
            ++at;
            say("security method: " + Header.secShown(data[at - 1] & 0xFF));
        }
        int name = at;
        if (!findValue(MAC, "MAC")) {
            return;
        }
        int end = at;
        while (end < data.length && data[end] != 0) {
            ++end;
        }
        if (end == data.length || end - at > LONGEST_MAC) {
            String reason =
                    end == data.length
                            ? "the MAC has no end"
                            : "a MAC of " + (end - at) + " characters is too long";
            throw new Stop(0, name, end - name, reason, "at most 43 characters and a zero byte");
        }
        String mac = Visible.quoted(data, at, end);
        at = end + 1;
        say("MAC " + mac);
    }

    /** Goes to the value of the parameter, if that is what comes next. */
    private boolean findValue(int token, String name) {
        int left = data.length - at;
        int taken = 0;
        if (left > 1 && next() == token) {
            taken = 1;
        } else if (left > NAME_LENGTH + 1
                && new String(data, at, NAME_LENGTH, StandardCharsets.ISO_8859_1)
                        .equalsIgnoreCase(name)) {
            taken = NAME_LENGTH + 1;
        }
        at += taken;
        if (taken != 0) {
            say("parameter " + name);
        }
        return taken != 0;
    }
}
