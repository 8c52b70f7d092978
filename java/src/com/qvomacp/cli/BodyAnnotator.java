package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** Says what the bytes of a body mean: the document and its characteristics, of any depth. */
final class BodyAnnotator extends ParmAnnotator {
    private static final int TAG_DOCUMENT = 0x05;
    private static final int TAG_CHARACTERISTIC = 0x06;
    private static final int VERSION = 0x45;
    private static final int VERSION_1_0 = 0x46;
    private static final int LITERAL = 0x04;
    private static final int EXT_I_0 = 0x80;

    private static final String IN_DOCUMENT =
            "characteristic (0x06), a string, SWITCH_PAGE (0x00), END (0x01)";

    /** Elements of a path that are told when it is a long one. */
    private static final int TOLD = 8;

    /** A characteristic whose END has not been read. */
    private static final class Open {
        /** Null: nothing but strings and page switches is accepted. */
        Kind kind;

        String name = "characteristic";
        int parms;
        boolean inParm;
        final Value[] authType = {new Value()};
        final Map<String, Integer> children = new HashMap<>();
    }

    private final List<Open> open = new ArrayList<>();
    private final Map<String, Integer> topLevel = new HashMap<>();
    private boolean inDocument;

    private BodyAnnotator(byte[] body) {
        super(body);
    }

    static Annotation.Section annotate(byte[] body) {
        BodyAnnotator annotator = new BodyAnnotator(body);
        Stop stop = null;
        try {
            annotator.body();
        } catch (Stop refused) {
            stop = refused;
            stop.read = annotator.at;
            stop.path = annotator.path();
        }
        annotator.finish(stop, stop == null ? "behind the document, not read" : "not read");
        return new Annotation.Section(annotator.notes, body.length, stop);
    }

    /** Whether bytes that are no push begin as a provisioning document does. */
    static boolean isDocument(byte[] bytes) {
        BodyAnnotator annotator = new BodyAnnotator(bytes);
        try {
            annotator.header();
            return bytes.length > 0 && bytes[0] >= 0 && bytes[0] <= STR_I;
        } catch (Stop other) {
            return false;
        }
    }

    private String path() {
        StringBuilder path = new StringBuilder(inDocument ? "wap-provisioningdoc" : "");
        for (int i = 0; i < open.size(); ++i) {
            if (open.size() > TOLD && i == TOLD / 2) {
                int left = open.size() - TOLD;
                path.append(" / (").append(left).append(" more)");
                i += left;
            }
            path.append(path.length() == 0 ? "" : " / ").append(open.get(i).name);
        }
        if (!open.isEmpty() && innermost().inParm) {
            path.append(" / parm ").append(innermost().parms);
        }
        return path.toString();
    }

    private Open innermost() {
        return open.get(open.size() - 1);
    }

    private void body() throws Stop {
        if (size == 0) {
            throw new Stop(Stop.BAD_ARGUMENT, 0, 0, "the body is empty", "a WBXML document");
        }
        header();
        int tag = peek("wap-provisioningdoc (0x05)") & TAG_MASK;
        switch (tag) {
            case TAG_DOCUMENT:
                document();
                break;
            case TAG_CHARACTERISTIC:
                siblings();
                break;
            case SWITCH_PAGE:
                dropPageSwitch();
                remark("the document ends here, empty");
                break;
            case TAG_PARM:
                remark("the document ends here, empty");
                break;
            case END:
                ++at;
                note("END: there is no document");
                break;
            default:
                throw new Stop(
                        Stop.UNKNOWN_ELEMENT,
                        at,
                        1,
                        elementName(next()) + " cannot begin a document",
                        "wap-provisioningdoc (0x05), characteristic (0x06)");
        }
    }

    private void document() throws Stop {
        element(TAG_DOCUMENT, "wap-provisioningdoc", "wap-provisioningdoc (0x05)");
        inDocument = true;
        if (!hasContent) {
            return;
        }
        ++depth;
        if (hasAttributes) {
            version();
        }
        for (; ; ) {
            int tag = peek(IN_DOCUMENT) & TAG_MASK;
            if (tag == END) {
                ++at;
                --depth;
                note("END of wap-provisioningdoc");
                return;
            } else if (tag == STR_I) {
                droppedText();
            } else if (tag == SWITCH_PAGE) {
                dropPageSwitch();
            } else if (tag == TAG_CHARACTERISTIC) {
                siblings();
            } else {
                throw new Stop(
                        Stop.UNKNOWN_ELEMENT,
                        at,
                        1,
                        elementName(next()) + " cannot stand in wap-provisioningdoc",
                        IN_DOCUMENT);
            }
        }
    }

    /** The attributes of the document element, which are skipped behind the first one. */
    private void version() throws Stop {
        String accepted = "VERSION (0x45), VERSION=1.0 (0x46)";
        int token = take(accepted);
        if (token != VERSION && token != VERSION_1_0) {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at - 1,
                    1,
                    attribute(token) + " is no attribute of wap-provisioningdoc",
                    accepted);
        }
        note(token == VERSION ? "VERSION=" : "VERSION=1.0");
        int next = peek("STR_I (0x03), END (0x01)") & TAG_MASK;
        if (next != END && next != STR_I) {
            throw new Stop(
                    Stop.UNKNOWN_ELEMENT,
                    at,
                    1,
                    hex(next()) + " stands behind the version",
                    "STR_I (0x03), END (0x01)");
        }
        int start = at;
        int stop = -1;
        while (!ended() && stop != END && stop != LITERAL && stop != EXT_I_0) {
            stop = next();
            ++at;
        }
        if (next == END) {
            note(stop == END && at - start == 1 ? "END of attributes" : "skipped, up to an end");
        } else {
            String value = Visible.quoted(data, start + 1, endOfText(start + 1, at));
            note(Note.Style.TEXT, value + " and all up to an END, skipped");
        }
    }

    /** A run of characteristics. */
    private void siblings() throws Stop {
        do {
            subtree();
        } while (hasNextSibling());
    }

    /** A characteristic with all that is nested in it; depth costs no stack. */
    private void subtree() throws Stop {
        boolean atStart = true;
        for (; ; ) {
            if (atStart) {
                int outer = open.size();
                enter();
                if (open.size() != outer) {
                    atStart = false;
                    continue;
                }
            } else {
                atStart = readContent(innermost());
                if (atStart) {
                    continue;
                }
                open.remove(open.size() - 1);
            }
            if (open.isEmpty()) {
                return;
            }
            atStart = hasNextSibling();
        }
    }

    /** Whether a run goes on: up to an END, across one string. */
    private boolean hasNextSibling() throws Stop {
        String accepted = "characteristic (0x06), a string, END (0x01)";
        int tag = peek(accepted) & TAG_MASK;
        if (tag == STR_I) {
            droppedText();
            tag = peek(accepted) & TAG_MASK;
        }
        return tag != END;
    }

    private void enter() throws Stop {
        element(
                TAG_CHARACTERISTIC,
                "characteristic",
                "behind a characteristic: characteristic (0x06), one string, END (0x01)");
        if (!hasContent) {
            return;
        }
        boolean named = hasAttributes;
        Map<String, Integer> counts = open.isEmpty() ? topLevel : innermost().children;
        Open entered = new Open();
        open.add(entered);
        ++depth;
        if (named) {
            attributes(entered);
        }
        if (entered.kind != null) {
            entered.name = entered.kind.type;
        }
        entered.name += " " + counts.merge(entered.name, 1, Integer::sum);
    }

    private void attributes(Open entered) throws Stop {
        String accepted = Kind.acceptedTypes(page);
        for (; ; ) {
            int token = peek(accepted);
            if (token == END) {
                ++at;
                note("END of attributes");
                return;
            }
            if (token == SWITCH_PAGE) {
                int start = at;
                entered.kind = null;
                if (!pageSwitch()) {
                    throw new Stop(
                            Stop.UNKNOWN_ELEMENT,
                            start,
                            Math.min(at, size) - start,
                            "there is no such code page",
                            "code page 0 or 1");
                }
                accepted = Kind.acceptedTypes(page);
            } else if (token == Kind.TYPE_AS_TEXT) {
                ++at;
                note(Note.Style.ELEMENT, "TYPE=text");
                Value name = new Value();
                content(name);
                entered.kind = Kind.named(name);
            } else {
                entered.kind = Kind.of(token, page);
                if (entered.kind == null) {
                    throw new Stop(
                            Stop.UNKNOWN_ELEMENT,
                            at,
                            1,
                            attribute(token) + " is no TYPE of a characteristic",
                            accepted);
                }
                ++at;
                note(Note.Style.ELEMENT, "TYPE=" + entered.kind.type);
            }
        }
    }

    /** Reads on in a characteristic: true in front of one that it accepts, false behind its END. */
    private boolean readContent(Open in) throws Stop {
        String accepted =
                (in.kind == null ? "" : "parm (0x07), ")
                        + (in.kind != null && in.kind.nests ? "characteristic (0x06), " : "")
                        + "a string, SWITCH_PAGE (0x00), END (0x01)";
        for (; ; ) {
            int tag = peek(accepted) & TAG_MASK;
            switch (tag) {
                case END:
                    ++at;
                    --depth;
                    note("END of " + (in.kind == null ? "characteristic" : in.kind.type));
                    return false;
                case STR_I:
                    droppedText();
                    break;
                case SWITCH_PAGE:
                    dropPageSwitch();
                    break;
                case TAG_CHARACTERISTIC:
                    if (in.kind != null && in.kind.nests) {
                        return true;
                    }
                    throw refused(
                            "no characteristic may stand in "
                                    + (in.kind == null ? "one of unknown TYPE" : in.kind.type),
                            accepted);
                case TAG_PARM:
                    if (in.kind == null) {
                        throw refused(
                                "no parm may stand in a characteristic of unknown TYPE", accepted);
                    }
                    ++in.parms;
                    in.inParm = true;
                    parm(in.kind, in.authType);
                    in.inParm = false;
                    break;
                default:
                    throw refused(
                            elementName(next()) + " cannot stand in a characteristic", accepted);
            }
        }
    }

    private Stop refused(String reason, String accepted) {
        return new Stop(Stop.UNKNOWN_ELEMENT, at, 1, reason, accepted);
    }
}
