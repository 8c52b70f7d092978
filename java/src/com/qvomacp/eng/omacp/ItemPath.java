package com.qvomacp.eng.omacp;

/** The path of an item: the elements that it stands in, from the outermost on. */
final class ItemPath {
    private static final int LONGEST = 8;

    private ItemPath() {}

    /** The path, such as {@code wap-provisioningdoc / NAPDEF 1 / BEARER}; the innermost eight. */
    static String of(Item item) {
        Item[] told = new Item[LONGEST];
        int first = LONGEST;
        Item outer = item;
        for (; outer != null && first > 0; outer = outer.parent()) {
            told[--first] = outer;
        }
        StringBuilder path = new StringBuilder();
        if (outer != null) {
            path.append("... / ");
        }
        for (int i = first; i < LONGEST; ++i) {
            told[i].step(path);
            if (i + 1 < LONGEST) {
                path.append(" / ");
            }
        }
        return path.toString();
    }
}
