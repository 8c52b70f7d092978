package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import java.util.ArrayDeque;
import java.util.ArrayList;
import java.util.Collections;
import java.util.Deque;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.Objects;

/**
 * Holds what the native library answers against what the message says. The characteristics of a
 * type that stand in the same one are compared by their order, and so the parameters of a name.
 */
final class Comparison {
    /** In place of a type, for what is answered of the push header. */
    static final String HEADER = "push header";

    private static final List<Item> NOTHING = Collections.emptyList();

    /** A characteristic that is being answered, and what of the message is left of it. */
    private static final class Level {
        final List<Answer> answers;
        final Map<String, Deque<Parameter>> parameters = new LinkedHashMap<>();
        final Map<String, Deque<Characteristic>> characteristics = new LinkedHashMap<>();

        Level(List<Answer> answers, List<Item> said) {
            this.answers = answers;
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
            return map.getOrDefault(key, new ArrayDeque<>());
        }
    }

    /** What is answered; empty when nothing is. */
    final List<Answer> answers = new ArrayList<>();

    /** Why nothing is answered; null when something is. */
    final String unanswered;

    /** What the natives should answer of the push header. */
    private final Map<String, String> facts = new HashMap<>();

    private final Deque<Level> open = new ArrayDeque<>();

    /**
     * Asks the library and compares.
     *
     * @throws UnsatisfiedLinkError when the library cannot be loaded
     */
    Comparison(Reading reading) {
        PushHeader header = reading.header;
        if (header != null) {
            facts.put("Content type", "" + header.contentType().code());
            facts.put("Header length", "" + (header.length() - header.contentType().offset()));
            facts.put("Body length", "" + (reading.held.bytes.length - header.length()));
            SecurityMethod method = header.securityMethod();
            facts.put("SEC", method == SecurityMethod.NONE ? null : method.name());
            facts.put("MAC", header.mac());
        }
        boolean isRead = reading.document != null;
        open.push(new Level(answers, isRead ? reading.document.children() : NOTHING));
        unanswered = Answers.ask(reading.held, this) ? null : "it refuses the message";
    }

    /** Says why nothing is answered. */
    Comparison(String unanswered) {
        this.unanswered = unanswered;
    }

    void begin(String type) {
        boolean isHeader = type.equals(HEADER);
        Map<String, Deque<Characteristic>> left = open.peek().characteristics;
        Characteristic said = isHeader ? null : Level.left(left, type).poll();
        List<Item> items = said == null ? NOTHING : said.children();
        int column = isHeader ? TextWriter.HEADER_COLUMN : TextWriter.column(items);
        Answer answer = Answer.characteristic(type, column, true);
        add(answer);
        open.push(new Level(answer.children, items));
    }

    /** An answer of the push header. */
    void fact(String name, String value) {
        String said = facts.get(name);
        add(Answer.parameter(name, value, said != null, said));
    }

    private void add(Answer answer) {
        open.peek().answers.add(answer);
    }

    /** An element of an array: the first parameter of the name that has the value, or the next. */
    void single(String name, String value) {
        Deque<Parameter> left = Level.left(open.peek().parameters, name);
        for (Parameter parameter : left) {
            if (Objects.equals(parameter.value(), value)) {
                left.remove(parameter);
                left.push(parameter);
                break;
            }
        }
        listed(name, value);
    }

    /** A parameter that may be answered several times. */
    void listed(String name, String value) {
        Parameter said = Level.left(open.peek().parameters, name).poll();
        add(Answer.parameter(name, value, said != null, said == null ? null : said.value()));
    }

    void end() {
        rest();
        open.pop();
    }

    /** Adds what the message says and nobody has answered. */
    void rest() {
        for (Deque<Parameter> left : open.peek().parameters.values()) {
            for (Parameter parameter : left) {
                add(Answer.missing(parameter.name(), parameter.value()));
            }
        }
        for (Deque<Characteristic> left : open.peek().characteristics.values()) {
            for (Characteristic characteristic : left) {
                add(Answer.characteristic(characteristic.type(), 0, false));
            }
        }
    }
}
