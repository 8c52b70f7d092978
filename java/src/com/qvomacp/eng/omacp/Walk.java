package com.qvomacp.eng.omacp;

import java.util.Arrays;

/** Goes through an item and everything in it, in the order of the message, without recursion. */
final class Walk {
    private Item[][] open = new Item[8][];
    private int[] next = new int[8];
    private int depth;

    Walk(Item item) {
        open[0] = new Item[] {item};
    }

    /** The next item, or {@code null} behind the last. */
    Item next() {
        while (depth >= 0 && next[depth] == open[depth].length) {
            --depth;
        }
        if (depth < 0) {
            return null;
        }
        Item item = open[depth][next[depth]++];
        if (item.inside().length > 0) {
            if (++depth == open.length) {
                open = Arrays.copyOf(open, 2 * depth);
                next = Arrays.copyOf(next, 2 * depth);
            }
            open[depth] = item.inside();
            next[depth] = 0;
        }
        return item;
    }

    /** Goes past what stands in the item that came last. */
    void pass() {
        if (next[depth] == 0) {
            --depth;
        }
    }

    static boolean same(Item left, Item right) {
        if (left == right) {
            return true;
        }
        Walk here = new Walk(left);
        Walk there = new Walk(right);
        for (Item item; (item = here.next()) != null; ) {
            Item other = there.next();
            if (!item.says(other) || item.inside().length != other.inside().length) {
                return false;
            }
        }
        return true;
    }

    static int hash(Item item) {
        int hash = 1;
        Walk walk = new Walk(item);
        for (Item part; (part = walk.next()) != null; ) {
            hash = 31 * (31 * hash + part.hash()) + part.inside().length;
        }
        return hash;
    }
}
