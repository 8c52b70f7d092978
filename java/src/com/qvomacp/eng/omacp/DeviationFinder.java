package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/**
 * Gathers where a body departs from the format: what its reader tells, and where elements and
 * attributes stand that the document type has no place for.
 */
final class DeviationFinder implements Reading {
    /** The items of the document by their offsets. */
    private final Item[] items;

    private final Item root;
    private final List<Deviation> deviations = new ArrayList<>();

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

    List<Deviation> found() {
        return deviations;
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
            requireName();
        }
    }

    private void place(int from, Element element, String name) {
        Element outer = open[depth];
        if (depth == 0) {
            if (!rootSeen && element != Element.DOCUMENT) {
                deviation(from, Deviation.Kind.OTHER_ROOT);
            }
            rootSeen = true;
        } else if (outer == Element.PARM) {
            deviation(from, Deviation.Kind.IN_PARM);
        } else if (element == Element.PARM && outer == Element.DOCUMENT) {
            deviation(from, Deviation.Kind.PARM_OUTSIDE);
        } else if (element == Element.OTHER) {
            deviation(
                    from,
                    Element.DOCUMENT.text.equals(name)
                            ? Deviation.Kind.INNER_DOCUMENT
                            : Deviation.Kind.OTHER_ELEMENT);
        }
    }

    @Override
    public void attribute(int from, int to, Attribute attribute, String name, String value) {
        Element element = open[depth];
        inAttribute = true;
        if (attribute == element.name) {
            require(from, !hasName, Deviation.Kind.SECOND_ATTRIBUTE);
            hasName = true;
        } else if (attribute == element.value) {
            require(from, !hasValue, Deviation.Kind.SECOND_ATTRIBUTE);
            hasValue = true;
        } else if (element == Element.INSTRUCTION) {
            require(from, !hasName, Deviation.Kind.SECOND_ATTRIBUTE);
            hasName = true;
        } else {
            deviation(from, Deviation.Kind.OTHER_ATTRIBUTE);
        }
    }

    @Override
    public void text(int from, int to, Writing writing, String text) {
        if (inAttributes) {
            require(from, inAttribute, Deviation.Kind.VALUE_ALONE);
        } else {
            deviation(from, Deviation.Kind.TEXT);
        }
    }

    @Override
    public void attributesEnd(int from, int to) {
        requireName();
        inAttributes = false;
    }

    @Override
    public void end(int from, int to) {
        if (inAttributes) {
            requireName();
            inAttributes = false;
        }
        --depth;
    }

    private void requireName() {
        Element element = open[depth];
        if (!hasName && element.name != null) {
            deviation(
                    offsets[depth],
                    element == Element.PARM
                            ? Deviation.Kind.NAME_MISSING
                            : Deviation.Kind.TYPE_MISSING);
        }
    }

    @Override
    public void page(int from, int to, boolean attributes, int page) {
        // A page that the format lacks is told by the tokens that stand on it.
    }

    @Override
    public void trailing(int from, int to) {
        // Told as a deviation.
    }

    private void require(int at, boolean met, Deviation.Kind kind) {
        if (!met) {
            deviation(at, kind);
        }
    }

    @Override
    public void deviation(int at, Deviation.Kind kind) {
        Item item = depth == 0 ? null : items[offsets[depth]];
        deviations.add(new Deviation(at, kind, item == null ? root : item));
    }
}
