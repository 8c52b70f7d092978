package com.qvomacp.eng.parser;

/**
 * The APPLICATION characteristics of the message, with their TO-PROXY, TO-NAPID, ADDR, APPADDR,
 * APPAUTH, RESOURCE and ROAMING below them.
 *
 * <pre>{@code
 * XCPCtxApplication applications = new XCPCtxApplication();
 * for (int a = 1; a <= applications.qvomacp_GetPxApplicationCount(); ++a) {
 *     System.out.println(applications.qvomacp_GetApplicationData(a)[0]);
 * }
 * }</pre>
 */
public class XCPCtxApplication {
    /** {@return the number of the APPLICATION of the message} */
    public native int qvomacp_GetPxApplicationCount();

    /** {@return the number of TO-PROXY values of an application} */
    public native int qvomacp_GetPxToProxyCount(int application);

    /** {@return one TO-PROXY of an application: its text, or {@code null}} */
    public native String qvomacp_GetPxToProxyData(int application, int proxy);

    /** {@return the number of TO-NAPID values of an application} */
    public native int qvomacp_GetPxNapIdCount(int application);

    /** {@return one TO-NAPID of an application: its text, or {@code null}} */
    public native String qvomacp_GetPxNapIdData(int application, int napId);

    /** {@return the number of ADDR values directly in an application} */
    public native int qvomacp_GetPxToAddrCount(int application);

    /** {@return one ADDR directly in an application: its text, or {@code null}} */
    public native String qvomacp_GetPxToAddrData(int application, int address);

    /** {@return the number of APPADDR of an application} */
    public native int qvomacp_GetPxAppAddrCount(int application);

    /**
     * {@return one APPADDR of an application in 3 elements: 0 ADDR, 1 ADDRTYPE (the text as it is
     * held), 2 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxAppAddrData(int application, int appAddr);

    /** {@return the number of PORT of an APPADDR} */
    public native int qvomacp_GetPxAppPortCount(int application, int appAddr);

    /** {@return the PORTNBR of a port of an APPADDR: its text, or {@code null}} */
    public native String qvomacp_GetPxAppPortData(int application, int appAddr, int port);

    /** {@return the number of SERVICE values of a port of an APPADDR} */
    public native int qvomacp_GetPxServiceCount(int application, int appAddr, int port);

    /** {@return one SERVICE of an APPADDR's port: unlike a proxy's, its text, or {@code null}} */
    public native String qvomacp_GetPxServiceData(
            int application, int appAddr, int port, int service);

    /** {@return the number of APPAUTH of an application} */
    public native int qvomacp_GetPxAppAuthCount(int application);

    /**
     * One APPAUTH of an application.
     *
     * <p>Element 0 is {@code APPSRV} for that text (capitals only) and for its token,
     * {@code CLIENT} for that text in any case, and {@code null} for everything else, the token of
     * CLIENT included.
     *
     * @return 6 elements: 0 AAUTHLEVEL as a name, 1 AAUTHTYPE, 2 AAUTHNAME, 3 AAUTHSECRET, 4
     *     AAUTHDATA, 5 always {@code null}; or {@code null}
     */
    public native String[] qvomacp_GetPxAppAuthData(int application, int appAuth);

    /** {@return the number of RESOURCE of an application} */
    public native int qvomacp_GetPxResourceCount(int application);

    /**
     * {@return one RESOURCE of an application in 9 elements: 0 URI, 1 NAME, 2 AACCEPT, 3
     * AAUTHTYPE, 4 AAUTHNAME, 5 AAUTHSECRET, 6 AAUTHDATA, 7 STARTPAGE (the text {@code startpage}
     * when the message has it without a value), 8 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxResourceData(int application, int resource);

    /**
     * {@return the parameters of an application in 13 elements: 0 APPID, 1 PROVIDER-ID, 2 FROM, 3
     * NAME, 4 AACCEPT, 5 APROTOCOL, 6 INTERNET, 7 XCAP_AUID_DCS, 8 XCAP_AUID_PMS, 9
     * XCAP_AUID_CDMS, 10 XCAP_IMEI_HEADER, 11 XCAP_TID_HEADER, 12 always {@code null}; or {@code
     * null}}
     */
    public native String[] qvomacp_GetApplicationData(int application);

    /**
     * The first ROAMING of the first application. No other ROAMING can be reached.
     *
     * @return 3 elements: 0 SYNC-ALLOWED, 1 SYNC-DEFAULT, 2 always {@code null}; or {@code null}
     */
    public native String[] qvomacp_GetPxRoamingData();
}
