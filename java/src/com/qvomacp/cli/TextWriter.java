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
        writer.header(message.header);
        for (Characteristic characteristic : message.characteristics) {
            writer.out.append('\n');
            writer.characteristic(characteristic, 0);
        }
        return writer.out.toString();
    }

    private void header(Header header) {
        fact("Content type", header.mediaType() + " (" + header.contentType + ")");
        fact("Header length", header.headerLength + " bytes");
        fact("Body length", header.bodyLength + " bytes");
        if (header.hasSec()) {
            fact("SEC", String.format("%s (0x%02X)", header.secName(), header.sec));
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
            column = Math.max(column, shown(parm.name).length() + INDENT);
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
        String shownName = shown(name);
        spaces(indent);
        out.append(shownName);
        spaces(column - shownName.length());
        out.append(shown(value)).append('\n');
    }

    private void spaces(int count) {
        for (int i = 0; i < count; ++i) {
            out.append(' ');
        }
    }

    /**
     * The text with everything that is no visible character written as its code, since a message
     * comes from a stranger and a terminal obeys control characters.
     */
    private static String shown(String text) {
        StringBuilder visible = new StringBuilder();
        text.codePoints()
                .forEach(
                        c -> {
                            if (isVisible(c)) {
                                visible.appendCodePoint(c);
                            } else {
                                visible.append(String.format("\\u%04x", c));
                            }
                        });
        return visible.toString();
    }

    private static boolean isVisible(int codePoint) {
        switch (Character.getType(codePoint)) {
            case Character.CONTROL:
            case Character.FORMAT:
            case Character.LINE_SEPARATOR:
            case Character.PARAGRAPH_SEPARATOR:
            case Character.SURROGATE:
                return false;
            default:
                return true;
        }
    }
}
