package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.LibraryStop.Cause;
import com.qvomacp.eng.omacp.LibraryStop.Place;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;

/**
 * Walks over a body as the native library's decoder does, step for step, and ends where the decoder
 * ends. No text is built but the start of names, whose lengths count towards the library's limit as
 * all others do. It costs no stack, however deep the elements nest.
 */
final class LibraryWalk {
    static final int FAILED = 1;
    static final int BAD_ARGUMENT = 2;
    static final int UNKNOWN_ELEMENT = 4101;
    static final int NO_DATA = 4103;
    static final int WRONG_DOCUMENT_TYPE = 4107;
    static final int NO_MEMORY = 4111;

    static final int SWITCH_PAGE = 0x00;
    static final int END = 0x01;
    static final int STR_I = 0x03;
    static final int TAG_MASK = 0x3F;
    static final int NAME_AS_TEXT = 0x05;
    static final int VALUE = 0x06;

    static final String DOCUMENT_TYPE = "-//WAPFORUM//DTD PROV 1.0//EN";

    private static final int STR_T = 0x83;
    private static final int OPAQUE = 0xC3;
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
    private static final int LONGEST_INTEGER = 5;
    private static final long LONGEST_TABLE = 0xFFFFFFFDL;

    /** Text that is decoded whatever the length of the body, and that for each of its bytes. */
    private static final long TEXT_ALWAYS = 8L << 20;

    private static final long TEXT_PER_BYTE = 100;

    /** Longer than every name that is compared. */
    private static final int NAME_KEPT = 64;

    /** NAME, VALUE and STR_I. */
    private static final int PLAIN_START = 3;

    /** How the text of a value token joins a text that is there. */
    private static final int DIRECT = 0;

    private static final int BEHIND_COMMA = 1;
    private static final int OUT_OF_SIGHT = 2;

    private static final byte[] COMMA = {','};
    private static final byte[][] VALUE_TEXTS = new byte[256][];
    private static final byte[] JOINS = new byte[256];

    static {
        values(
                DIRECT,
                "85 IPV4 86 IPV6 87 E164 88 ALPHA 89 APN 8A SCODE 8B TETRA-ITSI 8C MAN");
        values(
                BEHIND_COMMA,
                "91 HTTP 92 BASIC 93 DIGEST 9A PAP 9B CHAP 9C HTTP-BASIC 9D HTTP-DIGEST"
                        + " 9E WTLS_SS 9F MD5");
        values(
                OUT_OF_SIGHT,
                "90 ANALOG-MODEM 94 BIT-TRANSPARENT 95 DIRECT-ASYNCHRONOUS-DATA-SERVICE");
    }

    /** The body. */
    final byte[] data;

    final int size;

    /** How many bytes have been read. */
    int at;

    /** Whether there is a list of characteristics, be it empty, which a document needs. */
    boolean hasList;

    private final LibraryTrace trace;

    // ---- The header

    /** 0 also when it could not be read. */
    long publicId;

    /** The item of the header that could not be read; null when all were. */
    String unreadItem;

    boolean hasTable;

    /** As the body states it. */
    long tableLength;

    int tableAt;

    /** How many of its bytes are there. */
    int tablePresent;

    /** Where the elements begin; 0 as long as the header is read. */
    int elementsAt;

    // ---- Elements

    /** The code page. */
    int page;

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

    private boolean hasContent;
    private boolean hasAttributes;

    // ---- The text that is being read

    private final long textLimit;
    private long textRead;
    private boolean limited;
    private boolean held;

    /** Whether the text goes on from an earlier one, of this length as long as it is not held. */
    private boolean continues;

    private long length;

    /** Whether the text is a name, whose start is kept. */
    private boolean isName;

    /** The start of the type or name that was read last, and how long it is; -1 for none. */
    final byte[] name = new byte[NAME_KEPT];

    long nameLength = -1;

    /** How long the text of the innermost characteristic is that commas go on with; -1 for none. */
    private long continuedLength;

    // ---- What was skipped

    /** The end of the page switch that was read last, and whether its page was there. */
    int switchEnd = -1;

    boolean isSwitchWhole;

    /** Where a text begins that ends with the body, without a terminator; -1 for none. */
    int unendedText = -1;

    /** What was skipped last against the format; null for nothing. */
    String skipped;

    int skippedStart;
    int skippedEnd;

    /**
     * Begins a walk.
     *
     * @param data the body
     * @param trace may be null
     */
    LibraryWalk(byte[] data, LibraryTrace trace) {
        this.data = data;
        this.size = data.length;
        this.trace = trace;
        this.textLimit = Math.max(TEXT_ALWAYS, TEXT_PER_BYTE * size);
    }

    private static void values(int join, String pairs) {
        String[] words = pairs.split(" ");
        for (int i = 0; i < words.length; i += 2) {
            int token = Integer.parseInt(words[i], 16);
            VALUE_TEXTS[token] = words[i + 1].getBytes(StandardCharsets.US_ASCII);
            JOINS[token] = (byte) join;
        }
    }

    /** Walks over the body. */
    void run() throws LibraryStop {
        if (size == 0) {
            throw new LibraryStop(BAD_ARGUMENT, Cause.EMPTY_BODY, Place.DOCUMENT, 0);
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

    // ---- Stops

    private static LibraryStop misplaced(Place place, int offset) {
        return new LibraryStop(UNKNOWN_ELEMENT, Cause.MISPLACED, place, offset);
    }

    private LibraryStop ended(Place place) {
        return new LibraryStop(NO_DATA, Cause.ENDED, place, size);
    }

    /** A text that could not be read, or be kept. */
    private LibraryStop unreadable(Cause cause, Place place, int offset) {
        return limited
                ? new LibraryStop(NO_MEMORY, Cause.TOO_MUCH_TEXT, place, offset)
                : new LibraryStop(NO_DATA, cause, place, offset);
    }

    private void checkLimit(Place place, int offset) throws LibraryStop {
        if (limited) {
            throw unreadable(Cause.TOO_MUCH_TEXT, place, offset);
        }
    }

    // ---- Bytes

    private int peek(Place place) throws LibraryStop {
        if (at >= size) {
            throw ended(place);
        }
        return data[at] & 0xFF;
    }

    private int peekTag(Place place) throws LibraryStop {
        return peek(place) & TAG_MASK;
    }

    private int take(Place place) throws LibraryStop {
        int taken = peek(place);
        ++at;
        return taken;
    }

    /**
     * Reads an integer of at most five bytes, in 32 bits that higher ones fall off of; -1 when it
     * does not end.
     */
    private long integer() {
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

    private int endOfText(int from, int end) {
        int nul = from;
        while (nul < end && data[nul] != 0) {
            ++nul;
        }
        return nul;
    }

    // ---- Header

    /** Reads the header. One that is cut off is judged by what there is of it. */
    private void header() throws LibraryStop {
        ++at;
        unreadItem = unreadHeaderItem();
        if (publicId != PROVISIONING && (publicId != 0 || !isTypeInTable())) {
            throw new LibraryStop(
                    WRONG_DOCUMENT_TYPE, Cause.DOCUMENT_TYPE, Place.DOCUMENT, Math.min(1, size));
        }
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
        tableLength = integer();
        if (tableLength < 0 || tableLength > LONGEST_TABLE) {
            return "string table's length";
        }
        hasTable = true;
        tableAt = at;
        tablePresent = (int) Math.min(tableLength, size - at);
        at += tablePresent;
        return null;
    }

    /** A type that is given as text is what the table begins with, whatever the index is. */
    private boolean isTypeInTable() {
        int end = endOfText(tableAt, tableAt + tablePresent);
        return hasTable
                && end - tableAt == DOCUMENT_TYPE.length()
                && new String(data, tableAt, end - tableAt, StandardCharsets.ISO_8859_1)
                        .equals(DOCUMENT_TYPE);
    }

    // ---- Tokens

    /** Reads an element token, and the END of an element without content. */
    private void element(int tag, Place place) throws LibraryStop {
        int token = take(place);
        hasContent = (token & HAS_CONTENT) != 0;
        hasAttributes = (token & HAS_ATTRIBUTES) != 0;
        if ((token & TAG_MASK) != tag) {
            throw misplaced(place, at - 1);
        }
        if (!hasContent && at < size && (data[at] & TAG_MASK) == END) {
            ++at;
        }
    }

    /** Reads an attribute token. */
    private void expect(int token, Place place) throws LibraryStop {
        if (take(place) != token) {
            throw misplaced(place, at - 1);
        }
    }

    /**
     * Reads a page switch as two tokens, of which neither is verified and the page is masked. False
     * when there is no such page, which leaves the page as it was.
     */
    private boolean switchPage() {
        dropPageSwitch();
        int wanted = data[at - 1] & TAG_MASK;
        if (!isSwitchWhole || wanted > 1) {
            return false;
        }
        page = wanted;
        return true;
    }

    /** A page switch between elements, which has no effect. */
    private void dropPageSwitch() {
        isSwitchWhole = size - at >= 2;
        at = Math.min(at + 2, size);
        switchEnd = at;
    }

    private void skipped(String what, int start) {
        skipped = what;
        skippedStart = start;
        skippedEnd = at;
    }

    // ---- Texts

    private void newText() {
        held = false;
        continues = false;
        length = 0;
    }

    private void newName() {
        newText();
        isName = true;
        nameLength = -1;
    }

    private void endOfName() {
        isName = false;
        nameLength = held ? length : -1;
    }

    /** How much of the name is kept; one more than that for a longer one. */
    private int keptLength() {
        return (int) Math.min(nameLength, NAME_KEPT + 1);
    }

    /** The type or name that was read last, or as much of it as is kept; null for none. */
    String nameText() {
        return nameLength < 0
                ? null
                : CharacterSet.UTF_8.decode(name, 0, Math.min(keptLength(), NAME_KEPT));
    }

    /** Counts text that is decoded. False once there is too much of it. */
    private boolean count(long bytes) {
        textRead += bytes;
        if (textRead > textLimit) {
            limited = true;
        }
        return !limited;
    }

    /** Counts what is appended to the text, and with the first of it what it goes on from. */
    private boolean reserve(long bytes) {
        return count(bytes) && (held || count(length));
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
    private boolean inlineString() {
        int start = at;
        int nul = endOfText(start, size);
        if (!reserve(nul - start)) {
            return false;
        }
        append(data, start, nul);
        if (nul == size) {
            unendedText = start;
            at = size;
        } else {
            at = nul + 1;
        }
        return true;
    }

    private boolean tableReference() {
        long index = integer();
        if (index < 0 || !isInTable(index)) {
            return false;
        }
        int start = (int) Math.min(tableAt + index, tableAt + tablePresent);
        int nul = endOfText(start, tableAt + tablePresent);
        if (!reserve(nul - start)) {
            return false;
        }
        append(data, start, nul);
        return true;
    }

    /** An empty table answers its own two zero bytes. Behind one that is cut off nothing is read. */
    private boolean isInTable(long index) {
        return hasTable && index < (tableLength == 0 ? 2 : tablePresent);
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
    private boolean joinToken(int token) {
        byte[] text = VALUE_TEXTS[token];
        if (text == null) {
            return false;
        }
        if (JOINS[token] == DIRECT || !(held || continues)) {
            if (reserve(text.length)) {
                append(text, 0, text.length);
            }
        } else if (reserve(text.length + 1)) {
            held = true;
            if (JOINS[token] == BEHIND_COMMA) {
                append(COMMA, 0, 1);
                append(text, 0, text.length);
            }
        }
        return true;
    }

    private static boolean isString(int token) {
        return (token & 0x7F) == STR_I;
    }

    /** Reads strings and value tokens, of which one has been read, up to an END or VALUE. */
    private void run(int first) throws LibraryStop {
        int token = first;
        for (; ; ) {
            int start = at - 1;
            if (token == STR_I) {
                if (!inlineString()) {
                    throw unreadable(Cause.TOO_MUCH_TEXT, Place.IN_VALUE, start);
                }
            } else if (token == STR_T) {
                if (!tableReference()) {
                    throw unreadable(Cause.NO_SUCH_STRING, Place.IN_VALUE, start);
                }
            } else if (token == END || token == VALUE) {
                --at;
                return;
            } else if (!joinToken(token)) {
                throw unreadable(Cause.MISPLACED, Place.IN_VALUE, start);
            }
            if (at >= size) {
                throw unreadable(Cause.ENDED, Place.IN_VALUE, size);
            }
            token = data[at++] & 0xFF;
        }
    }

    /** Reads one value in any encoding. */
    private void content() throws LibraryStop {
        int start = at;
        int token = take(Place.VALUE);
        if (isString(token)) {
            run(token);
        } else if (token == OPAQUE) {
            opaque(Place.VALUE);
        } else if (!joinToken(token)) {
            if (token >= 0x80) {
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
        long level = 0;
        for (; ; ) {
            int token = take(Place.IN_SKIPPED);
            if (token == SWITCH_PAGE) {
                --at;
                dropPageSwitch();
            } else if (token == END) {
                --level;
                if (level == 0) {
                    --at;
                    return;
                }
            } else if (isString(token) || token == OPAQUE) {
                int start = at - 1;
                newText();
                if (token == OPAQUE) {
                    opaque(Place.IN_SKIPPED);
                } else {
                    run(token);
                }
                checkLimit(Place.IN_SKIPPED, start);
            } else {
                ++level;
            }
        }
    }

    /** A text between elements, which is dropped; its token counts as its first character. */
    private void dropText(Place place) throws LibraryStop {
        int start = at;
        newText();
        if (!inlineString()) {
            throw unreadable(Cause.TOO_MUCH_TEXT, place, start);
        }
        if (data[start] != STR_I) {
            skipped("all up to a zero byte, as one text", start);
        }
    }

    // ---- The document

    private void document() throws LibraryStop {
        element(TAG_DOCUMENT, Place.DOCUMENT);
        inDocument = true;
        if (!hasContent) {
            return;
        }
        if (hasAttributes) {
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

    /** Reads a run of characteristics with all that is nested in them, up to an END, which stays. */
    private void characteristics() throws LibraryStop {
        boolean isOpen = false;
        for (; ; ) {
            if (isOpen || enter()) {
                if (readContent()) {
                    isOpen = false;
                    continue;
                }
                leave();
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
        element(TAG_CHARACTERISTIC, Place.NEXT_CHARACTERISTIC);
        if (!hasContent) {
            if (trace != null) {
                trace.characteristic(depth, start, null, null);
                trace.characteristicEnd(start, at);
            }
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
        LibraryKind kind = hasAttributes ? type() : null;
        isTyped = true;
        kinds[depth - 1] = kind;
        continuedLength = -1;
        if (trace != null) {
            trace.characteristic(depth - 1, start, kind, kind == null ? nameText() : kind.type);
        }
        return true;
    }

    private void leave() {
        --depth;
        if (trace != null) {
            trace.characteristicEnd(starts[depth], at);
        }
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
                    Cause cause = isSwitchWhole ? Cause.NO_SUCH_PAGE : Cause.ENDED;
                    throw new LibraryStop(UNKNOWN_ELEMENT, cause, Place.TYPE, start);
                }
            } else if (token == LibraryKind.TYPE_AS_TEXT) {
                ++at;
                newName();
                content();
                endOfName();
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
                parm(kind);
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
        if (trace != null) {
            trace.parm(start);
        }
        for (; ; ) {
            int token = peek(Place.PARM);
            while (token == SWITCH_PAGE) {
                switchPage();
                token = peek(Place.PARM);
                if (!kind.readsTokenAfresh()) {
                    token &= TAG_MASK;
                }
            }
            if (trace == null && takePlain(kind, token)) {
                inParm = false;
                return;
            }
            if (token == END) {
                ++at;
                inParm = false;
                if (trace != null) {
                    trace.parmEnd(start, at);
                }
                return;
            }
            parameter(kind, token);
        }
    }

    /**
     * Reads the usual parameter in one go: NAME, VALUE, an inline string and the END of the parm.
     * Any other is read step by step, and so is one that would pass the limit of text.
     */
    private boolean takePlain(LibraryKind kind, int token) {
        byte[] bytes = data;
        int end = size;
        int start = at + PLAIN_START;
        byte shape = kind.shapes[token];
        if (shape == LibraryKind.UNKNOWN
                || shape > LibraryKind.OPTIONAL_LIST
                || start >= end
                || bytes[at] != (byte) token
                || bytes[at + 1] != VALUE
                || bytes[at + 2] != STR_I) {
            return false;
        }
        int nul = start;
        while (nul < end && bytes[nul] != 0) {
            ++nul;
        }
        long read = textRead + nul - start;
        if (nul + 1 >= end || bytes[nul + 1] != END || read > textLimit) {
            return false;
        }
        textRead = read;
        at = nul + 2;
        return true;
    }

    private void parameter(LibraryKind kind, int token) throws LibraryStop {
        switch (kind.shapes[token]) {
            case LibraryKind.TEXT:
                newText();
                pair(kind, token);
                break;
            case LibraryKind.CONTINUED_TEXT:
                newText();
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
        if (trace != null) {
            trace.name(kind.parm(token));
        }
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
            int start = at;
            content();
            if (trace != null && held) {
                trace.value(start, at);
            }
        }
    }

    /** Reads pairs up to END, each onto the text of the one before it. */
    private void list(LibraryKind kind) throws LibraryStop {
        newText();
        for (; ; ) {
            int token = peek(Place.PARM);
            if (token == END) {
                return;
            }
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
            if (limited) {
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
        newName();
        content();
        endOfName();
        if (nameLength <= 0 && !kind.takesEmptyName()) {
            throw new LibraryStop(FAILED, Cause.EMPTY_NAME, Place.PARM, start);
        }
        if (trace != null) {
            trace.name(nameText());
        }
        if (peek(Place.BEHIND_NAME) == VALUE) {
            if (!kind.takesName(name, keptLength())) {
                throw new LibraryStop(UNKNOWN_ELEMENT, Cause.UNKNOWN_NAME, Place.PARM, at);
            }
            newText();
            value();
        }
    }

    /** Reads one more value of the text that goes on. */
    private void comma() throws LibraryStop {
        int comma = at++;
        int token = peek(Place.COMMA_VALUE);
        boolean isBehindSwitch = token == SWITCH_PAGE;
        if (isBehindSwitch) {
            switchPage();
            token = peek(Place.COMMA_VALUE);
        }
        newText();
        held = continuedLength >= 0;
        length = Math.max(continuedLength, 0);
        int start = at;
        if (isString(token) && !isBehindSwitch) {
            if (!reserve(1)) {
                throw unreadable(Cause.TOO_MUCH_TEXT, Place.COMMA_VALUE, start);
            }
            append(COMMA, 0, 1);
            content();
        } else {
            joinToken(token);
            ++at;
            checkLimit(Place.COMMA_VALUE, start);
        }
        continuedLength = held ? length : -1;
        if (trace != null) {
            trace.value(comma, at);
        }
    }
}
