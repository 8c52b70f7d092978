package com.qvomacp.eng.omacp;

import java.nio.charset.StandardCharsets;
import java.security.GeneralSecurityException;
import java.security.MessageDigest;
import java.util.Locale;
import javax.crypto.Mac;
import javax.crypto.spec.SecretKeySpec;

/** Computes and compares MACs as OMA Provisioning Bootstrap defines them. */
final class MacVerifier {
    private static final String ALGORITHM = "HmacSHA1";
    private static final byte[] NO_KEY = {};

    private static final int LONGEST_IMSI = 15;

    /** How many digits key and MAC have at least that the user is told. */
    private static final int SHORTEST_HALF = 5;

    /** How many digits a MAC has at most that the user is told: one for each of its bytes. */
    private static final int LONGEST_HALF = 20;

    private MacVerifier() {}

    static boolean verify(
            SecurityMethod method, String mac, byte[] body, String pin, String imsi) {
        switch (method) {
            case NETWPIN:
                return verify(mac, body, imsiKey(imsi));
            case USERPIN:
                return verify(mac, body, pinKey(pin));
            case USERNETWPIN:
                return verify(mac, body, joined(imsiKey(imsi), pinKey(pin)));
            case USERPINMAC:
                return verifyTold(body, pin);
            default:
                return false;
        }
    }

    /** Compares the MAC in hexadecimal; an empty key, or none, is never right. */
    static boolean verify(String mac, byte[] body, byte[] key) {
        if (mac == null || key == null || key.length == 0) {
            return false;
        }
        byte[] expected = ascii(hexadecimal(hmac(key, body)));
        return MessageDigest.isEqual(expected, ascii(mac.toUpperCase(Locale.ROOT)));
    }

    /** Compares the MAC that is the second half of what the user has been told. */
    private static boolean verifyTold(byte[] body, String pin) {
        int half = pin == null ? 0 : pin.length() / 2;
        if (half < SHORTEST_HALF
                || half > LONGEST_HALF
                || pin.length() % 2 != 0
                || !isDigits(pin)) {
            return false;
        }
        byte[] told = ascii(pin.substring(half));
        byte[] hmac = hmac(ascii(pin.substring(0, half)), body);
        byte[] expected = new byte[half];
        for (int i = 0; i < half; ++i) {
            expected[i] = (byte) ('0' + (hmac[i] & 0xFF) % 10);
        }
        return MessageDigest.isEqual(expected, told);
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
        if (imsi == null || imsi.length() > LONGEST_IMSI || !isDigits(imsi)) {
            return NO_KEY;
        }
        String halves = imsi.length() % 2 == 1 ? "9" + imsi : "1" + imsi + "F";
        byte[] key = new byte[halves.length() / 2];
        for (int i = 0; i < key.length; ++i) {
            int low = Character.digit(halves.charAt(2 * i), 16);
            int high = Character.digit(halves.charAt(2 * i + 1), 16);
            key[i] = (byte) (high << 4 | low);
        }
        return key;
    }

    private static byte[] pinKey(String pin) {
        return pin == null ? NO_KEY : pin.getBytes(StandardCharsets.UTF_8);
    }

    /** Both keys in a row; none when one of them is missing. */
    private static byte[] joined(byte[] first, byte[] second) {
        if (first.length == 0 || second.length == 0) {
            return NO_KEY;
        }
        byte[] key = new byte[first.length + second.length];
        System.arraycopy(first, 0, key, 0, first.length);
        System.arraycopy(second, 0, key, first.length, second.length);
        return key;
    }

    private static boolean isDigits(String text) {
        for (int i = 0; i < text.length(); ++i) {
            if (text.charAt(i) < '0' || text.charAt(i) > '9') {
                return false;
            }
        }
        return !text.isEmpty();
    }

    private static String hexadecimal(byte[] bytes) {
        StringBuilder text = new StringBuilder();
        for (byte b : bytes) {
            text.append(String.format(Locale.ROOT, "%02X", b));
        }
        return text.toString();
    }

    private static byte[] ascii(String text) {
        return text.getBytes(StandardCharsets.US_ASCII);
    }
}
