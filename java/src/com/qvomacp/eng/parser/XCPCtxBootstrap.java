package com.qvomacp.eng.parser;

/**
 * The BOOTSTRAP characteristics of the message. All indexes count from 1.
 *
 * <pre>{@code
 * XCPCtxBootstrap bootstraps = new XCPCtxBootstrap();
 * for (int b = 1; b <= bootstraps.qvomacp_GetPxBootstrapCount(); ++b) {
 *     System.out.println(bootstraps.qvomacp_GetBootstrapData(b)[2]);
 * }
 * }</pre>
 */
public class XCPCtxBootstrap {
    /** Makes an object to call the natives on; it holds no state. */
    public XCPCtxBootstrap() {}

    /** {@return the number of the BOOTSTRAP of the message: their number} */
    public native int qvomacp_GetPxBootstrapCount();

    /**
     * Counts the PROXY-ID values of a BOOTSTRAP.
     *
     * @param bootstrap BOOTSTRAP, from 1
     * @return their number
     */
    public native int qvomacp_GetPxProxyIdCount(int bootstrap);

    /**
     * One PROXY-ID of a BOOTSTRAP.
     *
     * @param bootstrap BOOTSTRAP, from 1
     * @param proxyId PROXY-ID of that BOOTSTRAP, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxProxyIdData(int bootstrap, int proxyId);

    /**
     * Counts the NETWORK values of a BOOTSTRAP.
     *
     * @param bootstrap BOOTSTRAP, from 1
     * @return their number
     */
    public native int qvomacp_GetPxNetworkCount(int bootstrap);

    /**
     * One NETWORK of a BOOTSTRAP.
     *
     * @param bootstrap BOOTSTRAP, from 1
     * @param network NETWORK of that BOOTSTRAP, from 1
     * @return its text, or {@code null}
     */
    public native String qvomacp_GetPxNetworkData(int bootstrap, int network);

    /**
     * The parameters of a BOOTSTRAP.
     *
     * @param bootstrap BOOTSTRAP, from 1
     * @return 5 elements: 0 NAME, 1 COUNTRY, 2 PROVURL, 3 CONTEXT-ALLOW, 4 always {@code null}; or
     *     {@code null}
     */
    public native String[] qvomacp_GetBootstrapData(int bootstrap);
}
