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
    Validity(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return COUNTRY: the mobile country code} */
    public String country() {
        return value("COUNTRY");
    }

    /** {@return NETWORK: the mobile network code} */
    public String network() {
        return value("NETWORK");
    }

    /** {@return SID: the identifier of the system} */
    public String systemId() {
        return value("SID");
    }

    /** {@return SOC: the code of the system operator} */
    public String systemOperatorCode() {
        return value("SOC");
    }

    /** {@return VALIDUNTIL: the last point in time, as the message writes it} */
    public String validUntil() {
        return value("VALIDUNTIL");
    }
}
