package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.eng.omacp.WspTable.Kind;
import java.text.SimpleDateFormat;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Date;
import java.util.EnumSet;
import java.util.List;
import java.util.Locale;
import java.util.Set;
import java.util.TimeZone;

/**
 * Reads the header of a push by the grammar of WSP, from front to back.
 *
 * <p>Without a header length that fits and a media type there is no header. Everything else is read
 * as far as it goes: what is said to be longer than the header ends with it, what begins inside the
 * content type is taken to its own end, and an octet that can begin nothing is passed over.
 */
final class HeaderReader {
    private static final int PUSH = 0x06;

    /** What the first octet of a value says: so many octets follow, a length, a text, a number. */
    private static final int LENGTH_QUOTE = 0x1F;

    private static final int FIRST_TEXT = 0x20;
    private static final int FIRST_SHORT = 0x80;

    /** In front of a text that begins with an octet of a number; between headers, a page shift. */
    private static final int QUOTE = 0x7F;

    private static final int SEC = 0x11;
    private static final int MAC = 0x12;
    private static final int METHODS = 4;
    private static final int FIRST_PAGE = 1;

    private static final Set<Kind> LONG_IN_HEADERS =
            EnumSet.of(Kind.INTEGER, Kind.DATE, Kind.APPLICATION, Kind.SEC);

    private static final String NO_MEDIA_TYPE = "the content type has no media type";
    private static final long LAST_SECOND_OF_9999 = 253402300799L;
    private static final char[] DIGITS = "0123456789ABCDEF".toCharArray();

    private final byte[] bytes;
    private final int end;
    private Cursor cursor;

    /** Where the text begins that was read last. */
    private int textAt;

    /** Whether the length of a value that was read last was more than was left. */
    private boolean isCutOff;


    private HeaderReader(byte[] bytes, int from, int end) {
        this.bytes = bytes;
        this.end = end;
        goTo(from);
    }

    /** Reads a push from its transaction identifier on. */
    static PushHeader readPush(byte[] push) throws ProvisioningException {
        Cursor start = new Cursor(push, 0, push.length);
        int transaction = start.take();
        int type = start.peek();
        if (type < 0) {
            throw none(start.at(), "the data ends before the type of a push");
        }
        if (type != PUSH) {
            String likeness = ForeignBytes.describe(push);
            String second = "the second byte is " + hexadecimal(type) + ", and in a push 06";
            String look = likeness == null ? "" : "; this looks like " + likeness;
            throw none(start.at(), second + look);
        }
        start.skip(1);
        long length = start.integer();
        if (length < 0) {
            throw none(2, "the header length is cut off or too large");
        }
        if (length > start.left()) {
            String stated = "the header length is " + length + ", and ";
            throw none(2, stated + start.left() + " bytes follow");
        }
        int from = start.at();
        return new HeaderReader(push, from, from + (int) length).read(transaction, from);
    }

    /** Reads headers from the content type on. */
    static PushHeader readHeaders(byte[] headers) throws ProvisioningException {
        return new HeaderReader(headers, 0, headers.length).read(PushHeader.NO_TRANSACTION, 0);
    }

    private static ProvisioningException none(int offset, String sentence) {
        return new ProvisioningException(Reason.NO_PUSH_HEADER, offset, sentence);
    }

    private PushHeader read(int transaction, int from) throws ProvisioningException {
        ContentType contentType = readContentType();
        return new PushHeader(
                transaction, from, Arrays.copyOf(bytes, end), contentType, readFields());
    }

    private void goTo(int at) {
        cursor = new Cursor(bytes, at, end);
    }

    private ContentType readContentType() throws ProvisioningException {
        int from = cursor.at();
        int first = cursor.peek();
        if (first < 0) {
            throw none(from, "the header ends before the content type");
        }
        int valueEnd = from;
        if (first <= LENGTH_QUOTE) {
            int length = valueLength();
            valueEnd = cursor.at() + length;
            first = length == 0 ? -1 : cursor.peek();
        }
        int mediaTypeAt = cursor.at();
        if (first <= 0 || first == LENGTH_QUOTE) {
            throw none(mediaTypeAt, NO_MEDIA_TYPE);
        }
        List<HeaderField> parameters = new ArrayList<>(4);
        int code;
        String mediaType;
        int mediaTypeEnd;
        if (first >= FIRST_TEXT && first < FIRST_SHORT) {
            String text = text();
            // The native library takes these without their high bit, and senders send them so.
            if (text.indexOf('/') < 0 && LibraryHeader.isCode(first)) {
                goTo(mediaTypeAt + 1);
                text = WspTable.MEDIA_TYPES.name(first);
            }
            int nameEnd = text.indexOf(';');
            mediaType = nameEnd < 0 ? text : text.substring(0, nameEnd);
            mediaType = mediaType.trim().toLowerCase(Locale.ROOT);
            if (mediaType.isEmpty()) {
                throw none(mediaTypeAt, NO_MEDIA_TYPE);
            }
            code = WspTable.MEDIA_TYPES.number(mediaType);
            mediaTypeEnd = nameEnd < 0 ? cursor.at() : textAt + nameEnd;
            if (nameEnd >= 0) {
                readTextParameters(parameters, text, nameEnd);
            }
        } else {
            long number = integer();
            if (number < 0) {
                throw none(mediaTypeAt, "the media type is cut off or no number that can be one");
            }
            code = (int) number;
            mediaType = WspTable.MEDIA_TYPES.nameOrDigits(code);
            mediaTypeEnd = cursor.at();
        }
        while (cursor.at() < valueEnd) {
            readParameter(parameters);
        }
        int to = cursor.at();
        return new ContentType(mediaType, code, from, mediaTypeAt, mediaTypeEnd, to, parameters);
    }

    /** Reads what a gateway has left as text: {@code ; SEC=1; MAC="..."}. */
    private void readTextParameters(List<HeaderField> list, String text, int firstSemicolon) {
        int textAt = this.textAt;
        int from = firstSemicolon;
        while (from < text.length()) {
            int next = text.indexOf(';', from + 1);
            int to = next < 0 ? text.length() : next;
            int equals = text.indexOf('=', from + 1);
            boolean hasValue = equals >= 0 && equals < to;
            String name = text.substring(from + 1, hasValue ? equals : to).trim();
            if (!name.isEmpty()) {
                String value = hasValue ? unquoted(text.substring(equals + 1, to).trim()) : null;
                list.add(new HeaderField(name, value, textAt + from, to - from));
            }
            from = to;
        }
    }

    private static String unquoted(String value) {
        boolean isQuoted = value.length() > 1 && value.startsWith("\"") && value.endsWith("\"");
        return isQuoted ? value.substring(1, value.length() - 1) : value;
    }

    private void readParameter(List<HeaderField> list) {
        int at = cursor.at();
        int first = cursor.peek();
        String name;
        Kind kind;
        if (first >= FIRST_TEXT && first < FIRST_SHORT) {
            name = text();
            kind = WspTable.PARAMETERS.kind(WspTable.PARAMETERS.number(name));
            // Only the token is followed by a number of the form that quality has.
            kind = kind == Kind.QUALITY ? Kind.PLAIN : kind;
        } else {
            long number = first == 0 || first == LENGTH_QUOTE ? passOver() : integer();
            if (number < 0) {
                return;
            }
            name = WspTable.PARAMETERS.nameOrDigits((int) number);
            kind = WspTable.PARAMETERS.kind((int) number);
        }
        boolean isBare = kind == Kind.SEC && isBareMethod();
        String value = isBare ? SecurityMethod.nameOf(cursor.take()) : value(kind, true);
        list.add(new HeaderField(name, value, at, cursor.at() - at));
    }

    /** Goes on by an octet that begins nothing. */
    private int passOver() {
        cursor.skip(1);
        return -1;
    }

    /** Whether a sender has forgotten the high bit of SEC: the token of MAC follows at once. */
    private boolean isBareMethod() {
        int method = cursor.peek();
        return method > 0 && method < METHODS && cursor.peek(1) == (FIRST_SHORT | MAC);
    }

    private List<HeaderField> readFields() {
        List<HeaderField> fields = new ArrayList<>(0);
        int page = FIRST_PAGE;
        while (cursor.left() > 0) {
            int first = cursor.peek();
            if (first == 0) {
                passOver();
            } else if (first < FIRST_TEXT) {
                page = cursor.take();
            } else if (first == QUOTE) {
                passOver();
                page = cursor.take();
            } else {
                fields.add(readField(first, page));
            }
        }
        return fields;
    }

    private HeaderField readField(int first, int page) {
        int at = cursor.at();
        String name;
        Kind kind = Kind.PLAIN;
        if (first < FIRST_SHORT) {
            name = text();
            int number = WspTable.PARAMETERS.number(name);
            kind = number == SEC || number == MAC ? WspTable.PARAMETERS.kind(number) : kind;
        } else if (page == FIRST_PAGE) {
            int number = cursor.take() & 0x7F;
            WspTable table = isMisplaced(number) ? WspTable.PARAMETERS : WspTable.HEADERS;
            name = table.nameOrDigits(number);
            kind = table.kind(number);
        } else {
            name = "0x" + hexadecimal(cursor.take() & 0x7F) + " of code page " + page;
        }
        String value = value(kind, false);
        return new HeaderField(name, value, at, cursor.at() - at);
    }

    /**
     * Whether the token of a parameter stands among the headers, as it does when a content type has
     * no length. As headers the two tokens are Content-Type, which stands in front already, and
     * Date, which is no text.
     */
    private boolean isMisplaced(int number) {
        int first = cursor.peek();
        if (number == SEC) {
            return first >= FIRST_SHORT && first < FIRST_SHORT + METHODS;
        }
        return number == MAC && isHexadecimalText();
    }

    private boolean isHexadecimalText() {
        Cursor ahead = new Cursor(bytes, cursor.at(), end);
        if (ahead.peek() == '"') {
            ahead.skip(1);
        }
        int from = ahead.at();
        int octet = ahead.take();
        while (octet > 0 && Character.digit(octet, 16) >= 0) {
            octet = ahead.take();
        }
        return octet <= 0 && ahead.at() > from + 1;
    }

    /** A value, null when there is none. Only some headers may have a number of several octets. */
    private String value(Kind kind, boolean isParameter) {
        if (kind == Kind.QUALITY) {
            return quality();
        }
        int first = cursor.peek();
        if (first >= FIRST_TEXT) {
            return first >= FIRST_SHORT ? shortNumber(kind) : text();
        }
        if (first <= 0) {
            cursor.skip(1);
            return isParameter || first < 0 ? null : "";
        }
        return data(kind, isParameter ? kind != Kind.MAC : LONG_IN_HEADERS.contains(kind));
    }

    private String shortNumber(Kind kind) {
        int number = cursor.take() & 0x7F;
        if (kind == Kind.VERSION) {
            int minor = number & 0x0F;
            return minor == 0x0F ? "" + (number >> 4) : (number >> 4) + "." + minor;
        }
        return kind == Kind.CHARSET && number == 0 ? "*" : number(number, kind);
    }

    /** Octets behind their length: a number when they are all there, or hexadecimal digits. */
    private String data(Kind kind, boolean mayBeNumber) {
        boolean isLong = cursor.peek() < LENGTH_QUOTE;
        int length = valueLength();
        int from = cursor.at();
        cursor.skip(length);
        long number = 0;
        for (int at = from; at < from + length; ++at) {
            if (number >> 55 != 0) {
                return hexadecimal(bytes, from, length);
            }
            number = number << 8 | bytes[at] & 0xFF;
        }
        return isLong && mayBeNumber && !isCutOff
                ? number(number, kind)
                : hexadecimal(bytes, from, length);
    }

    private static String number(long number, Kind kind) {
        switch (kind) {
            case DATE:
                return number > LAST_SECOND_OF_9999 ? Long.toString(number) : date(number);
            case CHARSET:
                String charset = CharacterSet.of(number).name();
                return charset != null ? charset : Long.toString(number);
            case MEDIA_TYPE:
                return named(WspTable.MEDIA_TYPES, number);
            case FIELD_NAME:
                return named(WspTable.HEADERS, number);
            case APPLICATION:
                return named(WspTable.APPLICATIONS, number);
            case PUSH_FLAG:
                return flags((int) number);
            case SEC:
                return SecurityMethod.nameOf(number);
            default:
                return Long.toString(number);
        }
    }

    private static String named(WspTable table, long number) {
        String name = number > Integer.MAX_VALUE ? null : table.name((int) number);
        return name != null ? name : Long.toString(number);
    }

    private static String date(long seconds) {
        SimpleDateFormat format = new SimpleDateFormat("yyyy-MM-dd'T'HH:mm:ss'Z'", Locale.ROOT);
        format.setTimeZone(TimeZone.getTimeZone("UTC"));
        return format.format(new Date(seconds * 1000));
    }

    private static String flags(int number) {
        String[] names = {"authenticated", "trusted", "last"};
        StringBuilder text = new StringBuilder();
        for (int i = 0; i < names.length; ++i) {
            if ((number >> i & 1) != 0) {
                text.append(text.length() == 0 ? "" : ", ").append(names[i]);
            }
        }
        return text.length() == 0 || number >> names.length != 0
                ? Integer.toString(number)
                : text.toString();
    }

    /** A quality: hundredths and one more up to 100, thousandths and a hundred more beyond. */
    private String quality() {
        long number = cursor.integer();
        if (number < 1 || number > 1099) {
            return number < 0 ? null : Long.toString(number);
        }
        return number <= 100
                ? String.format(Locale.ROOT, "0.%02d", number - 1)
                : String.format(Locale.ROOT, "0.%03d", number - 100);
    }

    /** A text up to its NUL, or to the end of the header, without a quote in front. */
    private String text() {
        int first = cursor.peek();
        if (first == QUOTE || first == '"') {
            cursor.skip(1);
        }
        textAt = cursor.at();
        int length = CharacterSet.UTF_8.zero(bytes, textAt, end) - textAt;
        cursor.skip(length + 1);
        return CharacterSet.latin1(bytes, textAt, textAt + length);
    }

    /** A short or long integer; -1 for one that is cut off or has more than 31 bits. */
    private long integer() {
        int first = cursor.take();
        if (first >= FIRST_SHORT) {
            return first & 0x7F;
        }
        long number = 0;
        for (int i = 0; i < first; ++i) {
            int octet = cursor.take();
            boolean isBad = octet < 0 || number < 0 || number >> 23 != 0;
            number = isBad ? -1 : number << 8 | octet;
        }
        return number;
    }

    /** The length of a value, which the header bounds. */
    private int valueLength() {
        long length = cursor.take();
        if (length == LENGTH_QUOTE) {
            length = cursor.integer();
        }
        isCutOff = length < 0 || length > cursor.left();
        return isCutOff ? cursor.left() : (int) length;
    }

    /** Bytes in capital hexadecimal digits. */
    static String hexadecimal(byte[] bytes, int from, int length) {
        StringBuilder text = new StringBuilder(2 * length);
        for (int at = from; at < from + length; ++at) {
            text.append(DIGITS[bytes[at] >> 4 & 0xF]).append(DIGITS[bytes[at] & 0xF]);
        }
        return text.toString();
    }

    private static String hexadecimal(int octet) {
        return "" + DIGITS[octet >> 4 & 0xF] + DIGITS[octet & 0xF];
    }
}
