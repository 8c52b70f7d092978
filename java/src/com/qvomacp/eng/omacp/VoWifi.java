package com.qvomacp.eng.omacp;

/**
 * Voice over Wi-Fi: a characteristic of the message.
 */
public final class VoWifi extends Characteristic {
    private static final String[] NAMES = {"ePDG FQDN"};

    VoWifi(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells the full domain name of the gateway.
     *
     * @return ePDG FQDN, or {@code null} when the message does not set it
     */
    public String getEpdgHostName() {
        return value("ePDG FQDN");
    }
}
