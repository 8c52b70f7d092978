package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.TypedCharacteristic.Kind;
import java.io.ByteArrayOutputStream;
import java.util.Arrays;
import java.util.List;

/**
 * What a provisioning message says: its push header, its document, and views of the document's
 * characteristics by their kinds. Everything that can be read is read; whether the native library
 * takes the message is told beside it, by {@link #verdict}. Immutable.
 *
 * <pre>{@code
 * ProvisioningMessage message = ProvisioningMessage.parsePush(push);
 * if (message.verifyMac("1234", null) == MacResult.RIGHT) {
 *     for (AccessPoint accessPoint : message.accessPoints()) {
 *         System.out.println(accessPoint.name() + ": " + accessPoint.address());
 *     }
 * }
 * }</pre>
 *
 * <p>The lists hold the characteristics that stand directly in the document, in the order of the
 * message, and cannot be modified; {@link #document} has those elsewhere, and all else there is.
 */
public final class ProvisioningMessage {
    private static final int PUSH = 6;

    private final PushHeader header;
    private final ProvisioningDocument document;

    private ProvisioningMessage(PushHeader header, ProvisioningDocument document) {
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
        ProvisioningException.checkInput(push.length, options);
        PushHeader header = PushHeader.parse(push);
        return read(header, Arrays.copyOfRange(push, header.length(), push.length), options);
    }

    /**
     * Reads a body with the usual limits.
     *
     * @param body a WBXML body; it is copied
     * @return what it says
     * @throws ProvisioningException when it is over a limit, is no WBXML, or is a document of
     *     another type
     */
    public static ProvisioningMessage parseBody(byte[] body) throws ProvisioningException {
        return parseBody(body, ReadOptions.DEFAULT);
    }

    /**
     * Reads a body.
     *
     * @param body a WBXML body; it is copied
     * @param options the limits, and whether what the native library refuses is refused
     * @return what it says
     * @throws ProvisioningException as {@link #parseBody(byte[])}, and as the options ask for
     */
    public static ProvisioningMessage parseBody(byte[] body, ReadOptions options)
            throws ProvisioningException {
        ProvisioningException.checkInput(body.length, options);
        return read(null, body.clone(), options);
    }

    /**
     * Reads a message as a platform's receiver of pushes hands it out, with the usual limits.
     *
     * @param header the headers, from the content type on; they are copied
     * @param data the body; it is copied
     * @return what it says
     * @throws ProvisioningException when it is over a limit, {@code header} does not begin with a
     *     content type, or {@code data} is no WBXML or a document of another type
     */
    public static ProvisioningMessage parse(byte[] header, byte[] data)
            throws ProvisioningException {
        return parse(header, data, ReadOptions.DEFAULT);
    }

    /**
     * Reads a message as a platform's receiver of pushes hands it out.
     *
     * @param header the headers, from the content type on; they are copied
     * @param data the body; it is copied
     * @param options the limits, and whether what the native library refuses is refused
     * @return what it says
     * @throws ProvisioningException as {@link #parse(byte[], byte[])}, and as the options ask for
     */
    public static ProvisioningMessage parse(byte[] header, byte[] data, ReadOptions options)
            throws ProvisioningException {
        ProvisioningException.checkInput((long) header.length + data.length, options);
        return read(PushHeader.parseHeaders(header), data.clone(), options);
    }

    /** Reads a body that nobody else has. */
    private static ProvisioningMessage read(PushHeader header, byte[] body, ReadOptions options)
            throws ProvisioningException {
        ProvisioningMessage message =
                new ProvisioningMessage(header, ProvisioningDocument.of(body, options));
        if (options.acceptedOnly()) {
            ProvisioningException.checkVerdict(message.verdict());
        }
        return message;
    }

    /** {@return the push header; {@code null} when a body alone was read} */
    public PushHeader header() {
        return header;
    }

    /** {@return the document, with all that the message says; never {@code null}} */
    public ProvisioningDocument document() {
        return document;
    }

    /**
     * Finds out whether the native library takes the message, its header and its body. It is worked
     * out at each call.
     *
     * <p>The library takes whole pushes only. Of headers and body that were read apart it is asked
     * about the push that has them: three bytes in front of the headers, or four in front of more
     * than 127, for the offset of a header that is refused.
     *
     * @return the verdict, never {@code null}; that on the body when a body alone was read
     */
    public Verdict verdict() {
        if (header == null) {
            return document.verdict();
        }
        boolean isAlone = header.transactionIdentifier() == PushHeader.NO_TRANSACTION;
        byte[] head = isAlone ? push(header.bytes()) : header.bytes();
        byte[] body = document.bytes();
        byte[] push = Arrays.copyOf(head, head.length + body.length);
        System.arraycopy(body, 0, push, head.length, body.length);
        return Verdict.onPush(push, head.length, document);
    }

    /**
     * Looks for what is wrong with the message, worked out at each call.
     *
     * @return what each {@link Rule} finds, first in the push header, then in the order of the
     *     body; not modifiable
     */
    public List<Finding> lint() {
        return Linter.lint(header, document, verdict());
    }

    /** Headers as they stand in a push. */
    private static byte[] push(byte[] headers) {
        ByteArrayOutputStream push = new ByteArrayOutputStream();
        push.write(0);
        push.write(PUSH);
        BodyWriter.integer(headers.length, push);
        push.write(headers, 0, headers.length);
        return push.toByteArray();
    }

    /**
     * Checks the MAC by the method that the message states: {@link ProvisioningMac#verify}.
     *
     * @param pin what the user has been told; may be {@code null} for NETWPIN
     * @param imsi the subscriber's number, 1 to 15 digits; may be {@code null} unless the method
     *     has NETWPIN in its name
     * @return what comes of it, never {@code null}; {@link MacResult#NO_METHOD} for a body alone
     */
    public MacResult verifyMac(String pin, String imsi) {
        return header == null
                ? MacResult.NO_METHOD
                : ProvisioningMac.verify(
                        header.securityMethod(), header.mac(), document.bytes(), pin, imsi);
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
                        header.securityMethod(), header.mac(), document.bytes(), key);
    }

    /** {@return the proxies: every PXLOGICAL} */
    public List<Proxy> proxies() {
        return views(Proxy.class, Kind.PXLOGICAL);
    }

    /** {@return the network access points: every NAPDEF} */
    public List<AccessPoint> accessPoints() {
        return views(AccessPoint.class, Kind.NAPDEF);
    }

    /** {@return where further provisioning comes from: every BOOTSTRAP} */
    public List<Bootstrap> bootstraps() {
        return views(Bootstrap.class, Kind.BOOTSTRAP);
    }

    /** {@return the identities that the client gets: every CLIENTIDENTITY} */
    public List<ClientIdentity> clientIdentities() {
        return views(ClientIdentity.class, Kind.CLIENTIDENTITY);
    }

    /** {@return CLIENT-ID of the first CLIENTIDENTITY; {@code null} when it is not set} */
    public String clientId() {
        List<ClientIdentity> identities = clientIdentities();
        return identities.isEmpty() ? null : identities.get(0).clientId();
    }

    /** {@return what vendors' own software is told: every VENDORCONFIG} */
    public List<VendorConfiguration> vendorConfigurations() {
        return views(VendorConfiguration.class, Kind.VENDORCONFIG);
    }

    /** {@return the settings of applications: every APPLICATION} */
    public List<Application> applications() {
        return views(Application.class, Kind.APPLICATION);
    }

    /** {@return which traffic takes which way: every ACCESS} */
    public List<AccessRule> accessRules() {
        return views(AccessRule.class, Kind.ACCESS);
    }

    /** {@return the Wi-Fi networks: every WI-FI} */
    public List<Wifi> wifis() {
        return views(Wifi.class, Kind.WI_FI);
    }

    /** {@return the settings for voice over Wi-Fi: every such characteristic} */
    public List<VoWifi> voWifis() {
        return views(VoWifi.class, Kind.VODAFONE_VOWIFI);
    }

    private <V> List<V> views(Class<V> view, Kind kind) {
        return TypedCharacteristic.views(document.root(), view, kind);
    }

    /**
     * {@return whether another message says the same: it has an equal header, or none either, and
     * an equal document}
     * @param other what to compare with
     */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof ProvisioningMessage)) {
            return false;
        }
        ProvisioningMessage that = (ProvisioningMessage) other;
        return (header == null ? that.header == null : header.equals(that.header))
                && document.equals(that.document);
    }

    @Override
    public int hashCode() {
        return 31 * (header == null ? 0 : header.hashCode()) + document.hashCode();
    }

    /** {@return how much is set, in one line without any value or MAC, which may go to a log} */
    @Override
    public String toString() {
        String method = header == null ? "" : "securityMethod=" + header.securityMethod() + ", ";
        return "ProvisioningMessage{" + method + "proxies=" + proxies().size()
                + ", accessPoints=" + accessPoints().size()
                + ", bootstraps=" + bootstraps().size()
                + ", clientIdentities=" + clientIdentities().size()
                + ", vendorConfigurations=" + vendorConfigurations().size()
                + ", applications=" + applications().size()
                + ", accessRules=" + accessRules().size()
                + ", wifis=" + wifis().size()
                + ", voWifis=" + voWifis().size() + "}";
    }
}
