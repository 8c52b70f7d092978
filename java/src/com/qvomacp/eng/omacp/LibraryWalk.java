package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.LibraryStop.Cause;
import com.qvomacp.eng.omacp.LibraryStop.Place;
import java.util.Arrays;

/**
 * Walks over a body as the native library's decoder does, step for step, and ends where the decoder
 * ends. It costs no stack, however deep the elements nest.
 */
final class LibraryWalk extends LibraryText {
    private static final int NAME_AS_TEXT = 0x05;
    static final String DOCUMENT_TYPE = "-//WAPFORUM//DTD PROV 1.0//EN";

    private static final int LITERAL = 0x04;
    private static final int EXT_I_0 = 0x80;
    private static final int TAG_DOCUMENT = 0x05;
    private static final int TAG_CHARACTERISTIC = 0x06;
    private static final int TAG_PARM = 0x07;
    private static final int HAS_CONTENT = 0x40;
    private static final int HAS_ATTRIBUTES = 0x80;
    private static final int VERSION = 0x45;
    private static final int VERSION_1_0 = 0x46;
    private static final int PROVISIONING = 11;
    private static final long LONGEST_TABLE = 0xFFFFFFFDL;

    /** A parm with attributes and without content; behind it stand NAME, VALUE and STR_I. */
    private static final byte PLAIN_PARM = (byte) 0x87;

    private static final int PLAIN_START = 4;

    private static final byte[] COMMA = {','};

    /** Whether there is a list of characteristics, be it empty, which a document needs. */
    boolean hasList;

    /** 0 also when it could not be read. */
    long publicId;

    /** Where the length of the string table begins; 0 when the header was not read that far. */
    int tableLengthAt;

    /** Where the elements begin; 0 as long as the header is read. */
    int elementsAt;

    /** Open characteristics: where they begin, and what they are. */
    int depth;

    int[] starts = new int[8];
    LibraryKind[] kinds = new LibraryKind[8];

    /** Whether the attributes of the innermost one have been read. */
    boolean isTyped;

    boolean inDocument;
    boolean inParm;

    /** The token that names the parameter; -1 as long as none was read. */
    int parmToken;

    /** How long the text of the innermost characteristic is that commas go on with; -1 for none. */
    private long continuedLength;

    LibraryWalk(byte[] data, LibraryTrace trace) {
        super(data, trace);
    }

    /** Walks over the body. */
    void run() throws LibraryStop {
        if (size == 0) {
            throw new LibraryStop(Cause.EMPTY_BODY, Place.DOCUMENT, 0);
        }
        header();
        elementsAt = at;
        switch (peekTag(Place.DOCUMENT)) {
            case TAG_DOCUMENT:
                document();
                break;
            case TAG_CHARACTERISTIC:
                characteristics();
                break;
            case SWITCH_PAGE:
                dropPageSwitch();
                break;
            case TAG_PARM:
                break;
            case END:
                ++at;
                break;
            default:
                throw misplaced(Place.DOCUMENT, at);
        }
    }

    // ---- Header

    /** Reads the header. One that is cut off is judged by what there is of it. */
    private void header() throws LibraryStop {
        ++at;
        unreadItem = unreadHeaderItem();
        if (publicId != PROVISIONING && (publicId != 0 || !isTypeInTable())) {
            boolean isEnd = unreadItem != null && at >= size;
            int offset = isEnd ? size : isTypeText() ? tableAt : 1;
            throw new LibraryStop(Cause.DOCUMENT_TYPE, Place.DOCUMENT, offset);
        }
    }

    /** Whether the type has to be the text that the string table begins with. */
    boolean isTypeText() {
        return publicId == 0 && unreadItem == null;
    }

    /** Reads the header behind the version, up to the item that cannot be read. */
    private String unreadHeaderItem() {
        long read = integer();
        if (read < 0) {
            return "public identifier";
        }
        publicId = read;
        if (publicId == 0 && integer() < 0) {
            return "public identifier's index";
        }
        if (integer() < 0) {
            return "character set";
        }
        tableLengthAt = at;
        tableLength = integer();
        if (tableLength < 0 || tableLength > LONGEST_TABLE) {
            return "string table's length";
        }
        tableAt = at;
        tablePresent = (int) Math.min(tableLength, size - at);
        at += tablePresent;
        return null;
    }

    /** A type that is given as text is what the table begins with, whatever the index is. */
    private boolean isTypeInTable() {
        int length = endOfTableText(tableAt) - tableAt;
        return length == DOCUMENT_TYPE.length()
                && CharacterSet.latin1(data, tableAt, tableAt + length).equals(DOCUMENT_TYPE);
    }

    // ---- Tokens

    /** Reads an element token, and the END of an element without content. */
    private int element(int tag, Place place) throws LibraryStop {
        int token = take(place);
        if ((token & TAG_MASK) != tag) {
            throw misplaced(place, at - 1);
        }
        if ((token & HAS_CONTENT) == 0 && at < size && (data[at] & TAG_MASK) == END) {
            ++at;
        }
        return token;
    }

    /** Reads an attribute token. */
    private void expect(int token, Place place) throws LibraryStop {
        if (take(place) != token) {
            throw misplaced(place, at - 1);
        }
    }

    // ---- The document

    private void document() throws LibraryStop {
        int tag = element(TAG_DOCUMENT, Place.DOCUMENT);
        inDocument = true;
        if ((tag & HAS_CONTENT) == 0) {
            return;
        }
        if ((tag & HAS_ATTRIBUTES) != 0) {
            version();
        }
        for (; ; ) {
            switch (peekTag(Place.IN_DOCUMENT)) {
                case END:
                    ++at;
                    return;
                case STR_I:
                    dropText(Place.IN_DOCUMENT);
                    break;
                case SWITCH_PAGE:
                    dropPageSwitch();
                    break;
                case TAG_CHARACTERISTIC:
                    characteristics();
                    break;
                default:
                    throw misplaced(Place.IN_DOCUMENT, at);
            }
        }
    }

    /** The attributes of the document element, skipped behind the first one. */
    private void version() throws LibraryStop {
        int token = take(Place.VERSION);
        if (token != VERSION && token != VERSION_1_0) {
            throw misplaced(Place.VERSION, at - 1);
        }
        int start = at;
        int next = peekTag(Place.BEHIND_VERSION);
        if (next != END && next != STR_I) {
            throw misplaced(Place.BEHIND_VERSION, at);
        }
        int textEnd = next == STR_I ? endOfText(at, size) + 1 : at;
        while (at < size) {
            int stop = data[at++] & 0xFF;
            if (stop == END || stop == LITERAL || stop == EXT_I_0) {
                break;
            }
        }
        if (at != textEnd + 1) {
            skipped("the attributes of wap-provisioningdoc", start);
        }
    }

    // ---- Characteristics

    /** Reads a run of characteristics with all that is nested in them, up to an END. */
    private void characteristics() throws LibraryStop {
        boolean isOpen = false;
        for (; ; ) {
            if (isOpen || enter()) {
                if (readContent()) {
                    isOpen = false;
                    continue;
                }
                --depth;
                trace.end(at);
            }
            isOpen = !hasNext();
            if (isOpen && depth == 0) {
                hasList = true;
                return;
            }
        }
    }

    /** Whether a run goes on: up to an END, across one text. */
    private boolean hasNext() throws LibraryStop {
        int tag = peekTag(Place.NEXT_CHARACTERISTIC);
        if (tag == STR_I) {
            dropText(Place.NEXT_CHARACTERISTIC);
            tag = peekTag(Place.NEXT_CHARACTERISTIC);
        }
        return tag != END;
    }

    /** Reads the start of a characteristic; false when it has no content. */
    private boolean enter() throws LibraryStop {
        int start = at;
        int tag = element(TAG_CHARACTERISTIC, Place.NEXT_CHARACTERISTIC);
        trace.begin(start, false);
        if ((tag & HAS_CONTENT) == 0) {
            nameLength = -1;
            trace.type(this, depth, start, null);
            trace.end(at);
            return false;
        }
        if (depth == starts.length) {
            starts = Arrays.copyOf(starts, 2 * depth);
            kinds = Arrays.copyOf(kinds, 2 * depth);
        }
        starts[depth] = start;
        kinds[depth++] = null;
        nameLength = -1;
        isTyped = false;
        LibraryKind kind = (tag & HAS_ATTRIBUTES) != 0 ? type() : null;
        isTyped = true;
        kinds[depth - 1] = kind;
        continuedLength = -1;
        trace.type(this, depth - 1, start, kind);
        return true;
    }

    /** Reads the attributes of a characteristic; whatever comes last is its type. */
    private LibraryKind type() throws LibraryStop {
        LibraryKind kind = null;
        for (; ; ) {
            int token = peek(Place.TYPE);
            if (token == END) {
                ++at;
                return kind;
            }
            if (token == SWITCH_PAGE) {
                kind = null;
                nameLength = -1;
                int start = at;
                if (!switchPage()) {
                    Cause cause = isSwitchWhole ? Cause.NO_SUCH_PAGE : Cause.ENDED_IN_SWITCH;
                    throw new LibraryStop(cause, Place.TYPE, start);
                }
            } else if (token == LibraryKind.TYPE_AS_TEXT) {
                ++at;
                readName();
                kind = LibraryKind.named(name, keptLength());
            } else {
                kind = LibraryKind.of(token, page);
                if (kind == null) {
                    throw misplaced(Place.TYPE, at);
                }
                ++at;
            }
        }
    }

    /** Reads on in a characteristic: true in front of one that it takes, false behind its END. */
    private boolean readContent() throws LibraryStop {
        LibraryKind kind = kinds[depth - 1];
        for (; ; ) {
            int tag = peekTag(Place.IN_CHARACTERISTIC);
            if (tag == TAG_PARM && kind != null) {
                if (trace != LibraryTrace.NONE || !takePlain(kind)) {
                    parm(kind);
                }
            } else if (tag == END) {
                ++at;
                return false;
            } else if (tag == STR_I) {
                dropText(Place.IN_CHARACTERISTIC);
            } else if (tag == SWITCH_PAGE) {
                dropPageSwitch();
            } else if (tag == TAG_CHARACTERISTIC && kind != null && kind.nests) {
                return true;
            } else {
                throw misplaced(Place.IN_CHARACTERISTIC, at);
            }
        }
    }

    // ---- Parameters

    private void parm(LibraryKind kind) throws LibraryStop {
        int start = at;
        inParm = true;
        parmToken = -1;
        element(TAG_PARM, Place.IN_CHARACTERISTIC);
        trace.begin(start, true);
        for (; ; ) {
            int token = peek(Place.PARM);
            while (token == SWITCH_PAGE) {
                switchPage();
                token = kind.readsTokenAfresh() ? peek(Place.PARM) : peekTag(Place.PARM);
            }
            if (token == END) {
                ++at;
                inParm = false;
                trace.end(at);
                return;
            }
            parameter(kind, token);
        }
    }

    /**
     * Reads the usual parm in one go: NAME, VALUE, an inline string and END. Any other is read step by
     * step, and so is one that would pass the limit of text.
     */
    private boolean takePlain(LibraryKind kind) {
        byte[] bytes = data;
        int end = size;
        int from = at;
        int start = from + PLAIN_START;
        if (start >= end
                || bytes[from] != PLAIN_PARM
                || bytes[from + 2] != VALUE
                || bytes[from + 3] != STR_I) {
            return false;
        }
        byte shape = kind.shapes[bytes[from + 1] & 0xFF];
        if (shape == LibraryKind.UNKNOWN || shape > LibraryKind.OPTIONAL_LIST) {
            return false;
        }
        int nul = endOfText(start, end);
        long read = textRead + nul - start;
        if (nul + 1 >= end || bytes[nul + 1] != END || read > textLimit) {
            return false;
        }
        textRead = read;
        at = nul + 2;
        return true;
    }

    private void parameter(LibraryKind kind, int token) throws LibraryStop {
        newText();
        switch (kind.shapes[token]) {
            case LibraryKind.TEXT:
                pair(kind, token);
                break;
            case LibraryKind.CONTINUED_TEXT:
                pair(kind, token);
                continuedLength = held ? length : -1;
                break;
            case LibraryKind.LIST:
                list(kind);
                break;
            case LibraryKind.OPTIONAL_LIST:
                optionalList(kind);
                break;
            case LibraryKind.NAMED:
                named(kind);
                break;
            case LibraryKind.COMMA:
                comma();
                break;
            default:
                throw misplaced(Place.PARM, at);
        }
    }

    /** Reads NAME and VALUE of one parameter onto the text. */
    private void pair(LibraryKind kind, int token) throws LibraryStop {
        expect(token, Place.MASKED_NAME);
        parmToken = token;
        trace.name(this);
        int next = peek(Place.BEHIND_NAME);
        if (next == SWITCH_PAGE) {
            switchPage();
            value();
        } else if (next == VALUE) {
            value();
        } else if (next != END) {
            throw misplaced(Place.BEHIND_NAME, at);
        }
    }

    /** Reads a VALUE and what it carries. */
    private void value() throws LibraryStop {
        expect(VALUE, Place.VALUE_START);
        int next = peek(Place.VALUE);
        if (next == SWITCH_PAGE) {
            switchPage();
            next = peekTag(Place.VALUE);
        }
        if (next != END) {
            content();
            if (held) {
                trace.value(at);
            }
        }
    }

    /** The name of the parameter that is read; null for one that the library does not know. */
    String parmName() {
        if (parmToken == NAME_AS_TEXT) {
            return nameText();
        }
        return parmToken < 0 ? null : kinds[depth - 1].parm(parmToken);
    }

    /** Reads pairs up to END, each onto the text of the one before it. */
    private void list(LibraryKind kind) throws LibraryStop {
        for (int token; (token = peek(Place.PARM)) != END; ) {
            pair(kind, token);
            continues |= held;
            held = false;
        }
    }

    /** A list that cannot be read does not end the parm. */
    private void optionalList(LibraryKind kind) throws LibraryStop {
        int start = at;
        try {
            list(kind);
        } catch (LibraryStop stop) {
            if (stop.cause == Cause.TOO_MUCH_TEXT) {
                throw stop;
            }
            skipped("a value that cannot be read", start);
        }
    }

    /** Reads a parameter whose name is given as text. */
    private void named(LibraryKind kind) throws LibraryStop {
        int start = at;
        expect(NAME_AS_TEXT, Place.MASKED_NAME);
        parmToken = NAME_AS_TEXT;
        readName();
        if (nameLength <= 0 && !kind.takesEmptyName()) {
            throw new LibraryStop(Cause.EMPTY_NAME, Place.PARM, start);
        }
        trace.name(this);
        if (peek(Place.BEHIND_NAME) == VALUE) {
            if (!kind.takesName(name, keptLength())) {
                throw new LibraryStop(Cause.UNKNOWN_NAME, Place.PARM, at);
            }
            newText();
            value();
        }
    }

    /** Reads one more value of the text that goes on. */
    private void comma() throws LibraryStop {
        ++at;
        int token = peek(Place.COMMA_VALUE);
        boolean isBehindSwitch = token == SWITCH_PAGE;
        if (isBehindSwitch) {
            switchPage();
            token = peek(Place.COMMA_VALUE);
        }
        held = continuedLength >= 0;
        length = Math.max(continuedLength, 0);
        int start = at;
        if (isString(token) && !isBehindSwitch) {
            append(COMMA, 0, 1, Place.COMMA_VALUE, start);
            content();
        } else {
            joinToken(token);
            ++at;
            checkLimit(Place.COMMA_VALUE, start);
        }
        continuedLength = held ? length : -1;
        trace.value(at);
    }
}
