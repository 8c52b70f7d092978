package com.qvomacp.eng.omacp;

import java.util.Locale;
import java.util.Map;

/** Writes a document as XML. */
final class XmlWriter extends DocumentTaker {
    private static final String DOCUMENT_TYPE =
            "<!DOCTYPE wap-provisioningdoc PUBLIC \"-//WAPFORUM//DTD PROV 1.0//EN\""
                    + " \"http://www.wapforum.org/DTD/prov.dtd\">\n";

    private static final String MARKUP = "<&\"";
    private static final String[] ENTITIES = {"&lt;", "&amp;", "&quot;"};
    private static final int DEEPEST_SHOWN = 20;

    private final StringBuilder out = new StringBuilder();

    private XmlWriter(Item root) {
        super(root);
    }

    /** The document; its instruction states the options that are set and no secrets. */
    static String write(Item root, String version, EncodeOptions options)
            throws EncodingException {
        XmlWriter writer = new XmlWriter(root);
        writer.out.append("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n");
        writer.instruction(options.set());
        writer.out.append(DOCUMENT_TYPE).append("<wap-provisioningdoc");
        writer.attribute("version", version);
        writer.out.append(">\n");
        writer.take();
        return writer.out.append("</wap-provisioningdoc>\n").toString();
    }

    private void instruction(Map<EncodeOption, String> options) throws EncodingException {
        StringBuilder pairs = new StringBuilder();
        for (Map.Entry<EncodeOption, String> option : options.entrySet()) {
            if (!option.getKey().isSecret()) {
                pairs.append(' ').append(option.getKey().optionName());
                pairs.append("=\"").append(option.getValue()).append('"');
            }
        }
        if (pairs.length() > 0) {
            out.append("<?omacp-push").append(pairs).append("?>\n");
        }
    }

    @Override
    void characteristic(String type) throws EncodingException {
        indent(depth() - 1);
        out.append("<characteristic");
        attribute("type", type);
        out.append(">\n");
    }

    @Override
    void parameter(String name, String value) throws EncodingException {
        indent(depth());
        out.append("<parm");
        attribute("name", name);
        attribute("value", value);
        out.append("/>\n");
    }

    @Override
    void end() {
        indent(depth() - 1);
        out.append("</characteristic>\n");
    }

    /** Deeper nesting is not shown by more blanks, which would grow with its square. */
    private void indent(int depth) {
        for (int i = Math.min(depth, DEEPEST_SHOWN); i >= 0; --i) {
            out.append("  ");
        }
    }

    /** An attribute; none for a value that is null. */
    private void attribute(String name, String value) throws EncodingException {
        if (value == null) {
            return;
        }
        out.append(' ').append(name).append("=\"");
        for (int i = 0; i < value.length(); ) {
            int c = value.codePointAt(i);
            i += Character.charCount(c);
            if (!isXmlCharacter(c)) {
                throw error(String.format(Locale.ROOT, "XML has no character U+%04X", c));
            }
            character(c);
        }
        out.append('"');
    }

    private void character(int c) {
        int markup = MARKUP.indexOf(c);
        if (markup >= 0) {
            out.append(ENTITIES[markup]);
        } else if (Printable.isShown(c)) {
            out.appendCodePoint(c);
        } else {
            out.append("&#").append(c).append(';');
        }
    }

    /** Whether XML 1.0 has the character, at all. */
    static boolean isXmlCharacter(int c) {
        return c == '\t'
                || c == '\n'
                || c == '\r'
                || c >= 0x20 && c < Character.MIN_SURROGATE
                || c > Character.MAX_SURROGATE && c <= 0xFFFD
                || c >= Character.MIN_SUPPLEMENTARY_CODE_POINT && c <= Character.MAX_CODE_POINT;
    }
}
