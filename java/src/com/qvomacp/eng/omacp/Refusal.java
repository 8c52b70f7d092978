package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.LibraryStop.Cause;
import com.qvomacp.eng.omacp.LibraryStop.Place;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.Locale;

/** Where and why the native library refuses a message, in words. */
final class Refusal {
    static final String END_OF_DATA = "the end of the data";

    private static final String SWITCH_PAGE = "SWITCH_PAGE (0x00)";
    private static final String END = "END (0x01)";
    private static final String STR_I = "STR_I (0x03)";
    private static final String STR_T = "STR_T (0x83)";
    private static final String OPAQUE = "OPAQUE (0xC3)";
    private static final String DOCUMENT = "wap-provisioningdoc (0x05)";
    private static final String CHARACTERISTIC = "characteristic (0x06)";
    private static final String PARM = "parm (0x07)";
    private static final String VALUE = "VALUE (0x06)";
    private static final String TOKEN_WITH_TEXT = "a value token that has a text";

    private static final int LITERAL = 0x04;
    private static final int FIRST_VALUE = 0x80;

    /** The tokens that WBXML itself gives a meaning; null for the others. */
    private static final String[] GLOBAL = new String[256];

    static {
        String[] names = {"SWITCH_PAGE", "END", "ENTITY", "STR_I", "LITERAL"};
        System.arraycopy(names, 0, GLOBAL, 0, names.length);
        for (int i = 0; i < 3; ++i) {
            GLOBAL[0x40 + i] = "EXT_I_" + i;
            GLOBAL[0x80 + i] = "EXT_T_" + i;
            GLOBAL[0xC0 + i] = "EXT_" + i;
        }
        GLOBAL[0x43] = "PI";
        GLOBAL[0x44] = "LITERAL_C";
        GLOBAL[0x83] = "STR_T";
        GLOBAL[0x84] = "LITERAL_A";
        GLOBAL[0xC3] = "OPAQUE";
        GLOBAL[0xC4] = "LITERAL_AC";
    }

    /** Where that stands which is refused. */
    final int offset;

    /** The elements around; null when the header of a push is refused. */
    final String path;

    final String found;
    final List<String> expected;
    final String reason;

    private Refusal(int offset, String path, String found, List<String> expected, String reason) {
        this.offset = offset;
        this.path = path;
        this.found = found;
        this.expected = Collections.unmodifiableList(expected);
        this.reason = reason;
    }

    /** Of the header of a push. */
    static Refusal ofHeader(LibraryHeader header) {
        return new Refusal(header.offset, null, header.found, header.expected, header.reason);
    }

    /** Of a body that a walk has ended in. */
    static Refusal of(LibraryWalk walk, LibraryStop stop) {
        String found = new Words(walk).found(stop);
        return new Refusal(
                stop.cause == Cause.DOCUMENT_TYPE ? typeOffset(walk) : stop.offset,
                LibraryPath.of(walk),
                found,
                new Words(walk).expected(stop),
                new Words(walk).reason(stop, found) + skipped(walk));
    }

    /** Of a body that can be decoded and holds no characteristic at all. */
    static Refusal ofEmpty(LibraryWalk walk) {
        Words words = new Words(walk);
        int offset = walk.elementsAt;
        List<String> expected = Arrays.asList(DOCUMENT, CHARACTERISTIC);
        String reason;
        switch (walk.data[offset] & LibraryWalk.TAG_MASK) {
            case LibraryWalk.END:
                reason = "the body holds no document";
                break;
            case LibraryWalk.SWITCH_PAGE:
                reason =
                        walk.isSwitchWhole
                                ? "a document that begins with a SWITCH_PAGE is taken for an empty one"
                                : "the body ends within a SWITCH_PAGE";
                break;
            default:
                reason = "a document that begins with a parm is taken for an empty one";
                break;
        }
        if (walk.inDocument) {
            reason = "the document is empty";
            expected = Collections.singletonList(CHARACTERISTIC);
            if (walk.at - 1 > offset) {
                offset = walk.at - 1;
            }
        }
        return new Refusal(
                offset,
                LibraryPath.of(walk),
                words.elementAt(offset),
                expected,
                reason + skipped(walk));
    }

    /** The same of a body that is not the message's, which begins so many bytes behind it. */
    Refusal ofShiftedBody(int shift) {
        String where =
                "; the library takes the body to begin "
                        + bytes(Math.abs(shift))
                        + (shift < 0 ? " later" : " earlier");
        return new Refusal(offset, path, found, expected, reason + where);
    }

    /** What was skipped against the format in front of where the walk ended; empty for nothing. */
    private static String skipped(LibraryWalk walk) {
        if (walk.skipped == null) {
            return "";
        }
        return "; skipped before: "
                + bytes(walk.skippedEnd - walk.skippedStart)
                + " from offset "
                + walk.skippedStart
                + " on, "
                + walk.skipped;
    }

    private static int typeOffset(LibraryWalk walk) {
        if (walk.unreadItem != null && walk.at >= walk.size) {
            return walk.size;
        }
        return walk.publicId == 0 && walk.hasTable ? walk.tableAt : Math.min(1, walk.size);
    }

    static String bytes(long count) {
        return count == 1 ? "1 byte" : count + " bytes";
    }

    /** A text of a message in quotes, fit for a log. */
    static String quoted(byte[] data, int from, int length) {
        return Printable.quoted(CharacterSet.UTF_8.decode(data, from, from + length));
    }

    /** What there is to say where a walk has ended. */
    private static final class Words {
        private final LibraryWalk walk;

        /** The innermost characteristic; null outside of any, and for one of no known type. */
        private final LibraryKind kind;

        Words(LibraryWalk walk) {
            this.walk = walk;
            kind = walk.depth == 0 ? null : walk.kinds[walk.depth - 1];
        }

        // ---- What stands there

        private String found(LibraryStop stop) {
            if (stop.cause == Cause.DOCUMENT_TYPE) {
                return documentType();
            }
            if (stop.offset >= walk.size) {
                return END_OF_DATA;
            }
            switch (stop.place) {
                case DOCUMENT:
                case IN_DOCUMENT:
                case NEXT_CHARACTERISTIC:
                case IN_CHARACTERISTIC:
                    return elementAt(stop.offset);
                default:
                    break;
            }
            String found = attributeAt(stop.offset);
            if (stop.cause == Cause.NO_SUCH_PAGE) {
                return found + " to page " + (walk.data[stop.offset + 1] & 0xFF);
            }
            return stop.cause == Cause.UNKNOWN_NAME
                    ? found + " behind NAME=" + Printable.quoted(walk.nameText())
                    : found;
        }

        private String documentType() {
            if (walk.publicId != 0) {
                return "public identifier " + walk.publicId;
            }
            if (walk.hasTable) {
                return quoted(walk.data, walk.tableAt, tableTextEnd(walk.tableAt) - walk.tableAt);
            }
            return walk.at >= walk.size ? END_OF_DATA : "public identifier";
        }

        private int tableTextEnd(int from) {
            int end = from;
            while (end < walk.tableAt + walk.tablePresent && walk.data[end] != 0) {
                ++end;
            }
            return end;
        }

        /** The token of an element. */
        String elementAt(int offset) {
            int token = walk.data[offset] & 0xFF;
            if (GLOBAL[token] != null) {
                return global(offset);
            }
            Element element = CodePage.of(0).element(token & LibraryWalk.TAG_MASK);
            return element == null ? "element " + hex(token) : withToken(element.text, token);
        }

        /** The token of an attribute or of a value. */
        private String attributeAt(int offset) {
            int token = walk.data[offset] & 0xFF;
            if (GLOBAL[token] != null) {
                return global(offset);
            }
            String name = nameOf(CodePage.of(walk.page), token);
            if (name == null) {
                name = nameOf(CodePage.of(0), token);
            }
            return name == null ? hex(token) : withToken(name, token);
        }

        private static String nameOf(CodePage page, int token) {
            if (token >= FIRST_VALUE) {
                return page.value(token);
            }
            Attribute attribute = page.attribute(token);
            String value = page.begin(token);
            if (attribute == null || attribute == Attribute.NAME && value != null) {
                return value;
            }
            return value == null ? attribute.name() : attribute.name() + "=" + value;
        }

        /** A token of WBXML itself; a literal one with the name that it refers to. */
        private String global(int offset) {
            int token = walk.data[offset] & 0xFF;
            String name = GLOBAL[token];
            if ((token & LibraryWalk.TAG_MASK) == LITERAL) {
                int index = smallIntegerAt(offset + 1);
                if (walk.hasTable && index >= 0 && index < walk.tablePresent) {
                    int start = walk.tableAt + index;
                    name += " " + quoted(walk.data, start, tableTextEnd(start) - start);
                }
            }
            return withToken(name, token);
        }

        /** An integer that may be an index; -1 for one that is none. */
        private int smallIntegerAt(int offset) {
            int value = 0;
            for (int at = offset; at < walk.size && value < 1 << 24; ++at) {
                value = value << 7 | walk.data[at] & 0x7F;
                if (walk.data[at] >= 0) {
                    return value;
                }
            }
            return -1;
        }

        // ---- What would have been taken

        private List<String> expected(LibraryStop stop) {
            switch (stop.cause) {
                case EMPTY_BODY:
                    return Collections.singletonList("a WBXML document");
                case DOCUMENT_TYPE:
                    return Arrays.asList(
                            "public identifier 11",
                            "public identifier 0 with a string table that begins with \""
                                    + LibraryWalk.DOCUMENT_TYPE
                                    + '"');
                case NO_SUCH_PAGE:
                    return Arrays.asList("page 0", "page 1");
                case NO_SUCH_STRING:
                    return walk.hasTable
                            ? Collections.singletonList("an index below " + walk.tableLength)
                            : Collections.<String>emptyList();
                case OPAQUE_TOO_LONG:
                    return Collections.singletonList("at most " + bytes(walk.size - walk.at));
                case EMPTY_NAME:
                case UNKNOWN_NAME:
                    return names();
                case TOO_MUCH_TEXT:
                case OPAQUE_WITHOUT_LENGTH:
                    return Collections.emptyList();
                default:
                    return expectedAt(stop);
            }
        }

        private List<String> names() {
            List<String> names = new ArrayList<>();
            if (kind.names() == null) {
                names.add("a name");
            } else {
                for (String name : kind.names()) {
                    names.add("NAME=\"" + name + '"');
                }
            }
            return names;
        }

        private List<String> expectedAt(LibraryStop stop) {
            List<String> expected = new ArrayList<>();
            switch (stop.place) {
                case DOCUMENT:
                    return Arrays.asList(DOCUMENT, CHARACTERISTIC);
                case VERSION:
                    return Arrays.asList("VERSION (0x45)", "VERSION=1.0 (0x46)");
                case BEHIND_VERSION:
                    return Arrays.asList(END, STR_I);
                case IN_DOCUMENT:
                    return Arrays.asList(SWITCH_PAGE, END, STR_I, CHARACTERISTIC);
                case NEXT_CHARACTERISTIC:
                    return isBehindText(stop)
                            ? Arrays.asList(END, CHARACTERISTIC)
                            : Arrays.asList(END, STR_I, CHARACTERISTIC);
                case TYPE:
                    expected.addAll(Arrays.asList(SWITCH_PAGE, END));
                    expected.addAll(LibraryKind.expectedTypes(walk.page));
                    return expected;
                case IN_CHARACTERISTIC:
                    expected.addAll(Arrays.asList(SWITCH_PAGE, END, STR_I));
                    if (kind != null && kind.nests) {
                        expected.add(CHARACTERISTIC);
                    }
                    if (kind != null) {
                        expected.add(PARM);
                    }
                    return expected;
                case PARM:
                case MASKED_NAME:
                    expected.addAll(Arrays.asList(SWITCH_PAGE, END));
                    expected.addAll(kind.expectedParms());
                    return expected;
                case BEHIND_NAME:
                    return Arrays.asList(SWITCH_PAGE, END, VALUE);
                case VALUE_START:
                    return Collections.singletonList(VALUE);
                case VALUE:
                    return Arrays.asList(STR_I, STR_T, OPAQUE, "a value token");
                case IN_VALUE:
                    return Arrays.asList(END, STR_I, VALUE, STR_T, TOKEN_WITH_TEXT);
                case COMMA_VALUE:
                    return Arrays.asList(STR_I, STR_T, TOKEN_WITH_TEXT);
                default:
                    return Collections.singletonList(END);
            }
        }

        /** Whether the one text that may stand behind a characteristic is there already. */
        private boolean isBehindText(LibraryStop stop) {
            return stop.offset < walk.size
                    && (walk.data[stop.offset] & LibraryWalk.TAG_MASK) == LibraryWalk.STR_I;
        }

        // ---- Why

        private String reason(LibraryStop stop, String found) {
            switch (stop.cause) {
                case EMPTY_BODY:
                    return "the body is empty";
                case DOCUMENT_TYPE:
                    return wrongType();
                case ENDED:
                    return ended(stop.place);
                case NO_SUCH_PAGE:
                    return "there is no code page " + (walk.data[stop.offset + 1] & 0xFF);
                case NO_SUCH_STRING:
                    return walk.at >= walk.size && walk.data[walk.size - 1] < 0
                            ? "the body ends within a reference to the string table"
                            : "there is no such string in the string table";
                case OPAQUE_WITHOUT_LENGTH:
                    return walk.at >= walk.size
                            ? "the body ends within the length of opaque data"
                            : "the length of the opaque data has no end";
                case OPAQUE_TOO_LONG:
                    return "the opaque data is longer than the rest of the body";
                case EMPTY_NAME:
                    return "the name of the parameter is empty";
                case UNKNOWN_NAME:
                    return Printable.quoted(walk.nameText()) + " is no parameter of " + kind.type;
                case TOO_MUCH_TEXT:
                    return "the body is decoded to too much text";
                default:
                    return misplaced(stop, found);
            }
        }

        private String wrongType() {
            if (walk.unreadItem != null) {
                return unreadItem();
            }
            if (walk.publicId == 0) {
                return "the string table does not begin with the type of a provisioning document";
            }
            return "public identifier " + walk.publicId + " is no provisioning document";
        }

        private String unreadItem() {
            if (walk.at < walk.size) {
                return "the " + walk.unreadItem + " has no end";
            }
            return walk.size == 1
                    ? "the body ends behind its version"
                    : "the body ends within its header, where its "
                            + walk.unreadItem
                            + " is expected";
        }

        private String ended(Place place) {
            if (walk.elementsAt == walk.size) {
                if (walk.unreadItem != null) {
                    return unreadItem();
                }
                return walk.tablePresent < walk.tableLength
                        ? "the body ends within its string table of " + bytes(walk.tableLength)
                        : "the body ends behind its header";
            }
            if (walk.unendedText >= 0) {
                return "the body ends within the text at offset " + walk.unendedText;
            }
            if (walk.switchEnd == walk.size) {
                return walk.isSwitchWhole
                        ? "the body ends behind a SWITCH_PAGE"
                        : "the body ends within a SWITCH_PAGE";
            }
            return "the body ends " + endedIn(place);
        }

        private String endedIn(Place place) {
            switch (place) {
                case VERSION:
                case BEHIND_VERSION:
                    return "within the attributes of wap-provisioningdoc";
                case IN_DOCUMENT:
                    return "within wap-provisioningdoc";
                case NEXT_CHARACTERISTIC:
                    return "behind a characteristic";
                case TYPE:
                    return "within the attributes of a characteristic";
                case IN_CHARACTERISTIC:
                    return "within " + (kind == null ? "a characteristic" : kind.type);
                case BEHIND_NAME:
                    return "behind the name of a parameter";
                case VALUE:
                    return "in front of a value";
                case IN_VALUE:
                case COMMA_VALUE:
                    return "within a value";
                case IN_SKIPPED:
                    return "before the END up to which an unknown value is skipped";
                default:
                    return "within a parm";
            }
        }

        private String misplaced(LibraryStop stop, String found) {
            switch (stop.place) {
                case DOCUMENT:
                    return found + " cannot begin a document";
                case VERSION:
                    return found + " is no attribute of wap-provisioningdoc";
                case BEHIND_VERSION:
                    return found + " cannot stand behind the version";
                case IN_DOCUMENT:
                    return found + " cannot stand in wap-provisioningdoc";
                case NEXT_CHARACTERISTIC:
                    return found
                            + " cannot stand behind a characteristic"
                            + (isBehindText(stop) ? " and a text" : "");
                case TYPE:
                    return found + " is no TYPE of a characteristic";
                case IN_CHARACTERISTIC:
                    return found + " cannot stand in " + innermost();
                case PARM:
                    return found + " is no parameter of " + kind.type;
                case MASKED_NAME:
                    return found + " is not found behind a SWITCH_PAGE, being above 0x3F";
                case BEHIND_NAME:
                    return found + " cannot stand behind the name of a parameter";
                case VALUE_START:
                    return found + " stands in place of VALUE";
                default:
                    return found + " cannot stand in a value that begins with a string";
            }
        }

        private String innermost() {
            if (kind != null) {
                return kind.type;
            }
            String type = walk.nameText();
            return type == null
                    ? "a characteristic without a TYPE"
                    : "a characteristic of the unknown TYPE " + Printable.quoted(type);
        }

        private static String hex(int token) {
            return String.format(Locale.ROOT, "0x%02X", token);
        }

        private static String withToken(String name, int token) {
            return LibraryKind.withToken(name, token);
        }
    }
}
