package com.qvomacp.eng.parser;

/**
 * The VENDORCONFIG characteristics of the message. Indexes count from 1.
 *
 * <pre>{@code
 * XCPCtxVendorConfig vendors = new XCPCtxVendorConfig();
 * for (int v = 1; v <= vendors.qvomacp_GetPxVenderConfigCount(); ++v) {
 *     System.out.println(vendors.qvomacp_GetPxVenderConfigData(v)[0]);
 * }
 * }</pre>
 */
public class XCPCtxVendorConfig {
    /** {@return the number of the VENDORCONFIG of the message} */
    public native int qvomacp_GetPxVenderConfigCount();

    /**
     * The parameters of a VENDORCONFIG.
     *
     * <p>One parameter with a name of the vendor's own is kept, the last one: its name is element 1
     * and its value is element 2. When the last one has no value, element 2 is that of the one
     * before.
     *
     * @return 4 elements: 0 NAME, 1 the name of the vendor's parameter, 2 its value, 3 always
     *     {@code null}; or {@code null}
     */
    public native String[] qvomacp_GetPxVenderConfigData(int vendorConfig);
}
