package com.qvomacp.eng.omacp;

/**
 * What kind of address an address is.
 *
 * <pre>{@code
 * for (AccessPoint accessPoint : message.accessPoints()) {
 *     if (accessPoint.addressType() == AddressType.APN) {
 *         System.out.println(accessPoint.address());
 *     }
 * }
 * }</pre>
 */
public enum AddressType {
    /** An address of IP version 4. */
    IPV4("IPV4"),
    /** An address of IP version 6. */
    IPV6("IPV6"),
    /** A telephone number as E.164 writes it. */
    E164("E164"),
    /** A text. */
    ALPHA("ALPHA"),
    /** The name of an access point of GPRS. */
    APN("APN"),
    /** A service code. */
    SCODE("SCODE"),
    /** A subscriber identity of TETRA. */
    TETRA_ITSI("TETRA-ITSI"),
    /** An access number of MOBITEX. */
    MAN("MAN"),
    /** A text that stands for none of the other kinds. */
    UNKNOWN(null);

    private static final AddressType[] ALL = values();

    private final String text;

    AddressType(String text) {
        this.text = text;
    }

    /** The kind that a text stands for; null for null. */
    static AddressType of(String text) {
        if (text == null) {
            return null;
        }
        for (AddressType type : ALL) {
            if (text.equals(type.text)) {
                return type;
            }
        }
        return UNKNOWN;
    }
}
