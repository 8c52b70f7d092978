package com.qvomacp.eng.omacp;

/**
 * How an application or its service authenticates itself: an APPAUTH.
 */
public final class ApplicationAuthentication extends Characteristic {
    private static final String[] NAMES = {
        "AAUTHLEVEL",
        "AAUTHTYPE",
        "AAUTHNAME",
        "AAUTHSECRET",
        "AAUTHDATA",
    };

    ApplicationAuthentication(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells who authenticates itself.
     *
     * @return AAUTHLEVEL: {@code APPSRV} or {@code CLIENT}; {@code null} when the message does not
     *     set it, gives another value, or gives CLIENT as a token
     */
    public String getLevel() {
        return value("AAUTHLEVEL");
    }

    /**
     * Tells the scheme, such as {@code HTTP-BASIC}.
     *
     * @return AAUTHTYPE, or {@code null} when the message does not set it
     */
    public String getType() {
        return value("AAUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AAUTHNAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("AAUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AAUTHSECRET, or {@code null} when the message does not set it
     */
    public String getSecret() {
        return value("AAUTHSECRET");
    }

    /**
     * Tells what else the scheme needs, such as a nonce.
     *
     * @return AAUTHDATA, or {@code null} when the message does not set it
     */
    public String getData() {
        return value("AAUTHDATA");
    }
}
