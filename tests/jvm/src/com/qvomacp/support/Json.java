package com.qvomacp.support;

import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** A strict JSON reader: Maps, Lists, Strings, Integers, Booleans, null; anything else throws. */
public final class Json {
    private final String text;
    private int at;

    private Json(String text) {
        this.text = text;
    }

    public static Object parse(String text) {
        Json json = new Json(text);
        json.blanks();
        Object value = json.value();
        json.blanks();
        json.require(json.at == text.length());
        return value;
    }

    private Object value() {
        return switch (peek()) {
            case '{' -> object();
            case '[' -> list();
            case '"' -> string();
            case 'n' -> literal("null", null);
            case 't' -> literal("true", true);
            case 'f' -> literal("false", false);
            default -> number();
        };
    }

    private Boolean literal(String name, Boolean value) {
        require(text.startsWith(name, at));
        at += name.length();
        return value;
    }

    private Map<String, Object> object() {
        Map<String, Object> members = new LinkedHashMap<>();
        expect('{');
        if (peek() != '}') {
            do {
                blanks();
                String name = string();
                expect(':');
                blanks();
                require(!members.containsKey(name));
                members.put(name, value());
            } while (next(','));
        }
        expect('}');
        return members;
    }

    private List<Object> list() {
        List<Object> elements = new ArrayList<>();
        expect('[');
        if (peek() != ']') {
            do {
                blanks();
                elements.add(value());
            } while (next(','));
        }
        expect(']');
        return elements;
    }

    private String string() {
        require(text.charAt(at++) == '"');
        StringBuilder string = new StringBuilder();
        for (char c = text.charAt(at++); c != '"'; c = text.charAt(at++)) {
            require(c >= ' ');
            string.append(c == '\\' ? escaped() : c);
        }
        return string.toString();
    }

    private char escaped() {
        char c = text.charAt(at++);
        switch (c) {
            case '"', '\\', '/':
                return c;
            case 'n':
                return '\n';
            case 'r':
                return '\r';
            case 't':
                return '\t';
            default:
                require(c == 'u');
                at += 4;
                return (char) Integer.parseInt(text.substring(at - 4, at), 16);
        }
    }

    private Integer number() {
        int start = at;
        while (Character.isDigit(text.charAt(at))) {
            ++at;
        }
        return Integer.valueOf(text.substring(start, at));
    }

    private char peek() {
        blanks();
        return text.charAt(at);
    }

    private boolean next(char c) {
        boolean there = peek() == c;
        at += there ? 1 : 0;
        return there;
    }

    private void expect(char c) {
        require(next(c));
    }

    private void blanks() {
        while (at < text.length() && " \t\r\n".indexOf(text.charAt(at)) >= 0) {
            ++at;
        }
    }

    private void require(boolean right) {
        if (!right) {
            throw new IllegalArgumentException("no JSON at " + at + ": " + text);
        }
    }
}
