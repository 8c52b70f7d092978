package com.qvomacp.eng.omacp;

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
        int mediaType = header.byteAt(type.mediaTypeOffset());
        boolean isText = mediaType >= FIRST_TEXT && mediaType < 0x80;
        boolean isQuoted = header.byteAt(type.offset()) <= LONGEST_SHORT_LENGTH;
        String form = isText ? "text" : "short";
        set(EncodeOption.CONTENT_TYPE, isQuoted ? isText ? "quoted-text" : "quoted" : form);
        SecurityMethod method = header.securityMethod();
        boolean isSecured = method != SecurityMethod.NONE && method != SecurityMethod.UNKNOWN;
        if (isSecured) {
            set(EncodeOption.SEC, Printable.nameOf(method));
        }
        for (HeaderField parameter : type.parameters()) {
            security(parameter, header);
        }
        if (header.transactionIdentifier() >= 0) {
            set(EncodeOption.TID, hexadecimal(header, 0, 1));
        }
        StringBuilder further = new StringBuilder();
        int at = type.offset() + type.length();
        for (HeaderField field : header.fields()) {
            // Encoding writes them anew.
            if (isSecured && security(field, header)) {
                further.append(hexadecimal(header, at, field.offset()));
                at = field.offset() + field.length();
            }
        }
        further.append(hexadecimal(header, at, header.length()));
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

    private static String hexadecimal(PushHeader header, int from, int end) {
        return HeaderReader.hexadecimal(header.bytes(), from, end - from);
    }

    private void document(ProvisioningDocument document) {
        if (document.charsetName() != null) {
            set(EncodeOption.CHARSET, document.charsetName());
        }
        int table = document.stringTable().length;
        if (document.publicIdentifier() == 0) {
            set(EncodeOption.IDENTIFIER, "table");
            String type = document.documentType();
            table -= type == null ? 0 : type.length() + 1;
        }
        set(EncodeOption.STRINGS, table > 0 ? "table" : "inline");
    }
}
