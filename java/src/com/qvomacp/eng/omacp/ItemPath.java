package com.qvomacp.eng.omacp;

/** The path of an item: the elements that it stands in, from the outermost on. */
final class ItemPath {
    private static final int LONGEST = 8;

    private ItemPath() {}

    /** The path, such as {@code wap-provisioningdoc / NAPDEF 1 / BEARER}; the innermost eight. */
    static String of(Item item) {
        StringBuilder path = new StringBuilder(item.step());
        Item outer = item.parent();
        for (int told = 1; outer != null; outer = outer.parent()) {
            if (told++ == LONGEST) {
                return path.insert(0, "... / ").toString();
            }
            path.insert(0, " / ").insert(0, outer.step());
        }
        return path.toString();
    }
}
