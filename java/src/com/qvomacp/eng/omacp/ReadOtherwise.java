package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import java.util.Objects;

/** Compares what the native library's walk reads with the items of the tree. */
final class ReadOtherwise extends LibraryTrace {
    private static final int OPEN = -1;
    private static final int CHARACTERISTIC = -1;
    private static final int SKIPPED = -2;
    private static final int BEGIN = 64;
    private static final int END_MASK = 0x3F;

    private final byte[] body;
    private final ProvisioningDocument document;

    /** Where the document begins in what the library takes for the body. */
    private final int shift;

    private final ByteVisitor visitor;

    /** What the walk reads, in the order in which it begins. */
    private int count;

    private int[] starts = new int[BEGIN];
    private int[] ends = new int[BEGIN];

    /** What it is called; null for what the library does not know. */
    private String[] names = new String[BEGIN];

    /** How many pairs of name and value a parm has; what else it is. */
    private int[] pairs = new int[BEGIN];

    /** The end of a parm's value; 0 without one. */
    private int[] valueEnds = new int[BEGIN];

    /** The elements whose ends have not been read. */
    private int[] open = new int[16];

    private int depth;

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
            for (; next < count && isBefore(next, start); ++next) {
                told = tellAlone(next, told);
            }
            int itemEnd = start + item.length();
            if (next == count || starts[next] > start) {
                otherwise.add(item);
                if (start >= told) {
                    tell(start, itemEnd, "reads no element here");
                }
                continue;
            }
            String reading = reading(next, item, itemEnd);
            if (reading != null) {
                otherwise.add(item);
                tell(start, ends[next], reading);
            }
            ++next;
        }
        for (; next < count; ++next) {
            told = tellAlone(next, told);
        }
        return otherwise;
    }

    private boolean isBefore(int element, int start) {
        return starts[element] < start || starts[element] == start && pairs[element] == SKIPPED;
    }

    /** Tells of what no item stands for, and up to where no more is to be told. */
    private int tellAlone(int element, int told) {
        int start = starts[element];
        if (pairs[element] != SKIPPED) {
            tell(start, ends[element], reads(element));
            return told;
        }
        String bytes = Refusal.bytes(ends[element] - start);
        tell(start, ends[element], "skips " + bytes + " from here on, " + names[element]);
        return Math.max(told, ends[element]);
    }

    private String reads(int element) {
        String what = pairs[element] == CHARACTERISTIC ? "a characteristic" : "a parm";
        boolean isNamed = names[element] != null && !names[element].isEmpty();
        return "reads " + what + (isNamed ? " " + Printable.of(names[element]) : "");
    }

    /** What the library makes of the bytes of an item; null for the same. */
    private String reading(int element, Item item, int end) {
        boolean isCharacteristic = pairs[element] == CHARACTERISTIC;
        Class<?> kind = isCharacteristic ? Characteristic.class : Parameter.class;
        if (!kind.isInstance(item)) {
            return reads(element);
        }
        boolean isOpen = ends[element] == OPEN;
        if (isCharacteristic) {
            String type = ((Characteristic) item).type();
            // One that is open and of no known type is where the library refuses the message.
            if (!Objects.equals(names[element], type) && !(isOpen && names[element] == null)) {
                return names[element] == null ? "knows no such TYPE" : reads(element);
            }
        }
        if (isOpen) {
            return null;
        }
        if (ends[element] != end) {
            boolean isNext = ends[element] == end + 1 && (body[end] & END_MASK) == BodyReader.END;
            return isNext ? "takes the next END for its own" : "ends this " + by(ends[element] - end);
        }
        return isCharacteristic ? null : reading(element, (Parameter) item, end);
    }

    private static String by(int bytes) {
        return Refusal.bytes(Math.abs(bytes)) + (bytes < 0 ? " earlier" : " later");
    }

    private String reading(int parm, Parameter parameter, int end) {
        if (pairs[parm] != 1) {
            return pairs[parm] == 0 ? "reads no NAME" : "joins " + pairs[parm] + " parameters";
        }
        if (!Objects.equals(names[parm], parameter.name())) {
            return reads(parm);
        }
        if (valueEnds[parm] == (parameter.value() == null ? 0 : end - 1)) {
            return null;
        }
        return valueEnds[parm] == 0 ? "reads no value" : "ends the value before the END";
    }

    private int add(int start, int end, String name, int kind) {
        if (count == starts.length) {
            starts = Arrays.copyOf(starts, 2 * count);
            ends = Arrays.copyOf(ends, 2 * count);
            names = Arrays.copyOf(names, 2 * count);
            pairs = Arrays.copyOf(pairs, 2 * count);
            valueEnds = Arrays.copyOf(valueEnds, 2 * count);
        }
        starts[count] = start;
        ends[count] = end;
        names[count] = name;
        pairs[count] = kind;
        valueEnds[count] = 0;
        return count++;
    }

    @Override
    void begin(int start, boolean isParm) {
        if (depth == open.length) {
            open = Arrays.copyOf(open, 2 * depth);
        }
        open[depth++] = add(start, OPEN, null, isParm ? 0 : CHARACTERISTIC);
    }

    @Override
    void type(LibraryWalk walk, int outer, int start, LibraryKind kind) {
        names[open[depth - 1]] = kind == null ? null : kind.type;
    }

    @Override
    void name(LibraryWalk walk) {
        int parm = open[depth - 1];
        if (pairs[parm]++ == 0) {
            names[parm] = walk.parmName();
        }
    }

    @Override
    void value(int end) {
        valueEnds[open[depth - 1]] = end;
    }

    @Override
    void end(int end) {
        ends[open[--depth]] = end;
    }

    /** What was skipped within it is part of it. */
    @Override
    void skipped(String what, int start, int end) {
        while (count > 0 && pairs[count - 1] == SKIPPED && starts[count - 1] >= start) {
            --count;
        }
        add(start, end, what, SKIPPED);
    }
}
