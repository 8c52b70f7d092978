package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * An address of a service: an APPADDR.
 *
 * <pre>{@code
 * for (ApplicationAddress address : message.applications().get(0).addresses()) {
 *     System.out.println(address.address() + " " + address.ports());
 * }
 * }</pre>
 */
public final class ApplicationAddress extends TypedCharacteristic {
    ApplicationAddress(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return ADDR: the address} */
    public String address() {
        return value("ADDR");
    }

    /** {@return ADDRTYPE: what kind of address {@link #address} is} */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /** {@return ADDRTYPE as the message says it} */
    public String addressTypeText() {
        return value("ADDRTYPE");
    }

    /** {@return every PORT: the ports of the service at this address} */
    public List<Port> ports() {
        return views(Port.class, Kind.PORT);
    }
}
