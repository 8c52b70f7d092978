package com.qvomacp.eng.omacp;

import java.util.List;

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
    Characteristic(Characteristic parent, int offset, int end) {
        super(parent, offset, end);
    }

    /**
     * Tells the type.
     *
     * @return TYPE as the OMA documents write it, such as {@code NAPDEF}; {@code null} when the
     *     characteristic has none
     */
    public String type() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how the type is written.
     *
     * @return how; {@code null} without a type
     */
    public Writing typeWriting() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists what stands in the characteristic.
     *
     * @return every item, in the order of the message; not modifiable
     */
    public List<Item> children() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the parameters that stand directly in the characteristic.
     *
     * @return every parameter, in the order of the message; not modifiable
     */
    public List<Parameter> parameters() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the characteristics that stand directly in this one.
     *
     * @return every characteristic, in the order of the message; not modifiable
     */
    public List<Characteristic> characteristics() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the characteristics of a type that stand directly in this one.
     *
     * @param type what TYPE is, in exactly this case
     * @return all of them, in the order of the message; not modifiable
     */
    public List<Characteristic> characteristics(String type) {
        throw new UnsupportedOperationException();
    }

    /**
     * Finds a parameter.
     *
     * @param name what NAME is, in exactly this case
     * @return the first parameter of that name; {@code null} when there is none
     */
    public Parameter parameter(String name) {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the value of a parameter.
     *
     * @param name what NAME is, in exactly this case
     * @return the value of the first parameter of that name; {@code null} when there is none, and
     *     when it has no value
     */
    public String value(String name) {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the values of all parameters of a name.
     *
     * @param name what NAME is, in exactly this case
     * @return the values, in the order of the message, without those parameters that have none; not
     *     modifiable
     */
    public List<String> values(String name) {
        throw new UnsupportedOperationException();
    }
}
