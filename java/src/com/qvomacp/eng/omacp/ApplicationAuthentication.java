package com.qvomacp.eng.omacp;

/**
 * How application and service authenticate themselves: an APPAUTH.
 *
 * <pre>{@code
 * for (ApplicationAuthentication way : message.applications().get(0).authentications()) {
 *     System.out.println(way.level() + ": " + way.type() + " as " + way.name());
 * }
 * }</pre>
 */
public final class ApplicationAuthentication extends TypedCharacteristic {
    ApplicationAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return AAUTHLEVEL: who authenticates itself, such as {@code APPSRV} or {@code CLIENT}} */
    public String level() {
        return value("AAUTHLEVEL");
    }

    /** {@return AAUTHTYPE: the scheme, such as {@code HTTP-BASIC}} */
    public String type() {
        return value("AAUTHTYPE");
    }

    /** {@return AAUTHNAME: the name of the user} */
    public String name() {
        return value("AAUTHNAME");
    }

    /** {@return AAUTHSECRET: the password} */
    public String secret() {
        return value("AAUTHSECRET");
    }

    /** {@return AAUTHDATA: what else the scheme needs, such as a nonce} */
    public String data() {
        return value("AAUTHDATA");
    }
}
