package com.qvomacp.eng.omacp;

import java.util.Arrays;

/**
 * The push header of a message, and what checks the MAC that it carries. The MAC can be checked
 * before the body is decoded: see {@link ProvisioningMessage#parseHeader}.
 */
public final class PushHeader {
    private final ContentType contentType;
    private final int headerLength;
    private final int sec;
    private final String mac;
    private final byte[] body;

    PushHeader(ContentType contentType, int headerLength, int sec, String mac, byte[] body) {
        this.contentType = contentType;
        this.headerLength = headerLength;
        this.sec = sec;
        this.mac = mac;
        this.body = body;
    }

    /**
     * Tells the content type of the message.
     *
     * @return the content type, with its code and its name; never {@code null}
     */
    public ContentType getContentType() {
        return contentType;
    }

    /**
     * Tells how long the headers are. The body stands behind them, and behind the three bytes in
     * front of them.
     *
     * @return bytes, 0 to 255
     */
    public int getHeaderLength() {
        return headerLength;
    }

    /**
     * Tells how long the body is.
     *
     * @return bytes
     */
    public int getBodyLength() {
        return body.length;
    }

    /**
     * Tells the body, over which the MAC is computed.
     *
     * @return a new array
     */
    public byte[] getBody() {
        return body.clone();
    }

    /**
     * Tells the security method.
     *
     * @return the method that SEC states; {@link SecurityMethod#NONE} without SEC, {@link
     *     SecurityMethod#UNKNOWN} for a SEC that states none of them; never {@code null}
     */
    public SecurityMethod getSecurityMethod() {
        return SecurityMethod.ofSec(sec);
    }

    /**
     * Tells SEC as the message states it.
     *
     * @return the byte as sent, such as 0x81, or 0 when the message does not state it
     */
    public int getSec() {
        return sec;
    }

    /**
     * Tells the MAC as the message states it, which does not say that it is right.
     *
     * @return the MAC, usually 40 hexadecimal digits, or {@code null} when the message carries none
     */
    public String getMac() {
        return mac;
    }

    /**
     * Checks the MAC of a message that is secured by what the user has been told: {@link
     * SecurityMethod#USERPIN} or {@link SecurityMethod#USERPINMAC}. The same as {@link
     * #verifyMac(String, String) verifyMac(pin, null)}.
     *
     * @param pin what the user has been told, or {@code null}
     * @return true when the message carries the right MAC
     */
    public boolean verifyMac(String pin) {
        return verifyMac(pin, null);
    }

    /**
     * Checks the MAC of a message that is secured by the subscriber's number: {@link
     * SecurityMethod#NETWPIN}. The same as {@link #verifyMac(String, String) verifyMac(null,
     * imsi)}.
     *
     * @param imsi the subscriber's number, or {@code null}
     * @return true when the message carries the right MAC
     */
    public boolean verifyMacWithImsi(String imsi) {
        return verifyMac(null, imsi);
    }

    /**
     * Checks the MAC by whichever security method the message states.
     *
     * <p>The MAC is the HMAC-SHA1 of the body. Its key, as OMA Provisioning Bootstrap defines it:
     *
     * <ul>
     *   <li>{@link SecurityMethod#NETWPIN}: the IMSI in semi-octets, as it stands on a SIM card.
     *   <li>{@link SecurityMethod#USERPIN}: the characters of the PIN.
     *   <li>{@link SecurityMethod#USERNETWPIN}: that of the IMSI and then that of the PIN.
     *   <li>{@link SecurityMethod#USERPINMAC}: the first half of the PIN, whose second half is the
     *       MAC, a decimal digit for each of its first bytes. The PIN has an even number of digits,
     *       10 to 40. A MAC in the push header is not looked at.
     * </ul>
     *
     * <p>MACs are compared in a time that does not depend on where they differ. Small and capital
     * hexadecimal digits are the same.
     *
     * @param pin what the user has been told; may be {@code null} for NETWPIN
     * @param imsi the subscriber's number, 1 to 15 digits; may be {@code null} unless the method
     *     has NETWPIN in its name
     * @return true when the MAC is right; false when it is not, when the message states no security
     *     method, one that is unknown, or carries no MAC, and when the PIN or the number that the
     *     method needs is missing, empty or not made as said above
     */
    public boolean verifyMac(String pin, String imsi) {
        return MacVerifier.verify(getSecurityMethod(), mac, body, pin, imsi);
    }

    /**
     * Checks the MAC that the push header carries with a key that the caller has made: for a
     * network whose subscribers have no IMSI.
     *
     * @param key the bytes of the key, or {@code null}
     * @return true when the message carries a MAC and it is right; false when it is not, when there
     *     is none, and without a key
     */
    public boolean verifyMacWithKey(byte[] key) {
        return MacVerifier.verify(mac, body, key);
    }

    /** The first byte of a body that is not empty. */
    byte firstBodyByte() {
        return body[0];
    }

    /**
     * Compares all that the header states, and the bodies.
     *
     * @param other what to compare with
     * @return true for a header that states the same in front of the same body
     */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof PushHeader)) {
            return false;
        }
        PushHeader that = (PushHeader) other;
        return contentType == that.contentType
                && headerLength == that.headerLength
                && sec == that.sec
                && (mac == null ? that.mac == null : mac.equals(that.mac))
                && Arrays.equals(body, that.body);
    }

    /**
     * Answers a number that fits {@link #equals}.
     *
     * @return the same number for equal headers
     */
    @Override
    public int hashCode() {
        return 31 * (31 * contentType.getCode() + sec) + Arrays.hashCode(body);
    }

    /**
     * Shows what the header states.
     *
     * @return one line of text
     */
    @Override
    public String toString() {
        return "PushHeader{"
                + contentType.getMediaType()
                + ", SEC="
                + getSecurityMethod()
                + ", MAC="
                + mac
                + ", "
                + body.length
                + " bytes}";
    }
}
