package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;

/** Puts the header of a push (WAP-230-WSP) in front of a body, with SEC and MAC. */
final class PushWriter {
    private static final int PUSH = 0x06;
    private static final int LENGTH_QUOTE = 0x1F;

    private static final int CONNECTIVITY_WBXML = 0xB6;
    private static final String CONNECTIVITY_WBXML_TEXT = "application/vnd.wap.connectivity-wbxml";

    private static final int SEC = 0x91;
    private static final int MAC = 0x92;
    private static final int SHORT_INTEGER = 0x80;

    private PushWriter() {}

    static byte[] write(byte[] body, EncodeOptions options) throws EncodingException {
        ByteArrayOutputStream contentType = new ByteArrayOutputStream();
        String form = options.value(EncodeOption.CONTENT_TYPE);
        if (form.endsWith("text")) {
            text(CONNECTIVITY_WBXML_TEXT, contentType);
        } else {
            contentType.write(CONNECTIVITY_WBXML);
        }
        security(body, options, contentType);

        ByteArrayOutputStream headers = new ByteArrayOutputStream();
        if (form.startsWith("quoted")) {
            headers.write(LENGTH_QUOTE);
            BodyWriter.integer(contentType.size(), headers);
        }
        headers.write(contentType.toByteArray(), 0, contentType.size());
        byte[] further = hexadecimal(EncodeOption.HEADERS, options);
        headers.write(further, 0, further.length);

        byte[] tid = hexadecimal(EncodeOption.TID, options);
        if (tid.length != 1) {
            throw EncodingException.in(null, "tid is not one byte");
        }
        ByteArrayOutputStream push = new ByteArrayOutputStream();
        push.write(tid[0]);
        push.write(PUSH);
        BodyWriter.integer(headers.size(), push);
        push.write(headers.toByteArray(), 0, headers.size());
        push.write(body, 0, body.length);
        return push.toByteArray();
    }

    private static void text(String text, ByteArrayOutputStream out) {
        byte[] bytes = text.getBytes(StandardCharsets.US_ASCII);
        out.write(bytes, 0, bytes.length);
        out.write(0);
    }

    private static byte[] hexadecimal(EncodeOption option, EncodeOptions options)
            throws EncodingException {
        String digits = options.value(option).replace(" ", "");
        byte[] bytes = new byte[digits.length() / 2];
        boolean right = digits.length() % 2 == 0;
        for (int i = 0; i < bytes.length && right; ++i) {
            int high = Character.digit(digits.charAt(2 * i), 16);
            int low = Character.digit(digits.charAt(2 * i + 1), 16);
            right = high >= 0 && low >= 0;
            bytes[i] = (byte) (high << 4 | low);
        }
        if (!right) {
            throw EncodingException.in(null, option.optionName() + " is not hexadecimal");
        }
        return bytes;
    }
}
