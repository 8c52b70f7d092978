package com.qvomacp.eng.omacp;

import java.util.Arrays;

/**
 * Builds the tree. An item is made when its end is read and everything in it is there; until then
 * what is known of it stands in a frame, and the items that are whole wait for the one around them.
 */
final class TreeBuilder implements Reading {
    /** The document, where nothing of the document element is known. */
    private static final String DOCUMENT = "document";

    private static final int FRAMES = 8;
    private static final int ITEMS = 16;

    /** What is known of an element that has not ended. Frames are used again. */
    private static final class Frame {
        Element element;
        String elementName;
        int from;

        /** How many items waited when the element began. */
        int waited;

        String name;
        Writing nameWriting;
        String value;
        Writing valueWriting;
    }

    /** Deeper ones are let go of when their element ends: its item takes their place in memory. */
    private static final int KEPT_FRAMES = 64;

    /** The elements whose content is read, and behind them the one whose attributes are. */
    private Frame[] frames = new Frame[FRAMES];

    private int depth;

    /** The element whose attributes are read, or that ends. */
    private Frame frame;

    /** Whether attributes are read. An element that has nothing else is never one of those open. */
    private boolean inAttributes;

    private Item[] waiting = new Item[ITEMS];
    private int waits;

    /** The attribute whose value is read; {@code null} when text is. */
    private Attribute attribute;

    private String attributeName;

    /** The pieces of a value or text, from its beginning to its end. */
    private int pieces;

    private String text;
    private StringBuilder joined;
    private Writing writing;
    private int textFrom;
    private int textTo;

    private int rootFrom;
    private int rootTo;
    private String rootName = DOCUMENT;
    private String version;

    TreeBuilder(int from) {
        rootFrom = from;
        rootTo = from;
    }

    /** The document element, with everything that was read. */
    Other root() {
        finishText();
        Item[] inside = Arrays.copyOf(waiting, waits);
        return new Other(rootFrom, rootTo, inside, Other.Kind.ELEMENT, rootName, null, null);
    }

    /** The version attribute of the document element, or {@code null}. */
    String version() {
        return version;
    }

    @Override
    public void element(int from, int to, Element element, String name, boolean attributes) {
        finishText();
        if (depth == frames.length) {
            frames = Arrays.copyOf(frames, 2 * depth);
        }
        frame = frames[depth];
        if (frame == null) {
            frame = new Frame();
            frames[depth] = frame;
        }
        frame.element = element;
        frame.elementName = name;
        frame.from = from;
        frame.waited = waits;
        frame.name = null;
        frame.value = null;
        inAttributes = attributes;
        if (!attributes) {
            ++depth;
        }
    }

    @Override
    public void attribute(int from, int to, Attribute attribute, String name, String value) {
        finishText();
        this.attribute = attribute;
        attributeName = name;
        textFrom = from;
        textTo = to;
        if (value != null) {
            pieces = 1;
            text = value;
            writing = Writing.TOKEN;
        }
    }

    @Override
    public void text(int from, int to, Writing writing, String piece) {
        if (pieces++ == 0) {
            if (attribute == null) {
                textFrom = from;
            }
            text = piece;
            this.writing = writing;
        } else {
            join(piece);
        }
        textTo = to;
    }

    /** Joins a piece to what there is. An empty one changes nothing, and makes no text of its own. */
    private void join(String piece) {
        writing = Writing.JOINED;
        if (joined != null) {
            joined.append(piece);
        } else if (text.isEmpty()) {
            text = piece;
        } else if (!piece.isEmpty()) {
            joined = new StringBuilder(text).append(piece);
        }
    }

    /** The value or text is whole. */
    private void finishText() {
        if (attribute == null && pieces == 0) {
            return;
        }
        String whole = joined == null ? text : joined.toString();
        if (attribute == null) {
            add(new Other(textFrom, textTo, Item.NONE, Other.Kind.TEXT, null, whole, writing));
        } else {
            if (pieces == 0) {
                whole = "";
                writing = Writing.JOINED;
            }
            finishAttribute(whole);
        }
        attribute = null;
        pieces = 0;
        joined = null;
    }

    private void finishAttribute(String whole) {
        Element element = frame.element;
        boolean isTarget = element == Element.INSTRUCTION && frame.name == null;
        if (attribute == element.name && frame.name == null) {
            frame.name = whole;
            frame.nameWriting = writing;
        } else if (isTarget || attribute == element.value && frame.value == null) {
            frame.name = isTarget ? attribute.name(attributeName) : frame.name;
            frame.value = whole;
            frame.valueWriting = writing;
        } else {
            Other.Kind kind = Other.Kind.ATTRIBUTE;
            String called = attribute.name(attributeName);
            add(new Other(textFrom, textTo, Item.NONE, kind, called, whole, writing));
        }
    }

    @Override
    public void parameter(int from, int to, String name, String value, Writing writing) {
        finishText();
        add(new Parameter(from, to, Item.NONE, name, Writing.TOKEN, value, writing));
    }

    @Override
    public void attributesEnd(int from, int to) {
        finishText();
        inAttributes = false;
        ++depth;
    }

    @Override
    public void end(int from, int to) {
        finishText();
        if (!inAttributes) {
            frame = frames[--depth];
            if (depth >= KEPT_FRAMES) {
                frames[depth] = null;
            }
        }
        inAttributes = false;
        if (frame.element == Element.DOCUMENT) {
            // What stands in it waits on, for the document as a whole.
            rootFrom = frame.from;
            rootTo = to;
            rootName = frame.elementName;
            version = frame.value;
            return;
        }
        Item[] inside = Item.NONE;
        if (waits > frame.waited) {
            inside = Arrays.copyOfRange(waiting, frame.waited, waits);
            waits = frame.waited;
        }
        add(item(frame, to, inside));
    }

    private static Item item(Frame of, int to, Item[] inside) {
        Writing ofName = of.name == null ? null : of.nameWriting;
        Writing ofValue = of.value == null ? null : of.valueWriting;
        if (of.element == Element.PARM) {
            return new Parameter(of.from, to, inside, of.name, ofName, of.value, ofValue);
        }
        if (of.element == Element.CHARACTERISTIC) {
            return new Characteristic(of.from, to, inside, of.name, ofName);
        }
        if (of.element == Element.INSTRUCTION) {
            Other.Kind kind = Other.Kind.INSTRUCTION;
            return new Other(of.from, to, inside, kind, of.name, of.value, ofValue);
        }
        Other.Kind kind = Other.Kind.ELEMENT;
        return new Other(of.from, to, inside, kind, of.elementName, null, null);
    }

    @Override
    public void trailing(int from, int to) {
        finishText();
        add(new Other(from, to, Item.NONE, Other.Kind.TRAILING, null, null, null));
    }

    private void add(Item item) {
        if (waits == waiting.length) {
            waiting = Arrays.copyOf(waiting, 2 * waits);
        }
        waiting[waits++] = item;
    }
}
