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
    /** {@return the number of the BOOTSTRAP of the message} */
    public native int qvomacp_GetPxBootstrapCount();

    /** {@return the number of PROXY-ID values of a BOOTSTRAP} */
    public native int qvomacp_GetPxProxyIdCount(int bootstrap);

    /** {@return one PROXY-ID of a BOOTSTRAP: its text, or {@code null}} */
    public native String qvomacp_GetPxProxyIdData(int bootstrap, int proxyId);

    /** {@return the number of NETWORK values of a BOOTSTRAP} */
    public native int qvomacp_GetPxNetworkCount(int bootstrap);

    /** {@return one NETWORK of a BOOTSTRAP: its text, or {@code null}} */
    public native String qvomacp_GetPxNetworkData(int bootstrap, int network);

    /**
     * {@return the parameters of a BOOTSTRAP in 5 elements: 0 NAME, 1 COUNTRY, 2 PROVURL, 3
     * CONTEXT-ALLOW, 4 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetBootstrapData(int bootstrap);
}
