package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A port of a proxy, a machine of it, or an application address: a PORT.
 *
 * <pre>{@code
 * for (Port port : message.proxies().get(0).ports()) {
 *     System.out.println(port.number() + " for " + port.services());
 * }
 * }</pre>
 */
public final class Port extends TypedCharacteristic {
    Port(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return PORTNBR: the number of the port, as the message writes it} */
    public String number() {
        return value("PORTNBR");
    }

    /** {@return every SERVICE: the services of the port, such as {@code CO-WSP}} */
    public List<String> services() {
        return values("SERVICE");
    }
}
