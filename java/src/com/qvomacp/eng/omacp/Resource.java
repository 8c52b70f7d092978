package com.qvomacp.eng.omacp;

/**
 * A resource of a service: a RESOURCE.
 *
 * <pre>{@code
 * for (Resource resource : message.applications().get(0).resources()) {
 *     System.out.println(resource.uri() + (resource.hasStartPage() ? ", to begin with" : ""));
 * }
 * }</pre>
 */
public final class Resource extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "RESOURCE";

    Resource(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the address of the resource.
     *
     * @return URI; {@code null} when it is not set
     */
    public String uri() {
        return value("URI");
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME; {@code null} when it is not set
     */
    public String name() {
        return value("NAME");
    }

    /**
     * Tells the content types of the resource, with commas between them.
     *
     * @return AACCEPT; {@code null} when it is not set
     */
    public String accept() {
        return value("AACCEPT");
    }

    /**
     * Tells the authentication scheme.
     *
     * @return AAUTHTYPE; {@code null} when it is not set
     */
    public String authenticationType() {
        return value("AAUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AAUTHNAME; {@code null} when it is not set
     */
    public String authenticationName() {
        return value("AAUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AAUTHSECRET; {@code null} when it is not set
     */
    public String authenticationSecret() {
        return value("AAUTHSECRET");
    }

    /**
     * Tells what else the scheme needs.
     *
     * @return AAUTHDATA; {@code null} when it is not set
     */
    public String authenticationData() {
        return value("AAUTHDATA");
    }

    /**
     * Tells whether STARTPAGE stands here, with or without a value: by the standard, whether this
     * is the resource to begin with.
     *
     * @return true when it does
     */
    public boolean hasStartPage() {
        return has("STARTPAGE");
    }

    /**
     * Tells the value of STARTPAGE, which by the standard has none.
     *
     * @return STARTPAGE; {@code null} when it has no value, and when it is not set
     */
    public String startPage() {
        return value("STARTPAGE");
    }
}
