package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.util.ArrayDeque;
import java.util.Deque;
import java.util.Iterator;
import java.util.List;

/** Goes through items in the order of the message; depth costs no stack. */
abstract class Walk {
    /** Called for each item in front of what stands in it; the outermost items have depth 0. */
    abstract void enter(Item item, int depth);

    /** Called for each item behind what stands in it. */
    void leave(Item item) {}

    final void through(List<Item> items) {
        Deque<Item> open = new ArrayDeque<>();
        Deque<Iterator<Item>> left = new ArrayDeque<>();
        left.push(items.iterator());
        while (!left.isEmpty()) {
            if (left.peek().hasNext()) {
                Item item = left.peek().next();
                enter(item, open.size());
                open.push(item);
                left.push(item.children().iterator());
            } else {
                left.pop();
                if (!open.isEmpty()) {
                    leave(open.pop());
                }
            }
        }
    }
}
