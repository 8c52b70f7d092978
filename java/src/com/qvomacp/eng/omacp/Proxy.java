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
    /** The type of such a characteristic. */
    static final String TYPE = "PXLOGICAL";

    Proxy(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the proxy; applications refer to it by this name.
     *
     * @return PROXY-ID; {@code null} when it is not set
     */
    public String proxyId() {
        return value("PROXY-ID");
    }

    /**
     * Tells the password with which the proxy authenticates itself.
     *
     * @return PROXY-PW; {@code null} when it is not set
     */
    public String password() {
        return value("PROXY-PW");
    }

    /**
     * Tells how the push proxy gateway authenticates itself.
     *
     * @return PPGAUTH-TYPE; {@code null} when it is not set
     */
    public String pushAuthenticationType() {
        return value("PPGAUTH-TYPE");
    }

    /**
     * Names the provider of the proxy.
     *
     * @return PROXY-PROVIDER-ID; {@code null} when it is not set
     */
    public String providerId() {
        return value("PROXY-PROVIDER-ID");
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME; {@code null} when it is not set
     */
    public String name() {
        return value("NAME");
    }

    /**
     * Lists the domains that are reached through the proxy.
     *
     * @return every DOMAIN, in the order of the message; not modifiable
     */
    public List<String> domains() {
        return values("DOMAIN");
    }

    /**
     * Tells whether TRUST stands here, with or without a value: by the standard, whether the proxy
     * is trusted to provision.
     *
     * @return true when it does
     */
    public boolean hasTrust() {
        return has("TRUST");
    }

    /**
     * Tells the value of TRUST, which by the standard has none.
     *
     * @return TRUST; {@code null} when it has no value, and when it is not set
     */
    public String trust() {
        return value("TRUST");
    }

    /**
     * Tells whether MASTER stands here, with or without a value: by the standard, whether the proxy
     * is the master of its navigation domain.
     *
     * @return true when it does
     */
    public boolean hasMaster() {
        return has("MASTER");
    }

    /**
     * Tells the value of MASTER, which by the standard has none.
     *
     * @return MASTER; {@code null} when it has no value, and when it is not set
     */
    public String master() {
        return value("MASTER");
    }

    /**
     * Tells the address of the page to begin with.
     *
     * @return STARTPAGE; {@code null} when it is not set
     */
    public String startPage() {
        return value("STARTPAGE");
    }

    /**
     * Tells the name of the user for the page to begin with.
     *
     * @return BASAUTH-ID; {@code null} when it is not set
     */
    public String basicAuthenticationId() {
        return value("BASAUTH-ID");
    }

    /**
     * Tells the password for the page to begin with.
     *
     * @return BASAUTH-PW; {@code null} when it is not set
     */
    public String basicAuthenticationPassword() {
        return value("BASAUTH-PW");
    }

    /**
     * Tells the version of WSP that the proxy speaks.
     *
     * @return WSP-VERSION; {@code null} when it is not set
     */
    public String wspVersion() {
        return value("WSP-VERSION");
    }

    /**
     * Tells whether the proxy supports push: {@code 1} when it does.
     *
     * @return PUSHENABLED; {@code null} when it is not set
     */
    public String pushEnabled() {
        return value("PUSHENABLED");
    }

    /**
     * Tells whether the proxy supports pull: {@code 1} when it does.
     *
     * @return PULLENABLED; {@code null} when it is not set
     */
    public String pullEnabled() {
        return value("PULLENABLED");
    }

    /**
     * Lists how to authenticate towards the proxy.
     *
     * @return every PXAUTHINFO that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<ProxyAuthentication> authentications() {
        return views(ProxyAuthentication.TYPE, ProxyAuthentication::new);
    }

    /**
     * Lists the ports that hold for every physical proxy without ports of its own.
     *
     * @return every PORT that stands directly in this characteristic, in its order; not modifiable
     */
    public List<Port> ports() {
        return views(Port.TYPE, Port::new);
    }

    /**
     * Lists the machines behind the proxy.
     *
     * @return every PXPHYSICAL that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<PhysicalProxy> physicalProxies() {
        return views(PhysicalProxy.TYPE, PhysicalProxy::new);
    }
}
