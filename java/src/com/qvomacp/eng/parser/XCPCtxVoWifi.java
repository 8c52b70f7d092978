package com.qvomacp.eng.parser;

/**
 * The voice-over-Wi-Fi characteristics of the message. Indexes count from 1.
 *
 * <pre>{@code
 * XCPCtxVoWifi voWifis = new XCPCtxVoWifi();
 * for (int v = 1; v <= voWifis.qvomacp_GetPxVoWifiCount(); ++v) {
 *     System.out.println(voWifis.qvomacp_GetPxVoWifiData(v)[0]);
 * }
 * }</pre>
 */
public class XCPCtxVoWifi {
    /** {@return the number of the voice-over-Wi-Fi characteristics of the message} */
    public native int qvomacp_GetPxVoWifiCount();

    /**
     * {@return the parameter of a voice-over-Wi-Fi characteristic in 2 elements: 0 {@code ePDG
     * FQDN}, 1 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxVoWifiData(int voWifi);
}
