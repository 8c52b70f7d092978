package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/**
 * Something that stands in a provisioning document: a {@link Characteristic}, a {@link Parameter},
 * or {@link Other} content. Items are immutable; two of them are equal when they say the same,
 * wherever they stand and however they are written.
 *
 * <pre>{@code
 * for (Item item : document.children()) {
 *     System.out.println(document.path(item) + " at offset " + item.offset());
 * }
 * }</pre>
 */
public abstract class Item {
    static final Item[] NONE = {};
    private static final int LONGEST_PATH = 8;

    private final int offset;
    private final int end;
    private final Item[] children;

    /** Set once, by the item that this one stands in, before anybody else sees either. */
    private Item parent;

    Item(int offset, int end, Item[] children) {
        this.offset = offset;
        this.end = end;
        this.children = children;
        for (Item child : children) {
            child.parent = this;
        }
    }

    /** {@return where the item begins: bytes from the start of the body, counted from 0} */
    public final int offset() {
        return offset;
    }

    /** {@return how long the item is, with everything in it and its END: bytes of the body} */
    public final int length() {
        return end - offset;
    }

    /**
     * {@return what stands in the item, in the order of the message; not modifiable} The format has
     * parameters and characteristics in a characteristic, and nothing in a parameter; attributes
     * that it does not have come first.
     */
    public final List<Item> children() {
        return Collections.unmodifiableList(Arrays.asList(children));
    }

    /** Those of a kind that stand in the item: all of them, or those of a type or name. */
    final <T extends Item> List<T> children(Class<T> kind, String called) {
        List<T> found = new ArrayList<>();
        for (Item child : children) {
            if (kind.isInstance(child) && (called == null || called.equals(child.called()))) {
                found.add(kind.cast(child));
            }
        }
        return Collections.unmodifiableList(found);
    }

    /** Its type or name; {@code null} for none. */
    abstract String called();

    /** What stands in the item, not to be changed. */
    final Item[] inside() {
        return children;
    }

    /** How many of those that stand in the item may be passed over by who looks for characteristics. */
    int beforeCharacteristics() {
        return 0;
    }

    /** The item that this one stands in; {@code null} for the document element. */
    final Item parent() {
        return parent;
    }

    /** The path, such as {@code wap-provisioningdoc / NAPDEF 1 / BEARER}; the innermost eight. */
    final String path() {
        Item[] told = new Item[LONGEST_PATH];
        int first = LONGEST_PATH;
        Item outer = this;
        for (; outer != null && first > 0; outer = outer.parent) {
            told[--first] = outer;
        }
        StringBuilder path = new StringBuilder(outer == null ? "" : "...");
        for (int i = first; i < LONGEST_PATH; ++i) {
            path.append(path.length() == 0 ? "" : " / ");
            told[i].step(path);
        }
        return path.toString();
    }

    /** Adds what the item is called in a path. */
    abstract void step(StringBuilder path);

    /** Whether the item itself says the same as another one, whatever stands in them. */
    abstract boolean says(Item other);

    /** What is the same for items that say the same, whatever stands in them. */
    abstract int hash();

    /**
     * {@return whether another item says the same: it is the same, and so is everything in it}
     * @param other what to compare with
     */
    @Override
    public final boolean equals(Object other) {
        return other instanceof Item && Walk.same(this, (Item) other);
    }

    @Override
    public final int hashCode() {
        return Walk.hash(this);
    }
}
