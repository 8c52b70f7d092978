package com.qvomacp.eng.omacp;

/**
 * A Wi-Fi network: a WI-FI of the message.
 */
public final class Wifi extends Characteristic {
    private static final String[] NAMES = {
        "NETSSID",
        "SECMODE",
        "EAPMETHOD",
        "EAPTYPE",
        "USERNAME",
        "ANONUSERNAME",
        "PASSWORD",
        "CACERT",
        "USERCERT",
        "PHASE1",
        "AUTHALGORITHM",
        "PRIORITY",
    };

    Wifi(String[] values) {
        super(NAMES, values);
    }

    /**
     * Names the network.
     *
     * @return NETSSID, or {@code null} when the message does not set it
     */
    public String getSsid() {
        return value("NETSSID");
    }

    /**
     * Tells how the network is secured.
     *
     * @return SECMODE, or {@code null} when the message does not set it
     */
    public String getSecurityMode() {
        return value("SECMODE");
    }

    /**
     * Tells the method of EAP.
     *
     * @return EAPMETHOD, or {@code null} when the message does not set it
     */
    public String getEapMethod() {
        return value("EAPMETHOD");
    }

    /**
     * Tells the type of EAP.
     *
     * @return EAPTYPE, or {@code null} when the message does not set it
     */
    public String getEapType() {
        return value("EAPTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return USERNAME, or {@code null} when the message does not set it
     */
    public String getUserName() {
        return value("USERNAME");
    }

    /**
     * Tells the name that is sent unprotected.
     *
     * @return ANONUSERNAME, or {@code null} when the message does not set it
     */
    public String getAnonymousUserName() {
        return value("ANONUSERNAME");
    }

    /**
     * Tells the password.
     *
     * @return PASSWORD, or {@code null} when the message does not set it
     */
    public String getPassword() {
        return value("PASSWORD");
    }

    /**
     * Tells the certificate of the authority.
     *
     * @return CACERT, or {@code null} when the message does not set it
     */
    public String getCaCertificate() {
        return value("CACERT");
    }

    /**
     * Tells the certificate of the user.
     *
     * @return USERCERT, or {@code null} when the message does not set it
     */
    public String getUserCertificate() {
        return value("USERCERT");
    }

    /**
     * Tells the parameters of the first phase.
     *
     * @return PHASE1, or {@code null} when the message does not set it
     */
    public String getPhase1() {
        return value("PHASE1");
    }

    /**
     * Tells the algorithm of the authentication.
     *
     * @return AUTHALGORITHM, or {@code null} when the message does not set it
     */
    public String getAuthenticationAlgorithm() {
        return value("AUTHALGORITHM");
    }

    /**
     * Tells the priority among the networks.
     *
     * @return PRIORITY, or {@code null} when the message does not set it
     */
    public String getPriority() {
        return value("PRIORITY");
    }
}
