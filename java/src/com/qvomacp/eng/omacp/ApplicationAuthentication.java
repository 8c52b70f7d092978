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
    /** The type of such a characteristic. */
    static final String TYPE = "APPAUTH";

    ApplicationAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells who authenticates itself, such as {@code APPSRV}, {@code CLIENT} or {@code OBEX}.
     *
     * @return AAUTHLEVEL; {@code null} when it is not set
     */
    public String level() {
        return value("AAUTHLEVEL");
    }

    /**
     * Tells the scheme, such as {@code HTTP-BASIC}.
     *
     * @return AAUTHTYPE; {@code null} when it is not set
     */
    public String type() {
        return value("AAUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AAUTHNAME; {@code null} when it is not set
     */
    public String name() {
        return value("AAUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AAUTHSECRET; {@code null} when it is not set
     */
    public String secret() {
        return value("AAUTHSECRET");
    }

    /**
     * Tells what else the scheme needs, such as a nonce.
     *
     * @return AAUTHDATA; {@code null} when it is not set
     */
    public String data() {
        return value("AAUTHDATA");
    }
}
