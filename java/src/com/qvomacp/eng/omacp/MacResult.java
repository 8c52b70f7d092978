package com.qvomacp.eng.omacp;

/**
 * What comes of checking the MAC of a message.
 *
 * <pre>{@code
 * if (message.verifyMac("1234", null) != MacResult.RIGHT) {
 *     System.out.println("the message is not to be believed");
 * }
 * }</pre>
 */
public enum MacResult {
    /** The MAC is that of the body and the key: nobody who has no key has written the message. */
    RIGHT,

    /** The MAC is not that of the body and the key. */
    WRONG,

    /** The message carries no MAC, and its security method is one that needs it. */
    NO_MAC,

    /** The message states no security method, or one that is unknown. */
    NO_METHOD,

    /**
     * The PIN is missing or cannot be one: it is empty, or the method is {@link
     * SecurityMethod#USERPINMAC} and it is no even number of digits from 10 to 40.
     */
    UNUSABLE_PIN,

    /** The IMSI is missing or cannot be one: it is no number of 1 to 15 digits. */
    UNUSABLE_IMSI,

    /** The key is missing or has no bytes. */
    UNUSABLE_KEY
}
