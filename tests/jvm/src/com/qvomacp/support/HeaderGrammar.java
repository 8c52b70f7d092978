package com.qvomacp.support;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import java.util.Random;

/**
 * Writes push headers by the grammar of WSP, in any of the forms that it allows, and knows what
 * they say.
 */
public final class HeaderGrammar {
    /** A parameter or a header, as it is to be read. */
    public static final class Field {
        public final String name;
        public final String value;

        Field(String name, String value) {
            this.name = name;
            this.value = value;
        }

        @Override
        public String toString() {
            return name + "=" + value;
        }
    }

    private static final String[][] MEDIA_TYPES = {
        {"36", "application/vnd.wap.connectivity-wbxml"},
        {"35", "text/vnd.wap.connectivity-xml"},
        {"42", "application/vnd.syncml.dm+wbxml"},
        {"44", "application/vnd.syncml.notification"},
        {"2E", "application/vnd.wap.sic"},
        {"03", "text/plain"},
        {"00", "*/*"},
    };

    private static final String[] METHODS = {"NETWPIN", "USERPIN", "USERNETWPIN", "USERPINMAC"};

    private static final int[] TEXT_PARAMETERS = {0x05, 0x06, 0x0A, 0x0B, 0x0C, 0x0D, 0x0F, 0x17};
    private static final String[] TEXT_NAMES = {
        "name", "filename", "start", "start-info", "comment", "domain", "path", "name"
    };
    private static final int[] DATES = {0x12, 0x14, 0x1D};
    private static final String[] DATE_NAMES = {"Date", "Expires", "Last-Modified"};

    private final Random random;
    private ByteArrayOutputStream out = new ByteArrayOutputStream();

    public int transaction;
    public String mediaType;
    public int code;
    public final List<Field> parameters = new ArrayList<>();
    public final List<Field> fields = new ArrayList<>();
    public String sec;
    public String mac;

    /** The header, and the length of what stands in front of the content type. */
    public byte[] bytes;

    public int from;

    public HeaderGrammar(long seed) {
        random = new Random(seed);
        write();
    }

    private void write() {
        int count = random.nextInt(6);
        if (count == 0 && chance()) {
            constrainedMedia();
        } else {
            mediaType();
            for (int i = 0; i < count; ++i) {
                parameter();
            }
            byte[] value = take();
            valueLength(value.length);
            out.writeBytes(value);
        }
        for (int left = random.nextInt(4); left > 0; --left) {
            field();
        }
        byte[] headers = take();
        transaction = random.nextInt(256);
        out.write(transaction);
        out.write(0x06);
        uintvar(headers.length, random.nextInt(4) == 0 ? 1 + random.nextInt(3) : 0);
        from = out.size();
        out.writeBytes(headers);
        bytes = take();
    }

    private boolean chance() {
        return random.nextBoolean();
    }

    private int below(int bound) {
        return random.nextInt(bound);
    }

    private byte[] take() {
        byte[] written = out.toByteArray();
        out = new ByteArrayOutputStream();
        return written;
    }

    private void uintvar(int number, int more) {
        List<Integer> octets = new ArrayList<>();
        int rest = number;
        do {
            octets.add(0, rest & 0x7F | (octets.isEmpty() ? 0 : 0x80));
            rest >>= 7;
        } while (rest != 0);
        for (int i = 0; i < more && octets.size() < 5; ++i) {
            octets.add(0, 0x80);
        }
        octets.forEach(out::write);
    }

    private void valueLength(int length) {
        if (length <= 30 && chance()) {
            out.write(length);
        } else {
            out.write(0x1F);
            uintvar(length, below(2));
        }
    }

    private void integer(int number) {
        if (number < 0x80 && below(3) > 0) {
            out.write(0x80 | number);
        } else {
            longInteger(number, below(2));
        }
    }

    private void longInteger(int number, int zeros) {
        int octets = 1;
        while (octets < 4 && number >>> 8 * octets != 0) {
            ++octets;
        }
        out.write(octets + zeros);
        for (int i = 0; i < zeros; ++i) {
            out.write(0);
        }
        for (int i = octets - 1; i >= 0; --i) {
            out.write(number >>> 8 * i);
        }
    }

    private void textString(String text) {
        if (!text.isEmpty() && text.charAt(0) >= 0x80) {
            out.write(0x7F);
        }
        out.writeBytes(text.getBytes(StandardCharsets.ISO_8859_1));
        out.write(0);
    }

    private void textValue(String text) {
        if (chance()) {
            out.write('"');
            out.writeBytes(text.getBytes(StandardCharsets.ISO_8859_1));
            out.write(0);
        } else {
            textString(text);
        }
    }

    private String token() {
        StringBuilder text = new StringBuilder();
        for (int left = 1 + below(8); left > 0; --left) {
            text.append((char) ('a' + below(26)));
        }
        return "x-" + text;
    }

    private String anyCase(String text) {
        StringBuilder mixed = new StringBuilder();
        for (char c : text.toCharArray()) {
            mixed.append(chance() ? Character.toUpperCase(c) : Character.toLowerCase(c));
        }
        return mixed.toString();
    }

    private void named(String name, int number) {
        mediaType = name;
        code = number;
    }

    private void constrainedMedia() {
        String[] row = MEDIA_TYPES[below(MEDIA_TYPES.length)];
        named(row[1], Integer.parseInt(row[0], 16));
        if (chance()) {
            out.write(0x80 | code);
        } else {
            textString(anyCase(mediaType));
        }
    }

    private void mediaType() {
        if (below(8) == 0) {
            named("application/" + token(), -1);
            textString(mediaType);
            return;
        }
        String[] row = MEDIA_TYPES[below(MEDIA_TYPES.length)];
        named(row[1], Integer.parseInt(row[0], 16));
        if (below(3) == 0) {
            textString(anyCase(mediaType));
        } else {
            integer(code);
        }
    }

    private void parameter() {
        switch (below(10)) {
            case 0:
            case 1:
                securityParameter();
                break;
            case 2:
            case 3:
                macParameter();
                break;
            case 4:
                parameterToken(0x01);
                boolean isAny = below(4) == 0;
                if (isAny) {
                    out.write(0x80);
                } else {
                    integer(106);
                }
                parameters.add(new Field("charset", isAny ? "*" : "UTF-8"));
                break;
            case 5:
                int text = below(TEXT_PARAMETERS.length);
                parameterToken(TEXT_PARAMETERS[text]);
                String value = token() + " " + token();
                textValue(value);
                parameters.add(new Field(TEXT_NAMES[text], value));
                break;
            case 6:
                int number = below(1 << 1 + below(30));
                parameterToken(0x16);
                integer(number);
                parameters.add(new Field("size", "" + number));
                break;
            case 7:
                int hundredths = below(100);
                parameterToken(0x00);
                uintvar(hundredths + 1, 0);
                parameters.add(new Field("Q", String.format("0.%02d", hundredths)));
                break;
            case 8:
                parameterToken(0x10);
                out.write(0);
                parameters.add(new Field("secure", null));
                break;
            default:
                untypedParameter();
                break;
        }
    }

    private void parameterToken(int token) {
        if (below(8) == 0) {
            longInteger(token, below(2));
        } else {
            out.write(0x80 | token);
        }
    }

    private void untypedParameter() {
        String name = token();
        textString(name);
        int form = below(3);
        String value = form == 0 ? null : form == 1 ? "" + below(70000) : token();
        if (form == 0) {
            out.write(0);
        } else if (form == 1) {
            integer(Integer.parseInt(value));
        } else {
            textValue(value);
        }
        parameters.add(new Field(name, value));
    }

    private void securityParameter() {
        int method = below(METHODS.length);
        String name = "SEC";
        if (chance()) {
            parameterToken(0x11);
        } else {
            name = anyCase(name);
            textString(name);
        }
        integer(method);
        parameters.add(new Field(name, METHODS[method]));
        sec = sec != null ? sec : METHODS[method];
    }

    private void macParameter() {
        String name = "MAC";
        StringBuilder digits = new StringBuilder();
        while (digits.length() < 40) {
            digits.append("0123456789ABCDEF".charAt(below(16)));
        }
        if (chance()) {
            parameterToken(0x12);
        } else {
            name = anyCase(name);
            textString(name);
        }
        textValue(digits.toString());
        parameters.add(new Field(name, digits.toString()));
        mac = mac != null ? mac : digits.toString();
    }

    private void field() {
        switch (below(6)) {
            case 0:
                out.write(0x80 | 0x2F);
                integer(4);
                fields.add(new Field("X-Wap-Application-Id", "x-wap-application:mms.ua"));
                break;
            case 1:
                int date = below(DATES.length);
                out.write(0x80 | DATES[date]);
                longInteger(1_000_000_000, 0);
                fields.add(new Field(DATE_NAMES[date], "2001-09-09T01:46:40Z"));
                break;
            case 2:
                out.write(0x80 | 0x34);
                out.write(0x83);
                fields.add(new Field("Push-Flag", "authenticated, trusted"));
                break;
            case 3:
                int length = below(100000);
                out.write(0x80 | 0x0D);
                integer(length);
                fields.add(new Field("Content-Length", "" + length));
                break;
            case 4:
                String uri = "http://" + token() + "/";
                out.write(0x80 | 0x30);
                textString(uri);
                fields.add(new Field("X-Wap-Content-URI", uri));
                break;
            default:
                String name = token();
                String value = token();
                textString(name);
                textString(value);
                fields.add(new Field(name, value));
                break;
        }
    }
}
