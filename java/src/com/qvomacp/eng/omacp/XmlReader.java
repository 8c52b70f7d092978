package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/**
 * Reads a wap-provisioningdoc in XML (Extensible Markup Language 1.0), as it is found: with or without
 * a declaration, a document type, comments and blanks. Nothing is ever opened or fetched for it: the
 * document type is read over, and an entity that it may define is an error.
 */
final class XmlReader {
    /** A namespace without a prefix says nothing that the element's name does not. */
    private static final String NAMESPACE = "xmlns";

    private static final String INSTRUCTION = "omacp-push";
    private static final String[] ENTITIES = {
        "lt", "<", "gt", ">", "amp", "&", "quot", "\"", "apos", "'"
    };

    private static final String[] OUTER = {"<wap-provisioningdoc>"};
    private static final String[] INNER = {"<characteristic>", "<parm>"};
    private static final String NO_CHARACTER = "a character that XML does not have";

    private final XmlText text;

    /** Whether a characteristic may lack its type, and a parm its name. */
    private final boolean isLenient;

    private final TreeBuilder tree = new TreeBuilder(0);

    /** The document element; the offset of an item is that of its tag among the characters. */
    final Item root;

    /** The version that the document states; null without one. */
    final String version;

    /** The options that its instruction states. */
    EncodeOptions options = EncodeOptions.NONE;

    XmlReader(byte[] bytes, boolean isLenient) throws EncodingException {
        this.text = new XmlText(bytes);
        this.isLenient = isLenient;
        document();
        root = tree.root();
        version = tree.version();
    }

    /** Line and column of the tag of an item. */
    int[] place(Item item) {
        return text.place(item.offset());
    }

    private void document() throws EncodingException {
        if (text.startsWith("<?xml") && !text.startsWith("<?xml-")) {
            text.takeUntil("?>", "the XML declaration");
        }
        miscellany();
        if (text.skipIf("<!DOCTYPE")) {
            documentType();
            miscellany();
        }
        if (!text.startsWith("<")) {
            throw text.error(
                    text.isAtEnd() ? "there is no document" : "text stands in front of the document",
                    OUTER);
        }
        if (begin(Element.DOCUMENT) != null) {
            content();
        }
        miscellany();
        if (!text.isAtEnd()) {
            throw text.error(
                    text.startsWith("<")
                            ? "a second document stands behind the first"
                            : "text stands behind the document",
                    "the end of the file");
        }
    }

    /** Reads over blanks, comments and instructions. */
    private void miscellany() throws EncodingException {
        do {
            text.skipBlanks();
        } while (comment() || instruction());
    }

    private boolean comment() throws EncodingException {
        if (!text.skipIf("<!--")) {
            return false;
        }
        text.takeUntil("-->", "a comment");
        return true;
    }

    private boolean instruction() throws EncodingException {
        int from = text.at();
        if (!text.skipIf("<?")) {
            return false;
        }
        String target = text.takeName();
        if (target.equals("xml")) {
            throw text.errorAt(from, "an XML declaration stands behind the start of the file");
        }
        String data = text.takeUntil("?>", "a processing instruction");
        if (target.equals(INSTRUCTION)) {
            options(data, from);
        }
        return true;
    }

    /** Takes the options of an instruction. */
    private void options(String data, int from) throws EncodingException {
        int at = 0;
        while (at < data.length()) {
            if (XmlText.isBlank(data.charAt(at))) {
                ++at;
                continue;
            }
            int equals = data.indexOf('=', at);
            char quote = equals > 0 && equals + 1 < data.length() ? data.charAt(equals + 1) : 0;
            int end = quote == '"' || quote == '\'' ? data.indexOf(quote, equals + 2) : -1;
            EncodeOption option = end < 0 ? null : EncodeOption.named(data.substring(at, equals));
            if (option == null) {
                List<String> names = new ArrayList<>();
                for (EncodeOption known : EncodeOption.values()) {
                    names.add(known.optionName());
                }
                String sentence = "the instruction " + INSTRUCTION + " cannot be read";
                throw text.errorAt(from, sentence, names.toArray(new String[0]));
            }
            try {
                options = options.with(option, data.substring(equals + 2, end));
            } catch (IllegalArgumentException e) {
                String sentence = option.optionName() + " of the instruction has an unknown value";
                throw text.errorAt(from, sentence, option.choices().toArray(new String[0]));
            }
            at = end + 1;
        }
    }

    /** Reads over the rest of a document type, whatever it declares. */
    private void documentType() throws EncodingException {
        int open = 1;
        while (open > 0) {
            if (text.isAtEnd()) {
                throw text.error("the document type does not end", ">");
            }
            if (comment() || open > 1 && instruction()) {
                continue;
            }
            char c = text.take();
            if (c == '"' || c == '\'') {
                text.takeUntil(String.valueOf(c), "a text of the document type");
            } else if (c == '<' || c == '[') {
                ++open;
            } else if (c == '>' || c == ']') {
                --open;
            }
        }
    }

    // ---- Elements

    /** Reads the content of the root, and its end. The elements that are open are counted. */
    private void content() throws EncodingException {
        int open = 1;
        while (open > 0) {
            Element around = open == 1 ? Element.DOCUMENT : Element.CHARACTERISTIC;
            between(around);
            if (text.startsWith("</")) {
                end(around);
                --open;
                continue;
            }
            Element begun = begin(Element.CHARACTERISTIC);
            if (begun == Element.PARM) {
                between(Element.PARM);
                end(Element.PARM);
            } else if (begun != null) {
                ++open;
            }
        }
    }

    /** Reads a start tag: of the document or, inside it, another; null for an empty one. */
    private Element begin(Element fitting) throws EncodingException {
        int from = text.at();
        text.skip(1);
        String name = text.takeName();
        if (name.isEmpty()) {
            throw text.errorAt(from, "a tag without a name", INNER);
        }
        Map<String, String> stated = new LinkedHashMap<>();
        boolean isEmpty = attributes(stated);
        Element element = Element.of(name);
        boolean isInner = fitting != Element.DOCUMENT;
        if (element != fitting && !(isInner && element == Element.PARM)) {
            boolean isInCapitals =
                    name.equalsIgnoreCase(fitting.text) || name.equalsIgnoreCase(Element.PARM.text);
            String sentence =
                    name.indexOf(':') >= 0
                            ? "an element with a prefix"
                            : isInCapitals
                                    ? "element names are in lower case"
                                    : "no element of a provisioning document";
            throw text.errorAt(from, sentence, isInner ? INNER : OUTER);
        }
        tree.element(from, from, element, name, true);
        takeAttributes(from, element, stated);
        if (isEmpty) {
            tree.end(from, from);
            return null;
        }
        tree.attributesEnd(from, from);
        return element;
    }

    /** Takes the attributes, which are those of the element, or a namespace. */
    private void takeAttributes(int from, Element element, Map<String, String> stated)
            throws EncodingException {
        List<String> known = new ArrayList<>();
        for (Attribute attribute : new Attribute[] {element.name, element.value}) {
            if (attribute != null) {
                known.add(attribute.name().toLowerCase(Locale.ROOT));
            }
        }
        for (Map.Entry<String, String> attribute : stated.entrySet()) {
            String name = attribute.getKey();
            if (known.contains(name)) {
                tree.attribute(from, from, Attribute.of(name), null, attribute.getValue());
            } else if (!name.equals(NAMESPACE)) {
                boolean isPrefixed = name.indexOf(':') >= 0;
                String other = "no attribute of <" + element.text + ">";
                String sentence = isPrefixed ? "an attribute with a prefix" : other;
                throw text.errorAt(from, sentence, known.toArray(new String[0]));
            }
        }
        String needed = known.get(0);
        if (!isLenient && element.name != null && !stated.containsKey(needed)) {
            throw text.errorAt(from, "<" + element.text + "> without " + needed, needed);
        }
    }

    /** Reads attributes up to the end of their tag; whether the element ends with it. */
    private boolean attributes(Map<String, String> stated) throws EncodingException {
        while (true) {
            boolean blank = text.skipBlanks();
            if (text.skipIf(">")) {
                return false;
            }
            if (text.skipIf("/>")) {
                return true;
            }
            int from = text.at();
            String name = text.takeName();
            text.skipBlanks();
            if (!blank || name.isEmpty() || !text.skipIf("=")) {
                throw text.errorAt(from, "no attribute", "an attribute", ">", "/>");
            }
            text.skipBlanks();
            if (stated.containsKey(name)) {
                throw text.errorAt(from, "an attribute stands twice");
            }
            stated.put(name, attributeValue());
        }
    }

    private void end(Element element) throws EncodingException {
        int from = text.at();
        text.skip(2);
        String closed = text.takeName();
        text.skipBlanks();
        if (!closed.equals(element.text) || !text.skipIf(">")) {
            throw text.errorAt(from, "another element is open", "</" + element.text + ">");
        }
        tree.end(from, from);
    }

    /** Reads over what says nothing, up to the next tag. */
    private void between(Element parent) throws EncodingException {
        String end = "</" + parent.text + ">";
        boolean isParm = parent == Element.PARM;
        String[] tags = isParm ? new String[] {end} : new String[] {INNER[0], INNER[1], end};
        while (true) {
            miscellany();
            int from = text.at();
            boolean isBlank = false;
            if (text.isAtEnd()) {
                throw text.error("the document ends within <" + parent.text + ">", tags);
            }
            if (text.skipIf("<![CDATA[")) {
                isBlank = text.takeUntil("]]>", "a CDATA section").trim().isEmpty();
            } else if (text.peek() == '&') {
                // A blank is one however it is written; anything else is text.
                StringBuilder character = new StringBuilder();
                reference(character);
                isBlank = XmlText.isBlank(character.charAt(0));
            } else if (text.startsWith("<")) {
                if (isParm && !text.startsWith("</")) {
                    throw text.error("a parm has no content", tags);
                }
                return;
            }
            if (!isBlank) {
                throw text.errorAt(from, "text stands in <" + parent.text + ">", tags);
            }
        }
    }

    // ---- Texts

    /** An attribute's value, in which a blank that is not given as a reference is a space. */
    private String attributeValue() throws EncodingException {
        int quote = text.peek();
        if (quote != '"' && quote != '\'') {
            throw text.error("a value without quotes", "\"", "'");
        }
        text.skip(1);
        StringBuilder value = new StringBuilder();
        for (int c; (c = text.peek()) != quote; ) {
            if (c < 0) {
                throw text.error("a value does not end", String.valueOf((char) quote));
            }
            if (c == '<') {
                throw text.error("a value with <", "&lt;");
            }
            if (c == '&') {
                reference(value);
            } else if (text.skipIf("\r\n")) {
                value.append(' ');
            } else {
                character(value);
            }
        }
        text.skip(1);
        return value.toString();
    }

    private void character(StringBuilder value) throws EncodingException {
        int from = text.at();
        int c = text.takeCodePoint();
        if (!XmlWriter.isXmlCharacter(c)) {
            throw text.errorAt(from, NO_CHARACTER);
        }
        value.appendCodePoint(XmlText.isBlank(c) ? ' ' : c);
    }

    /** A character reference, or one of the five entities that need no declaration. */
    private void reference(StringBuilder value) throws EncodingException {
        int from = text.at();
        text.skip(1);
        if (text.skipIf("#")) {
            int radix = text.skipIf("x") ? 16 : 10;
            int c = number(text.takeName(), radix);
            if (text.skipIf(";") && XmlWriter.isXmlCharacter(c)) {
                value.appendCodePoint(c);
                return;
            }
            if (c >= 0) {
                throw text.errorAt(from, NO_CHARACTER);
            }
        } else {
            String name = text.takeName();
            for (int i = 0; i < ENTITIES.length; i += 2) {
                if (name.equals(ENTITIES[i]) && text.skipIf(";")) {
                    value.append(ENTITIES[i + 1]);
                    return;
                }
            }
        }
        throw text.errorAt(
                from,
                "a reference that is none of a character's, nor to one of five entities",
                "&lt;", "&gt;", "&amp;", "&quot;", "&apos;", "&#N;", "&#xN;");
    }

    /** The number of digits; -1 for one that is none. Any beyond Unicode is one number beyond it. */
    private static int number(String digits, int radix) {
        if (!digits.matches(radix == 16 ? "[0-9A-Fa-f]+" : "[0-9]+")) {
            return -1;
        }
        String significant = digits.replaceFirst("^0+(?=.)", "");
        return significant.length() > 7
                ? Character.MAX_CODE_POINT + 1
                : Integer.parseInt(significant, radix);
    }
}
