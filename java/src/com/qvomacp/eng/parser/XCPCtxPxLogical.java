package com.qvomacp.eng.parser;

/**
 * The proxies of the message: its PXLOGICAL characteristics, with their DOMAIN, PXAUTHINFO, PORT
 * and PXPHYSICAL below them.
 *
 * <pre>{@code
 * XCPCtxPxLogical proxies = new XCPCtxPxLogical();
 * for (int p = 1; p <= proxies.qvomacp_GetPxLogicalCount(); ++p) {
 *     System.out.println(proxies.qvomacp_GetProxyData(p)[0]);
 * }
 * }</pre>
 */
public class XCPCtxPxLogical {
    /** {@return the number of the PXLOGICAL of the message} */
    public native int qvomacp_GetPxLogicalCount();

    /** {@return the number of DOMAIN values of a proxy} */
    public native int qvomacp_GetPxDomainCount(int proxy);

    /** {@return one DOMAIN of a proxy: its text, or {@code null}} */
    public native String qvomacp_GetPxDomainData(int proxy, int domain);

    /** {@return the number of PXAUTHINFO of a proxy} */
    public native int qvomacp_GetPxAuthInfoCount(int proxy);

    /**
     * {@return one PXAUTHINFO of a proxy in 4 elements: 0 PXAUTH-TYPE, 1 PXAUTH-ID, 2 PXAUTH-PW, 3
     * always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxAuthInfoData(int proxy, int authInfo);

    /** {@return the number of PORT directly below a proxy} */
    public native int qvomacp_GetPxPortCount(int proxy);

    /** {@return the PORTNBR of a port directly below a proxy: its text, or {@code null}} */
    public native String qvomacp_GetPxPortData(int proxy, int port);

    /** {@return the number of SERVICE values of a port directly below a proxy} */
    public native int qvomacp_GetPxPortServiceCount(int proxy, int port);

    /**
     * A service name for a port directly below a proxy, chosen by the index alone.
     *
     * <p>The answer does not depend on the value in the message: the first SERVICE of a port
     * answers {@code CO-WSP}, the second {@code CL-SEC-WSP}, then {@code CO-SEC-WSP},
     * {@code CL-SEC-WTA}, {@code CO-SEC-WTA}, {@code OTA-HTTP-TO}, {@code OTA-HTTP-TLS-TO},
     * {@code OTA-HTTP-PO}, {@code OTA-HTTP-TLS-PO} and, for the tenth, {@code Unkown Service}.
     *
     * @return the name, or {@code null} when there is no such SERVICE, and from the eleventh on
     */
    public native String qvomacp_GetPxPortServiceData(int proxy, int port, int service);

    /** {@return the number of PXPHYSICAL of a proxy} */
    public native int qvomacp_GetPxPhysicalCount(int proxy);

    /**
     * One PXPHYSICAL of a proxy.
     *
     * <p>Element 2 is not the text of the message but a name made from it: {@code NET_ADDR_IPV6}
     * for IPV6, {@code NET_ADDR_IPV4} for every other value.
     *
     * @return 8 elements: 0 PHYSICAL-PROXY-ID, 1 PXADDR, 2 PXADDRTYPE as a name, 3 PXADDR-FQDN, 4
     *     WSP-VERSION, 5 PUSHENABLED, 6 PULLENABLED, 7 always {@code null}; or {@code null}
     */
    public native String[] qvomacp_GetPxPhysicalData(int proxy, int physical);

    /** {@return the number of DOMAIN values of a physical proxy} */
    public native int qvomacp_GetPxPhysicalDomainCount(int proxy, int physical);

    /** {@return one DOMAIN of a physical proxy: its text, or {@code null}} */
    public native String qvomacp_GetPxPhsicalDomainData(int proxy, int physical, int domain);

    /** {@return the number of TO-NAPID values of a physical proxy} */
    public native int qvomacp_GetPxPhsicalNapIdCount(int proxy, int physical);

    /** {@return one TO-NAPID of a physical proxy: its text, or {@code null}} */
    public native String qvomacp_GetPxPhysicalNapIdData(int proxy, int physical, int napId);

    /** {@return the number of PORT of a physical proxy} */
    public native int qvomacp_GetPxPhysicalPortCount(int proxy, int physical);

    /** {@return the PORTNBR of a port of a physical proxy: its text, or {@code null}} */
    public native String qvomacp_GetPxPhysicalPortData(int proxy, int physical, int port);

    /** {@return the number of SERVICE values of a port of a physical proxy} */
    public native int qvomacp_GetPxPhysicalPortServiceCount(int proxy, int physical, int port);

    /**
     * {@return a service name for a port of a physical proxy, chosen by the index alone: the name
     * that {@link #qvomacp_GetPxPortServiceData} gives for the same index, or {@code null} when
     * there is no such SERVICE, and from the eleventh on}
     */
    public native String qvomacp_GetPxPhysicalPortServiceData(
            int proxy, int physical, int port, int service);

    /**
     * The parameters of a proxy.
     *
     * <p>Unlike every other array, a proxy that is not there answers an array of 14 empty strings.
     * Without a parsed message the answer is {@code null}.
     *
     * @return 14 elements: 0 PROXY-ID, 1 PROXY-PW, 2 PPGAUTH-TYPE, 3 PROXY-PROVIDER-ID, 4 NAME, 5
     *     TRUST, 6 MASTER, 7 STARTPAGE, 8 to 12 reserved (no parameter fills them), 13 always
     *     {@code null}
     */
    public native String[] qvomacp_GetProxyData(int proxy);
}
