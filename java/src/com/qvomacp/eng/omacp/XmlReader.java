package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/**
 * Reads a wap-provisioningdoc in XML (Extensible Markup Language 1.0), as it is found: with or without
 * a declaration, a document type, comments and blanks. Nothing is ever opened or fetched for it: the
 * document type is read over, and an entity that it may define is an error.
 */
final class XmlReader {
    private static final String ROOT = "wap-provisioningdoc";
    private static final String CHARACTERISTIC = "characteristic";
    private static final String PARM = "parm";
    private static final String TYPE = "type";
    private static final String NAME = "name";
    private static final String VALUE = "value";
    private static final String VERSION = "version";

    /** A namespace without a prefix says nothing that the element's name does not. */
    private static final String NAMESPACE = "xmlns";

    private static final String INSTRUCTION = "omacp-push";
    private static final String[] ENTITIES = {
        "lt", "<", "gt", ">", "amp", "&", "quot", "\"", "apos", "'"
    };

    private final XmlText text;

    /** Whether a characteristic may lack its type, and a parm its name. */
    private final boolean isLenient;

    private EncodeOptions options = EncodeOptions.NONE;
    private DocumentSource source;

    private XmlReader(XmlText text, boolean isLenient) {
        this.text = text;
        this.isLenient = isLenient;
    }

    /** A document, and the options that its instruction states. */
    static final class Result {
        final DocumentSource source;
        final EncodeOptions options;

        Result(DocumentSource source, EncodeOptions options) {
            this.source = source;
            this.options = options;
        }
    }

    static Result read(byte[] bytes, boolean isLenient) throws EncodingException {
        XmlReader reader = new XmlReader(XmlText.of(bytes), isLenient);
        reader.document();
        return new Result(reader.source, reader.options);
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
        root();
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
        if (!text.startsWith("<?")) {
            return false;
        }
        int line = text.line();
        int column = text.column();
        text.skip(2);
        String target = text.takeName();
        if (target.equals("xml")) {
            throw EncodingException.at(
                    line, column, "an XML declaration stands behind the start of the file");
        }
        String data = text.takeUntil("?>", "a processing instruction");
        if (target.equals(INSTRUCTION)) {
            instruction(data, line, column);
        }
        return true;
    }

    /** Takes the options of an instruction. */
    private void instruction(String data, int line, int column) throws EncodingException {
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
                throw EncodingException.at(
                        line, column, "the instruction " + INSTRUCTION + " cannot be read", names());
            }
            String value = data.substring(equals + 2, end);
            try {
                options = options.with(option, value);
            } catch (IllegalArgumentException e) {
                throw EncodingException.at(
                        line,
                        column,
                        option.optionName() + " of the instruction has an unknown value",
                        option.choices().toArray(new String[0]));
            }
            at = end + 1;
        }
    }

    private static String[] names() {
        List<String> names = new ArrayList<>();
        for (EncodeOption option : EncodeOption.values()) {
            names.add(option.optionName());
        }
        return names.toArray(new String[0]);
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

    private void root() throws EncodingException {
        if (!text.startsWith("<")) {
            throw text.error(
                    text.isAtEnd() ? "there is no document" : "text stands in front of the document",
                    "<" + ROOT + ">");
        }
        Tag root = tag();
        root.require(ROOT);
        source = new DocumentSource(root.only(VERSION, null).get(VERSION));
        source.places.add(root.place());
        if (!root.isEmpty) {
            content();
        }
    }

    /** Reads the content of the root, and its end. The elements that are open are counted. */
    private void content() throws EncodingException {
        int open = 1;
        while (open > 0) {
            between(open == 1 ? ROOT : CHARACTERISTIC);
            if (text.startsWith("</")) {
                close(open == 1 ? ROOT : CHARACTERISTIC);
                --open;
                if (open > 0) {
                    source.end();
                }
                continue;
            }
            Tag tag = tag();
            source.places.add(tag.place());
            if (tag.name.equals(PARM)) {
                Map<String, String> attributes = tag.only(NAME, VALUE);
                need(tag, NAME);
                source.parameter(attributes.get(NAME), attributes.get(VALUE));
                if (!tag.isEmpty) {
                    between(PARM);
                    close(PARM);
                }
                continue;
            }
            tag.require(CHARACTERISTIC);
            Map<String, String> attributes = tag.only(TYPE, null);
            need(tag, TYPE);
            source.characteristic(attributes.get(TYPE));
            if (tag.isEmpty) {
                source.end();
            } else {
                ++open;
            }
        }
    }

    private void need(Tag tag, String needed) throws EncodingException {
        if (!isLenient && !tag.attributes.containsKey(needed)) {
            throw tag.error("<" + tag.name + "> without " + needed, needed);
        }
    }

    /** Reads over what says nothing, up to the next tag. */
    private void between(String parent) throws EncodingException {
        while (true) {
            text.skipBlanks();
            if (comment() || instruction()) {
                continue;
            }
            if (text.startsWith("<![CDATA[")) {
                EncodingException error = strayText(parent);
                text.skip("<![CDATA[".length());
                if (!text.takeUntil("]]>", "a CDATA section").trim().isEmpty()) {
                    throw error;
                }
                continue;
            }
            if (text.isAtEnd()) {
                throw text.error("the document ends within <" + parent + ">", tags(parent));
            }
            if (text.peek() == '&') {
                // A blank is one however it is written; anything else is text.
                EncodingException error = strayText(parent);
                StringBuilder character = new StringBuilder();
                reference(character);
                if (!XmlText.isBlank(character.charAt(0))) {
                    throw error;
                }
                continue;
            }
            if (!text.startsWith("<")) {
                throw strayText(parent);
            }
            if (parent.equals(PARM) && !text.startsWith("</")) {
                throw text.error("a parm has no content", tags(parent));
            }
            return;
        }
    }

    private EncodingException strayText(String parent) {
        return text.error("text stands in <" + parent + ">", tags(parent));
    }

    private static String[] tags(String parent) {
        return parent.equals(PARM)
                ? new String[] {"</parm>"}
                : new String[] {"<characteristic>", "<parm>", "</" + parent + ">"};
    }

    private void close(String name) throws EncodingException {
        int line = text.line();
        int column = text.column();
        text.skip(2);
        String closed = text.takeName();
        text.skipBlanks();
        if (!closed.equals(name) || !text.skipIf(">")) {
            throw EncodingException.at(line, column, "another element is open", "</" + name + ">");
        }
    }

    /** A start tag that was read. */
    private static final class Tag {
        final String name;
        final int line;
        final int column;
        final Map<String, String> attributes = new LinkedHashMap<>();
        boolean isEmpty;

        Tag(String name, int line, int column) {
            this.name = name;
            this.line = line;
            this.column = column;
        }

        EncodingException error(String sentence, String... expected) {
            return EncodingException.at(line, column, sentence, expected);
        }

        void require(String required) throws EncodingException {
            if (name.equals(required)) {
                return;
            }
            String sentence =
                    name.indexOf(':') >= 0
                            ? "an element with a prefix"
                            : name.equalsIgnoreCase(required) || name.equalsIgnoreCase(PARM)
                                    ? "element names are in lower case"
                                    : "no element of a provisioning document";
            if (required.equals(ROOT)) {
                throw error(sentence, "<" + ROOT + ">");
            }
            throw error(sentence, "<characteristic>", "<parm>");
        }

        /** The attributes, which are no others than these, or a namespace. */
        Map<String, String> only(String first, String second) throws EncodingException {
            for (String attribute : attributes.keySet()) {
                if (!attribute.equals(first)
                        && !attribute.equals(second)
                        && !attribute.equals(NAMESPACE)) {
                    String sentence =
                            attribute.indexOf(':') >= 0
                                    ? "an attribute with a prefix"
                                    : "no attribute of <" + name + ">";
                    throw second == null ? error(sentence, first) : error(sentence, first, second);
                }
            }
            return attributes;
        }

        int[] place() {
            return new int[] {line, column};
        }
    }

    private Tag tag() throws EncodingException {
        int line = text.line();
        int column = text.column();
        text.skip(1);
        Tag tag = new Tag(text.takeName(), line, column);
        if (tag.name.isEmpty()) {
            throw tag.error("a tag without a name", "<characteristic>", "<parm>");
        }
        while (true) {
            boolean blank = text.skipBlanks();
            if (text.skipIf(">")) {
                return tag;
            }
            if (text.skipIf("/>")) {
                tag.isEmpty = true;
                return tag;
            }
            EncodingException error = text.error("no attribute", "an attribute", ">", "/>");
            String name = text.takeName();
            text.skipBlanks();
            if (!blank || name.isEmpty() || !text.skipIf("=")) {
                throw error;
            }
            text.skipBlanks();
            if (tag.attributes.containsKey(name)) {
                throw EncodingException.at(error.line(), error.column(), "an attribute stands twice");
            }
            tag.attributes.put(name, attributeValue());
        }
    }

    /** An attribute's value, in which a blank that is not given as a reference is a space. */
    private String attributeValue() throws EncodingException {
        int quote = text.peek();
        if (quote != '"' && quote != '\'') {
            throw text.error("a value without quotes", "\"", "'");
        }
        text.skip(1);
        StringBuilder value = new StringBuilder();
        while (text.peek() != quote) {
            int c = text.peek();
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
            } else if (XmlText.isBlank(c)) {
                text.skip(1);
                value.append(' ');
            } else {
                character(value);
            }
        }
        text.skip(1);
        return value.toString();
    }

    private void character(StringBuilder value) throws EncodingException {
        EncodingException error = text.error("a character that XML does not have");
        char c = text.take();
        if (!Character.isSurrogate(c)) {
            if (!XmlWriter.isXmlCharacter(c)) {
                throw error;
            }
            value.append(c);
            return;
        }
        int low = text.peek();
        if (!Character.isHighSurrogate(c) || low < 0 || !Character.isLowSurrogate((char) low)) {
            throw error;
        }
        value.append(c).append(text.take());
    }

    /** A character reference, or one of the five entities that need no declaration. */
    private void reference(StringBuilder value) throws EncodingException {
        EncodingException error =
                text.error(
                        "a reference that is none of a character's, nor to one of five entities",
                        "&lt;", "&gt;", "&amp;", "&quot;", "&apos;", "&#N;", "&#xN;");
        text.skip(1);
        if (text.skipIf("#")) {
            int radix = text.skipIf("x") ? 16 : 10;
            String digits = text.takeName();
            int c = number(digits, radix);
            if (!text.skipIf(";") || !XmlWriter.isXmlCharacter(c)) {
                throw c >= 0
                        ? EncodingException.at(
                                error.line(), error.column(), "a character that XML does not have")
                        : error;
            }
            value.appendCodePoint(c);
            return;
        }
        String name = text.takeName();
        for (int i = 0; i < ENTITIES.length; i += 2) {
            if (name.equals(ENTITIES[i]) && text.skipIf(";")) {
                value.append(ENTITIES[i + 1]);
                return;
            }
        }
        throw error;
    }

    /** The number of digits; -1 for one that is none. Any beyond Unicode is one number beyond it. */
    private static int number(String digits, int radix) {
        int number = 0;
        for (int i = 0; i < digits.length(); ++i) {
            char c = digits.charAt(i);
            int digit = c < 0x80 ? Character.digit(c, radix) : -1;
            if (digit < 0) {
                return -1;
            }
            number = Math.min(number * radix + digit, Character.MAX_CODE_POINT + 1);
        }
        return digits.isEmpty() ? -1 : number;
    }
}
