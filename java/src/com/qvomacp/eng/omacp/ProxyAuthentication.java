package com.qvomacp.eng.omacp;

/**
 * How to authenticate towards a proxy: a PXAUTHINFO.
 */
public final class ProxyAuthentication extends Characteristic {
    private static final String[] NAMES = {"PXAUTH-TYPE", "PXAUTH-ID", "PXAUTH-PW"};

    ProxyAuthentication(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells the scheme, such as {@code HTTP-BASIC}.
     *
     * @return PXAUTH-TYPE, or {@code null} when the message does not set it
     */
    public String getType() {
        return value("PXAUTH-TYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return PXAUTH-ID, or {@code null} when the message does not set it
     */
    public String getId() {
        return value("PXAUTH-ID");
    }

    /**
     * Tells the password.
     *
     * @return PXAUTH-PW, or {@code null} when the message does not set it
     */
    public String getPassword() {
        return value("PXAUTH-PW");
    }
}
