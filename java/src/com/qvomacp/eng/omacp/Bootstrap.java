package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * Where further provisioning comes from: a BOOTSTRAP of the message.
 */
public final class Bootstrap extends Characteristic {
    private static final String[] NAMES = {"NAME", "COUNTRY", "PROVURL", "CONTEXT-ALLOW"};

    private final List<String> proxyIds;
    private final List<String> networks;

    Bootstrap(String[] values, List<String> proxyIds, List<String> networks) {
        super(NAMES, values, proxyIds, networks);
        this.proxyIds = proxyIds;
        this.networks = networks;
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
     * Tells the mobile country code.
     *
     * @return COUNTRY, or {@code null} when the message does not set it
     */
    public String getCountry() {
        return value("COUNTRY");
    }

    /**
     * Names the trusted provisioning server.
     *
     * @return PROVURL, or {@code null} when the message does not set it
     */
    public String getProvisioningUrl() {
        return value("PROVURL");
    }

    /**
     * Tells how many further contexts the server may make.
     *
     * @return CONTEXT-ALLOW, or {@code null} when the message does not set it
     */
    public String getContextAllow() {
        return value("CONTEXT-ALLOW");
    }

    /**
     * Lists the proxies that may provision, by their names.
     *
     * @return every PROXY-ID; not modifiable, empty when there is none
     */
    public List<String> getProxyIds() {
        return proxyIds;
    }

    /**
     * Lists the networks for which this holds.
     *
     * @return every NETWORK; not modifiable, empty when there is none
     */
    public List<String> getNetworks() {
        return networks;
    }
}
