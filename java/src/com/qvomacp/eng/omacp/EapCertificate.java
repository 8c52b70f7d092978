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
    EapCertificate(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return ISS-NAME: the name of the issuer} */
    public String issuerName() {
        return value("ISS-NAME");
    }

    /** {@return SUB-NAME: the name of the subject} */
    public String subjectName() {
        return value("SUB-NAME");
    }

    /** {@return CERT-TYPE: whose certificate it is} */
    public String type() {
        return value("CERT-TYPE");
    }

    /** {@return SER-NUM: the serial number} */
    public String serialNumber() {
        return value("SER-NUM");
    }

    /** {@return SUB-KEY-ID: the identifier of the key} */
    public String subjectKeyId() {
        return value("SUB-KEY-ID");
    }

    /** {@return THUMBPRINT: the thumbprint} */
    public String thumbprint() {
        return value("THUMBPRINT");
    }
}
