package com.qvomacp.eng.omacp;

/**
 * Where and until when an access point may be used: a VALIDITY.
 *
 * <pre>{@code
 * for (Validity validity : message.accessPoints().get(0).validities()) {
 *     System.out.println(validity.country() + " " + validity.network());
 * }
 * }</pre>
 */
public final class Validity extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "VALIDITY";

    Validity(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the mobile country code.
     *
     * @return COUNTRY; {@code null} when it is not set
     */
    public String country() {
        return value("COUNTRY");
    }

    /**
     * Tells the mobile network code.
     *
     * @return NETWORK; {@code null} when it is not set
     */
    public String network() {
        return value("NETWORK");
    }

    /**
     * Tells the identifier of the system.
     *
     * @return SID; {@code null} when it is not set
     */
    public String systemId() {
        return value("SID");
    }

    /**
     * Tells the code of the system operator.
     *
     * @return SOC; {@code null} when it is not set
     */
    public String systemOperatorCode() {
        return value("SOC");
    }

    /**
     * Tells the last point in time, as the message writes it.
     *
     * @return VALIDUNTIL; {@code null} when it is not set
     */
    public String validUntil() {
        return value("VALIDUNTIL");
    }
}
