package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.Locale;

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
        append(contentType.toByteArray(), headers);
        append(hexadecimal(EncodeOption.HEADERS, options), headers);

        byte[] tid = hexadecimal(EncodeOption.TID, options);
        if (tid.length != 1) {
            throw EncodingException.in(null, "tid is not one byte");
        }
        ByteArrayOutputStream push = new ByteArrayOutputStream();
        push.write(tid[0]);
        push.write(PUSH);
        BodyWriter.integer(headers.size(), push);
        append(headers.toByteArray(), push);
        append(body, push);
        return push.toByteArray();
    }

    /** SEC and MAC, as parameters of the content type. */
    private static void security(byte[] body, EncodeOptions options, ByteArrayOutputStream out)
            throws EncodingException {
        SecurityMethod method = method(options);
        if (method == SecurityMethod.NONE) {
            return;
        }
        parameter(SEC, "SEC", options, out);
        out.write(SHORT_INTEGER | method.ordinal() - SecurityMethod.NETWPIN.ordinal());
        // The user is told that of USERPINMAC, apart from the message.
        if (method != SecurityMethod.USERPINMAC) {
            parameter(MAC, "MAC", options, out);
            text(mac(method, body, options), out);
        }
    }

    private static void parameter(
            int token, String name, EncodeOptions options, ByteArrayOutputStream out) {
        if (options.is(EncodeOption.PARAMETERS, "text")) {
            text(name, out);
        } else {
            out.write(token);
        }
    }

    /** The security method that the options ask for. */
    static SecurityMethod method(EncodeOptions options) {
        String name = options.value(EncodeOption.SEC);
        return name == null
                ? SecurityMethod.NONE
                : SecurityMethod.valueOf(name.toUpperCase(Locale.ROOT));
    }

    private static String mac(SecurityMethod method, byte[] body, EncodeOptions options)
            throws EncodingException {
        if (options.value(EncodeOption.KEY) != null) {
            byte[] key = hexadecimal(EncodeOption.KEY, options);
            if (key.length == 0) {
                throw EncodingException.in(null, "the key is empty");
            }
            return ProvisioningMac.compute(key, body);
        }
        String pin = options.value(EncodeOption.PIN);
        String imsi = options.value(EncodeOption.IMSI);
        String mac = ProvisioningMac.compute(method, body, pin, imsi);
        if (mac == null) {
            String needsPin = method == SecurityMethod.NETWPIN ? "" : " a PIN";
            String needsImsi = method == SecurityMethod.USERPIN ? "" : " an IMSI of 1 to 15 digits";
            String and = needsPin.isEmpty() || needsImsi.isEmpty() ? "" : " and";
            throw EncodingException.in(
                    null,
                    options.value(EncodeOption.SEC) + " needs" + needsPin + and + needsImsi,
                    EncodeOption.PIN.optionName(),
                    EncodeOption.IMSI.optionName(),
                    EncodeOption.KEY.optionName());
        }
        return mac;
    }

    private static void text(String text, ByteArrayOutputStream out) {
        append(text.getBytes(StandardCharsets.US_ASCII), out);
        out.write(0);
    }

    private static void append(byte[] bytes, ByteArrayOutputStream out) {
        out.write(bytes, 0, bytes.length);
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
