package com.qvomacp.eng.omacp;

import java.util.Objects;

/**
 * A parameter of a provisioning document: a name, such as {@code NAPID}, and a value. The format
 * has nothing in a parm; what stands there all the same is in {@link #children}.
 *
 * <pre>{@code
 * for (Parameter parameter : characteristic.parameters()) {
 *     System.out.println(parameter.name() + (parameter.value() == null ? "" : " is set"));
 * }
 * }</pre>
 */
public final class Parameter extends Item {
    private final String name;
    private final String value;
    private final byte nameWriting;
    private final byte valueWriting;

    Parameter(
            int offset,
            int end,
            Item[] children,
            String name,
            Writing nameWriting,
            String value,
            Writing valueWriting) {
        super(offset, end, children);
        this.name = name;
        this.value = value;
        this.nameWriting = Writing.code(nameWriting);
        this.valueWriting = Writing.code(valueWriting);
    }

    /** {@return NAME as the OMA documents write it, as {@code NAPID}; {@code null} for none} */
    public String name() {
        return name;
    }

    /** {@return VALUE, which may be empty; {@code null} when the parameter has none} */
    public String value() {
        return value;
    }

    /** {@return how the name is written; {@code null} without a name} */
    public Writing nameWriting() {
        return Writing.of(nameWriting);
    }

    /** {@return how the value is written; {@code null} without a value} */
    public Writing valueWriting() {
        return Writing.of(valueWriting);
    }

    @Override
    String called() {
        return name;
    }

    @Override
    void step(StringBuilder path) {
        Printable.append(path, name == null ? Element.PARM.text : name);
    }

    @Override
    boolean says(Item other) {
        return other instanceof Parameter
                && Objects.equals(name, ((Parameter) other).name)
                && Objects.equals(value, ((Parameter) other).value);
    }

    @Override
    int hash() {
        return 31 * Objects.hashCode(name) + Objects.hashCode(value);
    }

    /** {@return the parameter, without its value, which may be a secret: one line of text} */
    @Override
    public String toString() {
        return "Parameter{name=" + (name == null ? "none" : Printable.of(name))
                + (value == null ? ", no value" : ", a value") + "}";
    }
}
