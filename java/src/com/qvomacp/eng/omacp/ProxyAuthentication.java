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
    ProxyAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return PXAUTH-TYPE: the scheme, such as {@code HTTP-BASIC}} */
    public String type() {
        return value("PXAUTH-TYPE");
    }

    /** {@return PXAUTH-ID: the name of the user} */
    public String id() {
        return value("PXAUTH-ID");
    }

    /** {@return PXAUTH-PW: the password} */
    public String password() {
        return value("PXAUTH-PW");
    }
}
