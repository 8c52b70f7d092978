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

    /** What is known of an element whose content is read. Frames are used again. */
    private static final class Frame {
        Element element;
        String elementName;
        int from;
        int waited;
        String name;
        Writing nameWriting;
        String value;
        Writing valueWriting;
    }

    /** Deeper ones are let go of when their element ends: its item takes their place in memory. */
    private static final int KEPT_FRAMES = 64;

    private Frame[] frames = new Frame[FRAMES];
    private int depth;

    /** What is known of the element whose attributes are read, or that ends. */
    private Element element;

    private String elementName;
    private int from;

    /** How many items waited when the element began. */
    private int waited;

    private String name;
    private Writing nameWriting;
    private String value;
    private Writing valueWriting;

    /** Whether attributes are read. An element that has nothing else needs no frame. */
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
        return new Other(
                rootFrom,
                rootTo,
                Arrays.copyOf(waiting, waits),
                Other.Kind.ELEMENT,
                rootName,
                null,
                null);
    }

    /** The version attribute of the document element, or {@code null}. */
    String version() {
        return version;
    }

    @Override
    public void element(int from, int to, Element element, String name, boolean attributes) {
        finishText();
        this.from = from;
        this.element = element;
        elementName = name;
        waited = waits;
        this.name = null;
        value = null;
        inAttributes = true;
        if (!attributes) {
            push();
        }
    }

    private void push() {
        inAttributes = false;
        if (depth == frames.length) {
            frames = Arrays.copyOf(frames, 2 * depth);
        }
        Frame frame = frames[depth];
        if (frame == null) {
            frame = new Frame();
            frames[depth] = frame;
        }
        ++depth;
        frame.element = element;
        frame.elementName = elementName;
        frame.from = from;
        frame.waited = waited;
        frame.name = name;
        frame.nameWriting = nameWriting;
        frame.value = value;
        frame.valueWriting = valueWriting;
    }

    private void pop() {
        Frame frame = frames[--depth];
        element = frame.element;
        elementName = frame.elementName;
        from = frame.from;
        waited = frame.waited;
        name = frame.name;
        nameWriting = frame.nameWriting;
        value = frame.value;
        valueWriting = frame.valueWriting;
        if (depth >= KEPT_FRAMES) {
            frames[depth] = null;
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
        if (attribute == element.name && name == null) {
            name = whole;
            nameWriting = writing;
        } else if (attribute == element.value && value == null) {
            value = whole;
            valueWriting = writing;
        } else if (element == Element.INSTRUCTION && name == null) {
            name = attribute.name(attributeName);
            value = whole;
            valueWriting = writing;
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
        push();
    }

    @Override
    public void end(int from, int to) {
        finishText();
        if (!inAttributes) {
            pop();
        }
        inAttributes = false;
        if (element == Element.DOCUMENT) {
            // What stands in it waits on, for the document as a whole.
            rootFrom = this.from;
            rootTo = to;
            rootName = elementName;
            version = value;
            return;
        }
        Item[] inside = Item.NONE;
        if (waits > waited) {
            inside = Arrays.copyOfRange(waiting, waited, waits);
            waits = waited;
        }
        add(item(to, inside));
    }

    private Item item(int to, Item[] inside) {
        Writing ofName = name == null ? null : nameWriting;
        Writing ofValue = value == null ? null : valueWriting;
        if (element == Element.PARM) {
            return new Parameter(from, to, inside, name, ofName, value, ofValue);
        }
        if (element == Element.CHARACTERISTIC) {
            return new Characteristic(from, to, inside, name, ofName);
        }
        if (element == Element.INSTRUCTION) {
            return new Other(from, to, inside, Other.Kind.INSTRUCTION, name, value, ofValue);
        }
        return new Other(from, to, inside, Other.Kind.ELEMENT, elementName, null, null);
    }

    @Override
    public void page(int from, int to, boolean attributes, int page) {
        // Names are told as texts.
    }

    @Override
    public void trailing(int from, int to) {
        finishText();
        add(new Other(from, to, Item.NONE, Other.Kind.TRAILING, null, null, null));
    }

    @Override
    public void deviation(int at, Deviation.Kind kind) {
        // Deviations are looked for when somebody asks for them.
    }

    private void add(Item item) {
        if (waits == waiting.length) {
            waiting = Arrays.copyOf(waiting, 2 * waits);
        }
        waiting[waits++] = item;
    }
}
