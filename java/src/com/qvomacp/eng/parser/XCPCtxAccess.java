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
    /** Makes an object to call the natives on; it holds no state. */
    public XCPCtxAccess() {}

    /** {@return the number of the ACCESS of the message: their number} */
    public native int qvomacp_GetPxCtxAccessCount();

    /**
     * Counts the RULE values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxRuleCount(int access);

    /**
     * One RULE of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param rule RULE of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxRuleData(int access, int rule);

    /**
     * Counts the APPID values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxAppIdCount(int access);

    /**
     * One APPID of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param appId APPID of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxAppIdData(int access, int appId);

    /**
     * Counts the PORTNBR values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxPortNbrCount(int access);

    /**
     * One PORTNBR of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param portNbr PORTNBR of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxPortNbrData(int access, int portNbr);

    /**
     * Counts the DOMAIN values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxAccessDomainCount(int access);

    /**
     * One DOMAIN of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param domain DOMAIN of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxAccessDomainData(int access, int domain);

    /**
     * Counts the TO-NAPID values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxAccessToNapIdCount(int access);

    /**
     * One TO-NAPID of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param napId TO-NAPID of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxAccessToNapIdData(int access, int napId);

    /**
     * Counts the TO-PROXY values of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @return their number
     */
    public native int qvomacp_GetPxAccessToProxyCount(int access);

    /**
     * One TO-PROXY of an ACCESS.
     *
     * @param access ACCESS, from 1
     * @param proxy TO-PROXY of that ACCESS, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxAccessToProxyData(int access, int proxy);
}
