package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * How to authenticate towards a wireless network by EAP: an EAP.
 *
 * <pre>{@code
 * for (Eap eap : message.accessPoints().get(0).wlans().get(0).eaps()) {
 *     System.out.println(eap.type() + " as " + eap.userName());
 * }
 * }</pre>
 */
public final class Eap extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "EAP";

    Eap(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the type of EAP.
     *
     * @return EAPTYPE; {@code null} when it is not set
     */
    public String type() {
        return value("EAPTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return USERNAME; {@code null} when it is not set
     */
    public String userName() {
        return value("USERNAME");
    }

    /**
     * Tells the password.
     *
     * @return PASSWORD; {@code null} when it is not set
     */
    public String password() {
        return value("PASSWORD");
    }

    /**
     * Tells the realm of the user.
     *
     * @return REALM; {@code null} when it is not set
     */
    public String realm() {
        return value("REALM");
    }

    /**
     * Tells whether pseudonyms are used.
     *
     * @return USE-PSEUD; {@code null} when it is not set
     */
    public String usePseudonym() {
        return value("USE-PSEUD");
    }

    /**
     * Tells whether the realm of the server is verified.
     *
     * @return VER-SER-REALM; {@code null} when it is not set
     */
    public String verifyServerRealm() {
        return value("VER-SER-REALM");
    }

    /**
     * Tells whether the client authenticates itself.
     *
     * @return CLIENT-AUTH; {@code null} when it is not set
     */
    public String clientAuthentication() {
        return value("CLIENT-AUTH");
    }

    /**
     * Tells how long a session holds.
     *
     * @return SES-VAL-TIME; {@code null} when it is not set
     */
    public String sessionValidityTime() {
        return value("SES-VAL-TIME");
    }

    /**
     * Tells the cipher suites.
     *
     * @return CIP-SUIT; {@code null} when it is not set
     */
    public String cipherSuites() {
        return value("CIP-SUIT");
    }

    /**
     * Tells whether version 0 of PEAP may be used.
     *
     * @return PEAP-V0; {@code null} when it is not set
     */
    public String peapVersion0() {
        return value("PEAP-V0");
    }

    /**
     * Tells whether version 1 of PEAP may be used.
     *
     * @return PEAP-V1; {@code null} when it is not set
     */
    public String peapVersion1() {
        return value("PEAP-V1");
    }

    /**
     * Tells whether version 2 of PEAP may be used.
     *
     * @return PEAP-V2; {@code null} when it is not set
     */
    public String peapVersion2() {
        return value("PEAP-V2");
    }

    /**
     * Lists the certificates.
     *
     * @return every CERT that stands directly in this characteristic, in its order; not modifiable
     */
    public List<EapCertificate> certificates() {
        return views(EapCertificate.TYPE, EapCertificate::new);
    }
}
