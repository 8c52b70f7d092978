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
    /** The type of such a characteristic. */
    static final String TYPE = "APPADDR";

    ApplicationAddress(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the address.
     *
     * @return ADDR; {@code null} when it is not set
     */
    public String address() {
        return value("ADDR");
    }

    /**
     * Tells what kind of address {@link #address} is.
     *
     * @return ADDRTYPE, {@link AddressType#UNKNOWN} for a text that is none of the kinds; {@code
     *     null} when it is not set
     */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /**
     * Tells what kind of address {@link #address} is, as the message says it.
     *
     * @return ADDRTYPE; {@code null} when it is not set
     */
    public String addressTypeText() {
        return value("ADDRTYPE");
    }

    /**
     * Lists the ports of the service at this address.
     *
     * @return every PORT that stands directly in this characteristic, in its order; not modifiable
     */
    public List<Port> ports() {
        return views(Port.TYPE, Port::new);
    }
}
