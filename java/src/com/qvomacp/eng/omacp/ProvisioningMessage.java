package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * What a pushed provisioning message sets: an immutable snapshot of everything that the library
 * answers about it.
 *
 * <pre>{@code
 * ProvisioningMessage message = ProvisioningMessage.parse(bytes);
 * if (message.verifyMac("1234")) {
 *     for (AccessPoint accessPoint : message.getAccessPoints()) {
 *         System.out.println(accessPoint.getName() + ": " + accessPoint.getAddress());
 *     }
 * }
 * }</pre>
 */
public final class ProvisioningMessage extends Characteristic {
    private static final String[] NAMES = {"CLIENT-ID"};

    private final PushHeader header;
    private final List<Proxy> proxies;
    private final List<AccessPoint> accessPoints;
    private final List<Bootstrap> bootstraps;
    private final List<VendorConfiguration> vendorConfigurations;
    private final List<Application> applications;
    private final List<AccessRule> accessRules;
    private final List<Wifi> wifis;
    private final List<VoWifi> voWifis;

    ProvisioningMessage(
            PushHeader header,
            String clientId,
            List<Proxy> proxies,
            List<AccessPoint> accessPoints,
            List<Bootstrap> bootstraps,
            List<VendorConfiguration> vendorConfigurations,
            List<Application> applications,
            List<AccessRule> accessRules,
            List<Wifi> wifis,
            List<VoWifi> voWifis) {
        super(
                NAMES,
                new String[] {clientId},
                header,
                proxies,
                accessPoints,
                bootstraps,
                vendorConfigurations,
                applications,
                accessRules,
                wifis,
                voWifis);
        this.header = header;
        this.proxies = proxies;
        this.accessPoints = accessPoints;
        this.bootstraps = bootstraps;
        this.vendorConfigurations = vendorConfigurations;
        this.applications = applications;
        this.accessRules = accessRules;
        this.wifis = wifis;
        this.voWifis = voWifis;
    }

    /**
     * Parses a pushed message. The MAC is not checked: see {@link #verifyMac(String)}.
     *
     * <p>May be called from many threads: they take turns, since the library parses one message at
     * a time. The natives find a record by counting up to it, so that the time grows with the square
     * of the number of characteristics of one kind: a hostile message of 64 KiB takes half a second,
     * one of 300 KiB half a minute. Refuse what is longer than a push can be.
     *
     * @param message the push as it was received, from its transaction identifier on; it is not
     *     kept, and must not change during the call
     * @return what the message sets
     * @throws ProvisioningException when the message cannot be parsed, {@code null} included
     * @throws UnsatisfiedLinkError when the native library cannot be loaded
     */
    public static ProvisioningMessage parse(byte[] message) throws ProvisioningException {
        return new MessageReader().parse(message);
    }

    /**
     * Parses the push header of a message alone, whatever its body holds: enough to check the MAC
     * before the body is looked at.
     *
     * @param message the push as it was received, from its transaction identifier on; it is not
     *     kept, and must not change during the call
     * @return what the push header states
     * @throws ProvisioningException when the push header cannot be parsed, or there is none
     * @throws UnsatisfiedLinkError when the native library cannot be loaded
     */
    public static PushHeader parseHeader(byte[] message) throws ProvisioningException {
        return new MessageReader().parseHeader(message);
    }

    /**
     * Tells what the push header states.
     *
     * @return the push header, never {@code null}
     */
    public PushHeader getHeader() {
        return header;
    }

    /**
     * Checks the MAC with the PIN that the user has been told: {@link
     * PushHeader#verifyMac(String)}.
     *
     * @param pin what the user has been told, or {@code null}
     * @return true when the MAC is right
     */
    public boolean verifyMac(String pin) {
        return header.verifyMac(pin);
    }

    /**
     * Checks the MAC with the subscriber's number: {@link PushHeader#verifyMacWithImsi}.
     *
     * @param imsi the subscriber's number, or {@code null}
     * @return true when the MAC is right
     */
    public boolean verifyMacWithImsi(String imsi) {
        return header.verifyMacWithImsi(imsi);
    }

    /**
     * Checks the MAC by whichever security method the message states: {@link
     * PushHeader#verifyMac(String, String)}.
     *
     * @param pin what the user has been told, or {@code null}
     * @param imsi the subscriber's number, or {@code null}
     * @return true when the MAC is right
     */
    public boolean verifyMac(String pin, String imsi) {
        return header.verifyMac(pin, imsi);
    }

    /**
     * Lists the proxies.
     *
     * @return every PXLOGICAL, in the order of the message; not modifiable
     */
    public List<Proxy> getProxies() {
        return proxies;
    }

    /**
     * Lists the network access points.
     *
     * @return every NAPDEF, in the order of the message; not modifiable
     */
    public List<AccessPoint> getAccessPoints() {
        return accessPoints;
    }

    /**
     * Lists where further provisioning comes from.
     *
     * @return every BOOTSTRAP, in the order of the message; not modifiable
     */
    public List<Bootstrap> getBootstraps() {
        return bootstraps;
    }

    /**
     * Tells the identity that the client gets.
     *
     * @return CLIENT-ID of the first CLIENTIDENTITY, or {@code null} when the message does not set
     *     it
     */
    public String getClientId() {
        return value("CLIENT-ID");
    }

    /**
     * Lists what vendors' own software is told.
     *
     * @return every VENDORCONFIG, in the order of the message; not modifiable
     */
    public List<VendorConfiguration> getVendorConfigurations() {
        return vendorConfigurations;
    }

    /**
     * Lists the settings of applications.
     *
     * @return every APPLICATION, in the order of the message; not modifiable
     */
    public List<Application> getApplications() {
        return applications;
    }

    /**
     * Lists which traffic takes which way.
     *
     * @return every ACCESS, in the order of the message; not modifiable
     */
    public List<AccessRule> getAccessRules() {
        return accessRules;
    }

    /**
     * Lists the Wi-Fi networks.
     *
     * @return every WI-FI, in the order of the message; not modifiable
     */
    public List<Wifi> getWifis() {
        return wifis;
    }

    /**
     * Lists the settings for voice over Wi-Fi.
     *
     * @return every such characteristic, in the order of the message; not modifiable
     */
    public List<VoWifi> getVoWifis() {
        return voWifis;
    }
}
