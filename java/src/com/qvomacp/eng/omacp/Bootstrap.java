package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * Where further provisioning comes from: a BOOTSTRAP.
 *
 * <pre>{@code
 * for (Bootstrap bootstrap : message.bootstraps()) {
 *     System.out.println(bootstrap.provisioningUrl() + " for " + bootstrap.networks());
 * }
 * }</pre>
 */
public final class Bootstrap extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "BOOTSTRAP";

    Bootstrap(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME; {@code null} when it is not set
     */
    public String name() {
        return value("NAME");
    }

    /**
     * Lists the proxies that may provision, by their names.
     *
     * @return every PROXY-ID, in the order of the message; not modifiable
     */
    public List<String> proxyIds() {
        return values("PROXY-ID");
    }

    /**
     * Tells the mobile country code.
     *
     * @return COUNTRY; {@code null} when it is not set
     */
    public String country() {
        return value("COUNTRY");
    }

    /**
     * Lists the networks for which this holds.
     *
     * @return every NETWORK, in the order of the message; not modifiable
     */
    public List<String> networks() {
        return values("NETWORK");
    }

    /**
     * Names the trusted provisioning server.
     *
     * @return PROVURL; {@code null} when it is not set
     */
    public String provisioningUrl() {
        return value("PROVURL");
    }

    /**
     * Tells how many further contexts the server may make.
     *
     * @return CONTEXT-ALLOW; {@code null} when it is not set
     */
    public String contextAllow() {
        return value("CONTEXT-ALLOW");
    }
}
