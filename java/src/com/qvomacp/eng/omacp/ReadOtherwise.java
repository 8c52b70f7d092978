package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import java.util.Objects;

/** Compares the elements that the native library's walk reads with the items of the tree. */
final class ReadOtherwise extends LibraryTrace {
    private static final int OPEN = -1;
    private static final int NO_PARM = -1;

    /** The elements in the order in which they begin. */
    private int count;

    private int[] starts = new int[64];
    private int[] ends = new int[64];

    /** What a characteristic or parameter is called; null for what the library does not know. */
    private String[] names = new String[64];

    /** How many pairs of name and value a parm has; -1 for a characteristic. */
    private int[] pairs = new int[64];

    /** The end of a parm's value; 0 without one. */
    private int[] valueEnds = new int[64];

    /** The elements whose ends have not been read. */
    private int[] open = new int[16];

    private int depth;

    private ReadOtherwise() {}

    /**
     * Lists the items of a document that the walk skips or reads as something else.
     *
     * @param body what the library takes for the body
     * @param shift where the document begins in it
     */
    static List<Item> of(byte[] body, ProvisioningDocument document, int shift) {
        ReadOtherwise read = new ReadOtherwise();
        LibraryWalk walk = new LibraryWalk(body, read);
        int end;
        try {
            walk.run();
            end = walk.at;
        } catch (LibraryStop stop) {
            end = stop.offset;
            if (walk.depth > 0 && !walk.isTyped) {
                read.begin(walk.starts[walk.depth - 1], null, false);
            }
        }
        List<Item> otherwise = new ArrayList<>();
        int next = 0;
        for (Item top : document.children()) {
            Walk items = new Walk(top);
            for (Item item; (item = items.next()) != null; ) {
                int start = item.offset() + shift;
                if (start >= end) {
                    return otherwise;
                }
                while (next < read.count && read.starts[next] < start) {
                    ++next;
                }
                boolean isThere = next < read.count && read.starts[next] == start;
                if (!isThere || !read.isAlike(next, item, start + item.length())) {
                    otherwise.add(item);
                }
            }
        }
        return otherwise;
    }

    private boolean isAlike(int element, Item item, int end) {
        boolean isOpen = ends[element] == OPEN;
        if (!isOpen && ends[element] != end) {
            return false;
        }
        if (item instanceof Characteristic) {
            // One that is open and of no known type is where the library refuses the message.
            return pairs[element] == NO_PARM
                    && (isOpen && names[element] == null
                            || Objects.equals(names[element], ((Characteristic) item).type()));
        }
        if (!(item instanceof Parameter) || pairs[element] == NO_PARM) {
            return false;
        }
        Parameter parameter = (Parameter) item;
        return isOpen
                || pairs[element] == 1
                        && Objects.equals(names[element], parameter.name())
                        && valueEnds[element] == (parameter.value() == null ? 0 : end - 1);
    }

    private void begin(int start, String name, boolean isParm) {
        if (count == starts.length) {
            starts = Arrays.copyOf(starts, 2 * count);
            ends = Arrays.copyOf(ends, 2 * count);
            names = Arrays.copyOf(names, 2 * count);
            pairs = Arrays.copyOf(pairs, 2 * count);
            valueEnds = Arrays.copyOf(valueEnds, 2 * count);
        }
        if (depth == open.length) {
            open = Arrays.copyOf(open, 2 * depth);
        }
        open[depth++] = count;
        starts[count] = start;
        ends[count] = OPEN;
        names[count] = name;
        pairs[count] = isParm ? 0 : NO_PARM;
        valueEnds[count++] = 0;
    }

    @Override
    void characteristic(LibraryWalk walk, int depth, int start, LibraryKind kind) {
        begin(start, kind == null ? null : kind.type, false);
    }

    @Override
    void parm(int start) {
        begin(start, null, true);
    }

    @Override
    void name(LibraryWalk walk) {
        int parm = count - 1;
        if (pairs[parm]++ == 0) {
            names[parm] = walk.parmName();
        }
    }

    @Override
    void value(int end) {
        valueEnds[count - 1] = end;
    }

    @Override
    void end(int end) {
        ends[open[--depth]] = end;
    }
}
