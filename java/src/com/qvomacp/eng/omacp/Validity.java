package com.qvomacp.eng.omacp;

/**
 * Where and until when an access point may be used: a VALIDITY.
 */
public final class Validity extends Characteristic {
    private static final String[] NAMES = {"COUNTRY", "NETWORK", "SID", "SOC", "VALIDUNTIL"};

    Validity(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells the mobile country code.
     *
     * @return COUNTRY, or {@code null} when the message does not set it
     */
    public String getCountry() {
        return value("COUNTRY");
    }

    /**
     * Tells the mobile network code.
     *
     * @return NETWORK, or {@code null} when the message does not set it
     */
    public String getNetwork() {
        return value("NETWORK");
    }

    /**
     * Tells the identifier of the system.
     *
     * @return SID, or {@code null} when the message does not set it
     */
    public String getSystemId() {
        return value("SID");
    }

    /**
     * Tells the code of the system operator.
     *
     * @return SOC, or {@code null} when the message does not set it
     */
    public String getSystemOperatorCode() {
        return value("SOC");
    }

    /**
     * Tells the last point in time, as the message writes it.
     *
     * @return VALIDUNTIL, or {@code null} when the message does not set it
     */
    public String getValidUntil() {
        return value("VALIDUNTIL");
    }
}
