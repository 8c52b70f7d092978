package com.qvomacp.eng.omacp;

import java.util.ArrayDeque;
import java.util.ArrayList;
import java.util.Deque;
import java.util.List;
import java.util.Objects;

/** Compares what the native library's walk reads with the items of the tree. */
final class ReadOtherwise extends LibraryTrace {
    private static final int OPEN = -1;
    private static final int END_MASK = 0x3F;

    private enum Kind { CHARACTERISTIC, PARM, SKIPPED }

    /** What the walk reads. */
    private static final class Part {
        final Kind kind;
        final int start;
        int end = OPEN;

        /** What it is called; null for what the library does not know. */
        String name;

        /** How many pairs of name and value a parm has. */
        int pairs;

        /** The end of a parm's value; 0 without one. */
        int valueEnd;

        Part(Kind kind, int start) {
            this.kind = kind;
            this.start = start;
        }
    }

    private final byte[] body;
    private final ProvisioningDocument document;

    /** Where the document begins in what the library takes for the body. */
    private final int shift;

    private final ByteVisitor visitor;

    /** In the order in which they begin. */
    private final List<Part> parts = new ArrayList<>();

    /** Those whose ends have not been read, the innermost first. */
    private final Deque<Part> open = new ArrayDeque<>();

    private ReadOtherwise(
            byte[] body, ProvisioningDocument document, int shift, ByteVisitor visitor) {
        this.body = body;
        this.document = document;
        this.shift = shift;
        this.visitor = visitor;
    }

    /**
     * Lists the items of a document that the walk skips or reads as something else, and tells what
     * it reads instead.
     *
     * @param body what the library takes for the body
     * @param shift where the document begins in it
     */
    static List<Item> of(
            byte[] body, ProvisioningDocument document, int shift, ByteVisitor visitor) {
        ReadOtherwise read = new ReadOtherwise(body, document, shift, visitor);
        LibraryWalk walk = new LibraryWalk(body, read);
        int end;
        try {
            walk.run();
            end = walk.at;
        } catch (LibraryStop stop) {
            end = stop.offset;
        }
        read.compareHeaders(walk);
        return read.compareItems(walk.elementsAt, end);
    }

    private void tell(int start, int end, String reading) {
        int from = Math.max(start - shift, 0);
        visitor.visit(from, Math.max(end - shift - from, 1), 0, "the library " + reading);
    }

    private void compareHeaders(LibraryWalk walk) {
        BodyHeader header = document.header();
        if (shift != 0) {
            tell(shift, shift, Refusal.shifted(shift));
        } else if (walk.unreadItem != null) {
            tell(header.identifierAt, walk.at, "cannot read the " + walk.unreadItem);
        } else if (walk.elementsAt != header.elementsAt) {
            String length = "reads " + walk.tableLength + " as the length of the string table";
            tell(header.charsetAt, walk.tableLengthAt, "reads a character set");
            tell(walk.tableLengthAt, walk.tableAt, length);
        }
    }

    /** Compares from where the walk's elements begin up to where it ends. */
    private List<Item> compareItems(int from, int end) {
        List<Item> otherwise = new ArrayList<>();
        int told = from;
        int next = 0;
        Walk items = new Walk(document.root());
        items.next();
        for (Item item; (item = items.next()) != null && item.offset() + shift < end; ) {
            int start = item.offset() + shift;
            for (; next < parts.size() && isBefore(parts.get(next), start); ++next) {
                told = tellAlone(parts.get(next), told);
            }
            int itemEnd = start + item.length();
            if (next == parts.size() || parts.get(next).start > start) {
                otherwise.add(item);
                if (start >= told) {
                    tell(start, itemEnd, "reads no element here");
                }
                continue;
            }
            Part part = parts.get(next++);
            String reading = reading(part, item, itemEnd);
            if (reading != null) {
                otherwise.add(item);
                tell(start, part.end, reading);
            }
        }
        for (; next < parts.size(); ++next) {
            told = tellAlone(parts.get(next), told);
        }
        return otherwise;
    }

    private static boolean isBefore(Part part, int start) {
        return part.start < start || part.start == start && part.kind == Kind.SKIPPED;
    }

    /** Tells of what no item stands for, and up to where no more is to be told. */
    private int tellAlone(Part part, int told) {
        if (part.kind != Kind.SKIPPED) {
            tell(part.start, part.end, reads(part));
            return told;
        }
        String bytes = Refusal.bytes(part.end - part.start);
        tell(part.start, part.end, "skips " + bytes + " from here on, " + part.name);
        return Math.max(told, part.end);
    }

    private static String reads(Part part) {
        String what = part.kind == Kind.CHARACTERISTIC ? "a characteristic" : "a parm";
        boolean isNamed = part.name != null && !part.name.isEmpty();
        return "reads " + what + (isNamed ? " " + Printable.of(part.name) : "");
    }

    /** What the library makes of the bytes of an item; null for the same. */
    private String reading(Part part, Item item, int end) {
        boolean isCharacteristic = part.kind == Kind.CHARACTERISTIC;
        boolean isOpen = part.end == OPEN;
        if (!(isCharacteristic ? item instanceof Characteristic : item instanceof Parameter)) {
            return reads(part);
        }
        // One that is open and of no known type is where the library refuses the message.
        if (isCharacteristic
                && !Objects.equals(part.name, item.called())
                && !(isOpen && part.name == null)) {
            return part.name == null ? "knows no such TYPE" : reads(part);
        }
        if (isOpen) {
            return null;
        }
        if (part.end != end) {
            boolean isNext = part.end == end + 1 && (body[end] & END_MASK) == BodyReader.END;
            String by = Refusal.bytes(Math.abs(part.end - end));
            String ends = "ends this " + by + (part.end < end ? " earlier" : " later");
            return isNext ? "takes the next END for its own" : ends;
        }
        return isCharacteristic ? null : reading(part, (Parameter) item, end);
    }

    private static String reading(Part parm, Parameter parameter, int end) {
        if (parm.pairs != 1) {
            return parm.pairs == 0 ? "reads no NAME" : "joins " + parm.pairs + " parameters";
        }
        if (!Objects.equals(parm.name, parameter.name())) {
            return reads(parm);
        }
        if (parm.valueEnd == (parameter.value() == null ? 0 : end - 1)) {
            return null;
        }
        return parm.valueEnd == 0 ? "reads no value" : "ends the value before the END";
    }

    private Part add(Kind kind, int start) {
        Part part = new Part(kind, start);
        parts.add(part);
        return part;
    }

    @Override
    void begin(int start, boolean isParm) {
        open.push(add(isParm ? Kind.PARM : Kind.CHARACTERISTIC, start));
    }

    @Override
    void type(LibraryWalk walk, int outer, int start, LibraryKind kind) {
        open.peek().name = kind == null ? null : kind.type;
    }

    @Override
    void name(LibraryWalk walk) {
        if (open.peek().pairs++ == 0) {
            open.peek().name = walk.parmName();
        }
    }

    @Override
    void value(int end) {
        open.peek().valueEnd = end;
    }

    @Override
    void end(int end) {
        open.pop().end = end;
    }

    /** What was skipped within it is part of it. */
    @Override
    void skipped(String what, int start, int end) {
        for (int last = parts.size() - 1;
                last >= 0 && parts.get(last).kind == Kind.SKIPPED && parts.get(last).start >= start;
                --last) {
            parts.remove(last);
        }
        Part part = add(Kind.SKIPPED, start);
        part.name = what;
        part.end = end;
    }
}
