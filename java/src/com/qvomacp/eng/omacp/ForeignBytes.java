package com.qvomacp.eng.omacp;

import java.nio.charset.StandardCharsets;
import java.util.Locale;
import java.util.regex.Pattern;

/**
 * Says what bytes look like that are no provisioning message, for the sentence that refuses them.
 * It is a guess, and nothing is read by it.
 *
 * <pre>{@code
 * String likeness = ForeignBytes.describe(bytes);
 * System.err.println(likeness == null ? "no message" : "no message: it looks like " + likeness);
 * }</pre>
 */
public final class ForeignBytes {
    private static final int PUSH = 0x06;
    private static final int CONFIRMED_PUSH = 0x07;
    private static final int LAST_WBXML_VERSION = 0x03;
    private static final int SHORTEST_BASE64 = 16;
    private static final Pattern BLANKS = Pattern.compile("\\s+");
    private static final Pattern HEXADECIMAL = Pattern.compile("[0-9A-Fa-f]+");
    private static final Pattern BASE64 = Pattern.compile("[0-9A-Za-z+/=_-]+");
    private static final char BYTE_ORDER_MARK = '\uFEFF';
    private static final int LONGEST_LOOK = 4096;

    /** What is in WBXML under a public identifier. */
    private static final Object[] DOCUMENTS = {
        0x02, "WML 1.0", 0x03, "WTA 1.0", 0x04, "WML 1.1",
        0x05, "a service indication (SI 1.0)", 0x06, "a service loading (SL 1.0)",
        0x07, "a cache operation (CO 1.0)", 0x08, "a channel (CHANNEL 1.1)",
        0x09, "WML 1.2", 0x0A, "WML 1.3", 0x0B, "a provisioning document (PROV 1.0)",
        0x0C, "WTA-WML 1.2", 0x0D, "an e-mail notification (EMN 1.0)",
        0x0E, "DRM rights (DRMREL 1.0)", 0x0F, "instant messaging (CSP 1.0)",
        0x10, "instant messaging (CSP 1.1)", 0x11, "instant messaging (CSP 1.2)",
        0x12, "instant messaging (CSP 1.3)", 0x13, "DRM (DRM 2.1)",
        0xFD1, "SyncML 1.0", 0xFD2, "device information (DevInf 1.0)",
        0xFD3, "SyncML 1.1, as of synchronisation or device management",
        0xFD4, "device information (DevInf 1.1)",
        0x1201, "SyncML 1.2, as of synchronisation or device management",
        0x1202, "meta information (MetInf 1.2)", 0x1203, "device information (DevInf 1.2)",
    };

    /** What is pushed under the number of a media type. */
    private static final Object[] PUSHED = {
        0x2D, "a service indication in XML", 0x2E, "a service indication",
        0x2F, "a service loading in XML", 0x30, "a service loading",
        0x31, "a cache operation in XML", 0x32, "a cache operation",
        0x34, "a session initiation", 0x35, "a provisioning document in XML",
        0x36, "a provisioning document", 0x3E, "an MMS notification",
        0x42, "a device management message", 0x43, "a device management message in XML",
        0x44, "a device management notification", 0x48, "a DRM message",
        0x4A, "DRM rights in XML", 0x4B, "DRM rights", 0x4E, "a synchronisation notification",
        0x304, "an e-mail notification in XML", 0x30A, "an e-mail notification",
        0x312, "a location request (SUPL)",
    };

    /** How XML begins, by the names of its document elements. */
    private static final String[] ELEMENTS = {
        "wap-provisioningdoc", "a provisioning document in XML, which is not encoded yet",
        "si", "a service indication in XML", "sl", "a service loading in XML",
        "co", "a cache operation in XML", "emn", "an e-mail notification in XML",
        "syncml", "SyncML in XML", "html", "a page in HTML",
    };

    /** How files of other kinds begin. */
    private static final String[] FILES = {
        "\u008C\u0082", "an MMS notification",
        "\u00D4\u00C3\u00B2\u00A1", "a capture of packets (pcap)",
        "\u00A1\u00B2\u00C3\u00D4", "a capture of packets (pcap)",
        "\n\r\r\n", "a capture of packets (pcapng)", "PK\u0003\u0004", "a ZIP archive",
        "\u001F\u008B", "data compressed by gzip", "\u0089PNG", "a picture (PNG)",
        "\u00FF\u00D8\u00FF", "a picture (JPEG)", "%PDF", "a PDF document",
    };

    private ForeignBytes() {}

    /**
     * Says what bytes look like: other documents in WBXML, other pushes, SMS, XML, hexadecimal or
     * base64 text, and so on.
     *
     * @param bytes any bytes
     * @return such as {@code a service indication (SI 1.0) in WBXML}, without any text of the bytes
     *     but the name of a media type; {@code null} when they look like nothing that is known
     */
    public static String describe(byte[] bytes) {
        if (bytes.length == 0) {
            return "no bytes at all";
        }
        String text = text(bytes);
        if (text != null) {
            return text(text);
        }
        String name = push(bytes);
        name = name != null ? name : sms(bytes);
        name = name != null ? name : wbxml(bytes);
        return name != null ? name : file(bytes);
    }

    /** What a row of a number tells; null without such a row. */
    private static String told(Object[] rows, long number) {
        for (int i = 0; i < rows.length; i += 2) {
            if ((Integer) rows[i] == number) {
                return (String) rows[i + 1];
            }
        }
        return null;
    }

    private static String push(byte[] bytes) {
        int type = bytes.length > 1 ? bytes[1] : 0;
        if (type != PUSH && type != CONFIRMED_PUSH) {
            return null;
        }
        ContentType content;
        try {
            byte[] push = bytes.clone();
            push[1] = PUSH;
            content = PushHeader.parse(push).contentType();
        } catch (ProvisioningException none) {
            return null;
        }
        String mediaType = content.mediaType();
        if (mediaType.indexOf('/') < 0) {
            return null;
        }
        // A name that no standard has, and senders use.
        boolean isNamed = mediaType.equals("application/vnd.wap.connectivity-xml");
        String pushed = told(PUSHED, isNamed ? 0x35 : content.code());
        return (type == PUSH ? "a push of " : "a confirmed push of ")
                + (pushed != null ? pushed : "the type " + Printable.of(mediaType));
    }

    private static String wbxml(byte[] bytes) {
        Cursor cursor = new Cursor(bytes, 0, bytes.length);
        int version = cursor.take();
        long type = cursor.integer();
        String name = told(DOCUMENTS, type);
        if (version > LAST_WBXML_VERSION || name == null) {
            return null;
        }
        boolean hasCharset = version == 0 || cursor.integer() >= 0;
        return hasCharset && cursor.integer() <= cursor.left() ? name + " in WBXML" : null;
    }

    /** Whether the lengths of a message between handset and network, or of its data, come out. */
    private static String sms(byte[] bytes) {
        int centre = bytes[0];
        boolean isCentre =
                centre == 0 || centre > 1 && centre <= 12 && bytes.length > 1 && bytes[1] < 0;
        String name = isCentre ? transferUnit(new Cursor(bytes, centre + 1, bytes.length)) : null;
        name = name != null ? name : transferUnit(new Cursor(bytes, 0, bytes.length));
        return name == null && isUserData(bytes) ? "the user data of an SMS" : name;
    }

    private static String transferUnit(Cursor cursor) {
        int first = cursor.take();
        int type = first & 0x03;
        if (first < 0 || type > 1) {
            return null;
        }
        boolean isSubmit = type == 1;
        cursor.skip(isSubmit ? 1 : 0);
        int digits = cursor.take();
        int kind = cursor.take();
        if (digits < 0 || digits > 20 || kind < 0x80) {
            return null;
        }
        cursor.skip((digits + 1) / 2 + 1);
        int coding = cursor.take();
        int validity = (first & 0x18) == 0 ? 0 : (first & 0x18) == 0x10 ? 1 : 7;
        cursor.skip(isSubmit ? validity : 7);
        int length = cursor.take();
        boolean isText = (coding & 0xCC) == 0 || (coding & 0xF4) == 0xF0;
        int octets = isText ? (7 * length + 7) / 8 : length;
        if (length < 0 || octets != cursor.left()) {
            return null;
        }
        return isSubmit ? "an SMS that is being sent (SMS-SUBMIT)" : "an SMS (SMS-DELIVER)";
    }

    private static boolean isUserData(byte[] bytes) {
        int left = bytes[0];
        boolean isKnown = false;
        Cursor cursor = new Cursor(bytes, 1, bytes.length);
        while (left > 0) {
            int element = cursor.take();
            int length = cursor.take();
            if (length < 0 || length > cursor.left()) {
                return false;
            }
            isKnown |= element == 0x05 && length == 4 || element == 0 && length == 3;
            cursor.skip(length);
            left -= 2 + length;
        }
        return isKnown && left == 0;
    }

    private static String file(byte[] bytes) {
        int length = Math.min(bytes.length, 8);
        String start = new String(bytes, 0, length, StandardCharsets.ISO_8859_1);
        for (int i = 0; i < FILES.length; i += 2) {
            if (start.startsWith(FILES[i])) {
                return FILES[i + 1];
            }
        }
        return null;
    }

    /** The bytes as text when they can be one, without a byte order mark; null otherwise. */
    private static String text(byte[] bytes) {
        boolean isWide = bytes.length > 1 && (bytes[0] & 0xFF) + (bytes[1] & 0xFF) == 0xFE + 0xFF;
        String text = new String(bytes, isWide ? StandardCharsets.UTF_16 : StandardCharsets.UTF_8);
        boolean isMarked = !text.isEmpty() && text.charAt(0) == BYTE_ORDER_MARK;
        text = isMarked ? text.substring(1) : text;
        for (int i = 0; i < text.length(); ++i) {
            char c = text.charAt(i);
            if (c < ' ' && !Character.isWhitespace(c) || c == '\u007F' || c == '\uFFFD') {
                return null;
            }
        }
        return text;
    }

    private static String text(String text) {
        String content = text.trim();
        if (content.isEmpty()) {
            return "nothing but blanks";
        }
        if (content.startsWith("<")) {
            return markup(content);
        }
        if (content.startsWith("{") || content.startsWith("[")) {
            return "JSON";
        }
        if (content.startsWith("+CM") || content.startsWith("AT+CM")) {
            return "what a modem says of an SMS";
        }
        return encoded(content);
    }

    private static String markup(String content) {
        String start = content.substring(0, Math.min(content.length(), LONGEST_LOOK));
        String lower = start.toLowerCase(Locale.ROOT);
        int found = start.length();
        String name = "XML";
        for (int i = 0; i < ELEMENTS.length; i += 2) {
            int at = lower.indexOf("<" + ELEMENTS[i]);
            int after = at + 1 + ELEMENTS[i].length();
            boolean isFirst = at >= 0 && at < found && after < start.length();
            if (isFirst && " \t\r\n>/".indexOf(start.charAt(after)) >= 0) {
                found = at;
                name = ELEMENTS[i + 1];
            }
        }
        return name;
    }

    private static String encoded(String content) {
        String packed = BLANKS.matcher(content).replaceAll("");
        if (HEXADECIMAL.matcher(packed).matches()) {
            return packed.length() % 2 == 0
                    ? "hexadecimal text"
                    : "hexadecimal text with an odd number of digits, " + packed.length();
        }
        boolean isLong = packed.length() >= SHORTEST_BASE64 && content.indexOf(' ') < 0;
        return isLong && BASE64.matcher(packed).matches() ? "base64 text" : "text";
    }
}
