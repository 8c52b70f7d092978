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
    Wlan(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return PRI-SSID: the name of the network} */
    public String primarySsid() {
        return value("PRI-SSID");
    }

    /** {@return whether PRI-U-SSID stands here} */
    public boolean hasPrimarySsidUse() {
        return has("PRI-U-SSID");
    }

    /** {@return the value of PRI-U-SSID} */
    public String primarySsidUse() {
        return value("PRI-U-SSID");
    }

    /** {@return whether PRI-H-SSID stands here} */
    public boolean hasPrimarySsidHidden() {
        return has("PRI-H-SSID");
    }

    /** {@return the value of PRI-H-SSID} */
    public String primarySsidHidden() {
        return value("PRI-H-SSID");
    }

    /** {@return every SEC-SSID: further names of networks} */
    public List<SecondarySsid> secondarySsids() {
        return views(SecondarySsid.class, "SEC-SSID");
    }

    /** {@return NETMODE: whether the network has an access point} */
    public String networkMode() {
        return value("NETMODE");
    }

    /** {@return SECMODE: how the network is secured} */
    public String securityMode() {
        return value("SECMODE");
    }

    /** {@return WPA-PRES-KEY-ASC: the pre-shared key of WPA, as text} */
    public String presharedKeyText() {
        return value("WPA-PRES-KEY-ASC");
    }

    /** {@return WPA-PRES-KEY-HEX: the pre-shared key of WPA, in hexadecimal} */
    public String presharedKeyHex() {
        return value("WPA-PRES-KEY-HEX");
    }

    /** {@return WEPKEYIND: which of the WEP keys is used} */
    public String wepKeyIndex() {
        return value("WEPKEYIND");
    }

    /** {@return WEPAUTHMODE: how WEP authenticates} */
    public String wepAuthenticationMode() {
        return value("WEPAUTHMODE");
    }

    /** {@return WLANHAND: the rule for handovers} */
    public String handover() {
        return value("WLANHAND");
    }

    /** {@return EDIT-SET: whether the user may change the settings} */
    public String editSettings() {
        return value("EDIT-SET");
    }

    /** {@return VIEW-SET: whether the user may see the settings} */
    public String viewSettings() {
        return value("VIEW-SET");
    }

    /** {@return FORW-SET: whether the user may pass the settings on} */
    public String forwardSettings() {
        return value("FORW-SET");
    }

    /** {@return every EAP: how to authenticate by EAP} */
    public List<Eap> eaps() {
        return views(Eap.class, "EAP");
    }

    /** {@return every WEPKEY: the WEP keys} */
    public List<WepKey> wepKeys() {
        return views(WepKey.class, "WEPKEY");
    }
}
