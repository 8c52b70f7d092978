package com.qvomacp.eng.omacp;

/**
 * How a message is read: limits, and whether a message that the native library refuses is refused.
 * Immutable; each {@code with} answers changed options.
 *
 * <pre>{@code
 * ReadOptions options = ReadOptions.DEFAULT.withInputLimit(1 << 20).withAcceptedOnly(true);
 * }</pre>
 */
public final class ReadOptions {
    /** Limits of 64 KiB of input and 8 MiB of text; everything that can be read is read. */
    public static final ReadOptions DEFAULT = new ReadOptions(64 << 10, 8 << 20, false);

    private final int inputLimit;
    private final int textLimit;
    private final boolean acceptedOnly;

    private ReadOptions(int inputLimit, int textLimit, boolean acceptedOnly) {
        this.inputLimit = inputLimit;
        this.textLimit = textLimit;
        this.acceptedOnly = acceptedOnly;
    }

    /** {@return how many bytes long a message or body may be} */
    public int inputLimit() {
        return inputLimit;
    }

    /**
     * {@return how many bytes of text, as the body writes it, a document may hold, references to
     * the string table counted each time}
     */
    public int textLimit() {
        return textLimit;
    }

    /** {@return whether a message that the native library refuses is refused} */
    public boolean acceptedOnly() {
        return acceptedOnly;
    }

    /**
     * {@return the options with another limit for how long a message or body may be}
     * @param bytes the longest length that is read
     * @throws IllegalArgumentException for a negative number
     */
    public ReadOptions withInputLimit(int bytes) {
        return new ReadOptions(notNegative(bytes), textLimit, acceptedOnly);
    }

    /**
     * {@return the options with another limit for how much text a document may hold}
     * @param bytes the most that is read, of text as the body writes it
     * @throws IllegalArgumentException for a negative number
     */
    public ReadOptions withTextLimit(int bytes) {
        return new ReadOptions(inputLimit, notNegative(bytes), acceptedOnly);
    }

    /**
     * {@return the options with or without refusing what the native library refuses}
     * @param only true to have it refused
     */
    public ReadOptions withAcceptedOnly(boolean only) {
        return new ReadOptions(inputLimit, textLimit, only);
    }

    private static int notNegative(int limit) {
        if (limit < 0) {
            throw new IllegalArgumentException("a limit of " + limit);
        }
        return limit;
    }

    @Override
    public boolean equals(Object other) {
        if (!(other instanceof ReadOptions)) {
            return false;
        }
        ReadOptions that = (ReadOptions) other;
        return inputLimit == that.inputLimit
                && textLimit == that.textLimit
                && acceptedOnly == that.acceptedOnly;
    }

    @Override
    public int hashCode() {
        return 31 * (31 * inputLimit + textLimit) + (acceptedOnly ? 1 : 0);
    }

    /** {@return the options: one line of text} */
    @Override
    public String toString() {
        return "ReadOptions{inputLimit=" + inputLimit + ", textLimit=" + textLimit
                + ", acceptedOnly=" + acceptedOnly + "}";
    }
}
