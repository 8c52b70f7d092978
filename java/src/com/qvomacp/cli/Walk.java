package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.util.Arrays;
import java.util.List;

/** Goes through items in the order of the message; depth costs no stack, and little else. */
abstract class Walk {
    private Item[] open = new Item[16];

    /** How many children of each open item have been entered. */
    private int[] entered = new int[16];

    /** Called for each item in front of what stands in it; the outermost items have depth 0. */
    abstract void enter(Item item, int depth);

    /** Called for each item behind what stands in it. */
    void leave(Item item) {}

    final void through(List<Item> items) {
        for (Item item : items) {
            through(item);
        }
    }

    private void through(Item outermost) {
        int depth = 0;
        open[0] = outermost;
        entered[0] = 0;
        enter(outermost, 0);
        while (depth >= 0) {
            List<Item> children = open[depth].children();
            if (entered[depth] == children.size()) {
                leave(open[depth--]);
                continue;
            }
            Item child = children.get(entered[depth]++);
            if (++depth == open.length) {
                open = Arrays.copyOf(open, 2 * depth);
                entered = Arrays.copyOf(entered, 2 * depth);
            }
            open[depth] = child;
            entered[depth] = 0;
            enter(child, depth);
        }
    }
}
