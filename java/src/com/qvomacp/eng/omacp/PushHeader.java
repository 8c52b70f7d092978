package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/**
 * The header of a push, by the Wireless Session Protocol (WAP-230): content type, security method,
 * MAC, and whatever else the sender has put there. Immutable.
 *
 * <p>There is no header without the type of a push, a header length that the data has, and a media
 * type. Of anything else what is there is read: a length inside the header that runs beyond it ends
 * with it, as does a text without its NUL; a parameter that begins inside the content type is read
 * to its own end; an octet that can begin nothing is passed over. SEC and MAC are found as
 * parameters and as headers, by number or by name in any case; the first one counts.
 *
 * <pre>{@code
 * PushHeader header = PushHeader.parse(push);
 * System.out.println(header.contentType().mediaType() + " " + header.securityMethod());
 * }</pre>
 */
public final class PushHeader {
    static final int NO_TRANSACTION = -1;

    private static final int FIRST_TEXT = 0x20;
    private static final int SHIFT = 0x7F;

    private final int transactionIdentifier;

    /** Where the content type begins. */
    private final int from;

    private final byte[] bytes;
    private final ContentType contentType;
    private final List<HeaderField> fields;
    private final SecurityMethod securityMethod;

    /** Null when the message carries none. */
    private final HeaderField mac;

    PushHeader(
            int transactionIdentifier,
            int from,
            byte[] bytes,
            ContentType contentType,
            List<HeaderField> fields) {
        this.transactionIdentifier = transactionIdentifier;
        this.from = from;
        this.bytes = bytes;
        this.contentType = contentType;
        this.fields = Collections.unmodifiableList(fields);
        HeaderField sec = first("SEC", false);
        securityMethod = sec == null ? SecurityMethod.NONE : SecurityMethod.stated(sec.value());
        mac = first("MAC", true);
    }

    /** The first parameter or header of a name; null without one. */
    private HeaderField first(String name, boolean hasValue) {
        HeaderField found = first(contentType.parameters(), name, hasValue);
        return found != null ? found : first(fields, name, hasValue);
    }

    private static HeaderField first(List<HeaderField> list, String name, boolean hasValue) {
        for (HeaderField field : list) {
            if (field.name().equalsIgnoreCase(name) && (!hasValue || field.value() != null)) {
                return field;
            }
        }
        return null;
    }

    /**
     * Reads the header of a push, whatever follows it.
     *
     * @param push a push, from its transaction identifier on
     * @return the header
     * @throws ProvisioningException when the bytes do not begin with the header of a push
     */
    public static PushHeader parse(byte[] push) throws ProvisioningException {
        return HeaderReader.readPush(push);
    }

    /**
     * Reads the headers of a push alone, from the content type on, as a platform hands them out.
     *
     * @param headers the content type and the headers behind it
     * @return the header, without transaction identifier
     * @throws ProvisioningException when the bytes are no headers of a push
     */
    public static PushHeader parseHeaders(byte[] headers) throws ProvisioningException {
        return HeaderReader.readHeaders(headers);
    }

    /** What was read, not to be changed. */
    byte[] bytes() {
        return bytes;
    }

    /** {@return the transaction identifier: 0 to 255; -1 when the headers were read alone} */
    public int transactionIdentifier() {
        return transactionIdentifier;
    }

    /** {@return how long the header is: bytes from the start of what was read to the body} */
    public int length() {
        return bytes.length;
    }

    /** {@return the content type with its parameters; never {@code null}} */
    public ContentType contentType() {
        return contentType;
    }

    /**
     * {@return the security method that SEC states; {@link SecurityMethod#NONE} without
     * SEC, {@link SecurityMethod#UNKNOWN} for a SEC that states none of them; never {@code null}}
     */
    public SecurityMethod securityMethod() {
        return securityMethod;
    }

    /**
     * {@return the MAC that the message states, right or not, which has 40 hexadecimal digits;
     * {@code null} when it carries none}
     */
    public String mac() {
        return mac == null ? null : mac.value();
    }

    /** {@return where the MAC begins: bytes from the start of what was read; -1 without one} */
    public int macOffset() {
        return mac == null ? -1 : mac.offset();
    }

    /** {@return the headers behind the content type, in their order; not modifiable} */
    public List<HeaderField> fields() {
        return fields;
    }

    /**
     * Tells what every byte of the header means. Nothing is kept: the visitor hears each as it is
     * worked out.
     *
     * @param visitor hears all bytes in their order; a meaning may hold any character that the
     *     message holds, the MAC among them
     */
    public void describe(ByteVisitor visitor) {
        if (transactionIdentifier != NO_TRANSACTION) {
            visitor.visit(0, 1, 0, "transaction identifier " + transactionIdentifier);
            visitor.visit(1, 1, 0, "push");
            visitor.visit(2, from - 2, 0, "header length " + (bytes.length - from));
        }
        contentType.describe(visitor);
        int at = contentType.offset() + contentType.length();
        for (HeaderField field : fields) {
            describeShifts(visitor, at, field.offset());
            field.describe(visitor, 0);
            at = field.offset() + field.length();
        }
        describeShifts(visitor, at, bytes.length);
    }

    /** Between the headers stand changes of the code page, and what begins no header. */
    private void describeShifts(ByteVisitor visitor, int from, int to) {
        int at = from;
        while (at < to) {
            int octet = bytes[at] & 0xFF;
            if (octet == SHIFT && at + 1 < to) {
                visitor.visit(at, 2, 0, "headers of code page " + (bytes[at + 1] & 0xFF));
                at += 2;
            } else {
                boolean isShift = octet > 0 && octet < FIRST_TEXT;
                visitor.visit(at, 1, 0, isShift ? "headers of code page " + octet : "no header");
                at += 1;
            }
        }
    }

    /** A byte of what was read, 0 to 255. */
    int byteAt(int offset) {
        return bytes[offset] & 0xFF;
    }

    /** {@return whether it is a header that says the same, however it is written} */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof PushHeader)) {
            return false;
        }
        PushHeader that = (PushHeader) other;
        return transactionIdentifier == that.transactionIdentifier
                && contentType.equals(that.contentType)
                && fields.equals(that.fields);
    }

    @Override
    public int hashCode() {
        return Arrays.hashCode(new Object[] {transactionIdentifier, contentType, fields});
    }

    /** {@return media type, security method and whether there is a MAC, in a line for a log} */
    @Override
    public String toString() {
        String text = "PushHeader{" + Printable.of(contentType.mediaType()) + ", ";
        return text + securityMethod + (mac == null ? ", no MAC}" : ", a MAC}");
    }
}
