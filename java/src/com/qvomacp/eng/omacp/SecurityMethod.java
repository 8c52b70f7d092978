package com.qvomacp.eng.omacp;

/**
 * The security methods of OMA Provisioning Bootstrap: what the key of the MAC is made of.
 *
 * <pre>{@code
 * if (header.securityMethod() == SecurityMethod.NETWPIN) {
 *     System.out.println("the user need not type a PIN");
 * }
 * }</pre>
 */
public enum SecurityMethod {
    /** The message states no security method. */
    NONE,

    /** The key is known to network and device: in GSM, the IMSI. */
    NETWPIN,

    /** The key is a PIN that the user has been told. */
    USERPIN,

    /** The key is that of {@link #NETWPIN} followed by that of {@link #USERPIN}. */
    USERNETWPIN,

    /** The user has been told key and MAC, as one PIN of twice the length. */
    USERPINMAC,

    /** The message states a security method that is none of these. */
    UNKNOWN;

    private static final SecurityMethod[] BY_NUMBER = {NETWPIN, USERPIN, USERNETWPIN, USERPINMAC};
    private static final String[] DIGITS = {"0", "1", "2", "3"};

    /** The name of the method that a number stands for; its digits when it stands for none. */
    static String nameOf(long number) {
        return number >= 0 && number < BY_NUMBER.length
                ? BY_NUMBER[(int) number].name()
                : Long.toString(number);
    }

    /** The method that SEC states, by its name or number; null is a SEC without value. */
    static SecurityMethod stated(String sec) {
        for (int number = 0; number < BY_NUMBER.length; ++number) {
            SecurityMethod method = BY_NUMBER[number];
            if (method.name().equalsIgnoreCase(sec) || DIGITS[number].equals(sec)) {
                return method;
            }
        }
        return UNKNOWN;
    }
}
