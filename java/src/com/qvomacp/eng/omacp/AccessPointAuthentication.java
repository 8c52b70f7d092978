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
    AccessPointAuthentication(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return AUTHTYPE: the scheme, such as {@code PAP} or {@code CHAP}} */
    public String type() {
        return value("AUTHTYPE");
    }

    /** {@return AUTHNAME: the name of the user} */
    public String name() {
        return value("AUTHNAME");
    }

    /** {@return AUTHSECRET: the password} */
    public String secret() {
        return value("AUTHSECRET");
    }

    /** {@return every AUTH-ENTITY: who asks for the authentication, such as {@code AAA}} */
    public List<String> entities() {
        return values("AUTH-ENTITY");
    }
}
