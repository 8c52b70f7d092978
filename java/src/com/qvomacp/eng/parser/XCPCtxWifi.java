package com.qvomacp.eng.parser;

/**
 * The WI-FI characteristics of the message. Indexes count from 1.
 *
 * <pre>{@code
 * XCPCtxWifi wifis = new XCPCtxWifi();
 * for (int w = 1; w <= wifis.qvomacp_GetPxWifiCount(); ++w) {
 *     System.out.println(wifis.qvomacp_GetPxWifiData(w)[0]);
 * }
 * }</pre>
 */
public class XCPCtxWifi {
    /** {@return the number of the WI-FI of the message} */
    public native int qvomacp_GetPxWifiCount();

    /**
     * {@return the parameters of a WI-FI in 13 elements: 0 NETSSID, 1 SECMODE, 2 EAPMETHOD, 3
     * EAPTYPE, 4 USERNAME, 5 ANONUSERNAME, 6 PASSWORD, 7 CACERT, 8 USERCERT, 9 PHASE1, 10
     * AUTHALGORITHM, 11 PRIORITY, 12 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxWifiData(int wifi);
}
