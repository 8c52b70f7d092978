package com.qvomacp.cli;

/**
 * Says what the bytes of a body mean, up to single values: header, string table, tokens, strings,
 * page switches. It reads as the decoder reads, step for step, and stops where the decoder stops.
 */
abstract class ValueAnnotator extends Cursor {
    static final int SWITCH_PAGE = 0x00;
    static final int END = 0x01;
    static final int STR_I = 0x03;
    static final int STR_T = 0x83;
    static final int OPAQUE = 0xC3;
    static final int TAG_MASK = 0x3F;
    static final int VALUE = 0x06;
    static final int PROVISIONING = 11;

    private static final int HAS_CONTENT = 0x40;
    private static final int HAS_ATTRIBUTES = 0x80;
    private static final int LONGEST_INTEGER = 5;
    private static final long LONGEST_TABLE = 0xFFFFFFFDL;

    /** Text that is decoded whatever the length of the body, and that for each of its bytes. */
    private static final long TEXT_ALWAYS = 8L << 20;

    private static final long TEXT_PER_BYTE = 100;

    int page;
    boolean hasContent;
    boolean hasAttributes;

    private long textRead;
    private boolean limited;

    private boolean hasTable;
    private boolean wholeTable;
    private long tableLength;
    private int tableAt;
    private int tablePresent;

    ValueAnnotator(byte[] body) {
        super(body, body.length);
    }

    // ---- Bytes

    int peek(String expected) throws Stop {
        if (ended()) {
            throw new Stop(Stop.NO_DATA, size, 0, "the body ends here", expected);
        }
        return next();
    }

    int take(String expected) throws Stop {
        int taken = peek(expected);
        ++at;
        return taken;
    }

    /** A multi-byte integer of at most five bytes; -1 when it has no end. */
    private long integer() {
        long value = 0;
        for (int i = 0; i < LONGEST_INTEGER && !ended(); ++i) {
            int taken = next();
            ++at;
            value = (value << 7 | (taken & 0x7F)) & 0xFFFFFFFFL;
            if (taken < 0x80) {
                return value;
            }
        }
        return -1;
    }

    static String hex(int token) {
        return String.format("0x%02X", token);
    }

    /** A token under its name, if it has one. */
    String attribute(int token) {
        String name = Vocabulary.attribute(page, token);
        return name == null ? hex(token) : name + " (" + hex(token) + ")";
    }

    // ---- Header

    /** Reads the WBXML header; one that is cut off is judged by what there is of it. */
    void header() throws Stop {
        long publicId = readHeader();
        boolean known = publicId == PROVISIONING || publicId == 0 && isTypeInTable();
        if (!known) {
            String named = Vocabulary.publicIdentifier(publicId);
            throw new Stop(
                    Stop.DOCUMENT_TYPE,
                    Math.min(1, size),
                    Math.min(at, size) - Math.min(1, size),
                    publicId == 0
                            ? "the string table does not begin with the provisioning document type"
                            : "public identifier "
                                    + publicId
                                    + (named == null ? "" : " (" + named + ")")
                                    + " is no provisioning document",
                    "public identifier 11, or 0 with a string table that begins with \""
                            + Vocabulary.DOCUMENT_TYPE
                            + '"');
        }
    }

    private long readHeader() {
        if (ended()) {
            return 0;
        }
        int version = next();
        ++at;
        note("WBXML version " + ((version >> 4) + 1) + "." + (version & 0x0F));
        long publicId = headerInteger("public identifier", true);
        if (publicId < 0) {
            return 0;
        }
        if (publicId == 0 && headerInteger("index of the public identifier", false) < 0) {
            return 0;
        }
        if (headerInteger("charset", false) >= 0) {
            stringTable();
        }
        return publicId;
    }

    private long headerInteger(String what, boolean isPublicId) {
        long value = integer();
        String named = null;
        if (isPublicId) {
            named = Vocabulary.publicIdentifier(value);
        } else if (what.equals("charset")) {
            named = Vocabulary.charset(value);
        }
        note(
                value < 0
                        ? what + ", without an end"
                        : what + " " + value + (named == null ? "" : ": " + named));
        return value;
    }

    private void stringTable() {
        long length = integer();
        if (length < 0 || length > LONGEST_TABLE) {
            note("length of the string table, not one that can be");
            return;
        }
        hasTable = true;
        tableLength = length;
        tableAt = at;
        tablePresent = (int) Math.min(length, Math.max(size - at, 0));
        wholeTable = tablePresent == length;
        note(
                "string table: "
                        + length
                        + " bytes"
                        + (wholeTable ? "" : ", more than the body has"));
        int end = at + tablePresent;
        ++depth;
        while (at < end) {
            int start = at;
            int nul = endOfText(start, end);
            at = Math.min(nul + 1, end);
            note(
                    Note.Style.TEXT,
                    "[" + (start - tableAt) + "] " + Visible.quoted(data, start, nul));
        }
        --depth;
    }

    int endOfText(int from, int end) {
        int nul = from;
        while (nul < end && data[nul] != 0) {
            ++nul;
        }
        return nul;
    }

    private boolean isTypeInTable() {
        int end = tableAt + tablePresent;
        Value type = new Value();
        type.append(data, tableAt, endOfText(tableAt, end));
        return hasTable && type.is(Vocabulary.DOCUMENT_TYPE);
    }

    // ---- Tokens

    /** Reads an element token, which must be the tag, and the END of an empty element. */
    void element(int tag, String name, String accepted) throws Stop {
        int token = take(accepted);
        hasContent = (token & HAS_CONTENT) != 0;
        hasAttributes = (token & HAS_ATTRIBUTES) != 0;
        if ((token & TAG_MASK) != tag) {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at - 1,
                    1,
                    elementName(token) + " stands in place of " + name,
                    accepted);
        }
        note(Note.Style.ELEMENT, "<" + name + "> " + flags());
        if (!hasContent && !ended() && (next() & TAG_MASK) == END) {
            ++at;
            note("END, read with the empty element");
        }
    }

    private String flags() {
        if (hasAttributes) {
            return hasContent ? "attributes, content" : "attributes";
        }
        return hasContent ? "content" : "empty";
    }

    static String elementName(int token) {
        switch (token & TAG_MASK) {
            case END:
                return "END";
            case 0x05:
                return "wap-provisioningdoc (" + hex(token) + ")";
            case 0x06:
                return "characteristic (" + hex(token) + ")";
            case 0x07:
                return "parm (" + hex(token) + ")";
            default:
                return "element " + hex(token);
        }
    }

    /**
     * Reads a page switch as two element tokens: neither is verified, the page is masked. False
     * when there is no such page, which leaves the page as it was.
     */
    boolean pageSwitch() {
        int first = at;
        at = Math.min(at + 2, size);
        if (at - first < 2) {
            note("page switch, cut off");
            return false;
        }
        int token = data[at - 1] & 0xFF;
        hasContent = (token & HAS_CONTENT) != 0;
        hasAttributes = (token & HAS_ATTRIBUTES) != 0;
        int wanted = token & TAG_MASK;
        if (wanted > 1) {
            note("SWITCH_PAGE to " + wanted + ", which there is not");
            return false;
        }
        page = wanted;
        note("SWITCH_PAGE to code page " + wanted);
        return true;
    }

    /** A page switch between elements, which has no effect. */
    void dropPageSwitch() {
        int first = at;
        at = Math.min(at + 2, size);
        note(
                at - first < 2
                        ? "page switch, cut off"
                        : "SWITCH_PAGE to " + (data[at - 1] & 0xFF) + ", without effect here");
    }

    // ---- Texts

    /** Counts text that is decoded. False once there is too much of it. */
    private boolean count(long bytes) {
        textRead += bytes;
        if (textRead > TEXT_ALWAYS && textRead > TEXT_PER_BYTE * size) {
            limited = true;
        }
        return !limited;
    }

    private boolean reserve(Value value, long bytes) {
        long copied = value.isHeld() ? 0 : value.length();
        return count(bytes) && count(copied);
    }

    private Stop unreadable(int from, String reason, String accepted) {
        int length = Math.max(Math.min(at, size) - from, 0);
        if (limited) {
            return tooMuch(from, length);
        }
        return new Stop(Stop.NO_DATA, from, length, reason, accepted);
    }

    private static Stop tooMuch(int from, int length) {
        return new Stop(
                Stop.NO_MEMORY,
                from,
                length,
                "the strings of this message are decoded to too much text",
                null);
    }

    void checkLimit(int from) throws Stop {
        if (limited) {
            throw tooMuch(Math.min(from, size), 0);
        }
    }

    boolean isLimited() {
        return limited;
    }

    /** Appends a single byte, such as the comma between two values. */
    boolean appendComma(Value value) {
        if (!reserve(value, 1)) {
            return false;
        }
        value.append(",");
        return true;
    }

    /** Reads an inline string from the byte at hand, up to its zero or the end of the body. */
    private boolean inline(Value value, String prefix) {
        int start = Math.min(at, size);
        int nul = endOfText(start, size);
        if (!reserve(value, nul - start)) {
            return false;
        }
        value.append(data, start, nul);
        at = nul + 1;
        note(
                Note.Style.TEXT,
                prefix + Visible.quoted(data, start, nul) + (nul < size ? "" : ", without an end"));
        return true;
    }

    /** A text between elements, which is dropped; its token counts as its first character. */
    void droppedText() throws Stop {
        int start = at;
        if (!inline(new Value(), "dropped: ")) {
            throw tooMuch(start, 1);
        }
    }

    private boolean tableReference(Value value) {
        long index = integer();
        if (index < 0 || !isInTable(index)) {
            return false;
        }
        int start = tableAt + (int) Math.min(index, tablePresent);
        int nul = endOfText(start, tableAt + tablePresent);
        if (!reserve(value, nul - start)) {
            return false;
        }
        value.append(data, start, nul);
        note(Note.Style.TEXT, "STR_T [" + index + "] " + Visible.quoted(data, start, nul));
        return true;
    }

    /** An empty table answers its own two zero bytes. */
    private boolean isInTable(long index) {
        if (!hasTable) {
            return false;
        }
        if (tableLength == 0) {
            return index < 2;
        }
        return wholeTable ? index < tableLength : index < tablePresent + 2;
    }

    private void opaque(Value value) throws Stop {
        int start = at - 1;
        long length = integer();
        if (length < 0) {
            throw unreadable(start, "the length of the opaque data has no end", null);
        }
        if (length > size - at) {
            throw unreadable(
                    start,
                    "opaque data of " + length + " bytes is longer than the rest of the body",
                    "at most " + (size - at) + " bytes");
        }
        int end = at + (int) length;
        if (!reserve(value, length)) {
            throw unreadable(start, "", null);
        }
        value.append(data, at, end);
        String shown = Visible.quoted(data, at, endOfText(at, end));
        at = end;
        note(Note.Style.TEXT, "OPAQUE, " + length + " bytes: " + shown);
    }

    /** Joins what a value token stands for; false for a token that stands for no text. */
    boolean joinToken(Value value, int token) {
        String text = Vocabulary.valueText(token);
        if (text == null) {
            return false;
        }
        Vocabulary.Join join = Vocabulary.join(token);
        boolean alone = !value.holdsText() || join == Vocabulary.Join.DIRECT;
        if (reserve(value, alone ? text.length() : text.length() + 1)) {
            if (alone) {
                value.append(text);
            } else if (join == Vocabulary.Join.COMMA) {
                value.append("," + text);
            } else {
                value.append("");
            }
        }
        return true;
    }

    void noteToken(int token) {
        String text = Vocabulary.valueText(token);
        if (text == null) {
            text = Vocabulary.keptValue(token);
        }
        note(Note.Style.TEXT, "value token " + hex(token) + (text == null ? "" : " " + text));
    }

    /** Reads strings and value tokens up to an END or VALUE, which stays. */
    private void run(Value value) throws Stop {
        String accepted =
                "STR_I (0x03), STR_T (0x83), a value token with a text, VALUE (0x06), END (0x01)";
        for (; ; ) {
            int start = at;
            if (ended()) {
                throw unreadable(size, "the body ends within a value", accepted);
            }
            int token = next();
            ++at;
            if (token == STR_I) {
                if (!inline(value, "STR_I ")) {
                    throw unreadable(start, "", null);
                }
            } else if (token == STR_T) {
                if (!tableReference(value)) {
                    throw unreadable(
                            start,
                            "there is no such string in the string table",
                            hasTable ? "an index below " + tableLength : null);
                }
            } else if (token == END || token == VALUE) {
                --at;
                return;
            } else if (joinToken(value, token)) {
                noteToken(token);
            } else {
                throw unreadable(
                        start, hex(token) + " cannot stand in a run of strings", accepted);
            }
        }
    }

    static boolean isString(int token) {
        return (token & 0x7F) == STR_I;
    }

    /** Reads a string or opaque data, whose token has just been read. */
    private void readData(Value value, int token) throws Stop {
        if (isString(token)) {
            --at;
            run(value);
        } else {
            opaque(value);
        }
    }

    /** Reads one value in any encoding. */
    void content(Value value) throws Stop {
        int start = at;
        int token = take("a value: STR_I (0x03), STR_T (0x83), OPAQUE (0xC3), a value token");
        if (isString(token) || token == OPAQUE) {
            readData(value, token);
        } else if (joinToken(value, token)) {
            noteToken(token);
        } else if (token >= 0x80) {
            value.replace(token);
            noteToken(token);
        } else {
            --at;
            skip();
        }
        checkLimit(start);
    }

    /** Skips to the END that closes the nesting, which stays. */
    private void skip() throws Stop {
        long level = 0;
        for (; ; ) {
            int token = take("END (0x01): everything up to it is skipped");
            if (token == SWITCH_PAGE) {
                at = Math.min(at + 1, size);
                note("skipped: SWITCH_PAGE");
            } else if (token == END) {
                --level;
                if (level == 0) {
                    --at;
                    return;
                }
                note("skipped: END");
            } else if (isString(token) || token == OPAQUE) {
                readData(new Value(), token);
                checkLimit(at);
            } else {
                ++level;
                note("skipped: " + hex(token));
            }
        }
    }
}
