package com.qvomacp.eng.omacp;

/**
 * A Wi-Fi network: a WI-FI.
 *
 * <pre>{@code
 * for (Wifi wifi : message.wifis()) {
 *     System.out.println(wifi.ssid() + ": " + wifi.securityMode());
 * }
 * }</pre>
 */
public final class Wifi extends TypedCharacteristic {
    Wifi(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return NETSSID: the name of the network} */
    public String ssid() {
        return value("NETSSID");
    }

    /** {@return SECMODE: how the network is secured} */
    public String securityMode() {
        return value("SECMODE");
    }

    /** {@return EAPMETHOD: the method of EAP} */
    public String eapMethod() {
        return value("EAPMETHOD");
    }

    /** {@return USERNAME: the name of the user} */
    public String userName() {
        return value("USERNAME");
    }

    /** {@return PASSWORD: the password} */
    public String password() {
        return value("PASSWORD");
    }
}
