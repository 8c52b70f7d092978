package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * The settings of an application: an APPLICATION.
 *
 * <pre>{@code
 * for (Application application : message.applications()) {
 *     System.out.println(application.appId() + ": " + application.addresses());
 *     for (Roaming roaming : application.roamings()) {
 *         System.out.println("abroad: " + roaming.syncAllowed());
 *     }
 * }
 * }</pre>
 */
public final class Application extends TypedCharacteristic {
    Application(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return APPID: which application it is, such as {@code w4} for multimedia messages} */
    public String appId() {
        return value("APPID");
    }

    /** {@return PROVIDER-ID: the name of the provider of the service} */
    public String providerId() {
        return value("PROVIDER-ID");
    }

    /** {@return NAME: the name to show to the user} */
    public String name() {
        return value("NAME");
    }

    /** {@return AACCEPT: the content types that the application accepts, commas between them} */
    public String accept() {
        return value("AACCEPT");
    }

    /** {@return APROTOCOL: the protocol that the application speaks} */
    public String protocol() {
        return value("APROTOCOL");
    }

    /** {@return every TO-PROXY: the proxies through which the application goes, by their names} */
    public List<String> toProxies() {
        return values("TO-PROXY");
    }

    /** {@return every TO-NAPID: the names of the access points that the application uses} */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /** {@return every ADDR: the addresses of the service without further properties} */
    public List<String> simpleAddresses() {
        return values("ADDR");
    }

    /** {@return APPREF: the name of the settings; others refer to them by this name} */
    public String reference() {
        return value("APPREF");
    }

    /** {@return every TO-APPREF: the names of other applications' settings that belong to these} */
    public List<String> toReferences() {
        return values("TO-APPREF");
    }

    /** {@return whether INTERNET stands here} */
    public boolean hasInternet() {
        return has("INTERNET");
    }

    /** {@return every APPADDR: the addresses of the service that have ports or a type} */
    public List<ApplicationAddress> addresses() {
        return views(ApplicationAddress.class, Kind.APPADDR);
    }

    /** {@return every APPAUTH: how application and service authenticate themselves} */
    public List<ApplicationAuthentication> authentications() {
        return views(ApplicationAuthentication.class, Kind.APPAUTH);
    }

    /** {@return every RESOURCE: the resources of the service, such as bookmarks and databases} */
    public List<Resource> resources() {
        return views(Resource.class, Kind.RESOURCE);
    }

    /** {@return every ROAMING: what the application may do while roaming} */
    public List<Roaming> roamings() {
        return views(Roaming.class, Kind.ROAMING);
    }
}
