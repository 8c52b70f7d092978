package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A wireless network behind an access point: a WLAN.
 *
 * <pre>{@code
 * for (Wlan wlan : message.accessPoints().get(0).wlans()) {
 *     System.out.println(wlan.primarySsid() + ": " + wlan.securityMode());
 * }
 * }</pre>
 */
public final class Wlan extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "WLAN";

    Wlan(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the network.
     *
     * @return PRI-SSID; {@code null} when it is not set
     */
    public String primarySsid() {
        return value("PRI-SSID");
    }

    /**
     * Tells whether PRI-U-SSID stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasPrimarySsidUse() {
        return has("PRI-U-SSID");
    }

    /**
     * Tells the value of PRI-U-SSID.
     *
     * @return PRI-U-SSID; {@code null} when it has no value, and when it is not set
     */
    public String primarySsidUse() {
        return value("PRI-U-SSID");
    }

    /**
     * Tells whether PRI-H-SSID stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasPrimarySsidHidden() {
        return has("PRI-H-SSID");
    }

    /**
     * Tells the value of PRI-H-SSID.
     *
     * @return PRI-H-SSID; {@code null} when it has no value, and when it is not set
     */
    public String primarySsidHidden() {
        return value("PRI-H-SSID");
    }

    /**
     * Lists further names of networks.
     *
     * @return every SEC-SSID that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<SecondarySsid> secondarySsids() {
        return views(SecondarySsid.TYPE, SecondarySsid::new);
    }

    /**
     * Tells whether the network has an access point.
     *
     * @return NETMODE; {@code null} when it is not set
     */
    public String networkMode() {
        return value("NETMODE");
    }

    /**
     * Tells how the network is secured.
     *
     * @return SECMODE; {@code null} when it is not set
     */
    public String securityMode() {
        return value("SECMODE");
    }

    /**
     * Tells the pre-shared key of WPA, as text.
     *
     * @return WPA-PRES-KEY-ASC; {@code null} when it is not set
     */
    public String presharedKeyText() {
        return value("WPA-PRES-KEY-ASC");
    }

    /**
     * Tells the pre-shared key of WPA, in hexadecimal.
     *
     * @return WPA-PRES-KEY-HEX; {@code null} when it is not set
     */
    public String presharedKeyHex() {
        return value("WPA-PRES-KEY-HEX");
    }

    /**
     * Tells which of the WEP keys is used.
     *
     * @return WEPKEYIND; {@code null} when it is not set
     */
    public String wepKeyIndex() {
        return value("WEPKEYIND");
    }

    /**
     * Tells how WEP authenticates.
     *
     * @return WEPAUTHMODE; {@code null} when it is not set
     */
    public String wepAuthenticationMode() {
        return value("WEPAUTHMODE");
    }

    /**
     * Tells the rule for handovers.
     *
     * @return WLANHAND; {@code null} when it is not set
     */
    public String handover() {
        return value("WLANHAND");
    }

    /**
     * Tells whether the user may change the settings.
     *
     * @return EDIT-SET; {@code null} when it is not set
     */
    public String editSettings() {
        return value("EDIT-SET");
    }

    /**
     * Tells whether the user may see the settings.
     *
     * @return VIEW-SET; {@code null} when it is not set
     */
    public String viewSettings() {
        return value("VIEW-SET");
    }

    /**
     * Tells whether the user may pass the settings on.
     *
     * @return FORW-SET; {@code null} when it is not set
     */
    public String forwardSettings() {
        return value("FORW-SET");
    }

    /**
     * Lists how to authenticate by EAP.
     *
     * @return every EAP that stands directly in this characteristic, in its order; not modifiable
     */
    public List<Eap> eaps() {
        return views(Eap.TYPE, Eap::new);
    }

    /**
     * Lists the WEP keys.
     *
     * @return every WEPKEY that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<WepKey> wepKeys() {
        return views(WepKey.TYPE, WepKey::new);
    }
}
