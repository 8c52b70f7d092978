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
    PhysicalProxy(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return PHYSICAL-PROXY-ID: the name of the machine} */
    public String physicalProxyId() {
        return value("PHYSICAL-PROXY-ID");
    }

    /** {@return every DOMAIN: the domains that are reached through the machine} */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /** {@return PXADDR: the address} */
    public String address() {
        return value("PXADDR");
    }

    /** {@return PXADDRTYPE: what kind of address {@link #address} is} */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /** {@return PXADDRTYPE as the message says it} */
    public String addressTypeText() {
        return value("PXADDRTYPE");
    }

    /** {@return PXADDR-FQDN: the full domain name} */
    public String hostName() {
        return value("PXADDR-FQDN");
    }

    /** {@return WSP-VERSION: the version of WSP that the machine speaks} */
    public String wspVersion() {
        return value("WSP-VERSION");
    }

    /** {@return PUSHENABLED: whether the machine supports push: {@code 1} when it does} */
    public String pushEnabled() {
        return value("PUSHENABLED");
    }

    /** {@return PULLENABLED: whether the machine supports pull: {@code 1} when it does} */
    public String pullEnabled() {
        return value("PULLENABLED");
    }

    /** {@return every TO-NAPID: the names of the access points that lead to the machine} */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /** {@return every PORT: the ports of the machine} */
    public List<Port> ports() {
        return views(Port.class, Kind.PORT);
    }
}
