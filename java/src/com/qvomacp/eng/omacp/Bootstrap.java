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
    Bootstrap(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return NAME: the name to show to the user} */
    public String name() {
        return value("NAME");
    }

    /** {@return every PROXY-ID: the proxies that may provision, by their names} */
    public List<String> proxyIds() {
        return values("PROXY-ID");
    }

    /** {@return COUNTRY: the mobile country code} */
    public String country() {
        return value("COUNTRY");
    }

    /** {@return every NETWORK: the networks for which this holds} */
    public List<String> networks() {
        return values("NETWORK");
    }

    /** {@return PROVURL: the name of the trusted provisioning server} */
    public String provisioningUrl() {
        return value("PROVURL");
    }

    /** {@return CONTEXT-ALLOW: how many further contexts the server may make} */
    public String contextAllow() {
        return value("CONTEXT-ALLOW");
    }
}
