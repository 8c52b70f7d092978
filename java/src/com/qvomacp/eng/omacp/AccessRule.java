package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * Which traffic takes which way: an ACCESS.
 *
 * <pre>{@code
 * for (AccessRule rule : message.accessRules()) {
 *     System.out.println(rule.appIds() + " by " + rule.toNapIds());
 * }
 * }</pre>
 */
public final class AccessRule extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "ACCESS";

    AccessRule(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Lists the rules.
     *
     * @return every RULE, in the order of the message; not modifiable
     */
    public List<String> rules() {
        return values("RULE");
    }

    /**
     * Lists the applications that the rule is about.
     *
     * @return every APPID, in the order of the message; not modifiable
     */
    public List<String> appIds() {
        return values("APPID");
    }

    /**
     * Lists the ports that the rule is about.
     *
     * @return every PORTNBR, in the order of the message; not modifiable
     */
    public List<String> portNumbers() {
        return values("PORTNBR");
    }

    /**
     * Lists the domains that the rule is about.
     *
     * @return every DOMAIN, in the order of the message; not modifiable
     */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /**
     * Lists the access points to take, by their names.
     *
     * @return every TO-NAPID, in the order of the message; not modifiable
     */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /**
     * Lists the proxies to take, by their names.
     *
     * @return every TO-PROXY, in the order of the message; not modifiable
     */
    public List<String> toProxies() {
        return values("TO-PROXY");
    }
}
