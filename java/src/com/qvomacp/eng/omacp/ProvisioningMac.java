package com.qvomacp.eng.omacp;

import java.nio.charset.StandardCharsets;
import java.security.GeneralSecurityException;
import java.security.MessageDigest;
import java.util.Arrays;
import java.util.Locale;
import javax.crypto.Mac;
import javax.crypto.spec.SecretKeySpec;

/**
 * Computes and checks MACs as OMA Provisioning Bootstrap defines them: the HMAC-SHA1 of the body,
 * with a key that the security method makes.
 *
 * <ul>
 *   <li>{@link SecurityMethod#NETWPIN}: the IMSI in semi-octets, as it stands on a SIM card.
 *   <li>{@link SecurityMethod#USERPIN}: the characters of the PIN.
 *   <li>{@link SecurityMethod#USERNETWPIN}: that of the IMSI and then that of the PIN.
 *   <li>{@link SecurityMethod#USERPINMAC}: the first half of the digits that the user has been
 *       told. Their second half is the MAC, a decimal digit for each of its first bytes, and the
 *       message carries none; one that stands in it all the same is not looked at.
 * </ul>
 *
 * <pre>{@code
 * PushHeader header = PushHeader.parse(push);
 * byte[] body = Arrays.copyOfRange(push, header.length(), push.length);
 * MacResult result =
 *         ProvisioningMac.verify(header.securityMethod(), header.mac(), body, "1234", null);
 * }</pre>
 */
public final class ProvisioningMac {
    private static final String ALGORITHM = "HmacSHA1";
    private static final int LONGEST_IMSI = 15;

    /** How many digits key and MAC have at least that the user is told. */
    private static final int SHORTEST_HALF = 5;

    /** How many digits a MAC has at most that the user is told: one for each of its bytes. */
    private static final int LONGEST_HALF = 20;

    private ProvisioningMac() {}

    /**
     * Checks a MAC with what the user and the network know. MACs are compared in a time that does
     * not depend on where they differ. Small and capital hexadecimal digits are the same.
     *
     * @param method the security method that the message states
     * @param mac the MAC that the message carries; {@code null} when it carries none
     * @param body the body, over which the MAC is computed
     * @param pin what the user has been told; may be {@code null} for NETWPIN
     * @param imsi the subscriber's number; may be {@code null} unless the method has NETWPIN in its
     *     name
     * @return what comes of it, never {@code null}; of several things that are missing the first in
     *     this order: the method, the MAC, the IMSI, the PIN
     */
    public static MacResult verify(
            SecurityMethod method, String mac, byte[] body, String pin, String imsi) {
        boolean isTold = method == SecurityMethod.USERPINMAC;
        MacResult missing = isTold ? null : missing(method, mac);
        missing = missing != null ? missing : unusable(method, pin, imsi);
        if (missing != null) {
            return missing;
        }
        String stated = isTold ? pin.substring(pin.length() / 2) : mac;
        return compare(compute(method, body, pin, imsi), stated);
    }

    /**
     * Checks a MAC with a key that the caller has made, for a network whose subscribers have no
     * IMSI.
     *
     * @param method the security method that the message states
     * @param mac the MAC that the message carries; {@code null} when it carries none
     * @param body the body, over which the MAC is computed
     * @param key the bytes of the key
     * @return what comes of it, never {@code null}; {@link MacResult#NO_MAC} for USERPINMAC, whose
     *     MAC the user has been told
     */
    public static MacResult verify(SecurityMethod method, String mac, byte[] body, byte[] key) {
        MacResult missing = missing(method, mac);
        if (missing == null && (key == null || key.length == 0)) {
            missing = MacResult.UNUSABLE_KEY;
        }
        return missing != null ? missing : compare(compute(key, body), mac);
    }

    /**
     * Computes the MAC that a body should have.
     *
     * @param method the security method
     * @param body the body
     * @param pin the PIN; for USERPINMAC all the digits that the user has been told
     * @param imsi the subscriber's number
     * @return 40 capital hexadecimal digits; for USERPINMAC the decimal digits that should be the
     *     second half of the PIN; {@code null} for NONE and UNKNOWN, and without a usable PIN or
     *     IMSI that the method needs
     */
    public static String compute(SecurityMethod method, byte[] body, String pin, String imsi) {
        if (!isKnown(method) || unusable(method, pin, imsi) != null) {
            return null;
        }
        if (method == SecurityMethod.USERPINMAC) {
            return told(pin.substring(0, pin.length() / 2), body);
        }
        byte[] network = isOfNetwork(method) ? imsiKey(imsi) : new byte[0];
        byte[] user = method == SecurityMethod.NETWPIN ? new byte[0] : utf8(pin);
        byte[] key = Arrays.copyOf(network, network.length + user.length);
        System.arraycopy(user, 0, key, network.length, user.length);
        return compute(key, body);
    }

    /**
     * Computes the MAC that a body should have, with a key that the caller has made.
     *
     * @param key the bytes of the key, at least one
     * @param body the body
     * @return 40 capital hexadecimal digits
     * @throws IllegalArgumentException for a key without bytes
     */
    public static String compute(byte[] key, byte[] body) {
        byte[] hmac = hmac(key, body);
        return HeaderReader.hexadecimal(hmac, 0, hmac.length);
    }

    /**
     * Computes what a user has to be told for a message with {@link SecurityMethod#USERPINMAC}.
     *
     * @param key the digits that are to be the key, 5 to 20
     * @param body the body of the message
     * @return the key and as many digits again, which are the MAC; {@code null} when the key is not
     *     as said
     */
    public static String digitsToTell(String key, byte[] body) {
        return isDigits(key, SHORTEST_HALF, LONGEST_HALF) ? key + told(key, body) : null;
    }

    private static boolean isKnown(SecurityMethod method) {
        return method != SecurityMethod.NONE && method != SecurityMethod.UNKNOWN;
    }

    private static MacResult missing(SecurityMethod method, String mac) {
        if (!isKnown(method)) {
            return MacResult.NO_METHOD;
        }
        return mac == null || method == SecurityMethod.USERPINMAC ? MacResult.NO_MAC : null;
    }

    /** What the method needs and has not, or null. */
    private static MacResult unusable(SecurityMethod method, String pin, String imsi) {
        if (isOfNetwork(method) && !isDigits(imsi, 1, LONGEST_IMSI)) {
            return MacResult.UNUSABLE_IMSI;
        }
        boolean isPin = pin != null && !pin.isEmpty();
        if (method == SecurityMethod.USERPINMAC) {
            isPin = isDigits(pin, 2 * SHORTEST_HALF, 2 * LONGEST_HALF) && pin.length() % 2 == 0;
        }
        return isPin || method == SecurityMethod.NETWPIN ? null : MacResult.UNUSABLE_PIN;
    }

    private static boolean isOfNetwork(SecurityMethod method) {
        return method == SecurityMethod.NETWPIN || method == SecurityMethod.USERNETWPIN;
    }

    private static boolean isDigits(String text, int least, int most) {
        boolean isGood = text != null && text.length() >= least && text.length() <= most;
        for (int i = 0; isGood && i < text.length(); ++i) {
            isGood = text.charAt(i) >= '0' && text.charAt(i) <= '9';
        }
        return isGood;
    }

    private static MacResult compare(String computed, String stated) {
        byte[] capitals = utf8(stated.toUpperCase(Locale.ROOT));
        boolean isRight = MessageDigest.isEqual(utf8(computed), capitals);
        return isRight ? MacResult.RIGHT : MacResult.WRONG;
    }

    /** The MAC as digits, as many as the key has. */
    private static String told(String key, byte[] body) {
        byte[] hmac = hmac(utf8(key), body);
        StringBuilder digits = new StringBuilder(key.length());
        for (int i = 0; i < key.length(); ++i) {
            digits.append((hmac[i] & 0xFF) % 10);
        }
        return digits.toString();
    }

    private static byte[] hmac(byte[] key, byte[] body) {
        try {
            Mac mac = Mac.getInstance(ALGORITHM);
            mac.init(new SecretKeySpec(key, ALGORITHM));
            return mac.doFinal(body);
        } catch (GeneralSecurityException e) {
            // Every Java platform has to have HmacSHA1, and it takes a key of any length.
            throw new IllegalStateException(e);
        }
    }

    /**
     * The IMSI as it stands on a SIM card: four bits of parity, then the digits, the low half of a
     * byte first; the last half is filled with ones when the number of digits is even.
     */
    private static byte[] imsiKey(String imsi) {
        String halves = imsi.length() % 2 == 1 ? "9" + imsi : "1" + imsi + "F";
        byte[] key = new byte[halves.length() / 2];
        for (int i = 0; i < key.length; ++i) {
            int low = Character.digit(halves.charAt(2 * i), 16);
            int high = Character.digit(halves.charAt(2 * i + 1), 16);
            key[i] = (byte) (high << 4 | low);
        }
        return key;
    }

    private static byte[] utf8(String text) {
        return text.getBytes(StandardCharsets.UTF_8);
    }
}
