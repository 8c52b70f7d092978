package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * An address of a service: an APPADDR.
 */
public final class ApplicationAddress extends Characteristic {
    private static final String[] NAMES = {"ADDR", "ADDRTYPE"};

    private final List<ApplicationPort> ports;

    ApplicationAddress(String[] values, List<ApplicationPort> ports) {
        super(NAMES, values, ports);
        this.ports = ports;
    }

    /**
     * Tells the address.
     *
     * @return ADDR, or {@code null} when the message does not set it
     */
    public String getAddress() {
        return value("ADDR");
    }

    /**
     * Tells what kind of address it is, as the library holds it.
     *
     * @return ADDRTYPE, or {@code null} when the message does not set it
     */
    public String getAddressType() {
        return value("ADDRTYPE");
    }

    /**
     * Lists the ports of the service at this address.
     *
     * @return every PORT; not modifiable, empty when there is none
     */
    public List<ApplicationPort> getPorts() {
        return ports;
    }
}
