package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Collections;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.Objects;

/**
 * A characteristic of a provisioning document: a type, such as {@code NAPDEF}, and what stands in
 * it, in the order of the message.
 *
 * <pre>{@code
 * for (Characteristic access : document.characteristics("NAPDEF")) {
 *     System.out.println(access.value("NAPID") + ": " + access.values("BEARER"));
 * }
 * }</pre>
 */
public final class Characteristic extends Item {
    private final String type;
    private final byte typeWriting;

    /** How many of its children stand before the first characteristic; at most what a byte holds. */
    private final byte beforeCharacteristics;

    /** The number of the characteristic in a path; 0 until somebody asks for one beside it. */
    private int ordinal;

    Characteristic(int offset, int end, Item[] children, String type, Writing typeWriting) {
        super(offset, end, children);
        this.type = type;
        this.typeWriting = Writing.code(typeWriting);
        byte before = 0;
        int most = Math.min(children.length, Byte.MAX_VALUE);
        while (before < most && !(children[before] instanceof Characteristic)) {
            ++before;
        }
        beforeCharacteristics = before;
    }

    /** {@return TYPE as the OMA documents write it, as {@code NAPDEF}; {@code null} for none} */
    public String type() {
        return type;
    }

    /** {@return how the type is written; {@code null} without a type} */
    public Writing typeWriting() {
        return Writing.of(typeWriting);
    }

    /** {@return the parameters directly in it, in the order of the message; not modifiable} */
    public List<Parameter> parameters() {
        return children(Parameter.class, null);
    }

    /** {@return the characteristics directly in it, in the order of the message; not modifiable} */
    public List<Characteristic> characteristics() {
        return children(Characteristic.class, null);
    }

    /**
     * {@return the characteristics of a type directly in it, in the order of the message; not
     * modifiable}
     * @param type what TYPE is, in exactly this case
     */
    public List<Characteristic> characteristics(String type) {
        return children(Characteristic.class, Objects.requireNonNull(type));
    }

    /**
     * {@return the first parameter of a name; {@code null} when there is none}
     * @param name what NAME is, in exactly this case
     */
    public Parameter parameter(String name) {
        for (Item child : inside()) {
            if (child instanceof Parameter && name.equals(((Parameter) child).name())) {
                return (Parameter) child;
            }
        }
        return null;
    }

    /**
     * {@return the value of the first parameter of a name; {@code null} when there is none, and
     * when it has no value}
     * @param name what NAME is, in exactly this case
     */
    public String value(String name) {
        Parameter parameter = parameter(name);
        return parameter == null ? null : parameter.value();
    }

    /**
     * {@return the values of all parameters of a name that have one, in the order of the message;
     * not modifiable}
     * @param name what NAME is, in exactly this case
     */
    public List<String> values(String name) {
        Objects.requireNonNull(name);
        List<String> values = new ArrayList<>();
        for (Item child : inside()) {
            if (child instanceof Parameter && name.equals(((Parameter) child).name())) {
                String value = ((Parameter) child).value();
                if (value != null) {
                    values.add(value);
                }
            }
        }
        return Collections.unmodifiableList(values);
    }

    @Override
    int beforeCharacteristics() {
        return beforeCharacteristics;
    }

    @Override
    String called() {
        return type;
    }

    @Override
    void step(StringBuilder path) {
        if (ordinal == 0) {
            count(parent());
        }
        Printable.append(path, type == null ? Element.CHARACTERISTIC.text : type);
        path.append(' ').append(ordinal);
    }

    /**
     * Numbers the characteristics of an item, all at once, so that many paths take no longer than
     * few. Two threads that do so at the same time write the same numbers.
     */
    private static void count(Item item) {
        Map<String, Integer> counts = new HashMap<>();
        for (Item child : item.inside()) {
            if (child instanceof Characteristic) {
                Characteristic characteristic = (Characteristic) child;
                Integer before = counts.get(characteristic.type);
                int number = before == null ? 1 : before + 1;
                counts.put(characteristic.type, number);
                characteristic.ordinal = number;
            }
        }
    }

    @Override
    boolean says(Item other) {
        return other instanceof Characteristic
                && Objects.equals(type, ((Characteristic) other).type);
    }

    @Override
    int hash() {
        return Objects.hashCode(type);
    }

    /** {@return the characteristic, without what is in it: one line of text} */
    @Override
    public String toString() {
        return "Characteristic{type="
                + (type == null ? "none" : Printable.of(type))
                + ", children="
                + inside().length
                + "}";
    }
}
