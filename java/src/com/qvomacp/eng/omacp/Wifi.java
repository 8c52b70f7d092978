package com.qvomacp.eng.omacp;

/**
 * A Wi-Fi network: a WI-FI.
 *
 * <pre>{@code
 * for (Wifi wifi : message.wifis()) {
 *     System.out.println(wifi.ssid() + ": " + wifi.securityMode());
 * }
 * }</pre>
 */
public final class Wifi extends TypedCharacteristic {
    Wifi(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return NETSSID: the name of the network} */
    public String ssid() {
        return value("NETSSID");
    }

    /** {@return SECMODE: how the network is secured} */
    public String securityMode() {
        return value("SECMODE");
    }

    /** {@return EAPMETHOD: the method of EAP} */
    public String eapMethod() {
        return value("EAPMETHOD");
    }

    /** {@return EAPTYPE: the type of EAP} */
    public String eapType() {
        return value("EAPTYPE");
    }

    /** {@return USERNAME: the name of the user} */
    public String userName() {
        return value("USERNAME");
    }

    /** {@return ANONUSERNAME: the name that is sent unprotected} */
    public String anonymousUserName() {
        return value("ANONUSERNAME");
    }

    /** {@return PASSWORD: the password} */
    public String password() {
        return value("PASSWORD");
    }

    /** {@return CACERT: the certificate of the authority} */
    public String caCertificate() {
        return value("CACERT");
    }

    /** {@return USERCERT: the certificate of the user} */
    public String userCertificate() {
        return value("USERCERT");
    }

    /** {@return PHASE1: the parameters of the first phase} */
    public String phase1() {
        return value("PHASE1");
    }

    /** {@return AUTHALGORITHM: the algorithm of the authentication} */
    public String authenticationAlgorithm() {
        return value("AUTHALGORITHM");
    }

    /** {@return PRIORITY: the priority among the networks} */
    public String priority() {
        return value("PRIORITY");
    }
}
