package com.qvomacp.eng.omacp;

/**
 * What a pushed provisioning message sets. Immutable.
 *
 * <pre>{@code
 * ProvisioningMessage message = ProvisioningMessage.parsePush(bytes);
 * if (message.verifyMac("1234", null) == MacResult.RIGHT) {
 *     for (AccessPoint accessPoint : message.accessPoints()) {
 *         System.out.println(accessPoint.name() + ": " + accessPoint.address());
 *     }
 * }
 * }</pre>
 */
public final class ProvisioningMessage {
    private final PushHeader header;
    private final ProvisioningDocument document;

    ProvisioningMessage(PushHeader header, ProvisioningDocument document) {
        this.header = header;
        this.document = document;
    }

    /**
     * Reads a push with the usual limits.
     *
     * @param push the push as it was received, from its transaction identifier on; it is copied
     * @return what it says
     * @throws ProvisioningException when it is over a limit, does not begin with a push header, or
     *     its body is no WBXML or a document of another type
     */
    public static ProvisioningMessage parsePush(byte[] push) throws ProvisioningException {
        return parsePush(push, ReadOptions.DEFAULT);
    }

    /**
     * Reads a push.
     *
     * @param push the push as it was received, from its transaction identifier on; it is copied
     * @param options the limits, and whether what the native library refuses is refused
     * @return what it says
     * @throws ProvisioningException as {@link #parsePush(byte[])}, and as the options ask for
     */
    public static ProvisioningMessage parsePush(byte[] push, ReadOptions options)
            throws ProvisioningException {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the push header.
     *
     * @return the header; {@code null} when a body alone was read
     */
    public PushHeader header() {
        return header;
    }

    /**
     * Tells the document, with all that the message says.
     *
     * @return the document, never {@code null}
     */
    public ProvisioningDocument document() {
        return document;
    }

    /**
     * Finds out whether the native library takes the message, its header and its body. It is worked
     * out at each call.
     *
     * @return the verdict, never {@code null}
     */
    public Verdict verdict() {
        throw new UnsupportedOperationException();
    }

    /**
     * Checks the MAC by whichever security method the message states: {@link ProvisioningMac#verify}.
     *
     * @param pin what the user has been told; may be {@code null} for NETWPIN
     * @param imsi the subscriber's number, 1 to 15 digits; may be {@code null} unless the method has
     *     NETWPIN in its name
     * @return what comes of it, never {@code null}; {@link MacResult#NO_METHOD} for a body alone
     */
    public MacResult verifyMac(String pin, String imsi) {
        return header == null
                ? MacResult.NO_METHOD
                : ProvisioningMac.verify(
                        header.securityMethod(), header.mac(), document.body(), pin, imsi);
    }

    /**
     * Checks the MAC with a key that the caller has made, for a network whose subscribers have no
     * IMSI.
     *
     * @param key the bytes of the key
     * @return what comes of it, never {@code null}; {@link MacResult#NO_METHOD} for a body alone
     */
    public MacResult verifyMac(byte[] key) {
        return header == null
                ? MacResult.NO_METHOD
                : ProvisioningMac.verify(
                        header.securityMethod(), header.mac(), document.body(), key);
    }
}
