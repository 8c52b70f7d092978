package com.qvomacp.eng.omacp;

/** The kinds of proxy addresses that the library tells apart. */
public enum ProxyAddressType {
    /** An address of IP version 4, and every other one that is not of version 6. */
    IPV4,

    /** An address of IP version 6. */
    IPV6;

    /** The kind that the library has answered, null for null. */
    static ProxyAddressType answered(String name) {
        if (name == null) {
            return null;
        }
        return name.equals("NET_ADDR_IPV6") ? IPV6 : IPV4;
    }
}
