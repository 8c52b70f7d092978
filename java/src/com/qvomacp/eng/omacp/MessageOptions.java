package com.qvomacp.eng.omacp;

import java.util.Locale;

/** The options with which a message that was read could have been encoded. */
final class MessageOptions {
    private static final int FIRST_TEXT = 0x20;
    private static final int LONGEST_SHORT_LENGTH = 0x1F;

    private EncodeOptions options = EncodeOptions.NONE;

    private MessageOptions() {}

    static EncodeOptions of(ProvisioningMessage message) {
        MessageOptions options = new MessageOptions();
        if (message.header() != null) {
            options.header(message.header());
        }
        options.document(message.document());
        return options.options;
    }

    private void set(EncodeOption option, String value) {
        if (!value.equals(option.defaultValue())) {
            options = options.with(option, value);
        }
    }

    private void header(PushHeader header) {
        ContentType type = header.contentType();
        boolean text = header.byteAt(type.mediaTypeOffset()) >= FIRST_TEXT
                && header.byteAt(type.mediaTypeOffset()) < 0x80;
        boolean quoted = header.byteAt(type.offset()) <= LONGEST_SHORT_LENGTH;
        set(
                EncodeOption.CONTENT_TYPE,
                quoted ? text ? "quoted-text" : "quoted" : text ? "text" : "short");
        SecurityMethod method = header.securityMethod();
        boolean isSecured = method != SecurityMethod.NONE && method != SecurityMethod.UNKNOWN;
        if (isSecured) {
            set(EncodeOption.SEC, method.name().toLowerCase(Locale.ROOT));
        }
        for (HeaderField parameter : type.parameters()) {
            security(parameter, header);
        }
        if (header.transactionIdentifier() >= 0) {
            set(EncodeOption.TID, hexadecimal(header.transactionIdentifier()));
        }
        StringBuilder further = new StringBuilder();
        int at = type.offset() + type.length();
        for (HeaderField field : header.fields()) {
            // Encoding writes them anew.
            if (isSecured && security(field, header)) {
                append(further, header, at, field.offset());
                at = field.offset() + field.length();
            }
        }
        append(further, header, at, header.length());
        set(EncodeOption.HEADERS, further.toString());
    }

    /** Whether it is SEC or MAC, and if so, how they are named. */
    private boolean security(HeaderField field, PushHeader header) {
        boolean is = field.name().equals("SEC") || field.name().equals("MAC");
        if (is && header.byteAt(field.offset()) < 0x80) {
            set(EncodeOption.PARAMETERS, "text");
        }
        return is;
    }

    private static void append(StringBuilder to, PushHeader header, int from, int end) {
        for (int at = from; at < end; ++at) {
            to.append(hexadecimal(header.byteAt(at)));
        }
    }

    private void document(ProvisioningDocument document) {
        if (document.charsetName() != null) {
            set(EncodeOption.CHARSET, document.charsetName());
        }
        int table = document.stringTable().length;
        if (document.publicIdentifier() == 0) {
            set(EncodeOption.IDENTIFIER, "table");
            table -= document.documentType().length() + 1;
        }
        set(EncodeOption.STRINGS, table > 0 ? "table" : "inline");
    }

    private static String hexadecimal(int octet) {
        return String.format(Locale.ROOT, "%02X", octet);
    }
}
