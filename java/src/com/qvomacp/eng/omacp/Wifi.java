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
    /** The type of such a characteristic. */
    static final String TYPE = "WI-FI";

    Wifi(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the network.
     *
     * @return NETSSID; {@code null} when it is not set
     */
    public String ssid() {
        return value("NETSSID");
    }

    /**
     * Tells how the network is secured.
     *
     * @return SECMODE; {@code null} when it is not set
     */
    public String securityMode() {
        return value("SECMODE");
    }

    /**
     * Tells the method of EAP.
     *
     * @return EAPMETHOD; {@code null} when it is not set
     */
    public String eapMethod() {
        return value("EAPMETHOD");
    }

    /**
     * Tells the type of EAP.
     *
     * @return EAPTYPE; {@code null} when it is not set
     */
    public String eapType() {
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
     * Tells the name that is sent unprotected.
     *
     * @return ANONUSERNAME; {@code null} when it is not set
     */
    public String anonymousUserName() {
        return value("ANONUSERNAME");
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
     * Tells the certificate of the authority.
     *
     * @return CACERT; {@code null} when it is not set
     */
    public String caCertificate() {
        return value("CACERT");
    }

    /**
     * Tells the certificate of the user.
     *
     * @return USERCERT; {@code null} when it is not set
     */
    public String userCertificate() {
        return value("USERCERT");
    }

    /**
     * Tells the parameters of the first phase.
     *
     * @return PHASE1; {@code null} when it is not set
     */
    public String phase1() {
        return value("PHASE1");
    }

    /**
     * Tells the algorithm of the authentication.
     *
     * @return AUTHALGORITHM; {@code null} when it is not set
     */
    public String authenticationAlgorithm() {
        return value("AUTHALGORITHM");
    }

    /**
     * Tells the priority among the networks.
     *
     * @return PRIORITY; {@code null} when it is not set
     */
    public String priority() {
        return value("PRIORITY");
    }
}
