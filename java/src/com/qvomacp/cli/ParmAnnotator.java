package com.qvomacp.cli;

/** Says what the bytes of parm elements mean. */
abstract class ParmAnnotator extends ValueAnnotator {
    static final int TAG_PARM = 0x07;

    private static final int DOMAIN = 0x17;
    private static final int AAUTHTYPE = 0x33;
    private static final String BEHIND_NAME = "VALUE (0x06), SWITCH_PAGE (0x00), END (0x01)";

    ParmAnnotator(byte[] body) {
        super(body);
    }

    /** Reads a parm of a characteristic; {@code authType} is the text that commas continue. */
    void parm(Kind kind, Value[] authType) throws Stop {
        String accepted = kind.accepted();
        element(TAG_PARM, "parm", "parm (0x07)");
        ++depth;
        for (; ; ) {
            int token = peek(accepted);
            while (token == SWITCH_PAGE) {
                pageSwitch();
                token = peek(accepted);
                token = kind.readsTokenAfresh() ? token : token & TAG_MASK;
            }
            if (token == END) {
                ++at;
                --depth;
                note("END of parm");
                return;
            }
            Kind.Parm parm = kind.parm(token);
            if (parm == null) {
                throw new Stop(
                        Stop.UNKNOWN_ELEMENT,
                        at,
                        1,
                        attribute(token) + " is no parameter of " + kind.type,
                        accepted);
            }
            read(kind, parm, authType);
        }
    }

    private void read(Kind kind, Kind.Parm parm, Value[] authType) throws Stop {
        switch (parm.shape) {
            case TEXT:
                Value text = new Value();
                pair(parm.token, parm.name, text);
                if (parm.token == AAUTHTYPE) {
                    authType[0] = text;
                }
                break;
            case LIST:
                listOrGoOn(kind, parm);
                break;
            case NAMED:
                named(kind, parm.token);
                break;
            default:
                comma(authType);
                break;
        }
    }

    /** Reads the token that must come next. */
    private void expect(int token, String name) throws Stop {
        int read = take(name);
        if (read != token) {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at - 1,
                    1,
                    attribute(read) + " stands in place of " + name,
                    name + " (" + hex(token) + ")");
        }
    }

    /** Reads NAME and VALUE of one parameter. */
    private void pair(int token, String name, Value value) throws Stop {
        expect(token, name);
        note(Note.Style.ELEMENT, "NAME=" + name);
        int next = peek(BEHIND_NAME);
        if (next == END) {
            value.before = -1;
        } else if (next == SWITCH_PAGE) {
            pageSwitch();
            value(value);
        } else if (next == VALUE) {
            value(value);
        } else {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at,
                    1,
                    attribute(next) + " stands behind NAME=" + name,
                    BEHIND_NAME);
        }
    }

    /** Reads a VALUE and what it carries. */
    private void value(Value value) throws Stop {
        expect(VALUE, "VALUE");
        note("VALUE");
        int next = peek("a value, END (0x01)");
        if (next == SWITCH_PAGE) {
            pageSwitch();
            next = peek("a value, END (0x01)") & TAG_MASK;
        }
        if (next != END) {
            content(value);
        }
    }

    /** A DOMAIN of PXPHYSICAL that cannot be read does not end the parm. */
    private void listOrGoOn(Kind kind, Kind.Parm parm) throws Stop {
        try {
            list(parm);
        } catch (Stop stop) {
            if (kind != Kind.PXPHYSICAL || parm.token != DOMAIN || isLimited()) {
                throw stop;
            }
            note("the DOMAIN cannot be read and is left out: " + stop.getMessage());
        }
    }

    /** Reads pairs up to END, each onto the text of the one before it. */
    private void list(Kind.Parm parm) throws Stop {
        long last = -1;
        for (; ; ) {
            int token = peek("END (0x01)");
            if (token == END) {
                return;
            }
            Value value = new Value();
            value.before = last;
            String name = token == parm.token ? parm.name : Vocabulary.attribute(page, token);
            pair(token, name == null ? hex(token) : name, value);
            last = value.holdsText() ? value.length() : -1;
        }
    }

    /** Reads a parm whose name is given as text. */
    private void named(Kind kind, int token) throws Stop {
        int start = at;
        expect(token, "NAME=text");
        note(Note.Style.ELEMENT, "NAME=text");
        Value name = new Value();
        content(name);
        if (kind != Kind.VENDORCONFIG && name.length() == 0) {
            throw new Stop(
                    Stop.FAILED,
                    start,
                    Math.min(at, size) - start,
                    "the name of the parm is empty",
                    kind.names == null ? "a name" : "a name out of " + kind.names);
        }
        if (peek(BEHIND_NAME) == VALUE && (kind.names == null || isListed(kind, name))) {
            value(new Value());
        } else if (next() == VALUE) {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at,
                    1,
                    "the VALUE belongs to a name that " + kind.type + " does not know",
                    kind.names.toString());
        }
    }

    private static boolean isListed(Kind kind, Value name) {
        for (String known : kind.names) {
            if (name.is(known)) {
                return true;
            }
        }
        return false;
    }

    /** Reads one more value of AAUTHTYPE. */
    private void comma(Value[] authType) throws Stop {
        String accepted = "a string, or a value token with a text";
        ++at;
        note("comma: one more AAUTHTYPE");
        int token = peek(accepted);
        boolean behindSwitch = token == SWITCH_PAGE;
        if (behindSwitch) {
            pageSwitch();
            token = peek(accepted);
        }
        if (!behindSwitch && isString(token)) {
            if (!appendComma(authType[0])) {
                checkLimit(at);
            }
            content(authType[0]);
        } else {
            joinToken(authType[0], token);
            ++at;
            noteToken(token);
            checkLimit(at);
        }
    }
}
