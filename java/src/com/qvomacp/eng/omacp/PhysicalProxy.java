package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A machine of a proxy: a PXPHYSICAL.
 */
public final class PhysicalProxy extends Characteristic {
    private static final String[] NAMES = {
        "PHYSICAL-PROXY-ID",
        "PXADDR",
        "PXADDRTYPE",
        "PXADDR-FQDN",
        "WSP-VERSION",
        "PUSHENABLED",
        "PULLENABLED",
    };

    private final List<String> domains;
    private final List<String> toNapIds;
    private final List<ProxyPort> ports;

    PhysicalProxy(
            String[] values,
            List<String> domains,
            List<String> toNapIds,
            List<ProxyPort> ports) {
        super(NAMES, values, domains, toNapIds, ports);
        this.domains = domains;
        this.toNapIds = toNapIds;
        this.ports = ports;
    }

    /**
     * Names the machine.
     *
     * @return PHYSICAL-PROXY-ID, or {@code null} when the message does not set it
     */
    public String getPhysicalProxyId() {
        return value("PHYSICAL-PROXY-ID");
    }

    /**
     * Tells the address.
     *
     * @return PXADDR, or {@code null} when the message does not set it
     */
    public String getAddress() {
        return value("PXADDR");
    }

    /**
     * Tells the full domain name.
     *
     * @return PXADDR-FQDN, or {@code null} when the message does not set it
     */
    public String getHostName() {
        return value("PXADDR-FQDN");
    }

    /**
     * Tells the version of WSP that the proxy speaks.
     *
     * @return WSP-VERSION, or {@code null} when the message does not set it
     */
    public String getWspVersion() {
        return value("WSP-VERSION");
    }

    /**
     * Tells whether the proxy supports push.
     *
     * @return PUSHENABLED, or {@code null} when the message does not set it
     */
    public String getPushEnabled() {
        return value("PUSHENABLED");
    }

    /**
     * Tells whether the proxy supports pull.
     *
     * @return PULLENABLED, or {@code null} when the message does not set it
     */
    public String getPullEnabled() {
        return value("PULLENABLED");
    }

    /**
     * Lists the domains that are reached through the machine.
     *
     * @return every DOMAIN; not modifiable, empty when there is none
     */
    public List<String> getDomains() {
        return domains;
    }

    /**
     * Lists the access points through which the machine is reached, by their names.
     *
     * @return every TO-NAPID; not modifiable, empty when there is none
     */
    public List<String> getToNapIds() {
        return toNapIds;
    }

    /**
     * Lists the ports of the machine.
     *
     * @return every PORT in the PXPHYSICAL; not modifiable, empty when there is none
     */
    public List<ProxyPort> getPorts() {
        return ports;
    }

    /**
     * Tells what kind of address {@link #getAddress} is.
     *
     * <p>The library knows two kinds: a type that is not IPV6, whichever it is, is taken for IPV4.
     *
     * @return the kind, or {@code null} when the message does not set PXADDRTYPE
     */
    public ProxyAddressType getAddressType() {
        return ProxyAddressType.answered(value("PXADDRTYPE"));
    }
}
