package com.qvomacp.cli;

import java.util.List;
import java.util.function.Consumer;

/**
 * Writes a message as one JSON object.
 *
 * <p>{@code header} has {@code contentType}, {@code contentTypeCode}, {@code headerLength} and
 * {@code bodyLength}, with {@code sec} (its name) and {@code secCode} (the byte as sent) when the
 * message has a SEC, and {@code mac} when it has a MAC; it is null for a body alone. {@code characteristics} is an array; each
 * has {@code type}, {@code parms} (objects of {@code name} and {@code value}, the value null when
 * the parameter is set but the library answers none) and again {@code characteristics}.
 */
final class JsonWriter {
    private static final String INDENT = "  ";

    private final StringBuilder out = new StringBuilder();

    private JsonWriter() {}

    static String write(Message message) {
        JsonWriter writer = new JsonWriter();
        writer.message(message);
        return writer.out.append('\n').toString();
    }

    /** The push header alone: the object that is {@code header} in a whole message. */
    static String write(Header header) {
        JsonWriter writer = new JsonWriter();
        writer.out.append("{\n").append(INDENT);
        writer.header(header);
        return writer.out.append("\n}\n").toString();
    }

    /** Why a message is refused: an object with {@code refused}. */
    static String write(Explanation explanation) {
        JsonWriter writer = new JsonWriter();
        writer.out.append("{\n").append(INDENT).append("\"refused\": {\n");
        writer.member("reason").text(explanation.reason);
        if (explanation.code != 0) {
            writer.nextMember("code").out.append(explanation.code);
            writer.nextMember("name").text(Vocabulary.result(explanation.code));
        }
        if (!explanation.isHeader()) {
            writer.nextMember("bodyOffset").out.append(explanation.bodyOffset);
        }
        writer.nextMember("messageOffset").out.append(explanation.messageOffset);
        writer.nextMember("path").text(explanation.path);
        if (explanation.accepted != null) {
            writer.nextMember("accepted").text(explanation.accepted);
        }
        writer.out.append('\n').append(INDENT).append("}\n}\n");
        return writer.out.toString();
    }

    /** Why nothing can be said of a message: an object with {@code error}. */
    static String error(String reason) {
        JsonWriter writer = new JsonWriter();
        writer.out.append("{\n").append(INDENT).append("\"error\": ");
        writer.text(reason);
        return writer.out.append("\n}\n").toString();
    }

    /** An object as an element of an array, with {@code file} in front; without a line end. */
    static String element(String file, String object) {
        JsonWriter writer = new JsonWriter();
        writer.out.append("{\n").append(INDENT).append("\"file\": ");
        writer.text(file);
        writer.out.append(",\n").append(INDENT).append(object.substring("{\n".length()).trim());
        return INDENT + writer.out.toString().replace("\n", "\n" + INDENT);
    }

    private void message(Message message) {
        out.append("{\n").append(INDENT);
        if (message.header == null) {
            out.append("\"header\": null");
        } else {
            header(message.header);
        }
        out.append(",\n").append(INDENT);
        characteristics(message.characteristics, INDENT);
        out.append("\n}");
    }

    private void header(Header header) {
        out.append("\"header\": {\n");
        member("contentType").text(header.mediaType());
        nextMember("contentTypeCode").out.append(header.contentType);
        nextMember("headerLength").out.append(header.headerLength);
        nextMember("bodyLength").out.append(header.bodyLength);
        if (header.hasSec()) {
            nextMember("sec").text(header.secName());
            nextMember("secCode").out.append(header.sec);
        }
        if (header.hasMac()) {
            nextMember("mac").text(header.mac);
        }
        out.append('\n').append(INDENT).append('}');
    }

    private JsonWriter nextMember(String name) {
        out.append(",\n");
        return member(name);
    }

    private JsonWriter member(String name) {
        out.append(INDENT).append(INDENT);
        text(name);
        out.append(": ");
        return this;
    }

    /** Recursion ends at a port of a physical proxy, four levels down. */
    private void characteristics(List<Characteristic> characteristics, String indent) {
        String inner = indent + INDENT + INDENT;
        array(
                "characteristics",
                characteristics,
                indent,
                characteristic -> {
                    out.append("{\n").append(inner).append("\"type\": ");
                    text(characteristic.type);
                    out.append(",\n").append(inner);
                    array("parms", characteristic.parms, inner, this::parm);
                    out.append(",\n").append(inner);
                    characteristics(characteristic.characteristics, inner);
                    out.append('\n').append(indent).append(INDENT).append('}');
                });
    }

    private void parm(Characteristic.Parm parm) {
        out.append("{\"name\": ");
        text(parm.name);
        out.append(", \"value\": ");
        if (parm.value == null) {
            out.append("null");
        } else {
            text(parm.value);
        }
        out.append('}');
    }

    /** A member that is an array, with an element a line. */
    private <T> void array(String name, List<T> elements, String indent, Consumer<T> write) {
        text(name);
        out.append(": [");
        String separator = "\n";
        for (T element : elements) {
            out.append(separator).append(indent).append(INDENT);
            write.accept(element);
            separator = ",\n";
        }
        if (!elements.isEmpty()) {
            out.append('\n').append(indent);
        }
        out.append(']');
    }

    /** A JSON string; a surrogate without a partner is escaped, as UTF-8 has no place for it. */
    private void text(String text) {
        out.append('"');
        for (int i = 0; i < text.length(); i += Character.charCount(text.codePointAt(i))) {
            int codePoint = text.codePointAt(i);
            if (codePoint == '"' || codePoint == '\\') {
                out.append('\\').append((char) codePoint);
            } else if (codePoint == '\n') {
                out.append("\\n");
            } else if (codePoint == '\r') {
                out.append("\\r");
            } else if (codePoint == '\t') {
                out.append("\\t");
            } else if (Character.isISOControl(codePoint)
                    || Character.getType(codePoint) == Character.SURROGATE) {
                out.append(String.format("\\u%04x", codePoint));
            } else {
                out.appendCodePoint(codePoint);
            }
        }
        out.append('"');
    }
}
