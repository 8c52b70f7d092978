package com.qvomacp.eng.parser;

/**
 * The CLIENTIDENTITY of the message. Only the first one of a message is kept.
 *
 * <pre>{@code
 * String clientId = new XCPCtxClientIdentity().qvomacp_GetPxClientIdentityData();
 * System.out.println(clientId);
 * }</pre>
 */
public class XCPCtxClientIdentity {
    /**
     * {@return the CLIENT-ID of the CLIENTIDENTITY: its text; {@code null} when there is no
     * CLIENTIDENTITY or it sets no CLIENT-ID}
     */
    public native String qvomacp_GetPxClientIdentityData();
}
