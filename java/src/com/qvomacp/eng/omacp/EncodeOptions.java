package com.qvomacp.eng.omacp;

import java.util.EnumMap;
import java.util.Map;

/**
 * How a document is encoded: the options that are set. Immutable; {@link #with} answers changed
 * options.
 *
 * <pre>{@code
 * EncodeOptions options = EncodeOptions.NONE
 *         .with(EncodeOption.SEC, "userpin")
 *         .with(EncodeOption.PIN, "1234");
 * }</pre>
 */
public final class EncodeOptions {
    /** No option is set. */
    public static final EncodeOptions NONE =
            new EncodeOptions(new EnumMap<EncodeOption, String>(EncodeOption.class));

    private final EnumMap<EncodeOption, String> values;

    private EncodeOptions(EnumMap<EncodeOption, String> values) {
        this.values = values;
    }

    /**
     * Sets an option.
     *
     * @param option which
     * @param value its value
     * @return the changed options
     * @throws IllegalArgumentException for a value that the option does not take
     */
    public EncodeOptions with(EncodeOption option, String value) {
        if (!option.choices().isEmpty() && !option.choices().contains(value)) {
            throw new IllegalArgumentException(
                    option.optionName() + " is none of " + option.choices() + ": " + value);
        }
        EnumMap<EncodeOption, String> changed = new EnumMap<>(values);
        changed.put(option, value);
        return new EncodeOptions(changed);
    }

    /**
     * Tells the value of an option.
     *
     * @param option which
     * @return the value that is set, or else the option's default; {@code null} for none
     */
    public String value(EncodeOption option) {
        String value = values.get(option);
        return value == null ? option.defaultValue() : value;
    }

    /** Whether the option has a value: not whether it was set. */
    boolean is(EncodeOption option, String value) {
        return value.equals(value(option));
    }

    /** These options, and those of others that are not set here. */
    EncodeOptions orElse(EncodeOptions others) {
        EnumMap<EncodeOption, String> all = new EnumMap<>(others.values);
        all.putAll(values);
        return new EncodeOptions(all);
    }

    /** The options that are set, in the order of {@link EncodeOption}. */
    Map<EncodeOption, String> set() {
        return values;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof EncodeOptions && values.equals(((EncodeOptions) other).values);
    }

    @Override
    public int hashCode() {
        return values.hashCode();
    }

    /**
     * {@return the options that are set, without the values of PIN, IMSI and key: one line of text}
     */
    @Override
    public String toString() {
        StringBuilder text = new StringBuilder("EncodeOptions{");
        String separator = "";
        for (Map.Entry<EncodeOption, String> entry : values.entrySet()) {
            text.append(separator).append(entry.getKey().optionName());
            if (!entry.getKey().isSecret()) {
                text.append('=').append(entry.getValue());
            }
            separator = ", ";
        }
        return text.append('}').toString();
    }
}
