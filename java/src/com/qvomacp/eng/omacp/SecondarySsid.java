package com.qvomacp.eng.omacp;

/**
 * A further name of a wireless network: a SEC-SSID.
 *
 * <pre>{@code
 * for (SecondarySsid ssid : message.accessPoints().get(0).wlans().get(0).secondarySsids()) {
 *     System.out.println(ssid.ssid());
 * }
 * }</pre>
 */
public final class SecondarySsid extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "SEC-SSID";

    SecondarySsid(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the network.
     *
     * @return S-SSID; {@code null} when it is not set
     */
    public String ssid() {
        return value("S-SSID");
    }

    /**
     * Tells whether S-U-SSID stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasUse() {
        return has("S-U-SSID");
    }

    /**
     * Tells the value of S-U-SSID.
     *
     * @return S-U-SSID; {@code null} when it has no value, and when it is not set
     */
    public String use() {
        return value("S-U-SSID");
    }
}
