package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.Deviation.Kind;
import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import java.util.Arrays;
import java.util.HashMap;
import java.util.Locale;
import java.util.Map;

/**
 * Reads a body as WBXML 1.0 to 1.3 has it, and tells a {@link Reading} what it reads. A loop over the
 * tokens: depth costs no stack. What departs from the format is told, and read as far as it can be.
 */
final class BodyReader {
    static final int SWITCH_PAGE = 0x00;
    static final int END = 0x01;
    static final int ENTITY = 0x02;
    static final int STR_I = 0x03;
    static final int LITERAL = 0x04;
    static final int EXT_I_0 = 0x40;
    static final int EXT_I_2 = 0x42;
    static final int PI = 0x43;
    static final int EXT_T_0 = 0x80;
    static final int EXT_T_2 = 0x82;
    static final int STR_T = 0x83;
    static final int EXT_0 = 0xC0;
    static final int OPAQUE = 0xC3;

    private static final int ATTRIBUTES = 0x80;
    private static final int CONTENT = 0x40;
    private static final int ELEMENT = 0x3F;
    private static final int FIRST_VALUE = 0x80;

    /** The tokens of a parm and of VALUE on either page, and a parm with attributes alone. */
    private static final int PARM = 0x07;

    private static final int VALUE = 0x06;
    private static final int PLAIN_PARM = 0x87;

    /** The parm, NAME, VALUE, one value, END: bytes. */
    private static final int SHORTEST_PARM = 5;

    /** The tokens that are a piece of text, in values as well as where elements stand. */
    private static final boolean[] PIECES = new boolean[0x100];

    static {
        int[] single = {ENTITY, STR_I, STR_T, OPAQUE};
        for (int token : single) {
            PIECES[token] = true;
        }
        int[] extensions = {EXT_I_0, EXT_T_0, EXT_0};
        for (int first : extensions) {
            Arrays.fill(PIECES, first, first + 3, true);
        }
    }

    private static final String NO_LITERAL = "unknown-literal";

    private final byte[] body;
    private final BodyHeader header;
    private final CharacterSet charset;
    private final Cursor cursor;
    private final Reading reading;
    private final int textLimit;

    private int elementPage;
    private int attributePage;
    private CodePage elements = CodePage.of(0);
    private CodePage attributes = CodePage.of(0);

    private int depth;
    private boolean rootEnded;

    /** The element whose attributes are read. */
    private Element element;

    /** How many pieces the value has that is read. */
    private int pieces;

    /** Bytes of all texts so far. */
    private int textLength;

    /** The texts of the string table that were referred to, by their offsets, and their lengths. */
    private String[] tableTexts;

    private int[] tableLengths;

    /** Names for tokens that stand for nothing, so that equal ones are one text. */
    private Map<Integer, String> unknown;

    BodyReader(byte[] body, BodyHeader header, int textLimit, Reading reading) {
        this.body = body;
        this.header = header;
        this.charset = header.charset;
        this.cursor = new Cursor(body, header.elementsAt, body.length);
        this.reading = reading;
        this.textLimit = textLimit;
    }

    /** Reads everything behind the header. */
    void read() throws ProvisioningException {
        Cursor cursor = this.cursor;
        deviationsOfHeader();
        for (int token; (token = cursor.take()) >= 0; ) {
            int from = cursor.at() - 1;
            if (token == PLAIN_PARM) {
                // In a row, for on 32 bits HotSpot pays much for a call that it does not inline.
                int behind = plainParms(from);
                if (behind > from) {
                    cursor.skip(behind - cursor.at());
                    continue;
                }
            }
            if (depth == 0 && (rootEnded ? token != PI : token == END)) {
                trailing(from);
                break;
            }
            if (token == END) {
                end(from);
            } else if (token == SWITCH_PAGE) {
                elementPage = switchPage(from, false, elementPage);
                elements = CodePage.of(elementPage);
            } else if (token == PI) {
                instruction(from);
            } else if (PIECES[token]) {
                piece(from, token);
            } else {
                element(from, token);
            }
        }
        int end = cursor.at();
        if (depth > 0) {
            reading.deviation(end, Kind.END_MISSING);
        } else if (!rootEnded) {
            reading.deviation(end, Kind.NO_ROOT);
        }
        for (; depth > 0; --depth) {
            reading.end(end, end);
        }
    }

    private void deviationsOfHeader() {
        if (!header.isVersionKnown()) {
            reading.deviation(0, Kind.VERSION);
        }
        if (!header.isStated()) {
            reading.deviation(header.identifierAt, Kind.DOCUMENT_TYPE);
        }
        if (charset.name() == null && charset.number() != CharacterSet.NOT_STATED) {
            reading.deviation(header.charsetAt, Kind.CHARSET);
        }
    }

    private void trailing(int from) {
        cursor.skip(cursor.left());
        reading.deviation(from, Kind.TRAILING);
        reading.trailing(from, cursor.at());
    }

    // --- Elements and instructions -------------------------------------------------------------

    private void element(int from, int token) throws ProvisioningException {
        String name = null;
        if ((token & ELEMENT) == LITERAL) {
            name = literal(from);
            element = Element.of(name);
        } else {
            element = elementOf(from, token & ELEMENT);
            name = element == Element.OTHER ? unknown(elementPage, token & ELEMENT) : element.text;
        }
        if (element == Element.DOCUMENT && depth > 0) {
            element = Element.OTHER;
        }
        reading.element(from, cursor.at(), element, name, (token & ATTRIBUTES) != 0);
        ++depth;
        if ((token & ATTRIBUTES) != 0) {
            attributes((token & CONTENT) != 0);
        } else if ((token & CONTENT) == 0) {
            end(cursor.at());
        }
    }

    /**
     * Reads parms in a row whose attributes are what nearly all are: a token for its name, and as its
     * value one token, or one text of ASCII in its place. Answers where the first begins that is not.
     */
    private int plainParms(int first) throws ProvisioningException {
        byte[] body = this.body;
        int from = first;
        if (depth == 0 || elements.element(PARM) != Element.PARM) {
            return from;
        }
        while (body.length - from >= SHORTEST_PARM
                && body[from] == (byte) PLAIN_PARM
                && body[from + 1] >= 0
                && body[from + 2] == VALUE) {
            int start = from + 4;
            int end = start;
            int token = body[from + 3] & 0xFF;
            String name = PIECES[body[from + 1]] ? null : attributes.name(body[from + 1]);
            if (name == null) {
                break;
            }
            String value = null;
            if (token == STR_I) {
                end = asciiEnd(start) + 1;
                if (end > 0 && end < body.length && body[end] == END) {
                    charge(start - 1, end - 1 - start);
                    value = CharacterSet.latin1(body, start, end - 1);
                }
            } else if (token >= FIRST_VALUE && !PIECES[token] && body[start] == END) {
                value = attributes.value(token);
            }
            if (value == null) {
                break;
            }
            Writing writing = token == STR_I ? Writing.INLINE : Writing.TOKEN;
            reading.parameter(from, end + 1, name, value, writing);
            from = end + 1;
        }
        return from;
    }

    private Element elementOf(int from, int token) {
        Element found = elements.element(token);
        if (found == null) {
            found = CodePage.of(0).element(token);
            notOnPage(from, found);
        }
        return found == null ? Element.OTHER : found;
    }

    /** Tells of a token that the code page in force does not have, and what page 0 has for it. */
    private void notOnPage(int from, Object ofFirstPage) {
        boolean isFound = ofFirstPage != null;
        reading.deviation(from, isFound ? Kind.OTHER_PAGE : Kind.UNKNOWN_TOKEN);
    }

    private void instruction(int from) throws ProvisioningException {
        element = Element.INSTRUCTION;
        reading.element(from, cursor.at(), element, null, true);
        boolean ended = rootEnded;
        ++depth;
        attributes(false);
        rootEnded = ended;
    }

    /** The innermost element ends, by the END at {@code from} or, when that is not taken, by itself. */
    private void end(int from) {
        reading.end(from, cursor.at());
        rootEnded = --depth == 0;
    }

    private int switchPage(int from, boolean ofAttributes, int before) {
        int page = cursor.take();
        if (page < 0) {
            reading.deviation(from, Kind.CUT_OFF);
            page = before;
        }
        reading.page(from, cursor.at(), ofAttributes, page);
        return page;
    }

    // --- Attributes ----------------------------------------------------------------------------

    /** Reads attributes up to their END, which is that of the element when it has no content. */
    private void attributes(boolean content) throws ProvisioningException {
        Cursor cursor = this.cursor;
        for (int token; (token = cursor.take()) >= 0; ) {
            int from = cursor.at() - 1;
            if (token == END) {
                if (content) {
                    reading.attributesEnd(from, cursor.at());
                } else {
                    end(from);
                }
                return;
            }
            if (token == SWITCH_PAGE) {
                attributePage = switchPage(from, true, attributePage);
                attributes = CodePage.of(attributePage);
            } else if (PIECES[token] && !isOfPage(token)) {
                piece(from, token);
                ++pieces;
            } else if (token >= FIRST_VALUE) {
                value(from, token);
                ++pieces;
            } else {
                attribute(from, token);
            }
        }
    }

    /**
     * Whether a token that WBXML gives another meaning is one of the code page all the same, as some
     * of page 1 are. They stand for extensions, which mean nothing to the format, and for a reference
     * to the string table, which it can only be where there is a table.
     */
    private boolean isOfPage(int token) {
        if (attributePage == 0) {
            return false;
        }
        if (token < FIRST_VALUE) {
            return attributes.attribute(token) != null;
        }
        return attributes.value(token) != null
                && (token != STR_T || header.tableAt == header.elementsAt);
    }

    private void attribute(int from, int token) throws ProvisioningException {
        if (token == LITERAL) {
            String name = literal(from);
            Attribute attribute = Attribute.of(name);
            name = attribute == Attribute.OTHER ? name : null;
            reading.attribute(from, cursor.at(), attribute, name, null);
            pieces = 0;
            return;
        }
        if (PIECES[token]) {
            reading.deviation(from, Kind.OTHER_MEANING);
        }
        CodePage page = attributes;
        Attribute attribute = page.attribute(token);
        if (attribute == null) {
            page = CodePage.of(0);
            attribute = page.attribute(token);
            notOnPage(from, attribute);
        }
        if (attribute != null) {
            String value = page.begin(token);
            reading.attribute(from, cursor.at(), attribute, null, value);
            pieces = value == null ? 0 : 1;
            return;
        }
        String name = unknown(attributePage, token);
        if (element.name != null) {
            // Nearly all tokens say what a parm or characteristic is, so this one may do so too.
            reading.attribute(from, cursor.at(), element.name, null, name);
            pieces = 1;
        } else {
            reading.attribute(from, cursor.at(), Attribute.OTHER, name, null);
            pieces = 0;
        }
    }

    private void value(int from, int token) throws ProvisioningException {
        if (PIECES[token]) {
            reading.deviation(from, Kind.OTHER_MEANING);
        }
        String value = attributes.value(token);
        if (value == null) {
            value = CodePage.of(0).value(token);
            notOnPage(from, value);
        }
        value = value == null ? unknown(attributePage, token) : value;
        if (pieces > 0) {
            charge(from, value.length());
        }
        reading.text(from, cursor.at(), Writing.TOKEN, value);
    }

    // --- Texts ---------------------------------------------------------------------------------

    private void piece(int from, int token) throws ProvisioningException {
        String text;
        Writing writing;
        if (token == STR_I) {
            text = inline(from);
            writing = Writing.INLINE;
        } else if (token == STR_T) {
            text = reference(from, "");
            writing = Writing.TABLE;
        } else if (token == OPAQUE) {
            text = opaque(from);
            writing = Writing.OPAQUE;
        } else {
            writing = Writing.ENTITY;
            text = token == ENTITY ? character(from) : extension(from, token);
        }
        reading.text(from, cursor.at(), writing, text);
    }

    private String inline(int from) throws ProvisioningException {
        int start = cursor.at();
        int zero = asciiEnd(start);
        if (zero >= 0) {
            cursor.skip(zero - start + 1);
            charge(from, zero - start);
            return CharacterSet.latin1(body, start, zero);
        }
        int end = start + cursor.left();
        zero = charset.zero(body, start, end);
        if (zero == end) {
            reading.deviation(from, Kind.CUT_OFF);
        }
        cursor.skip(zero - start + charset.unit());
        return decode(from, start, zero);
    }

    /** Where the zero stands behind a text that is all ASCII; -1 for another text. */
    private int asciiEnd(int start) {
        byte[] body = this.body;
        int end = body.length;
        int at = start;
        if (charset.isAscii()) {
            while (at < end && body[at] > 0) {
                ++at;
            }
            if (at < end && body[at] == 0) {
                return at;
            }
        }
        return -1;
    }

    private String opaque(int from) throws ProvisioningException {
        long length = integer(from);
        int start = cursor.at();
        if (length > cursor.left()) {
            reading.deviation(from, Kind.CUT_OFF);
        }
        cursor.skip((int) Math.max(0, Math.min(length, cursor.left())));
        return decode(from, start, cursor.at());
    }

    private String decode(int from, int start, int end) throws ProvisioningException {
        charge(from, end - start);
        String text = charset.decode(body, start, end);
        if (text.indexOf(CharacterSet.REPLACEMENT) >= 0) {
            reading.deviation(from, Kind.BAD_TEXT);
        }
        return text;
    }

    private String character(int from) throws ProvisioningException {
        long point = integer(from);
        charge(from, 1);
        if (point == Cursor.NO_INTEGER) {
            return String.valueOf(CharacterSet.REPLACEMENT);
        }
        if (point > Character.MAX_CODE_POINT
                || point >= Character.MIN_SURROGATE && point <= Character.MAX_SURROGATE) {
            reading.deviation(from, Kind.NO_CHARACTER);
            return String.valueOf(CharacterSet.REPLACEMENT);
        }
        return new String(Character.toChars((int) point));
    }

    private String extension(int from, int token) throws ProvisioningException {
        reading.deviation(from, Kind.EXTENSION);
        if (token <= EXT_I_2) {
            return inline(from);
        }
        if (token <= EXT_T_2) {
            long number = integer(from);
            String text = number == Cursor.NO_INTEGER ? "" : Long.toString(number);
            charge(from, text.length());
            return text;
        }
        return "";
    }

    /** A multi-byte integer; {@link Cursor#NO_INTEGER}, which is told, for one that cannot be read. */
    private long integer(int from) {
        long value = cursor.integer();
        if (value == Cursor.NO_INTEGER) {
            notReadable(from, Kind.NUMBER);
        }
        return value;
    }

    /** Tells of an integer that is cut off, or of another kind. */
    private void notReadable(int from, Kind kind) {
        reading.deviation(from, cursor.left() == 0 ? Kind.CUT_OFF : kind);
    }

    private String literal(int from) throws ProvisioningException {
        return reference(from, NO_LITERAL);
    }

    /** A text of the string table, or {@code otherwise} when there is none. */
    private String reference(int from, String otherwise) throws ProvisioningException {
        long index = cursor.integer();
        int length = header.elementsAt - header.tableAt;
        if (index == Cursor.NO_INTEGER) {
            notReadable(from, Kind.REFERENCE);
            return otherwise;
        }
        if (index >= length) {
            reading.deviation(from, Kind.REFERENCE);
            return otherwise;
        }
        if (tableTexts == null) {
            tableTexts = new String[length];
            tableLengths = new int[length];
        }
        int place = (int) index;
        if (tableTexts[place] == null) {
            int start = header.tableAt + place;
            int zero = charset.zero(body, start, header.elementsAt);
            tableTexts[place] = decode(from, start, zero);
            tableLengths[place] = zero - start;
        } else {
            charge(from, tableLengths[place]);
        }
        return tableTexts[place];
    }

    private void charge(int from, int length) throws ProvisioningException {
        textLength += length;
        if (textLength > textLimit || textLength < 0) {
            String text = "the texts of the document are more than " + textLimit + " bytes";
            throw new ProvisioningException(Reason.TEXT_TOO_LONG, from, text);
        }
    }

    private String unknown(int page, int token) {
        if (unknown == null) {
            unknown = new HashMap<>();
        }
        Integer key = page << Byte.SIZE | token;
        String name = unknown.get(key);
        if (name == null) {
            String digits = Integer.toHexString(0x100 | token).substring(1);
            name = "unknown-" + page + "-" + digits.toUpperCase(Locale.ROOT);
            unknown.put(key, name);
        }
        return name;
    }
}
