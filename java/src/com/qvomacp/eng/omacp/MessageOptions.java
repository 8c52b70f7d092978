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
        if (method != SecurityMethod.NONE && method != SecurityMethod.UNKNOWN) {
            set(EncodeOption.SEC, method.name().toLowerCase(Locale.ROOT));
        }
        for (HeaderField parameter : type.parameters()) {
            if (parameter.name().equals("SEC") && header.byteAt(parameter.offset()) < 0x80) {
                set(EncodeOption.PARAMETERS, "text");
            }
        }
        if (header.transactionIdentifier() >= 0) {
            set(EncodeOption.TID, hexadecimal(header.transactionIdentifier()));
        }
        StringBuilder further = new StringBuilder();
        for (int at = type.offset() + type.length(); at < header.length(); ++at) {
            further.append(hexadecimal(header.byteAt(at)));
        }
        set(EncodeOption.HEADERS, further.toString());
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
