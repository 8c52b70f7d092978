package com.qvomacp.cli;

/**
 * Writes a message for people: a block per characteristic, indented as they nest, values in a
 * column.
 */
final class TextWriter {
    private static final int INDENT = 2;
    private static final int HEADER_COLUMN = 16;

    private final StringBuilder out = new StringBuilder();

    private TextWriter() {}

    static String write(Message message) {
        TextWriter writer = new TextWriter();
        writer.header(message);
        for (Characteristic characteristic : message.characteristics) {
            writer.out.append('\n');
            writer.characteristic(characteristic, 0);
        }
        return writer.out.toString();
    }

    /** Writes what the push header says, alone. */
    static String write(Header header) {
        TextWriter writer = new TextWriter();
        writer.header(header);
        return writer.out.toString();
    }

    private void header(Message message) {
        if (message.header == null) {
            fact("Body length", message.bodyLength + " bytes, without a push header");
        } else {
            header(message.header);
        }
    }

    private void header(Header header) {
        fact("Content type", header.mediaType() + " (" + header.contentType + ")");
        fact("Header length", header.headerLength + " bytes");
        fact("Body length", header.bodyLength + " bytes");
        if (header.hasSec()) {
            fact("SEC", Header.secShown(header.sec));
        }
        if (header.hasMac()) {
            fact("MAC", header.mac);
        }
    }

    private void fact(String name, String value) {
        line(0, HEADER_COLUMN, name, value);
    }

    /** Recursion ends at a port of a physical proxy, four levels down. */
    private void characteristic(Characteristic characteristic, int indent) {
        spaces(indent);
        out.append(characteristic.type).append('\n');
        int column = 0;
        for (Characteristic.Parm parm : characteristic.parms) {
            column = Math.max(column, Visible.of(parm.name).length() + INDENT);
        }
        for (Characteristic.Parm parm : characteristic.parms) {
            String value = parm.value == null ? "(set, value not answered)" : parm.value;
            line(indent + INDENT, column, parm.name, value);
        }
        for (Characteristic child : characteristic.characteristics) {
            characteristic(child, indent + INDENT);
        }
    }

    private void line(int indent, int column, String name, String value) {
        String shownName = Visible.of(name);
        spaces(indent);
        out.append(shownName);
        spaces(column - shownName.length());
        out.append(Visible.of(value)).append('\n');
    }

    private void spaces(int count) {
        for (int i = 0; i < count; ++i) {
            out.append(' ');
        }
    }
}
