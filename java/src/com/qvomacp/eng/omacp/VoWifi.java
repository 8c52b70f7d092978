package com.qvomacp.eng.omacp;

/**
 * Voice over Wi-Fi: a characteristic of a type of its own, which {@link #characteristic} tells.
 *
 * <pre>{@code
 * for (VoWifi voWifi : message.voWifis()) {
 *     System.out.println(voWifi.epdgHostName());
 * }
 * }</pre>
 */
public final class VoWifi extends TypedCharacteristic {
    VoWifi(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return ePDG FQDN: the full domain name of the gateway} */
    public String epdgHostName() {
        return value("ePDG FQDN");
    }
}
