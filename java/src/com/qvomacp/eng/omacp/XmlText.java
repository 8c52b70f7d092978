package com.qvomacp.eng.omacp;

import java.nio.ByteBuffer;
import java.nio.CharBuffer;
import java.nio.charset.CharacterCodingException;
import java.nio.charset.Charset;
import java.nio.charset.CharsetDecoder;
import java.nio.charset.CoderResult;
import java.nio.charset.CodingErrorAction;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;

/**
 * The characters of a document in XML, and the place where reading stands. Nothing but these bytes
 * is ever read: there is nothing here that could open a file or a connection.
 */
final class XmlText {
    private static final char BYTE_ORDER_MARK = '\uFEFF';

    private final String text;
    private int at;
    private int line = 1;
    private int lineStart;

    private XmlText(String text) {
        this.text = text;
    }

    /** The text of bytes in the encoding that they state, or else in UTF-8. */
    static XmlText of(byte[] bytes) throws EncodingException {
        Charset charset = charset(bytes);
        CharsetDecoder decoder =
                charset.newDecoder()
                        .onMalformedInput(CodingErrorAction.REPORT)
                        .onUnmappableCharacter(CodingErrorAction.REPORT);
        ByteBuffer in = ByteBuffer.wrap(bytes);
        CharBuffer out = CharBuffer.allocate((int) (bytes.length * decoder.maxCharsPerByte()) + 1);
        CoderResult result = decoder.decode(in, out, true);
        out.flip();
        XmlText text = new XmlText(out.toString());
        if (text.peek() == BYTE_ORDER_MARK) {
            text.at = 1;
            text.lineStart = 1;
        }
        if (result.isError()) {
            text.skip(out.length() - text.at);
            throw text.error("the bytes here are not " + charset.name());
        }
        return text;
    }

    private static Charset charset(byte[] bytes) throws EncodingException {
        int first = bytes.length > 0 ? bytes[0] & 0xFF : -1;
        int second = bytes.length > 1 ? bytes[1] & 0xFF : -1;
        if (first == 0xFE && second == 0xFF || first == 0 && second == '<') {
            return StandardCharsets.UTF_16BE;
        }
        if (first == 0xFF && second == 0xFE || first == '<' && second == 0) {
            return StandardCharsets.UTF_16LE;
        }
        String stated = statedEncoding(bytes);
        if (stated == null) {
            return StandardCharsets.UTF_8;
        }
        try {
            return Charset.forName(stated);
        } catch (IllegalArgumentException e) {
            throw EncodingException.at(1, 1, "the encoding of the document is not known");
        }
    }

    /** What the XML declaration calls the encoding; null when it does not. */
    private static String statedEncoding(byte[] bytes) {
        String start =
                new String(
                        Arrays.copyOf(bytes, Math.min(bytes.length, 200)),
                        StandardCharsets.ISO_8859_1);
        int end = start.indexOf("?>");
        if (!start.replaceFirst("^\u00EF\u00BB\u00BF", "").startsWith("<?xml") || end < 0) {
            return null;
        }
        int name = start.indexOf("encoding");
        if (name < 0 || name > end) {
            return null;
        }
        int from = name;
        while (from < end && start.charAt(from) != '"' && start.charAt(from) != '\'') {
            ++from;
        }
        int to = start.indexOf(start.charAt(from), from + 1);
        return to > from && to < end ? start.substring(from + 1, to) : null;
    }

    /** The next character, or -1 at the end; the place stays. */
    int peek() {
        return at < text.length() ? text.charAt(at) : -1;
    }

    boolean startsWith(String what) {
        return text.startsWith(what, at);
    }

    boolean isAtEnd() {
        return at == text.length();
    }

    /** Goes on by one character, which is there. */
    char take() {
        char c = text.charAt(at++);
        if (c == '\n' || c == '\r' && peek() != '\n') {
            ++line;
            lineStart = at;
        }
        return c;
    }

    /** Goes on by so many characters, which are there. */
    void skip(int count) {
        for (int i = 0; i < count; ++i) {
            take();
        }
    }

    /** Goes on behind `what`, if that stands here. */
    boolean skipIf(String what) {
        if (!startsWith(what)) {
            return false;
        }
        skip(what.length());
        return true;
    }

    /** Goes on behind the next `what` and answers what stands in front of it. */
    String takeUntil(String what, String name) throws EncodingException {
        int end = text.indexOf(what, at);
        if (end < 0) {
            throw error(name + " does not end", what);
        }
        String taken = text.substring(at, end);
        skip(end + what.length() - at);
        return taken;
    }

    /** Goes on behind blanks; false when there was none. */
    boolean skipBlanks() {
        int from = at;
        while (isBlank(peek())) {
            take();
        }
        return at > from;
    }

    static boolean isBlank(int c) {
        return c == ' ' || c == '\t' || c == '\n' || c == '\r';
    }

    /** Takes a name, which may be empty. */
    String takeName() {
        int from = at;
        while (isNameCharacter(peek())) {
            take();
        }
        return text.substring(from, at);
    }

    private static boolean isNameCharacter(int c) {
        return c >= 'a' && c <= 'z'
                || c >= 'A' && c <= 'Z'
                || c >= '0' && c <= '9'
                || c == '-'
                || c == '_'
                || c == '.'
                || c == ':'
                || c >= 0x80 && Character.isUnicodeIdentifierPart(c);
    }

    int line() {
        return line;
    }

    /** Counted from 1. */
    int column() {
        return at - lineStart + 1;
    }

    /** An error at this place. */
    EncodingException error(String sentence, String... expected) {
        return EncodingException.at(line, column(), sentence, expected);
    }
}
