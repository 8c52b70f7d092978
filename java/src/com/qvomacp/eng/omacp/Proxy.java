package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A proxy: a PXLOGICAL.
 *
 * <pre>{@code
 * for (Proxy proxy : message.proxies()) {
 *     System.out.println(proxy.proxyId() + " begins with " + proxy.startPage());
 *     for (PhysicalProxy machine : proxy.physicalProxies()) {
 *         System.out.println(machine.address() + " by " + machine.toNapIds());
 *     }
 * }
 * }</pre>
 */
public final class Proxy extends TypedCharacteristic {
    Proxy(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return PROXY-ID: the name of the proxy; applications refer to it by this name} */
    public String proxyId() {
        return value("PROXY-ID");
    }

    /** {@return PROXY-PW: the password with which the proxy authenticates itself} */
    public String password() {
        return value("PROXY-PW");
    }

    /** {@return PPGAUTH-TYPE: how the push proxy gateway authenticates itself} */
    public String pushAuthenticationType() {
        return value("PPGAUTH-TYPE");
    }

    /** {@return PROXY-PROVIDER-ID: the name of the provider of the proxy} */
    public String providerId() {
        return value("PROXY-PROVIDER-ID");
    }

    /** {@return NAME: the name to show to the user} */
    public String name() {
        return value("NAME");
    }

    /** {@return every DOMAIN: the domains that are reached through the proxy} */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /** {@return whether TRUST stands here: by the standard, the proxy is trusted to provision} */
    public boolean hasTrust() {
        return has("TRUST");
    }

    /** {@return whether MASTER stands here: by the standard, it leads its navigation domain} */
    public boolean hasMaster() {
        return has("MASTER");
    }

    /** {@return STARTPAGE: the address of the page to begin with} */
    public String startPage() {
        return value("STARTPAGE");
    }

    /** {@return WSP-VERSION: the version of WSP that the proxy speaks} */
    public String wspVersion() {
        return value("WSP-VERSION");
    }

    /** {@return PUSHENABLED: whether the proxy supports push: {@code 1} when it does} */
    public String pushEnabled() {
        return value("PUSHENABLED");
    }

    /** {@return PULLENABLED: whether the proxy supports pull: {@code 1} when it does} */
    public String pullEnabled() {
        return value("PULLENABLED");
    }

    /** {@return every PXAUTHINFO: how to authenticate towards the proxy} */
    public List<ProxyAuthentication> authentications() {
        return views(ProxyAuthentication.class, Kind.PXAUTHINFO);
    }

    /** {@return every PORT: the ports of each physical proxy that has none of its own} */
    public List<Port> ports() {
        return views(Port.class, Kind.PORT);
    }

    /** {@return every PXPHYSICAL: the machines behind the proxy} */
    public List<PhysicalProxy> physicalProxies() {
        return views(PhysicalProxy.class, Kind.PXPHYSICAL);
    }
}
