package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * The settings of an application: an APPLICATION of the message.
 */
public final class Application extends Characteristic {
    private static final String[] NAMES = {
        "APPID",
        "PROVIDER-ID",
        "FROM",
        "NAME",
        "AACCEPT",
        "APROTOCOL",
        "INTERNET",
        "XCAP_AUID_DCS",
        "XCAP_AUID_PMS",
        "XCAP_AUID_CDMS",
        "XCAP_IMEI_HEADER",
        "XCAP_TID_HEADER",
    };

    private final List<String> toProxies;
    private final List<String> toNapIds;
    private final List<String> simpleAddresses;
    private final List<ApplicationAddress> addresses;
    private final List<ApplicationAuthentication> authentications;
    private final List<Resource> resources;
    private final Roaming roaming;

    Application(
            String[] values,
            List<String> toProxies,
            List<String> toNapIds,
            List<String> simpleAddresses,
            List<ApplicationAddress> addresses,
            List<ApplicationAuthentication> authentications,
            List<Resource> resources,
            Roaming roaming) {
        super(
                NAMES,
                values,
                toProxies,
                toNapIds,
                simpleAddresses,
                addresses,
                authentications,
                resources,
                roaming);
        this.toProxies = toProxies;
        this.toNapIds = toNapIds;
        this.simpleAddresses = simpleAddresses;
        this.addresses = addresses;
        this.authentications = authentications;
        this.resources = resources;
        this.roaming = roaming;
    }

    /**
     * Tells which application it is, such as {@code w4} for multimedia messages.
     *
     * @return APPID, or {@code null} when the message does not set it
     */
    public String getAppId() {
        return value("APPID");
    }

    /**
     * Names the provider of the service.
     *
     * @return PROVIDER-ID, or {@code null} when the message does not set it
     */
    public String getProviderId() {
        return value("PROVIDER-ID");
    }

    /**
     * Tells the sender that the application uses.
     *
     * @return FROM, or {@code null} when the message does not set it
     */
    public String getFrom() {
        return value("FROM");
    }

    /**
     * Tells the name to show to the user.
     *
     * @return NAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("NAME");
    }

    /**
     * Lists the content types that the application accepts.
     *
     * @return AACCEPT, or {@code null} when the message does not set it
     */
    public String getAccept() {
        return value("AACCEPT");
    }

    /**
     * Tells the protocol that the application speaks.
     *
     * @return APROTOCOL, or {@code null} when the message does not set it
     */
    public String getProtocol() {
        return value("APROTOCOL");
    }

    /**
     * Tells whether the application is reached through the Internet.
     *
     * @return INTERNET, or {@code null} when the message does not set it
     */
    public String getInternet() {
        return value("INTERNET");
    }

    /**
     * Tells the first of the XCAP application identifiers.
     *
     * @return XCAP_AUID_DCS, or {@code null} when the message does not set it
     */
    public String getXcapAuidDcs() {
        return value("XCAP_AUID_DCS");
    }

    /**
     * Tells the second of the XCAP application identifiers.
     *
     * @return XCAP_AUID_PMS, or {@code null} when the message does not set it
     */
    public String getXcapAuidPms() {
        return value("XCAP_AUID_PMS");
    }

    /**
     * Tells the third of the XCAP application identifiers.
     *
     * @return XCAP_AUID_CDMS, or {@code null} when the message does not set it
     */
    public String getXcapAuidCdms() {
        return value("XCAP_AUID_CDMS");
    }

    /**
     * Tells the XCAP header for the identity of the device.
     *
     * @return XCAP_IMEI_HEADER, or {@code null} when the message does not set it
     */
    public String getXcapImeiHeader() {
        return value("XCAP_IMEI_HEADER");
    }

    /**
     * Tells the XCAP header for the identity of the transaction.
     *
     * @return XCAP_TID_HEADER, or {@code null} when the message does not set it
     */
    public String getXcapTidHeader() {
        return value("XCAP_TID_HEADER");
    }

    /**
     * Lists the proxies through which the application goes, by their names.
     *
     * @return every TO-PROXY; not modifiable, empty when there is none
     */
    public List<String> getToProxies() {
        return toProxies;
    }

    /**
     * Lists the access points through which the application goes, by their names.
     *
     * @return every TO-NAPID; not modifiable, empty when there is none
     */
    public List<String> getToNapIds() {
        return toNapIds;
    }

    /**
     * Lists the addresses of the service that are given without further properties.
     *
     * @return every ADDR directly in the APPLICATION; not modifiable, empty when there is none
     */
    public List<String> getSimpleAddresses() {
        return simpleAddresses;
    }

    /**
     * Lists the addresses of the service that have ports or a type.
     *
     * @return every APPADDR; not modifiable, empty when there is none
     */
    public List<ApplicationAddress> getAddresses() {
        return addresses;
    }

    /**
     * Lists how application and service authenticate themselves.
     *
     * @return every APPAUTH; not modifiable, empty when there is none
     */
    public List<ApplicationAuthentication> getAuthentications() {
        return authentications;
    }

    /**
     * Lists the resources of the service, such as bookmarks and databases.
     *
     * @return every RESOURCE; not modifiable, empty when there is none
     */
    public List<Resource> getResources() {
        return resources;
    }

    /**
     * Tells what the application may do while roaming. The library answers this of the first
     * application of a message only, and of that one its first ROAMING.
     *
     * @return the first ROAMING of the first application, or {@code null}
     */
    public Roaming getRoaming() {
        return roaming;
    }
}
