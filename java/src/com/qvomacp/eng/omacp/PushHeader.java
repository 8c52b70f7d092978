package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * The header of a push, by the Wireless Session Protocol (WAP-230): content type, security method,
 * MAC, and whatever else the sender has put there. Immutable.
 *
 * <pre>{@code
 * PushHeader header = PushHeader.parse(push);
 * System.out.println(header.contentType().mediaType() + " " + header.securityMethod());
 * }</pre>
 */
public final class PushHeader {
    private PushHeader() {}

    /**
     * Reads the header of a push, whatever follows it.
     *
     * @param push a push, from its transaction identifier on
     * @return the header
     * @throws ProvisioningException when the bytes do not begin with the header of a push
     */
    public static PushHeader parse(byte[] push) throws ProvisioningException {
        throw new UnsupportedOperationException();
    }

    /**
     * Reads the headers of a push alone, from the content type on, as a platform hands them out.
     *
     * @param headers the content type and the headers behind it
     * @return the header, without transaction identifier
     * @throws ProvisioningException when the bytes are no headers of a push
     */
    public static PushHeader parseHeaders(byte[] headers) throws ProvisioningException {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the transaction identifier.
     *
     * @return 0 to 255; -1 when the headers were read alone
     */
    public int transactionIdentifier() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells how long the header is.
     *
     * @return bytes from the start of what was read to the body
     */
    public int length() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the content type with its parameters.
     *
     * @return the content type, never {@code null}
     */
    public ContentType contentType() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the security method.
     *
     * @return the method that SEC states; {@link SecurityMethod#NONE} without SEC, {@link
     *     SecurityMethod#UNKNOWN} for a SEC that states none of them; never {@code null}
     */
    public SecurityMethod securityMethod() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the MAC as the message states it, which does not say that it is right.
     *
     * @return the MAC, 40 hexadecimal digits when it can be one; {@code null} when the message
     *     carries none
     */
    public String mac() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the headers behind the content type.
     *
     * @return every header, in the order of the message; not modifiable
     */
    public List<HeaderField> fields() {
        throw new UnsupportedOperationException();
    }
}
