package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A port of the address of a service: a PORT with its services.
 */
public final class ApplicationPort extends Characteristic {
    private static final String[] NAMES = {"PORTNBR"};

    private final List<String> services;

    ApplicationPort(String[] values, List<String> services) {
        super(NAMES, values, services);
        this.services = services;
    }

    /**
     * Tells the number of the port, as the message writes it.
     *
     * @return PORTNBR, or {@code null} when the message does not set it
     */
    public String getNumber() {
        return value("PORTNBR");
    }

    /**
     * Lists the services of the port.
     *
     * @return every SERVICE; not modifiable, empty when there is none
     */
    public List<String> getServices() {
        return services;
    }
}
