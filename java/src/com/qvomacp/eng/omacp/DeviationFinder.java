package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.Deviation.Kind;
import java.util.AbstractList;
import java.util.Arrays;
import java.util.List;
import java.util.RandomAccess;

/**
 * Gathers where a body departs from the format: what its reader tells, and where elements and
 * attributes stand that the document type has no place for.
 */
final class DeviationFinder implements Reading {
    /** The items of the document by their offsets. */
    private final Item[] items;

    private final Item root;

    /** The deviations, each an offset, a kind and the item that it is in: there may be many. */
    private int[] at = new int[16];

    private byte[] kinds = new byte[16];
    private Item[] in = new Item[16];
    private int count;

    /** The elements that have not ended, and where they begin. */
    private Element[] open = new Element[16];

    private int[] offsets = new int[16];
    private int depth;
    private boolean rootSeen;

    private boolean hasName;
    private boolean hasValue;
    private boolean inAttributes;
    private boolean inAttribute;

    DeviationFinder(Item root, int length) {
        this.root = root;
        items = new Item[length + 1];
        Walk walk = new Walk(root);
        for (Item item; (item = walk.next()) != null; ) {
            items[item.offset()] = item;
        }
    }

    /** What was found; a deviation is made when somebody asks for it. */
    List<Deviation> found() {
        return new Found(Arrays.copyOf(at, count), Arrays.copyOf(kinds, count), Arrays.copyOf(in, count));
    }

    private static final class Found extends AbstractList<Deviation> implements RandomAccess {
        private final int[] at;
        private final byte[] kinds;
        private final Item[] in;

        Found(int[] at, byte[] kinds, Item[] in) {
            this.at = at;
            this.kinds = kinds;
            this.in = in;
        }

        @Override
        public Deviation get(int index) {
            return new Deviation(at[index], Kind.of(kinds[index]), in[index]);
        }

        @Override
        public int size() {
            return at.length;
        }
    }

    @Override
    public void element(int from, int to, Element element, String name, boolean attributes) {
        if (element != Element.INSTRUCTION) {
            place(from, element, name);
        }
        if (++depth == open.length) {
            open = Arrays.copyOf(open, 2 * depth);
            offsets = Arrays.copyOf(offsets, 2 * depth);
        }
        open[depth] = element;
        offsets[depth] = from;
        hasName = false;
        hasValue = false;
        inAttribute = false;
        inAttributes = attributes;
        if (!attributes) {
            requireName(from);
        }
    }

    private void place(int from, Element element, String name) {
        Element outer = open[depth];
        if (depth == 0) {
            if (!rootSeen && element != Element.DOCUMENT) {
                deviation(from, Kind.OTHER_ROOT);
            }
            rootSeen = true;
        } else if (outer == Element.PARM) {
            deviation(from, Kind.IN_PARM);
        } else if (element == Element.PARM && outer == Element.DOCUMENT) {
            deviation(from, Kind.PARM_OUTSIDE);
        } else if (element == Element.OTHER) {
            boolean isDocument = Element.DOCUMENT.text.equals(name);
            deviation(from, isDocument ? Kind.INNER_DOCUMENT : Kind.OTHER_ELEMENT);
        }
    }

    @Override
    public void attribute(int from, int to, Attribute attribute, String name, String value) {
        Element element = open[depth];
        inAttribute = true;
        boolean isName = attribute == element.name;
        boolean isValue = attribute == element.value;
        if (!isName && !isValue && element != Element.INSTRUCTION) {
            deviation(from, Kind.OTHER_ATTRIBUTE);
        } else if (isValue ? hasValue : hasName) {
            deviation(from, Kind.SECOND_ATTRIBUTE);
        }
        hasValue |= isValue;
        hasName |= isName || element == Element.INSTRUCTION;
    }

    @Override
    public void text(int from, int to, Writing writing, String text) {
        if (!inAttributes) {
            deviation(from, Kind.TEXT);
        } else if (!inAttribute) {
            deviation(from, Kind.VALUE_ALONE);
        }
    }

    @Override
    public void attributesEnd(int from, int to) {
        requireName(from);
        inAttributes = false;
    }

    @Override
    public void end(int from, int to) {
        if (inAttributes) {
            attributesEnd(from, to);
        }
        --depth;
    }

    private void requireName(int from) {
        Element element = open[depth];
        if (!hasName && element.name != null) {
            deviation(from, element == Element.PARM ? Kind.NAME_MISSING : Kind.TYPE_MISSING);
        }
    }

    @Override
    public void deviation(int at, Kind kind) {
        if (count == kinds.length) {
            this.at = Arrays.copyOf(this.at, 2 * count);
            kinds = Arrays.copyOf(kinds, 2 * count);
            in = Arrays.copyOf(in, 2 * count);
        }
        this.at[count] = at;
        kinds[count] = (byte) kind.ordinal();
        in[count++] = depth == 0 ? root : items[offsets[depth]];
    }
}
