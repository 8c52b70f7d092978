package com.qvomacp.eng.omacp;

import java.util.ArrayDeque;
import java.util.Deque;

/** Tells a {@link ByteVisitor} what each byte of a body means. Nothing of it is kept. */
final class Describer implements Reading {
    private final ByteVisitor visitor;

    /** The names of the elements that have not ended, of the innermost first. */
    private final Deque<String> open = new ArrayDeque<>();

    Describer(ByteVisitor visitor) {
        this.visitor = visitor;
    }

    /** Tells the fields before the elements. */
    void header(byte[] body, BodyHeader header) {
        visit(0, header.identifierAt, "WBXML " + header.versionText());
        String type = header.isStated() ? quoted(header.documentType) : "not stated";
        visit(header.identifierAt, header.charsetAt, "document type: " + type);
        CharacterSet charset = header.charset;
        String name = charset.name() == null ? "number " + charset.number() : charset.name();
        visit(header.charsetAt, header.tableLengthAt, "character set: " + name);
        int length = header.elementsAt - header.tableAt;
        visit(header.tableLengthAt, header.tableAt, "string table: " + length + " bytes");
        for (int from = header.tableAt; from < header.elementsAt; ) {
            int zero = charset.zero(body, from, header.elementsAt);
            int to = Math.min(zero + charset.unit(), header.elementsAt);
            String text = quoted(charset.decode(body, from, zero));
            visit(from, to, "text " + (from - header.tableAt) + " of the table: " + text);
            from = to;
        }
    }

    @Override
    public void element(int from, int to, Element element, String name, boolean attributes) {
        String called = element == Element.INSTRUCTION ? "instruction" : name;
        visit(from, to, called);
        open.push(called);
    }

    @Override
    public void attribute(int from, int to, Attribute attribute, String name, String value) {
        String called = Printable.of(attribute.name(name));
        visit(from, to, called + (value == null ? "" : " = " + quoted(value)));
    }

    @Override
    public void text(int from, int to, Writing writing, String text) {
        visit(from, to, quoted(text) + ", " + Printable.nameOf(writing));
    }

    @Override
    public void attributesEnd(int from, int to) {
        visit(from, to, "END of attributes");
    }

    @Override
    public void end(int from, int to) {
        visit(from, to, "END of " + open.pop());
    }

    @Override
    public void page(int from, int to, boolean attributes, int page) {
        String what = attributes ? "attributes" : "elements";
        visit(from, to, "SWITCH_PAGE: " + what + " by code page " + page);
    }

    @Override
    public void trailing(int from, int to) {
        visit(from, to, "behind the end of the document");
    }

    private static String quoted(String text) {
        return '"' + text + '"';
    }

    private void visit(int from, int to, String meaning) {
        if (to > from) {
            visitor.visit(from, to - from, open.size(), meaning);
        }
    }
}
