package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A proxy: a PXLOGICAL of the message.
 */
public final class Proxy extends Characteristic {
    private static final String[] NAMES = {
        "PROXY-ID",
        "PROXY-PW",
        "PPGAUTH-TYPE",
        "PROXY-PROVIDER-ID",
        "NAME",
        "TRUST",
        "MASTER",
        "STARTPAGE",
    };

    private final List<String> domains;
    private final List<ProxyAuthentication> authentications;
    private final List<ProxyPort> ports;
    private final List<PhysicalProxy> physicalProxies;

    Proxy(
            String[] values,
            List<String> domains,
            List<ProxyAuthentication> authentications,
            List<ProxyPort> ports,
            List<PhysicalProxy> physicalProxies) {
        super(NAMES, values, domains, authentications, ports, physicalProxies);
        this.domains = domains;
        this.authentications = authentications;
        this.ports = ports;
        this.physicalProxies = physicalProxies;
    }

    /**
     * Names the proxy; an application refers to it by this name.
     *
     * @return PROXY-ID, or {@code null} when the message does not set it
     */
    public String getProxyId() {
        return value("PROXY-ID");
    }

    /**
     * Tells the password with which the proxy authenticates itself.
     *
     * @return PROXY-PW, or {@code null} when the message does not set it
     */
    public String getPassword() {
        return value("PROXY-PW");
    }

    /**
     * Tells how the push proxy gateway authenticates itself.
     *
     * @return PPGAUTH-TYPE, or {@code null} when the message does not set it
     */
    public String getPushAuthenticationType() {
        return value("PPGAUTH-TYPE");
    }

    /**
     * Names the provider of the proxy.
     *
     * @return PROXY-PROVIDER-ID, or {@code null} when the message does not set it
     */
    public String getProviderId() {
        return value("PROXY-PROVIDER-ID");
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("NAME");
    }

    /**
     * Tells whether the proxy is trusted to provision.
     *
     * @return TRUST, or {@code null} when the message does not set it
     */
    public String getTrust() {
        return value("TRUST");
    }

    /**
     * Tells whether the proxy is the master of its navigation domain.
     *
     * @return MASTER, or {@code null} when the message does not set it
     */
    public String getMaster() {
        return value("MASTER");
    }

    /**
     * Tells the address of the page to begin with.
     *
     * @return STARTPAGE, or {@code null} when the message does not set it
     */
    public String getStartPage() {
        return value("STARTPAGE");
    }

    /**
     * Lists the domains that are reached through the proxy.
     *
     * @return every DOMAIN; not modifiable, empty when there is none
     */
    public List<String> getDomains() {
        return domains;
    }

    /**
     * Lists how to authenticate towards the proxy.
     *
     * @return every PXAUTHINFO; not modifiable, empty when there is none
     */
    public List<ProxyAuthentication> getAuthentications() {
        return authentications;
    }

    /**
     * Lists the ports that hold for every physical proxy without ports of its own.
     *
     * @return every PORT directly in the PXLOGICAL; not modifiable, empty when there is none
     */
    public List<ProxyPort> getPorts() {
        return ports;
    }

    /**
     * Lists the machines behind the proxy.
     *
     * @return every PXPHYSICAL; not modifiable, empty when there is none
     */
    public List<PhysicalProxy> getPhysicalProxies() {
        return physicalProxies;
    }
}
