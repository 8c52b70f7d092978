package com.qvomacp.eng.omacp;

/** Takes the elements of a document in their order, without recursion, and knows where it is. */
abstract class DocumentTaker {
    private final Item root;

    /** The innermost element that has begun and not ended, and how many there are in the root. */
    private Item open;

    private int depth;

    DocumentTaker(Item root) {
        this.root = root;
        open = root;
    }

    /** A characteristic begins; the type is null for none, as may be in XML that is looked at. */
    abstract void characteristic(String type) throws EncodingException;

    /** A parameter; the value is null for none, and the name where a type may be. */
    abstract void parameter(String name, String value) throws EncodingException;

    /** The characteristic that began last, of those that have not ended, ends. */
    abstract void end();

    /** Takes what stands in the document element. Nothing stands in a parm, by the format. */
    final void take() throws EncodingException {
        Walk items = new Walk(root);
        items.next();
        for (Item item; (item = items.next()) != null; ) {
            endUpTo(item.parent());
            if (item instanceof Parameter) {
                items.pass();
                parameter(item.called(), ((Parameter) item).value());
            } else {
                open = item;
                ++depth;
                characteristic(item.called());
            }
        }
        endUpTo(root);
    }

    private void endUpTo(Item outer) {
        for (; open != outer; open = open.parent()) {
            end();
            --depth;
        }
    }

    /** The type of the innermost characteristic; the name of the document element outside any. */
    final String innermost() {
        return open.called();
    }

    /** How many characteristics are open. */
    final int depth() {
        return depth;
    }

    /** Something that cannot be written where this stands. */
    final EncodingException error(String sentence) {
        return EncodingException.in(open.path(), sentence);
    }
}
