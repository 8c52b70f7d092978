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
    AccessRule(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return every RULE: the rules} */
    public List<String> rules() {
        return values("RULE");
    }

    /** {@return every APPID: the applications that the rule is about} */
    public List<String> appIds() {
        return values("APPID");
    }

    /** {@return every PORTNBR: the ports that the rule is about} */
    public List<String> portNumbers() {
        return values("PORTNBR");
    }

    /** {@return every DOMAIN: the domains that the rule is about} */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /** {@return every TO-NAPID: the access points to take, by their names} */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /** {@return every TO-PROXY: the proxies to take, by their names} */
    public List<String> toProxies() {
        return values("TO-PROXY");
    }
}
