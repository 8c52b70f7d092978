package com.qvomacp.cli;

/** Says what the bytes of a body mean, up to single values: their texts, and how they are joined. */
abstract class ValueAnnotator extends TokenAnnotator {
    static final int STR_T = 0x83;
    static final int OPAQUE = 0xC3;
    static final int VALUE = 0x06;

    /** Text that is decoded whatever the length of the body, and that for each of its bytes. */
    private static final long TEXT_ALWAYS = 8L << 20;

    private static final long TEXT_PER_BYTE = 100;

    private long textRead;
    private boolean limited;

    ValueAnnotator(byte[] body) {
        super(body);
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
