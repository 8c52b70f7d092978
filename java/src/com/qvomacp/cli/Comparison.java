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
final class Comparison implements Answers.Listener {
    /** In place of a type, for what is answered of the push header. */
    static final String HEADER = "push header";

    /** How an answer stands to the message. */
    enum Agreement {
        SAME,
        OTHERWISE,
        NOT_SAID
    }

    /** Hears what is answered, compared. */
    interface Listener {
        /** The items of the characteristic in the message; empty when it is not there. */
        void begin(String type, List<Item> said);

        /** Of a parameter; {@code said} is what the message says where that is something else. */
        void answered(String name, String value, Agreement agreement, String said);

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

        Characteristic next(String type) {
            Deque<Characteristic> left = characteristics.get(type);
            return left == null ? null : left.poll();
        }

        /** The next parameter of a name, or the first one that has the value. */
        Parameter next(String name, String value, boolean anywhere) {
            Deque<Parameter> left = parameters.get(name);
            if (left == null) {
                return null;
            }
            if (anywhere) {
                for (Iterator<Parameter> each = left.iterator(); each.hasNext(); ) {
                    Parameter parameter = each.next();
                    if (Objects.equals(parameter.value(), value)) {
                        each.remove();
                        return parameter;
                    }
                }
            }
            return left.poll();
        }
    }

    private final Listener listener;
    private final Map<String, String> header;
    private final Deque<Level> open = new ArrayDeque<>();
    private boolean inHeader;

    private Comparison(Reading reading, Listener listener) {
        this.listener = listener;
        this.header = factsOf(reading);
        open.push(new Level(reading.document.children()));
    }

    /**
     * Asks the library and compares.
     *
     * @throws UnsatisfiedLinkError when the library cannot be loaded
     */
    static void of(Reading reading, Listener listener) {
        Comparison comparison = new Comparison(reading, listener);
        if (Answers.ask(reading.held, comparison)) {
            comparison.rest();
        } else {
            listener.unanswered("it refuses the message");
        }
    }

    /** What the natives should answer of the push header. */
    private static Map<String, String> factsOf(Reading reading) {
        Map<String, String> facts = new HashMap<>();
        PushHeader header = reading.header;
        if (header != null) {
            facts.put("Content type", "" + header.contentType().code());
            facts.put("Header length", "" + (header.length() - header.contentType().offset()));
            facts.put("Body length", "" + (reading.held.bytes.length - header.length()));
            SecurityMethod method = header.securityMethod();
            facts.put("SEC", method == SecurityMethod.NONE ? null : method.name());
            facts.put("MAC", header.mac());
        }
        return facts;
    }

    @Override
    public void begin(String type) {
        inHeader = type.equals(HEADER);
        Characteristic said = inHeader ? null : open.peek().next(type);
        List<Item> items = said == null ? Collections.<Item>emptyList() : said.children();
        open.push(new Level(items));
        listener.begin(type, items);
    }

    @Override
    public void single(String name, String value) {
        if (inHeader) {
            compare(name, value, header.get(name) != null, header.get(name));
        } else {
            compare(name, value, open.peek().next(name, value, true));
        }
    }

    @Override
    public void listed(String name, String value) {
        compare(name, value, open.peek().next(name, value, false));
    }

    private void compare(String name, String value, Parameter said) {
        compare(name, value, said != null, said == null ? null : said.value());
    }

    private void compare(String name, String value, boolean isSaid, String said) {
        Agreement ofSaid = Objects.equals(value, said) ? Agreement.SAME : Agreement.OTHERWISE;
        listener.answered(name, value, isSaid ? ofSaid : Agreement.NOT_SAID, said);
    }

    @Override
    public void end() {
        rest();
        open.pop();
        listener.end();
        inHeader = false;
    }

    /** Tells what the message says and nobody has answered. */
    private void rest() {
        Level level = open.peek();
        for (Deque<Parameter> left : level.parameters.values()) {
            for (Parameter parameter : left) {
                listener.notAnswered(parameter.name(), parameter.value());
            }
        }
        for (Deque<Characteristic> left : level.characteristics.values()) {
            for (Characteristic characteristic : left) {
                listener.notAnswered(characteristic.type());
            }
        }
    }
}
