package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * How to authenticate towards an access point: a NAPAUTHINFO.
 */
public final class AccessPointAuthentication extends Characteristic {
    private static final String[] NAMES = {"AUTHTYPE", "AUTHNAME", "AUTHSECRET"};

    private final List<String> entities;

    AccessPointAuthentication(String[] values, List<String> entities) {
        super(NAMES, values, entities);
        this.entities = entities;
    }

    /**
     * Tells the scheme.
     *
     * @return AUTHTYPE: {@code PAP}, {@code CHAP}, {@code HTTP-BASIC}, {@code HTTP-DIGEST}, {@code
     *     WTLS-SS} or {@code MD5}; {@code NONE} for any other value; {@code null} when the message
     *     does not set it
     */
    public String getType() {
        return value("AUTHTYPE");
    }

    /**
     * Tells the name of the user.
     *
     * @return AUTHNAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("AUTHNAME");
    }

    /**
     * Tells the password.
     *
     * @return AUTHSECRET, or {@code null} when the message does not set it
     */
    public String getSecret() {
        return value("AUTHSECRET");
    }

    /**
     * Lists the entities that ask for the authentication, such as {@code AAA}.
     *
     * @return every AUTH-ENTITY; not modifiable, empty when there is none
     */
    public List<String> getEntities() {
        return entities;
    }
}
