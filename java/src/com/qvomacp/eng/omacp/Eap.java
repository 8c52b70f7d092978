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
    Eap(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return EAPTYPE: the type of EAP} */
    public String type() {
        return value("EAPTYPE");
    }

    /** {@return USERNAME: the name of the user} */
    public String userName() {
        return value("USERNAME");
    }

    /** {@return PASSWORD: the password} */
    public String password() {
        return value("PASSWORD");
    }

    /** {@return REALM: the realm of the user} */
    public String realm() {
        return value("REALM");
    }

    /** {@return USE-PSEUD: whether pseudonyms are used} */
    public String usePseudonym() {
        return value("USE-PSEUD");
    }

    /** {@return VER-SER-REALM: whether the realm of the server is verified} */
    public String verifyServerRealm() {
        return value("VER-SER-REALM");
    }

    /** {@return CLIENT-AUTH: whether the client authenticates itself} */
    public String clientAuthentication() {
        return value("CLIENT-AUTH");
    }

    /** {@return SES-VAL-TIME: how long a session holds} */
    public String sessionValidityTime() {
        return value("SES-VAL-TIME");
    }

    /** {@return CIP-SUIT: the cipher suites} */
    public String cipherSuites() {
        return value("CIP-SUIT");
    }

    /** {@return PEAP-V0: whether version 0 of PEAP may be used} */
    public String peapVersion0() {
        return value("PEAP-V0");
    }

    /** {@return PEAP-V1: whether version 1 of PEAP may be used} */
    public String peapVersion1() {
        return value("PEAP-V1");
    }

    /** {@return PEAP-V2: whether version 2 of PEAP may be used} */
    public String peapVersion2() {
        return value("PEAP-V2");
    }

    /** {@return every CERT: the certificates} */
    public List<EapCertificate> certificates() {
        return views(EapCertificate.class, "CERT");
    }
}
