package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * How to authenticate towards an access point: a NAPAUTHINFO.
 *
 * <pre>{@code
 * for (AccessPointAuthentication way : message.accessPoints().get(0).authentications()) {
 *     System.out.println(way.type() + " as " + way.name());
 * }
 * }</pre>
 */
public final class AccessPointAuthentication extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "NAPAUTHINFO";

    AccessPointAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the scheme, such as {@code PAP} or {@code CHAP}.
     *
     * @return AUTHTYPE; {@code null} when it is not set
     */
    public String type() {
        return value("AUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AUTHNAME; {@code null} when it is not set
     */
    public String name() {
        return value("AUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AUTHSECRET; {@code null} when it is not set
     */
    public String secret() {
        return value("AUTHSECRET");
    }

    /**
     * Lists the entities that ask for the authentication, such as {@code AAA}.
     *
     * @return every AUTH-ENTITY, in the order of the message; not modifiable
     */
    public List<String> entities() {
        return values("AUTH-ENTITY");
    }

    /**
     * Tells the security parameter index of Mobile IP.
     *
     * @return SPI; {@code null} when it is not set
     */
    public String securityParameterIndex() {
        return value("SPI");
    }
}
