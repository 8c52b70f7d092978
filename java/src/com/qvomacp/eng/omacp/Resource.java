package com.qvomacp.eng.omacp;

/**
 * A resource of a service: a RESOURCE.
 */
public final class Resource extends Characteristic {
    private static final String[] NAMES = {
        "URI",
        "NAME",
        "AACCEPT",
        "AAUTHTYPE",
        "AAUTHNAME",
        "AAUTHSECRET",
        "AAUTHDATA",
        "STARTPAGE",
    };

    Resource(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells the address of the resource.
     *
     * @return URI, or {@code null} when the message does not set it
     */
    public String getUri() {
        return value("URI");
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("NAME");
    }

    /**
     * Lists the content types of the resource.
     *
     * @return AACCEPT, or {@code null} when the message does not set it
     */
    public String getAccept() {
        return value("AACCEPT");
    }

    /**
     * Tells the authentication scheme.
     *
     * @return AAUTHTYPE, or {@code null} when the message does not set it
     */
    public String getAuthenticationType() {
        return value("AAUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AAUTHNAME, or {@code null} when the message does not set it
     */
    public String getAuthenticationName() {
        return value("AAUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AAUTHSECRET, or {@code null} when the message does not set it
     */
    public String getAuthenticationSecret() {
        return value("AAUTHSECRET");
    }

    /**
     * Tells what else the scheme needs.
     *
     * @return AAUTHDATA, or {@code null} when the message does not set it
     */
    public String getAuthenticationData() {
        return value("AAUTHDATA");
    }

    /**
     * Tells whether this is the resource to begin with.
     *
     * @return STARTPAGE, which is {@code startpage} when the message gives it without a value;
     *     {@code null} when the message does not set it
     */
    public String getStartPage() {
        return value("STARTPAGE");
    }
}
