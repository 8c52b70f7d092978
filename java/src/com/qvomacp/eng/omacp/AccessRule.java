package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * Which traffic takes which way: an ACCESS of the message.
 */
public final class AccessRule extends Characteristic {
    private final List<String> rules;
    private final List<String> appIds;
    private final List<String> portNumbers;
    private final List<String> domains;
    private final List<String> toNapIds;
    private final List<String> toProxies;

    AccessRule(
            List<String> rules,
            List<String> appIds,
            List<String> portNumbers,
            List<String> domains,
            List<String> toNapIds,
            List<String> toProxies) {
        super(NONE, NONE, rules, appIds, portNumbers, domains, toNapIds, toProxies);
        this.rules = rules;
        this.appIds = appIds;
        this.portNumbers = portNumbers;
        this.domains = domains;
        this.toNapIds = toNapIds;
        this.toProxies = toProxies;
    }

    /**
     * Lists the rules.
     *
     * @return every RULE; not modifiable, empty when there is none
     */
    public List<String> getRules() {
        return rules;
    }

    /**
     * Lists the applications that the rule is about.
     *
     * @return every APPID; not modifiable, empty when there is none
     */
    public List<String> getAppIds() {
        return appIds;
    }

    /**
     * Lists the ports that the rule is about.
     *
     * @return every PORTNBR; not modifiable, empty when there is none
     */
    public List<String> getPortNumbers() {
        return portNumbers;
    }

    /**
     * Lists the domains that the rule is about.
     *
     * @return every DOMAIN; not modifiable, empty when there is none
     */
    public List<String> getDomains() {
        return domains;
    }

    /**
     * Lists the access points to take, by their names.
     *
     * @return every TO-NAPID; not modifiable, empty when there is none
     */
    public List<String> getToNapIds() {
        return toNapIds;
    }

    /**
     * Lists the proxies to take, by their names.
     *
     * @return every TO-PROXY; not modifiable, empty when there is none
     */
    public List<String> getToProxies() {
        return toProxies;
    }
}
