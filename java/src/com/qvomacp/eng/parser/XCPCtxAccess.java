package com.qvomacp.eng.parser;

/**
 * The ACCESS characteristics of the message. Every parameter of an ACCESS is a list of values. All
 * indexes count from 1.
 *
 * <pre>{@code
 * XCPCtxAccess access = new XCPCtxAccess();
 * for (int a = 1; a <= access.qvomacp_GetPxCtxAccessCount(); ++a) {
 *     System.out.println(access.qvomacp_GetPxRuleData(a, 1));
 * }
 * }</pre>
 */
public class XCPCtxAccess {
    /** {@return the number of the ACCESS of the message} */
    public native int qvomacp_GetPxCtxAccessCount();

    /** {@return the number of RULE values of an ACCESS} */
    public native int qvomacp_GetPxRuleCount(int access);

    /** {@return one RULE of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxRuleData(int access, int rule);

    /** {@return the number of APPID values of an ACCESS} */
    public native int qvomacp_GetPxAppIdCount(int access);

    /** {@return one APPID of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxAppIdData(int access, int appId);

    /** {@return the number of PORTNBR values of an ACCESS} */
    public native int qvomacp_GetPxPortNbrCount(int access);

    /** {@return one PORTNBR of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxPortNbrData(int access, int portNbr);

    /** {@return the number of DOMAIN values of an ACCESS} */
    public native int qvomacp_GetPxAccessDomainCount(int access);

    /** {@return one DOMAIN of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxAccessDomainData(int access, int domain);

    /** {@return the number of TO-NAPID values of an ACCESS} */
    public native int qvomacp_GetPxAccessToNapIdCount(int access);

    /** {@return one TO-NAPID of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxAccessToNapIdData(int access, int napId);

    /** {@return the number of TO-PROXY values of an ACCESS} */
    public native int qvomacp_GetPxAccessToProxyCount(int access);

    /** {@return one TO-PROXY of an ACCESS: its text, or {@code null}} */
    public native String qvomacp_GetPxAccessToProxyData(int access, int proxy);
}
