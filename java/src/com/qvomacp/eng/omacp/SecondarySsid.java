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
    SecondarySsid(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return S-SSID: the name of the network} */
    public String ssid() {
        return value("S-SSID");
    }

    /** {@return whether S-U-SSID stands here} */
    public boolean hasUse() {
        return has("S-U-SSID");
    }

    /** {@return the value of S-U-SSID} */
    public String use() {
        return value("S-U-SSID");
    }
}
