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
    /** The type of such a characteristic. */
    static final String TYPE = "APPLICATION";

    Application(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells which application it is, such as {@code w4} for multimedia messages.
     *
     * @return APPID; {@code null} when it is not set
     */
    public String appId() {
        return value("APPID");
    }

    /**
     * Names the provider of the service.
     *
     * @return PROVIDER-ID; {@code null} when it is not set
     */
    public String providerId() {
        return value("PROVIDER-ID");
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
     * Tells the content types that the application accepts, with commas between them.
     *
     * @return AACCEPT; {@code null} when it is not set
     */
    public String accept() {
        return value("AACCEPT");
    }

    /**
     * Tells the protocol that the application speaks.
     *
     * @return APROTOCOL; {@code null} when it is not set
     */
    public String protocol() {
        return value("APROTOCOL");
    }

    /**
     * Lists the proxies through which the application goes, by their names.
     *
     * @return every TO-PROXY, in the order of the message; not modifiable
     */
    public List<String> toProxies() {
        return values("TO-PROXY");
    }

    /**
     * Lists the access points through which the application goes, by their names.
     *
     * @return every TO-NAPID, in the order of the message; not modifiable
     */
    public List<String> toNapIds() {
        return values("TO-NAPID");
    }

    /**
     * Lists the addresses of the service that are given without further properties.
     *
     * @return every ADDR, in the order of the message; not modifiable
     */
    public List<String> simpleAddresses() {
        return values("ADDR");
    }

    /**
     * Names the settings; others refer to them by this name.
     *
     * @return APPREF; {@code null} when it is not set
     */
    public String reference() {
        return value("APPREF");
    }

    /**
     * Lists the settings of other applications that belong to these, by their names.
     *
     * @return every TO-APPREF, in the order of the message; not modifiable
     */
    public List<String> toReferences() {
        return values("TO-APPREF");
    }

    /**
     * Tells whether INTERNET stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasInternet() {
        return has("INTERNET");
    }

    /**
     * Tells the value of INTERNET.
     *
     * @return INTERNET; {@code null} when it has no value, and when it is not set
     */
    public String internet() {
        return value("INTERNET");
    }

    /**
     * Tells the sender that the application uses.
     *
     * @return FROM; {@code null} when it is not set
     */
    public String from() {
        return value("FROM");
    }

    /**
     * Tells the first of the XCAP application identifiers.
     *
     * @return XCAP_AUID_DCS; {@code null} when it is not set
     */
    public String xcapAuidDcs() {
        return value("XCAP_AUID_DCS");
    }

    /**
     * Tells the second of the XCAP application identifiers.
     *
     * @return XCAP_AUID_PMS; {@code null} when it is not set
     */
    public String xcapAuidPms() {
        return value("XCAP_AUID_PMS");
    }

    /**
     * Tells the third of the XCAP application identifiers.
     *
     * @return XCAP_AUID_CDMS; {@code null} when it is not set
     */
    public String xcapAuidCdms() {
        return value("XCAP_AUID_CDMS");
    }

    /**
     * Tells the XCAP header for the identity of the device.
     *
     * @return XCAP_IMEI_HEADER; {@code null} when it is not set
     */
    public String xcapImeiHeader() {
        return value("XCAP_IMEI_HEADER");
    }

    /**
     * Tells the XCAP header for the identity of the transaction.
     *
     * @return XCAP_TID_HEADER; {@code null} when it is not set
     */
    public String xcapTidHeader() {
        return value("XCAP_TID_HEADER");
    }

    /**
     * Lists the addresses of the service that have ports or a type.
     *
     * @return every APPADDR that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<ApplicationAddress> addresses() {
        return views(ApplicationAddress.TYPE, ApplicationAddress::new);
    }

    /**
     * Lists how application and service authenticate themselves.
     *
     * @return every APPAUTH that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<ApplicationAuthentication> authentications() {
        return views(ApplicationAuthentication.TYPE, ApplicationAuthentication::new);
    }

    /**
     * Lists the resources of the service, such as bookmarks and databases.
     *
     * @return every RESOURCE that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<Resource> resources() {
        return views(Resource.TYPE, Resource::new);
    }

    /**
     * Lists what the application may do while roaming.
     *
     * @return every ROAMING that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<Roaming> roamings() {
        return views(Roaming.TYPE, Roaming::new);
    }
}
