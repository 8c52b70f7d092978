package com.qvomacp.eng.omacp;

/**
 * Which certificate EAP uses: a CERT.
 *
 * <pre>{@code
 * Wlan wlan = message.accessPoints().get(0).wlans().get(0);
 * for (EapCertificate certificate : wlan.eaps().get(0).certificates()) {
 *     System.out.println(certificate.issuerName() + " " + certificate.serialNumber());
 * }
 * }</pre>
 */
public final class EapCertificate extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "CERT";

    EapCertificate(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the issuer.
     *
     * @return ISS-NAME; {@code null} when it is not set
     */
    public String issuerName() {
        return value("ISS-NAME");
    }

    /**
     * Names the subject.
     *
     * @return SUB-NAME; {@code null} when it is not set
     */
    public String subjectName() {
        return value("SUB-NAME");
    }

    /**
     * Tells whose certificate it is.
     *
     * @return CERT-TYPE; {@code null} when it is not set
     */
    public String type() {
        return value("CERT-TYPE");
    }

    /**
     * Tells the serial number.
     *
     * @return SER-NUM; {@code null} when it is not set
     */
    public String serialNumber() {
        return value("SER-NUM");
    }

    /**
     * Tells the identifier of the key.
     *
     * @return SUB-KEY-ID; {@code null} when it is not set
     */
    public String subjectKeyId() {
        return value("SUB-KEY-ID");
    }

    /**
     * Tells the thumbprint.
     *
     * @return THUMBPRINT; {@code null} when it is not set
     */
    public String thumbprint() {
        return value("THUMBPRINT");
    }
}
