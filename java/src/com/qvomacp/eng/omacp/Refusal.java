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
    static Refusal ofHeader(int offset, String found, String reason, String... expected) {
        return new Refusal(offset, null, found, Arrays.asList(expected), reason);
    }

    /** Of a body that a walk has ended in. */
    static Refusal of(LibraryWalk walk, LibraryStop stop) {
        Words words = new Words(walk, stop);
        String found = words.found();
        return of(walk, stop.offset, found, words.expected(), words.reason(found));
    }

    /** Of a body that can be decoded and holds no characteristic at all. */
    static Refusal ofEmpty(LibraryWalk walk) {
        int offset = walk.elementsAt;
        List<String> expected = Arrays.asList(LibraryStop.DOCUMENT, LibraryStop.CHARACTERISTIC);
        int first = walk.data[offset] & LibraryText.TAG_MASK;
        String reason;
        if (walk.inDocument) {
            reason = "the document is empty";
            expected = expected.subList(1, 2);
            offset = Math.max(offset, walk.at - 1);
        } else if (first == LibraryText.END) {
            reason = "the body holds no document";
        } else if (first != LibraryText.SWITCH_PAGE) {
            reason = "a document that begins with a parm is taken for an empty one";
        } else if (walk.isSwitchWhole) {
            reason = "a document that begins with a SWITCH_PAGE is taken for an empty one";
        } else {
            reason = "the body ends within a SWITCH_PAGE";
        }
        return of(walk, offset, new Words(walk, null).elementAt(offset), expected, reason);
    }

    /** Tells too what was skipped against the format in front of where the walk ended. */
    private static Refusal of(
            LibraryWalk walk, int offset, String found, List<String> expected, String why) {
        String reason = why;
        if (walk.skipped != null) {
            reason += "; skipped before: " + bytes(walk.skippedEnd - walk.skippedStart);
            reason += " from offset " + walk.skippedStart + " on, " + walk.skipped;
        }
        return new Refusal(offset, LibraryPath.of(walk), found, expected, reason);
    }

    /** The same of a body that is not the message's, which begins so many bytes behind it. */
    Refusal ofShiftedBody(int shift) {
        String why = reason + "; the library " + shifted(shift);
        return new Refusal(offset, path, found, expected, why);
    }

    static String shifted(int shift) {
        String where = shift < 0 ? " later" : " earlier";
        return "takes the body to begin " + bytes(Math.abs(shift)) + where;
    }

    static String bytes(long count) {
        return count == 1 ? "1 byte" : count + " bytes";
    }

    static String hex(int octet) {
        return String.format(Locale.ROOT, "0x%02X", octet & 0xFF);
    }

    /** A text of a message in quotes, fit for a log. */
    static String quoted(byte[] data, int from, int end) {
        return Printable.quoted(CharacterSet.UTF_8.decode(data, from, end));
    }

    /** What there is to say where a walk has ended. */
    private static final class Words {
        private static final int LITERAL = 0x04;
        private static final int FIRST_VALUE = 0x80;

        /** The tokens that WBXML itself gives a meaning. */
        private static final String[] GLOBAL = {
            "SWITCH_PAGE", "END", "ENTITY", "STR_I", "LITERAL",
            "EXT_I_0", "EXT_I_1", "EXT_I_2", "PI", "LITERAL_C",
            "EXT_T_0", "EXT_T_1", "EXT_T_2", "STR_T", "LITERAL_A",
            "EXT_0", "EXT_1", "EXT_2", "OPAQUE", "LITERAL_AC",
        };

        private final LibraryWalk walk;

        /** Null when the walk has come to an end of its own. */
        private final LibraryStop stop;

        /** The innermost characteristic; null outside of any, and for one of no known type. */
        private final LibraryKind kind;

        Words(LibraryWalk walk, LibraryStop stop) {
            this.walk = walk;
            this.stop = stop;
            kind = walk.depth == 0 ? null : walk.kinds[walk.depth - 1];
        }

        /** Where the walk has ended, which may be behind the one text between characteristics. */
        private Place place() {
            boolean isBehindText =
                    stop.place == Place.NEXT_CHARACTERISTIC
                            && stop.offset < walk.size
                            && (walk.data[stop.offset] & LibraryText.TAG_MASK) == LibraryText.STR_I;
            return isBehindText ? Place.BEHIND_TEXT : stop.place;
        }

        // ---- What stands there

        String found() {
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
                return found + " to page " + wantedPage();
            }
            return stop.cause == Cause.UNKNOWN_NAME
                    ? found + " behind NAME=" + Printable.quoted(walk.nameText())
                    : found;
        }

        private int wantedPage() {
            return walk.data[stop.offset + 1] & 0xFF;
        }

        private String documentType() {
            if (walk.isTypeText()) {
                return quoted(walk.data, walk.tableAt, walk.endOfTableText(walk.tableAt));
            }
            if (walk.publicId != 0) {
                return "public identifier " + walk.publicId;
            }
            return walk.at >= walk.size ? END_OF_DATA : "public identifier";
        }

        /** The token of an element. */
        String elementAt(int offset) {
            Element element = CodePage.of(0).element(walk.data[offset] & LibraryText.TAG_MASK);
            return withToken(offset, element == null ? null : element.text, "element ");
        }

        /** The token of an attribute or of a value. */
        private String attributeAt(int offset) {
            int token = walk.data[offset] & 0xFF;
            String name = nameOf(CodePage.of(walk.page), token);
            return withToken(offset, name != null ? name : nameOf(CodePage.of(0), token), "");
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

        /** The name of a token, that of WBXML first; a literal one with what it refers to. */
        private String withToken(int offset, String ofPage, String unknown) {
            int token = walk.data[offset] & 0xFF;
            int low = token & LibraryText.TAG_MASK;
            if (low > LITERAL) {
                return ofPage == null ? unknown + hex(token) : LibraryKind.withToken(ofPage, token);
            }
            String name = GLOBAL[(token >> 6) * (LITERAL + 1) + low];
            if (low == LITERAL && walk.unreadItem == null) {
                long index = new Cursor(walk.data, offset + 1, walk.size).integer();
                if (index >= 0 && index < walk.tablePresent) {
                    int start = walk.tableAt + (int) index;
                    name += " " + quoted(walk.data, start, walk.endOfTableText(start));
                }
            }
            return LibraryKind.withToken(name, token);
        }

        // ---- What would have been taken

        List<String> expected() {
            if (!stop.cause.expected.isEmpty()) {
                return stop.cause.expected;
            }
            switch (stop.cause) {
                case NO_SUCH_STRING:
                    return walk.unreadItem == null
                            ? Collections.singletonList("an index below " + walk.tableLength)
                            : Collections.<String>emptyList();
                case OPAQUE_TOO_LONG:
                    return Collections.singletonList("at most " + bytes(walk.size - walk.at));
                case EMPTY_NAME:
                case UNKNOWN_NAME:
                    return kind.expectedNames();
                case TOO_MUCH_TEXT:
                case OPAQUE_WITHOUT_LENGTH:
                    return Collections.emptyList();
                default:
                    return expectedThere();
            }
        }

        private List<String> expectedThere() {
            List<String> expected = new ArrayList<>(place().expected);
            if (stop.place == Place.TYPE) {
                expected.addAll(LibraryKind.expectedTypes(walk.page));
            } else if (stop.place == Place.PARM || stop.place == Place.MASKED_NAME) {
                expected.addAll(kind.expectedParms());
            } else if (stop.place == Place.IN_CHARACTERISTIC && kind != null) {
                if (kind.nests) {
                    expected.add(LibraryStop.CHARACTERISTIC);
                }
                expected.add(LibraryStop.PARM);
            }
            return expected;
        }

        // ---- Why

        String reason(String found) {
            if (stop.cause.reason != null) {
                return stop.cause.reason;
            }
            boolean isAtEnd = walk.at >= walk.size;
            switch (stop.cause) {
                case DOCUMENT_TYPE:
                    return wrongType();
                case ENDED:
                case ENDED_IN_SWITCH:
                    return ended();
                case NO_SUCH_PAGE:
                    return "there is no code page " + wantedPage();
                case NO_SUCH_STRING:
                    return isAtEnd && walk.data[walk.size - 1] < 0
                            ? "the body ends within a reference to the string table"
                            : "there is no such string in the string table";
                case OPAQUE_WITHOUT_LENGTH:
                    return isAtEnd
                            ? "the body ends within the length of opaque data"
                            : "the length of the opaque data has no end";
                case UNKNOWN_NAME:
                    return Printable.quoted(walk.nameText()) + " is no parameter of " + kind.type;
                default:
                    return found + " " + place().refused + characteristic(false);
            }
        }

        private String wrongType() {
            if (walk.unreadItem != null) {
                return unreadItem();
            }
            return walk.publicId == 0
                    ? "the string table does not begin with the type of a provisioning document"
                    : "public identifier " + walk.publicId + " is no provisioning document";
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

        private String ended() {
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
                String where = walk.isSwitchWhole ? "behind" : "within";
                return "the body ends " + where + " a SWITCH_PAGE";
            }
            return "the body ends " + stop.place.where + characteristic(true);
        }

        /** Names the characteristic where the words of a place end with it. */
        private String characteristic(boolean isEnd) {
            if (stop.place == Place.PARM) {
                return isEnd ? "" : " " + kind.type;
            }
            if (stop.place != Place.IN_CHARACTERISTIC) {
                return "";
            }
            if (kind != null) {
                return " " + kind.type;
            }
            String type = isEnd ? null : walk.nameText();
            return type != null
                    ? " a characteristic of the unknown TYPE " + Printable.quoted(type)
                    : isEnd ? " a characteristic" : " a characteristic without a TYPE";
        }
    }
}
