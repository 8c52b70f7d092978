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
    Resource(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return URI: the address of the resource} */
    public String uri() {
        return value("URI");
    }

    /** {@return NAME: the name to show to the user} */
    public String name() {
        return value("NAME");
    }

    /** {@return AACCEPT: the content types of the resource, with commas between them} */
    public String accept() {
        return value("AACCEPT");
    }

    /** {@return AAUTHTYPE: the authentication scheme} */
    public String authenticationType() {
        return value("AAUTHTYPE");
    }

    /** {@return AAUTHNAME: the name of the user} */
    public String authenticationName() {
        return value("AAUTHNAME");
    }

    /** {@return AAUTHSECRET: the password} */
    public String authenticationSecret() {
        return value("AAUTHSECRET");
    }

    /** {@return AAUTHDATA: what else the scheme needs} */
    public String authenticationData() {
        return value("AAUTHDATA");
    }

    /** {@return whether STARTPAGE stands here: by the standard, this is where to begin} */
    public boolean hasStartPage() {
        return has("STARTPAGE");
    }
}
