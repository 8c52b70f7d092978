package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.util.ArrayDeque;
import java.util.Deque;
import java.util.Iterator;
import java.util.List;

/** Goes through items in the order of the message; depth costs no stack. */
abstract class Walk {
    private static final class Level {
        final Item item;
        final Iterator<Item> children;

        Level(Item item, List<Item> children) {
            this.item = item;
            this.children = children.iterator();
        }
    }

    /** Called for each item in front of what stands in it; the outermost items have depth 0. */
    abstract void enter(Item item, int depth);

    /** Called for each item behind what stands in it. */
    void leave(Item item) {}

    final void through(List<Item> items) {
        Deque<Level> open = new ArrayDeque<>();
        open.push(new Level(null, items));
        while (!open.isEmpty()) {
            Level level = open.peek();
            if (level.children.hasNext()) {
                Item item = level.children.next();
                enter(item, open.size() - 1);
                open.push(new Level(item, item.children()));
            } else {
                open.pop();
                if (level.item != null) {
                    leave(level.item);
                }
            }
        }
    }
}
