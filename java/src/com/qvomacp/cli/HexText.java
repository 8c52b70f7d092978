package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Base64;
import java.util.List;
import java.util.Locale;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/**
 * Reads bytes out of text, as logs, dumps, gateways and source code write them. A text is a row of
 * pieces; which of them belong together only their bytes can say.
 */
final class HexText {
    /** Digits on one line, or all the bytes of a dump or of a gateway's form. */
    static final class Piece {
        /** Counted from 1. */
        final int line;

        /**
         * Hexadecimal digits; an odd number of them when a line breaks within a byte. Null for
         * numbers that are no bytes.
         */
        final String digits;

        /** Whether it stands for itself, and is not to be joined with others. */
        final boolean isWhole;

        /** Whether it is user data with its header, by what the text says. */
        final boolean isUserData;

        Piece(int line, String digits, boolean isWhole, boolean isUserData) {
            this.line = line;
            this.digits = digits;
            this.isWhole = isWhole;
            this.isUserData = isUserData;
        }

        boolean follows(Piece other) {
            return !isWhole && !other.isWhole && line == other.line + 1;
        }
    }

    private static final String DIGITS = "0123456789ABCDEF";
    private static final String BYTE_ORDER_MARK = "\uFEFF";

    /** So many digits are behind a label at least, lest words and times be taken for bytes. */
    private static final int FEWEST_BEHIND_LABEL = 16;

    /** What may stand between and around digits, with the letters of a prefix. */
    private static final String AROUND = "xX \t:,;-\"'{}[]()<>";

    private HexText() {}

    /** The content as text when it can be one, without a byte order mark; null otherwise. */
    static String text(byte[] content) {
        boolean isWide = content.length > 1 && (content[0] & 0xFF) + (content[1] & 0xFF) == 0x1FD;
        // Most messages need not be decoded to see that they are no text.
        for (int i = 0; i < content.length && !isWide; ++i) {
            if (content[i] >= 0 && isControl(content[i])) {
                return null;
            }
        }
        Charset charset = isWide ? StandardCharsets.UTF_16 : StandardCharsets.UTF_8;
        String text = new String(content, charset);
        if (isWide && text.chars().anyMatch(HexText::isControl)) {
            return null;
        }
        return text.startsWith(BYTE_ORDER_MARK) ? text.substring(1) : text;
    }

    private static boolean isControl(int c) {
        return c < ' ' && !Character.isWhitespace(c) || c == 0x7F;
    }

    /** The pieces of a text, in their order. */
    static List<Piece> pieces(String text) {
        List<String> lines = Arrays.asList(text.split("\r\n|[\r\n\f]", -1));
        List<Piece> pieces = new ArrayList<>();
        Dump.Repeats repeats = new Dump.Repeats();
        Piece last = null;
        for (int i = 0; i < lines.size(); ++i) {
            Dump dump = Dump.at(lines, i, repeats);
            Piece piece;
            if (dump == null) {
                piece = piece(lines.get(i).trim(), i + 1);
            } else {
                piece = new Piece(i + 1, digits(dump.bytes), true, false);
                i = dump.next - 1;
            }
            // Of numbers that follow each other the first stand for all.
            if (piece != null && (piece.digits != null || last == null || last.digits != null)) {
                pieces.add(piece);
                last = piece;
            }
        }
        return pieces;
    }

    private static Piece piece(String line, int number) {
        // What a modem or its user says about messages is none of them.
        String upper = line.toUpperCase(Locale.ROOT);
        boolean isOfModem = upper.startsWith("+C") || upper.startsWith("AT");
        if (line.isEmpty() || isOfModem || upper.equals("OK")) {
            return null;
        }
        Piece form = gatewayForm(line, number);
        if (form != null) {
            return form;
        }
        boolean isLiteral = line.contains("\\x");
        String digits = isLiteral ? digits(escaped(line)) : behindLabel(line);
        if (digits == null) {
            return null;
        }
        boolean areBytes = isLiteral || !areNumbers(line);
        return new Piece(number, areBytes ? digits : null, !areBytes, false);
    }

    /**
     * The digits that a line ends with, separators, prefixes and brackets left out. Something else
     * in front is a label. Null when there are none, or too few behind a label.
     */
    private static String behindLabel(String line) {
        int from = tail(line);
        boolean hasLabel = from > 0;
        boolean isInWord = hasLabel && Character.isLetterOrDigit(line.charAt(from - 1));
        // A label may end with letters that are digits too.
        while (isInWord && from < line.length() && Character.isLetterOrDigit(line.charAt(from))) {
            ++from;
        }
        int colon = line.indexOf(':');
        // A word of such letters, and no byte.
        if (!hasLabel && colon > 2 && line.matches("(?s)\\p{javaLetterOrDigit}+:.+")) {
            hasLabel = true;
            from = colon + 1;
        }
        String digits = digitsOf(line.substring(from));
        int fewest = hasLabel ? FEWEST_BEHIND_LABEL : 1;
        return digits != null && digits.length() >= fewest ? digits : null;
    }

    /** Whether a line ends with groups of odd numbers of digits, as no bytes do. */
    private static boolean areNumbers(String line) {
        int odd = 0;
        int digits = 0;
        for (int at = line.length() - 1, from = tail(line); at >= from; --at) {
            digits = isDigit(line, at) ? digits + 1 : 0;
            boolean isBegin = digits > 0 && (at == 0 || !isDigit(line, at - 1));
            boolean hasPrefix = isX(line, at - 1) || isX(line, at + digits);
            odd += isBegin && digits % 2 != 0 && !hasPrefix ? 1 : 0;
        }
        return odd > 2;
    }

    private static boolean isX(String line, int at) {
        return at >= 0 && at < line.length() && (line.charAt(at) | 0x20) == 'x';
    }

    /** Where the digits begin that a line ends with, and what may stand around them. */
    private static int tail(String line) {
        int from = line.length();
        while (from > 0
                && (isDigit(line, from - 1) || AROUND.indexOf(line.charAt(from - 1)) >= 0)) {
            --from;
        }
        return from;
    }

    /** The digits without what may stand around them; null for an x that is no prefix. */
    private static String digitsOf(String text) {
        StringBuilder digits = new StringBuilder(text.length());
        for (int i = 0; i < text.length(); ++i) {
            boolean isX = isX(text, i);
            if (isDigit(text, i)) {
                digits.append(text.charAt(i));
            } else if (isX && (i == 0 || text.charAt(i - 1) != '0')) {
                return null;
            } else if (isX && (!isDigit(text, i + 1) || isDigit(text, i + 2))) {
                // The zero of a prefix; in front of a single digit it stays.
                digits.setLength(digits.length() - 1);
            }
        }
        return digits.toString();
    }

    private static boolean isDigit(String text, int at) {
        char c = at < text.length() ? text.charAt(at) : 0;
        return c < 0x80 && Character.digit(c, 16) >= 0;
    }

    /** What two digits stand for; -1 where there are none. */
    private static int byteAt(String text, int at) {
        boolean isByte = isDigit(text, at) && isDigit(text, at + 1);
        return isByte ? Integer.parseInt(text.substring(at, at + 2), 16) : -1;
    }

    /** A literal of source code, where some bytes are escapes and others stand for themselves. */
    private static byte[] escaped(String line) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        int from = line.indexOf('\\');
        int quote = Math.max(line.lastIndexOf('"', from), line.lastIndexOf('\'', from));
        boolean isQuoted = quote >= 0;
        String others = line.substring(from).replaceAll("\\\\x[0-9A-Fa-f]{2}|[\\s,;+\"']", "");
        boolean isPure = others.isEmpty();
        for (int i = isQuoted ? quote + 1 : from; i < line.length(); ++i) {
            char c = line.charAt(i);
            boolean isEscape = c == '\\' && i + 1 < line.length();
            if (isEscape && line.charAt(i + 1) == 'x' && byteAt(line, i + 2) >= 0) {
                bytes.write(byteAt(line, i + 2));
                i += 3;
            } else if (isEscape) {
                int known = "nrt0".indexOf(line.charAt(i + 1));
                bytes.write(known >= 0 ? "\n\r\t\0".charAt(known) : line.charAt(i + 1));
                ++i;
            } else if (isQuoted && c == line.charAt(quote) && !isPure) {
                break;
            } else if (!isPure) {
                bytes.write(c);
            }
        }
        return bytes.toByteArray();
    }

    /** What a gateway is asked to send: {@code udh=%06%05...&text=%01%06...}. */
    private static Piece gatewayForm(String line, int number) {
        byte[] header = member(line, "udh");
        byte[] data = null;
        for (String name : new String[] {"text", "data", "message", "msg", "ud", "binary"}) {
            data = data == null ? member(line, name) : data;
        }
        boolean isForm = header != null || data != null && line.indexOf('%') >= 0;
        if (!isForm && line.charAt(0) != '%') {
            return null;
        }
        data = isForm ? data : percentDecoded(line);
        String digits = (header == null ? "" : digits(header)) + (data == null ? "" : digits(data));
        return new Piece(number, digits, true, header != null);
    }

    /** A member of a form; null when the line has none of that name. */
    private static byte[] member(String line, String name) {
        if (line.indexOf('=') < 0) {
            return null;
        }
        String member = "(?i)(?<!\\p{javaLetterOrDigit})" + name + "=([^&\"' \t]*)";
        Matcher found = Pattern.compile(member).matcher(line);
        if (!found.find()) {
            return null;
        }
        String value = found.group(1);
        String digits = value.indexOf('%') < 0 ? digitsOf(value) : null;
        boolean isWhole = digits != null && digits.length() == value.length();
        return isWhole && digits.length() % 2 == 0 ? bytes(digits) : percentDecoded(value);
    }

    private static byte[] percentDecoded(String value) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        for (int i = 0; i < value.length(); ++i) {
            char c = value.charAt(i);
            if (c == '%' && byteAt(value, i + 1) >= 0) {
                bytes.write(byteAt(value, i + 1));
                i += 2;
            } else {
                bytes.write(c == '+' ? ' ' : c);
            }
        }
        return bytes.toByteArray();
    }

    /**
     * What base64 of either alphabet stands for, white space left out; null for anything else, and
     * for what is nothing but hexadecimal digits.
     */
    static byte[] base64(String text) {
        StringBuilder letters = new StringBuilder(text.length());
        boolean areDigits = true;
        for (int i = 0; i < text.length(); ++i) {
            char c = text.charAt(i);
            if (!Character.isWhitespace(c)) {
                areDigits &= isDigit(text, i);
                letters.append(c == '-' ? '+' : c == '_' ? '/' : c);
            }
        }
        if (areDigits) {
            return null;
        }
        try {
            byte[] bytes = Base64.getDecoder().decode(letters.toString());
            return bytes.length == 0 ? null : bytes;
        } catch (IllegalArgumentException other) {
            return null;
        }
    }

    /** The bytes of an even number of digits. */
    static byte[] bytes(String digits) {
        byte[] bytes = new byte[digits.length() / 2];
        for (int i = 0; i < bytes.length; ++i) {
            bytes[i] = (byte) byteAt(digits, 2 * i);
        }
        return bytes;
    }

    /** Two digits for each byte; null for null. */
    static String digits(byte[] bytes) {
        return bytes == null ? null : digits(bytes, 0, bytes.length, "");
    }

    /** Two digits for each byte of a range, and something between the bytes. */
    static String digits(byte[] bytes, int from, int to, String between) {
        StringBuilder digits = new StringBuilder();
        for (int i = from; i < to; ++i) {
            digits.append(i == from ? "" : between);
            digits.append(DIGITS.charAt(bytes[i] >> 4 & 0xF)).append(DIGITS.charAt(bytes[i] & 0xF));
        }
        return digits.toString();
    }
}
