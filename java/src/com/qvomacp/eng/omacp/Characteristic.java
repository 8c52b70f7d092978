package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.List;

/** What all snapshots share: the parameters by their names, and what stands beside them. */
abstract class Characteristic {
    /** The names and values of a characteristic of which every parameter is a list. */
    static final String[] NONE = {};

    private static final List<String> SECRETS =
            Arrays.asList(
                    "PROXY-PW", "PXAUTH-PW", "AUTHSECRET", "AAUTHSECRET", "AAUTHDATA", "PASSWORD");

    private final String[] names;
    private final String[] values;
    private final Object[] parts;

    /**
     * Takes what the library has answered.
     *
     * @param names what the elements of {@code values} are called; null for one without a name
     * @param values at least as many as there are names; belongs to the snapshot from now on
     * @param parts everything else that makes two snapshots equal
     */
    Characteristic(String[] names, String[] values, Object... parts) {
        this.names = names;
        this.values = values;
        this.parts = parts;
    }

    final String value(String name) {
        for (int i = 0; i < names.length; ++i) {
            if (name.equals(names[i])) {
                return values[i];
            }
        }
        throw new IllegalArgumentException(name);
    }

    /**
     * Compares everything that the message sets.
     *
     * @param other what to compare with
     * @return true for an object of the same class that sets the same
     */
    @Override
    public final boolean equals(Object other) {
        if (other == null || other.getClass() != getClass()) {
            return false;
        }
        Characteristic that = (Characteristic) other;
        return Arrays.equals(values, that.values) && Arrays.equals(parts, that.parts);
    }

    /**
     * Answers a number that fits {@link #equals}.
     *
     * @return the same number for equal objects
     */
    @Override
    public final int hashCode() {
        return 31 * Arrays.hashCode(values) + Arrays.hashCode(parts);
    }

    /**
     * Shows what is set, for logs: passwords and their like are shown as {@code ***}.
     *
     * @return one line of text
     */
    @Override
    public final String toString() {
        StringBuilder text = new StringBuilder(getClass().getSimpleName()).append('{');
        String separator = "";
        for (int i = 0; i < names.length; ++i) {
            if (names[i] != null && values[i] != null) {
                text.append(separator).append(names[i]).append('=');
                text.append(SECRETS.contains(names[i]) ? "***" : values[i]);
                separator = ", ";
            }
        }
        for (Object part : parts) {
            if (isShown(part)) {
                text.append(separator).append(part);
                separator = ", ";
            }
        }
        return text.append('}').toString();
    }

    /** Counts and the like say little without their names. */
    private static boolean isShown(Object part) {
        return part instanceof List
                ? !((List<?>) part).isEmpty()
                : part instanceof Characteristic || part instanceof PushHeader;
    }
}
