package com.qvomacp.eng.omacp;

import java.util.Arrays;

/**
 * Builds the tree. An item is made when its end is read and everything in it is there; until then
 * what is known of it stands in a frame, and the items that are whole wait for the one around them.
 */
final class TreeBuilder implements Reading {
    /** The document, where nothing of the document element is known. */
    private static final String DOCUMENT = "document";

    /** What is known of an element that has not ended. Frames are used again. */
    private static final class Frame {
        Element element;
        String elementName;
        int from;

        /** How many items waited when it began. */
        int waited;

        String name;
        Writing nameWriting;
        String value;
        Writing valueWriting;

        void begin(int from, Element element, String elementName, int waited) {
            this.element = element;
            this.elementName = elementName;
            this.from = from;
            this.waited = waited;
            name = null;
            nameWriting = null;
            value = null;
            valueWriting = null;
        }
    }

    private Frame[] frames = new Frame[16];
    private int depth;
    private Frame innermost;

    private Item[] waiting = new Item[64];
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
        innermost = new Frame();
        innermost.begin(from, Element.OTHER, null, 0);
        frames[0] = innermost;
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
        if (++depth == frames.length) {
            frames = Arrays.copyOf(frames, 2 * depth);
        }
        Frame frame = frames[depth];
        if (frame == null) {
            frame = new Frame();
            frames[depth] = frame;
        }
        frame.begin(from, element, name, waits);
        innermost = frame;
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
        Element element = innermost.element;
        if (attribute == element.name && innermost.name == null) {
            innermost.name = whole;
            innermost.nameWriting = writing;
        } else if (attribute == element.value && innermost.value == null) {
            innermost.value = whole;
            innermost.valueWriting = writing;
        } else if (element == Element.INSTRUCTION && innermost.name == null) {
            innermost.name = attributeName;
            innermost.value = whole;
            innermost.valueWriting = writing;
        } else {
            Other.Kind kind = Other.Kind.ATTRIBUTE;
            add(new Other(textFrom, textTo, Item.NONE, kind, attributeName, whole, writing));
        }
    }

    @Override
    public void attributesEnd(int from, int to) {
        finishText();
    }

    @Override
    public void end(int from, int to) {
        finishText();
        Frame frame = innermost;
        innermost = frames[--depth];
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

    private static Item item(Frame frame, int to, Item[] inside) {
        String name = frame.name;
        String value = frame.value;
        Writing valueWriting = frame.valueWriting;
        if (frame.element == Element.PARM) {
            return new Parameter(
                    frame.from, to, inside, name, frame.nameWriting, value, valueWriting);
        }
        if (frame.element == Element.CHARACTERISTIC) {
            return new Characteristic(frame.from, to, inside, name, frame.nameWriting);
        }
        if (frame.element == Element.INSTRUCTION) {
            Other.Kind kind = Other.Kind.INSTRUCTION;
            return new Other(frame.from, to, inside, kind, name, value, valueWriting);
        }
        Other.Kind kind = Other.Kind.ELEMENT;
        return new Other(frame.from, to, inside, kind, frame.elementName, null, null);
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
