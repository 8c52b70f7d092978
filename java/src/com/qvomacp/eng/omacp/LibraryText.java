package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.LibraryStop.Cause;
import com.qvomacp.eng.omacp.LibraryStop.Place;
import java.nio.charset.StandardCharsets;

/**
 * Reads the bytes, the page switches and the texts of a body as the native library's decoder does.
 * No text is built but the start of names; the lengths of all count towards the library's limit.
 */
abstract class LibraryText {
    static final int SWITCH_PAGE = 0x00;
    static final int END = 0x01;
    static final int STR_I = 0x03;
    static final int STR_T = 0x83;
    static final int OPAQUE = 0xC3;
    static final int VALUE = 0x06;
    static final int TAG_MASK = 0x3F;

    private static final int FIRST_VALUE = 0x80;
    private static final int LONGEST_INTEGER = 5;

    /** Text that is decoded whatever the length of the body, and that for each of its bytes. */
    private static final long TEXT_ALWAYS = 8L << 20;

    private static final long TEXT_PER_BYTE = 100;

    /** Longer than every name that is compared. */
    private static final int NAME_KEPT = 64;

    /** How the text of a value token joins a text that is there: as it is, or not to be seen. */
    private static final char DIRECT = '=';

    private static final char OUT_OF_SIGHT = '-';

    /** The value tokens that have a text, with a comma in front of one that joins by it. */
    private static final byte[][] VALUE_TEXTS =
            values(
                    "85=IPV4 86=IPV6 87=E164 88=ALPHA 89=APN 8A=SCODE 8B=TETRA-ITSI 8C=MAN"
                            + " 91,HTTP 92,BASIC 93,DIGEST 9A,PAP 9B,CHAP 9C,HTTP-BASIC"
                            + " 9D,HTTP-DIGEST 9E,WTLS_SS 9F,MD5 90-ANALOG-MODEM"
                            + " 94-BIT-TRANSPARENT 95-DIRECT-ASYNCHRONOUS-DATA-SERVICE");

    /** The body. */
    final byte[] data;

    final int size;

    /** How many bytes have been read. */
    int at;

    /** The item of the header that could not be read; null when all were, the table among them. */
    String unreadItem;

    /** The length of the string table as the body states it, and how much of it is there. */
    long tableLength;

    int tablePresent;
    int tableAt;

    /** The code page. */
    int page;

    final long textLimit;
    long textRead;
    private boolean limited;

    /** Whether there is a text, and whether one goes on that is of this length as long as not. */
    boolean held;

    boolean continues;
    long length;

    /** Whether the text is a name, whose start is kept. */
    private boolean isName;

    /** The start of the type or name that was read last, and how long it is; -1 for none. */
    final byte[] name = new byte[NAME_KEPT];

    long nameLength = -1;

    /** The end of the page switch that was read last, and whether its page was there. */
    int switchEnd = -1;

    boolean isSwitchWhole;

    /** Where a text begins that ends with the body, without a terminator; -1 for none. */
    int unendedText = -1;

    /** What was skipped last against the format; null for nothing. */
    String skipped;

    int skippedStart;
    int skippedEnd;

    final LibraryTrace trace;

    LibraryText(byte[] data, LibraryTrace trace) {
        this.data = data;
        this.trace = trace;
        this.size = data.length;
        this.textLimit = Math.max(TEXT_ALWAYS, TEXT_PER_BYTE * size);
    }

    private static byte[][] values(String rows) {
        byte[][] texts = new byte[256][];
        for (String row : rows.split(" ")) {
            texts[Integer.parseInt(row.substring(0, 2), 16)] =
                    row.substring(2).getBytes(StandardCharsets.US_ASCII);
        }
        return texts;
    }

    // ---- Stops

    static LibraryStop misplaced(Place place, int offset) {
        return new LibraryStop(Cause.MISPLACED, place, offset);
    }

    /** A text that could not be read, or be kept. */
    private LibraryStop unreadable(Cause cause, Place place, int offset) {
        return new LibraryStop(limited ? Cause.TOO_MUCH_TEXT : cause, place, offset);
    }

    final void checkLimit(Place place, int offset) throws LibraryStop {
        if (limited) {
            throw unreadable(Cause.TOO_MUCH_TEXT, place, offset);
        }
    }

    // ---- Bytes

    final int peek(Place place) throws LibraryStop {
        if (at >= size) {
            throw new LibraryStop(Cause.ENDED, place, size);
        }
        return data[at] & 0xFF;
    }

    final int peekTag(Place place) throws LibraryStop {
        return peek(place) & TAG_MASK;
    }

    final int take(Place place) throws LibraryStop {
        int taken = peek(place);
        ++at;
        return taken;
    }

    /**
     * Reads an integer of at most five bytes, in 32 bits that higher ones fall off of; -1 when it
     * does not end.
     */
    final long integer() {
        int value = 0;
        for (int i = 0; i < LONGEST_INTEGER && at < size; ++i) {
            int taken = data[at++];
            value = value << 7 | taken & 0x7F;
            if (taken >= 0) {
                return value & 0xFFFFFFFFL;
            }
        }
        return -1;
    }

    final int endOfText(int from, int end) {
        int nul = from;
        while (nul < end && data[nul] != 0) {
            ++nul;
        }
        return nul;
    }

    /** Where a text of the string table ends. */
    final int endOfTableText(int from) {
        return endOfText(from, tableAt + tablePresent);
    }

    /**
     * Reads a page switch as two tokens, of which neither is verified and the page is masked. False
     * when there is no such page, which leaves the page as it was.
     */
    final boolean switchPage() {
        dropPageSwitch();
        int wanted = data[at - 1] & TAG_MASK;
        if (!isSwitchWhole || wanted > 1) {
            return false;
        }
        page = wanted;
        return true;
    }

    /** A page switch between elements, which has no effect. */
    final void dropPageSwitch() {
        isSwitchWhole = size - at >= 2;
        at = Math.min(at + 2, size);
        switchEnd = at;
    }

    final void skipped(String what, int start) {
        skipped = what;
        skippedStart = start;
        skippedEnd = at;
        trace.skipped(what, start, at);
    }

    // ---- Texts

    final void newText() {
        held = false;
        continues = false;
        length = 0;
    }

    /** Counts text that is decoded. False once there is too much of it. */
    private boolean count(long bytes) {
        textRead += bytes;
        limited |= textRead > textLimit;
        return !limited;
    }

    /** Counts what is appended to the text, and with the first of it what it goes on from. */
    private boolean reserve(long bytes) {
        return count(bytes) && (held || count(length));
    }

    final void append(byte[] bytes, int from, int to, Place place, int start) throws LibraryStop {
        if (!reserve(to - from)) {
            throw unreadable(Cause.TOO_MUCH_TEXT, place, start);
        }
        append(bytes, from, to);
    }

    private void append(byte[] bytes, int from, int to) {
        if (isName) {
            for (int i = from; i < to && length + i - from < NAME_KEPT; ++i) {
                name[(int) length + i - from] = bytes[i];
            }
        }
        held = true;
        length += to - from;
    }

    /** Reads an inline string from here up to its zero, or to the end of the body. */
    private void inlineString(Place place, int tokenAt) throws LibraryStop {
        int start = at;
        int nul = endOfText(start, size);
        append(data, start, nul, place, tokenAt);
        unendedText = nul == size ? start : unendedText;
        at = Math.min(nul + 1, size);
    }

    /** An empty table has two zero bytes of its own. Of one that is cut off no more is read. */
    private void tableReference(int tokenAt) throws LibraryStop {
        long index = integer();
        long readable = unreadItem != null ? 0 : tableLength == 0 ? 2 : tablePresent;
        if (index < 0 || index >= readable) {
            throw unreadable(Cause.NO_SUCH_STRING, Place.IN_VALUE, tokenAt);
        }
        int start = (int) Math.min(tableAt + index, tableAt + tablePresent);
        append(data, start, endOfTableText(start), Place.IN_VALUE, tokenAt);
    }

    private void opaque(Place place) throws LibraryStop {
        int start = at - 1;
        long count = integer();
        if (count < 0) {
            throw unreadable(Cause.OPAQUE_WITHOUT_LENGTH, place, start);
        }
        if (count > size - at) {
            throw unreadable(Cause.OPAQUE_TOO_LONG, place, start);
        }
        if (!reserve(count)) {
            throw unreadable(Cause.TOO_MUCH_TEXT, place, start);
        }
        int end = at + (int) count;
        append(data, at, endOfText(at, end));
        at = end;
    }

    /** Joins what a value token stands for; false for a token that stands for no text. */
    final boolean joinToken(int token) {
        byte[] text = VALUE_TEXTS[token];
        if (text == null) {
            return false;
        }
        // The comma stands in front of the text already.
        boolean isFirst = text[0] == DIRECT || !(held || continues);
        int from = isFirst ? 1 : 0;
        if (reserve(text.length - from)) {
            if (isFirst || text[0] != OUT_OF_SIGHT) {
                append(text, from, text.length);
            }
            held = true;
        }
        return true;
    }

    static boolean isString(int token) {
        return token == STR_I || token == STR_T;
    }

    /** Reads the text that a token begins; false for a token that begins none. */
    private boolean text(int token, Place place) throws LibraryStop {
        if (token == OPAQUE) {
            opaque(place);
        } else if (isString(token)) {
            strings(token);
        } else {
            return false;
        }
        return true;
    }

    /** Reads strings and value tokens, of which one has been read, up to an END or VALUE. */
    private void strings(int first) throws LibraryStop {
        for (int token = first; token != END && token != VALUE; token = data[at++] & 0xFF) {
            int start = at - 1;
            if (token == STR_I) {
                inlineString(Place.IN_VALUE, start);
            } else if (token == STR_T) {
                tableReference(start);
            } else if (!joinToken(token)) {
                throw unreadable(Cause.MISPLACED_IN_VALUE, Place.IN_VALUE, start);
            }
            if (at >= size) {
                throw unreadable(Cause.ENDED, Place.IN_VALUE, size);
            }
        }
        --at;
    }

    /** Reads one value in any encoding. */
    final void content() throws LibraryStop {
        int start = at;
        int token = take(Place.VALUE);
        if (!text(token, Place.VALUE) && !joinToken(token)) {
            if (token >= FIRST_VALUE) {
                replaceText(token);
            } else {
                --at;
                skipElement();
            }
        }
        checkLimit(Place.VALUE, start);
    }

    /** A token that stands for no text is one itself, in place of what there was. */
    private void replaceText(int token) {
        held = true;
        length = 1;
        if (isName) {
            name[0] = (byte) token;
        }
    }

    /** Reads a type or a name; false when there is no text. */
    final void readName() throws LibraryStop {
        newText();
        isName = true;
        nameLength = -1;
        content();
        isName = false;
        nameLength = held ? length : -1;
    }

    /** How much of the name is kept; one more than that for a longer one. */
    final int keptLength() {
        return (int) Math.min(nameLength, NAME_KEPT + 1);
    }

    /** The type or name that was read last, or as much of it as is kept; null for none. */
    final String nameText() {
        return nameLength < 0
                ? null
                : CharacterSet.UTF_8.decode(name, 0, Math.min(keptLength(), NAME_KEPT));
    }

    /** Skips to the END that closes the nesting, which stays; the text is left as it is. */
    private void skipElement() throws LibraryStop {
        int start = at;
        boolean wasHeld = held;
        boolean wasContinued = continues;
        boolean wasName = isName;
        long wasLength = length;
        isName = false;
        try {
            skipLevels();
        } finally {
            skipped("an unknown value with all up to an END", start);
        }
        held = wasHeld;
        continues = wasContinued;
        isName = wasName;
        length = wasLength;
    }

    private void skipLevels() throws LibraryStop {
        for (long level = 0; ; ) {
            int start = at;
            int token = take(Place.IN_SKIPPED);
            newText();
            if (token == SWITCH_PAGE) {
                --at;
                dropPageSwitch();
            } else if (token == END) {
                if (--level == 0) {
                    --at;
                    return;
                }
            } else if (text(token, Place.IN_SKIPPED)) {
                checkLimit(Place.IN_SKIPPED, start);
            } else {
                ++level;
            }
        }
    }

    /** A text between elements, which is dropped; its token counts as its first character. */
    final void dropText(Place place) throws LibraryStop {
        int start = at;
        newText();
        inlineString(place, start);
        if (data[start] == STR_I) {
            trace.skipped("as a text", start, at);
        } else {
            skipped("all up to a zero byte, as one text", start);
        }
    }
}
