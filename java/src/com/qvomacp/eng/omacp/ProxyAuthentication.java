package com.qvomacp.eng.omacp;

/**
 * How to authenticate towards a proxy: a PXAUTHINFO.
 *
 * <pre>{@code
 * for (ProxyAuthentication way : message.proxies().get(0).authentications()) {
 *     System.out.println(way.type() + " as " + way.id());
 * }
 * }</pre>
 */
public final class ProxyAuthentication extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "PXAUTHINFO";

    ProxyAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the scheme, such as {@code HTTP-BASIC}.
     *
     * @return PXAUTH-TYPE; {@code null} when it is not set
     */
    public String type() {
        return value("PXAUTH-TYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return PXAUTH-ID; {@code null} when it is not set
     */
    public String id() {
        return value("PXAUTH-ID");
    }

    /**
     * Tells the password.
     *
     * @return PXAUTH-PW; {@code null} when it is not set
     */
    public String password() {
        return value("PXAUTH-PW");
    }
}
