package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A machine of a proxy: a PXPHYSICAL.
 *
 * <pre>{@code
 * for (PhysicalProxy machine : message.proxies().get(0).physicalProxies()) {
 *     System.out.println(machine.address() + " is of type " + machine.addressTypeText());
 * }
 * }</pre>
 */
public final class PhysicalProxy extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "PXPHYSICAL";

    PhysicalProxy(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the machine.
     *
     * @return PHYSICAL-PROXY-ID; {@code null} when it is not set
     */
    public String physicalProxyId() {
        return value("PHYSICAL-PROXY-ID");
    }

    /**
     * Lists the domains that are reached through the machine.
     *
     * @return every DOMAIN, in the order of the message; not modifiable
     */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /**
     * Tells the address.
     *
     * @return PXADDR; {@code null} when it is not set
     */
    public String address() {
        return value("PXADDR");
    }

    /**
     * Tells what kind of address {@link #address} is.
     *
     * @return PXADDRTYPE, {@link AddressType#UNKNOWN} for a text that is none of the kinds; {@code
     *     null} when it is not set
     */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /**
     * Tells what kind of address {@link #address} is, as the message says it.
     *
     * @return PXADDRTYPE; {@code null} when it is not set
     */
    public String addressTypeText() {
        return value("PXADDRTYPE");
    }

    /**
     * Tells the full domain name.
     *
     * @return PXADDR-FQDN; {@code null} when it is not set
     */
    public String hostName() {
        return value("PXADDR-FQDN");
    }

    /**
     * Tells the version of WSP that the machine speaks.
     *
     * @return WSP-VERSION; {@code null} when it is not set
     */
    public String wspVersion() {
        return value("WSP-VERSION");
    }

    /**
     * Tells whether the machine supports push: {@code 1} when it does.
     *
     * @return PUSHENABLED; {@code null} when it is not set
     */
    public String pushEnabled() {
        return value("PUSHENABLED");
    }

    /**
     * Tells whether the machine supports pull: {@code 1} when it does.
     *
     * @return PULLENABLED; {@code null} when it is not set
     */
    public String pullEnabled() {
        return value("PULLENABLED");
    }

    /**
     * Lists the access points through which the machine is reached, by their names.
     *
     * @return every TO-NAPID, in the order of the message; not modifiable
     */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /**
     * Lists the ports of the machine.
     *
     * @return every PORT that stands directly in this characteristic, in its order; not modifiable
     */
    public List<Port> ports() {
        return views(Port.TYPE, Port::new);
    }
}
