package com.qvomacp.eng.omacp;

import java.nio.ByteBuffer;
import java.nio.CharBuffer;
import java.nio.charset.Charset;
import java.nio.charset.CharsetDecoder;
import java.nio.charset.StandardCharsets;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/**
 * The characters of a document in XML, and the place where reading stands. Nothing but these bytes
 * is ever read: there is nothing here that could open a file or a connection.
 */
final class XmlText {
    /** The start of an XML declaration, be it behind a byte order mark, with its encoding. */
    private static final Pattern ENCODING =
            Pattern.compile(
                    "(?s)(?:\u00EF\u00BB\u00BF)?<\\?xml(?>.*?encoding)[^\"']*([\"'])(.*?)\\1");

    private static final int LONGEST_DECLARATION = 200;
    private static final String BYTE_ORDER_MARK = "\uFEFF";

    private final String text;
    private int at;

    /** How far the lines have been counted, how many there are, and where the last one begins. */
    private int counted;

    private int lines;
    private int lineStart;

    /** The text of bytes in the encoding that they state, or else in UTF-8. */
    XmlText(byte[] bytes) throws EncodingException {
        Charset charset = charset(bytes);
        CharsetDecoder decoder = charset.newDecoder();
        ByteBuffer in = ByteBuffer.wrap(bytes);
        CharBuffer out = CharBuffer.allocate((int) (bytes.length * decoder.maxCharsPerByte()) + 1);
        boolean isError = decoder.decode(in, out, true).isError();
        out.flip();
        String decoded = out.toString();
        text = decoded.startsWith(BYTE_ORDER_MARK) ? decoded.substring(1) : decoded;
        if (isError) {
            throw errorAt(text.length(), "the bytes here are not " + charset.name());
        }
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
        int length = Math.min(bytes.length, LONGEST_DECLARATION);
        String start = new String(bytes, 0, length, StandardCharsets.ISO_8859_1);
        Matcher declaration = ENCODING.matcher(start).region(0, Math.max(start.indexOf("?>"), 0));
        if (!declaration.lookingAt()) {
            return StandardCharsets.UTF_8;
        }
        try {
            return Charset.forName(declaration.group(2));
        } catch (IllegalArgumentException e) {
            throw EncodingException.at(1, 1, "the encoding of the document is not known");
        }
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
        return text.charAt(at++);
    }

    /** Goes on by one character, which is there, with both its halves. */
    int takeCodePoint() {
        int c = text.codePointAt(at);
        at += Character.charCount(c);
        return c;
    }

    /** Goes on by so many characters, which are there. */
    void skip(int count) {
        at += count;
    }

    /** Goes on behind `what`, if that stands here. */
    boolean skipIf(String what) {
        if (!startsWith(what)) {
            return false;
        }
        at += what.length();
        return true;
    }

    /** Goes on behind the next `what` and answers what stands in front of it. */
    String takeUntil(String what, String name) throws EncodingException {
        int end = text.indexOf(what, at);
        if (end < 0) {
            throw error(name + " does not end", what);
        }
        String taken = text.substring(at, end);
        at = end + what.length();
        return taken;
    }

    /** Goes on behind blanks; false when there was none. */
    boolean skipBlanks() {
        int from = at;
        while (isBlank(peek())) {
            ++at;
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
            ++at;
        }
        return text.substring(from, at);
    }

    private static boolean isNameCharacter(int c) {
        return c < 0x80
                ? Character.isLetterOrDigit(c) || "-_.:".indexOf(c) >= 0
                : Character.isUnicodeIdentifierPart(c);
    }

    int at() {
        return at;
    }

    /** Line and column of a place, counted from 1: in one go for places in their order. */
    int[] place(int offset) {
        if (offset < counted) {
            counted = 0;
            lines = 0;
            lineStart = 0;
        }
        for (; counted < offset; ++counted) {
            char c = text.charAt(counted);
            if (c == '\n' || c == '\r' && !text.startsWith("\n", counted + 1)) {
                ++lines;
                lineStart = counted + 1;
            }
        }
        return new int[] {lines + 1, offset - lineStart + 1};
    }

    /** An error at this place. */
    EncodingException error(String sentence, String... expected) {
        return errorAt(at, sentence, expected);
    }

    EncodingException errorAt(int offset, String sentence, String... expected) {
        int[] place = place(offset);
        return EncodingException.at(place[0], place[1], sentence, expected);
    }
}
