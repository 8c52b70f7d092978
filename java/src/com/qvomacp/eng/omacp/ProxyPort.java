package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A port of a proxy or of a physical proxy: a PORT with its services.
 *
 * <p>The library does not answer which services the message sets for a port of a proxy; it names
 * them by their place in the list. How many there are is right.
 */
public final class ProxyPort extends Characteristic {
    private static final String[] NAMES = {"PORTNBR"};

    private final int serviceCount;
    private final List<String> servicesByPlace;

    ProxyPort(String[] values, int serviceCount, List<String> servicesByPlace) {
        super(NAMES, values, serviceCount, servicesByPlace);
        this.serviceCount = serviceCount;
        this.servicesByPlace = servicesByPlace;
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
     * Counts the services of the port.
     *
     * @return the number of SERVICE values that the message sets
     */
    public int getServiceCount() {
        return serviceCount;
    }

    /**
     * Lists a name for each service of the port, which follows from its place alone: {@code CO-WSP}
     * for the first, whatever the message says, then {@code CL-SEC-WSP}, {@code CO-SEC-WSP}, {@code
     * CL-SEC-WTA}, {@code CO-SEC-WTA}, {@code OTA-HTTP-TO}, {@code OTA-HTTP-TLS-TO}, {@code
     * OTA-HTTP-PO}, {@code OTA-HTTP-TLS-PO} and {@code Unkown Service}, and none from the eleventh
     * on.
     *
     * @return a name for each of the first ten SERVICE; not modifiable, empty when there is none
     */
    public List<String> getServicesByPlace() {
        return servicesByPlace;
    }
}
