package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.nio.ByteBuffer;
import java.nio.CharBuffer;
import java.nio.charset.CharacterCodingException;
import java.nio.charset.CharsetEncoder;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.Map;

/**
 * Writes a document as a body: the Binary XML Content Format (WAP-192-WBXML), version 1.3, with the
 * tokens of OMA provisioning content (OMA-WAP-TS-ProvCont).
 */
final class BodyWriter extends DocumentTaker {
    private static final int ATTRIBUTES = 0x80;
    private static final int CONTENT = 0x40;
    private static final int DOCUMENT = 0x05 | CONTENT;
    private static final int CHARACTERISTIC = 0x06 | ATTRIBUTES | CONTENT;
    private static final int PARM = 0x07 | ATTRIBUTES;

    private static final int NAME = 0x05;
    private static final int VALUE = 0x06;
    private static final int VERSION = 0x45;
    private static final int VERSION_1_0 = 0x46;
    private static final int TYPE = 0x50;

    private static final int WBXML_1_3 = 0x03;
    private static final int PROV_1_0 = 0x0B;
    private static final String PROV_1_0_TEXT = "-//WAPFORUM//DTD PROV 1.0//EN";

    /** The texts of the document, and how often each occurs. */
    private final Map<String, Integer> counts = new LinkedHashMap<>();

    /** Where texts stand in the string table. */
    private final Map<String, Integer> places = new HashMap<>();

    private final ByteArrayOutputStream table = new ByteArrayOutputStream();
    private final ByteArrayOutputStream out = new ByteArrayOutputStream();
    private final String version;
    private final WritingTokens tokens;
    private final CharsetEncoder encoder;
    private final byte[] terminator;

    private int page;

    private BodyWriter(Item root, String version, WritingTokens tokens, CharacterSet charset) {
        super(root);
        this.version = version;
        this.tokens = tokens;
        this.encoder = charset.newEncoder();
        this.terminator = new byte[charset.unit()];
    }

    static byte[] write(Item root, String version, EncodeOptions options)
            throws EncodingException {
        String name = options.value(EncodeOption.CHARSET);
        int charset = CharacterSet.number(name);
        if (charset == CharacterSet.NOT_STATED) {
            throw EncodingException.in(null, "the character set " + name + " is not known");
        }
        WritingTokens tokens = new WritingTokens(options.value(EncodeOption.TOKENS));
        BodyWriter writer = new BodyWriter(root, version, tokens, CharacterSet.of(charset));
        return writer.body(options, charset);
    }

    private byte[] body(EncodeOptions options, int charset) throws EncodingException {
        boolean typeAsText = options.is(EncodeOption.IDENTIFIER, "table");
        if (typeAsText) {
            place(PROV_1_0_TEXT);
        }
        document();
        if (options.is(EncodeOption.STRINGS, "table")) {
            for (Map.Entry<String, Integer> text : counts.entrySet()) {
                if (text.getValue() > 1) {
                    place(text.getKey());
                }
            }
            document();
        }
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.write(WBXML_1_3);
        if (typeAsText) {
            body.write(0);
            body.write(0);
        } else {
            body.write(PROV_1_0);
        }
        integer(charset, body);
        integer(table.size(), body);
        body.write(table.toByteArray(), 0, table.size());
        body.write(out.toByteArray(), 0, out.size());
        return body.toByteArray();
    }

    /** Puts a text into the string table. */
    private void place(String text) throws EncodingException {
        places.put(text, table.size());
        string(text, table);
    }

    private void document() throws EncodingException {
        out.reset();
        page = 0;
        out.write(version == null ? DOCUMENT : DOCUMENT | ATTRIBUTES);
        if (version != null) {
            start("1.0".equals(version) ? VERSION_1_0 : WritingTokens.NONE, VERSION, version);
            out.write(BodyReader.END);
        }
        take();
        out.write(BodyReader.END);
    }

    /** One without children is written as one with content, too. */
    @Override
    void characteristic(String type) throws EncodingException {
        out.write(type == null ? CHARACTERISTIC ^ ATTRIBUTES : CHARACTERISTIC);
        if (type != null) {
            start(tokens.type(type, page), TYPE, type);
            out.write(BodyReader.END);
        }
    }

    @Override
    void parameter(String name, String value) throws EncodingException {
        if (name == null && value == null) {
            out.write(PARM ^ ATTRIBUTES);
            return;
        }
        out.write(PARM);
        if (name != null) {
            start(tokens.name(name, page), NAME, name);
        }
        if (value != null) {
            out.write(VALUE);
            String rest = tokens.writeValue(innermost(), name, value, page, out);
            if (rest != null) {
                text(rest);
            }
        }
        out.write(BodyReader.END);
    }

    @Override
    void end() {
        out.write(BodyReader.END);
    }

    /**
     * Writes a token behind a switch to its page, or else `literal` and the text.
     *
     * @param token page and token, or {@link WritingTokens#NONE}
     */
    private void start(int token, int literal, String text) throws EncodingException {
        if (token == WritingTokens.NONE) {
            out.write(literal);
            text(text);
            return;
        }
        if (token >> 8 != page) {
            page = token >> 8;
            out.write(BodyReader.SWITCH_PAGE);
            out.write(page);
        }
        out.write(token & 0xFF);
    }

    private void text(String text) throws EncodingException {
        Integer count = counts.get(text);
        counts.put(text, count == null ? 1 : count + 1);
        Integer place = places.get(text);
        if (place == null) {
            out.write(BodyReader.STR_I);
            string(text, out);
        } else {
            out.write(BodyReader.STR_T);
            integer(place, out);
        }
    }

    /** Writes a text in the character set of the document, with its terminator. */
    private void string(String text, ByteArrayOutputStream to) throws EncodingException {
        if (text.indexOf(0) >= 0) {
            throw error("a text with a NUL has no inline form");
        }
        try {
            ByteBuffer bytes = encoder.encode(CharBuffer.wrap(text));
            to.write(bytes.array(), bytes.arrayOffset(), bytes.limit());
        } catch (CharacterCodingException e) {
            throw error("a text cannot be written in " + encoder.charset().name());
        }
        to.write(terminator, 0, terminator.length);
    }

    /** Writes a multi-byte integer. */
    static void integer(int number, ByteArrayOutputStream to) {
        for (int shift = 28; shift > 0; shift -= 7) {
            if (number >>> shift != 0) {
                to.write(0x80 | number >>> shift & 0x7F);
            }
        }
        to.write(number & 0x7F);
    }
}
