package com.qvomacp.cli;

/**
 * Says what the bytes of a body mean, up to single tokens: header, string table, elements, page
 * switches. It reads as the decoder reads, step for step, and stops where the decoder stops.
 */
abstract class TokenAnnotator extends Cursor {
    static final int SWITCH_PAGE = 0x00;
    static final int END = 0x01;
    static final int STR_I = 0x03;
    static final int TAG_MASK = 0x3F;
    static final int PROVISIONING = 11;

    private static final int HAS_CONTENT = 0x40;
    private static final int HAS_ATTRIBUTES = 0x80;
    private static final int LONGEST_INTEGER = 5;
    private static final long LONGEST_TABLE = 0xFFFFFFFDL;

    int page;
    boolean hasContent;
    boolean hasAttributes;

    boolean hasTable;

    /** Whether the whole of the table is there. */
    boolean wholeTable;

    /** As the body states it. */
    long tableLength;

    int tableAt;

    /** How many of its bytes are there. */
    int tablePresent;

    TokenAnnotator(byte[] body) {
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
    long integer() {
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
}
