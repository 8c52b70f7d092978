package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import java.util.ArrayDeque;
import java.util.Collections;
import java.util.Deque;
import java.util.HashMap;
import java.util.Iterator;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.Objects;

/**
 * Holds what the native library answers against what the message says. The characteristics of a type
 * that stand in the same one are compared by their order, and so are the parameters of a name.
 */
final class Comparison {
    /** In place of a type, for what is answered of the push header. */
    static final String HEADER = "push header";

    /** Hears what is answered, compared. */
    interface Listener {
        /** Told in front of everything else. */
        void begin();

        /** The items of the characteristic in the message; empty when it is not there. */
        void begin(String type, List<Item> said);

        /** Of a parameter, with what the message says of it; null when it does not give a value. */
        void answered(String name, String value, boolean isSaid, String said);

        /** A parameter of the message, or a characteristic of it, that is not answered. */
        void notAnswered(String name, String value);

        void notAnswered(String type);

        void end();

        /** Told in place of anything else. */
        void unanswered(String why);
    }

    /** A characteristic that is being answered, and what of the message is left of it. */
    private static final class Level {
        final Map<String, Deque<Parameter>> parameters = new LinkedHashMap<>();
        final Map<String, Deque<Characteristic>> characteristics = new LinkedHashMap<>();

        Level(List<Item> said) {
            for (Item item : said) {
                if (item instanceof Parameter) {
                    add(parameters, ((Parameter) item).name(), (Parameter) item);
                } else if (item instanceof Characteristic) {
                    add(characteristics, ((Characteristic) item).type(), (Characteristic) item);
                }
            }
        }

        private static <T> void add(Map<String, Deque<T>> map, String key, T item) {
            map.computeIfAbsent(key, first -> new ArrayDeque<>()).add(item);
        }

        private static <T> Deque<T> left(Map<String, Deque<T>> map, String key) {
            Deque<T> left = map.get(key);
            return left == null ? new ArrayDeque<>() : left;
        }
    }

    private final Listener listener;

    /** What the natives should answer of the push header. */
    private final Map<String, String> facts = new HashMap<>();

    private final Deque<Level> open = new ArrayDeque<>();

    private Comparison(Reading reading, Listener listener) {
        this.listener = listener;
        PushHeader header = reading.header;
        if (header != null) {
            facts.put("Content type", "" + header.contentType().code());
            facts.put("Header length", "" + (header.length() - header.contentType().offset()));
            facts.put("Body length", "" + (reading.held.bytes.length - header.length()));
            SecurityMethod method = header.securityMethod();
            facts.put("SEC", method == SecurityMethod.NONE ? null : method.name());
            facts.put("MAC", header.mac());
        }
        open.push(new Level(reading.document.children()));
    }

    /**
     * Asks the library and compares.
     *
     * @throws UnsatisfiedLinkError when the library cannot be loaded
     */
    static void of(Reading reading, Listener listener) {
        if (!Answers.ask(reading.held, new Comparison(reading, listener))) {
            listener.unanswered("it refuses the message");
        }
    }

    void begin() {
        listener.begin();
    }

    void begin(String type) {
        boolean isHeader = type.equals(HEADER);
        Characteristic said = isHeader ? null : Level.left(open.peek().characteristics, type).poll();
        List<Item> items = said == null ? Collections.<Item>emptyList() : said.children();
        open.push(new Level(items));
        listener.begin(type, items);
    }

    /** An answer of the push header. */
    void fact(String name, String value) {
        String said = facts.get(name);
        listener.answered(name, value, said != null, said);
    }

    /** An element of an array: the first parameter of the name that has the value, or the next. */
    void single(String name, String value) {
        Deque<Parameter> left = Level.left(open.peek().parameters, name);
        for (Iterator<Parameter> each = left.iterator(); each.hasNext(); ) {
            Parameter parameter = each.next();
            if (Objects.equals(parameter.value(), value)) {
                each.remove();
                listener.answered(name, value, true, value);
                return;
            }
        }
        listed(name, value);
    }

    /** A parameter that may be answered several times. */
    void listed(String name, String value) {
        Parameter said = Level.left(open.peek().parameters, name).poll();
        listener.answered(name, value, said != null, said == null ? null : said.value());
    }

    void end() {
        rest();
        open.pop();
        listener.end();
    }

    /** Tells what the message says and nobody has answered. */
    void rest() {
        for (Deque<Parameter> left : open.peek().parameters.values()) {
            for (Parameter parameter : left) {
                listener.notAnswered(parameter.name(), parameter.value());
            }
        }
        for (Deque<Characteristic> left : open.peek().characteristics.values()) {
            for (Characteristic characteristic : left) {
                listener.notAnswered(characteristic.type());
            }
        }
    }
}
