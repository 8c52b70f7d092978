package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A network access point: a NAPDEF of the message.
 */
public final class AccessPoint extends Characteristic {
    private static final String[] NAMES = {
        "NAPID",
        "NAME",
        "INTERNET",
        "NAP-ADDRESS",
        "NAP-ADDRTYPE",
        "CALLTYPE",
        "LOCAL-ADDR",
        "LOCAL-ADDRTYPE",
        "LINKSPEED",
        "DNLINKSPEED",
        "LINGER",
        "DELIVERY-ERR-SDU",
        "DELIVERY-ORDER",
        "TRAFFIC-CLASS",
        "MAX-SDU-SIZE",
        "MAX-BITRATE-UPLINK",
        "MAX-BITRATE-DNLINK",
        null,
        null,
        null,
        null,
        null,
        null,
        "MAX-NUM-RETRY",
        "FIRST-RETRY-TIMEOUT",
        "REREG-THRESHOLD",
        "T-BIT",
        "INIT",
    };

    private final boolean addressTypeHidden;
    private final int bearerCount;
    private final List<String> bearers;
    private final List<String> dnsAddresses;
    private final List<AccessPointAuthentication> authentications;
    private final List<Validity> validities;

    AccessPoint(
            String[] values,
            boolean addressTypeHidden,
            int bearerCount,
            List<String> bearers,
            List<String> dnsAddresses,
            List<AccessPointAuthentication> authentications,
            List<Validity> validities) {
        super(
                NAMES,
                values,
                addressTypeHidden,
                bearerCount,
                bearers,
                dnsAddresses,
                authentications,
                validities);
        this.addressTypeHidden = addressTypeHidden;
        this.bearerCount = bearerCount;
        this.bearers = bearers;
        this.dnsAddresses = dnsAddresses;
        this.authentications = authentications;
        this.validities = validities;
    }

    /**
     * Names the access point; proxies and applications refer to it by this name.
     *
     * @return NAPID, or {@code null} when the message does not set it
     */
    public String getNapId() {
        return value("NAPID");
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
     * Tells whether the access point leads to the Internet.
     *
     * @return INTERNET, or {@code null} when the message does not set it
     */
    public String getInternet() {
        return value("INTERNET");
    }

    /**
     * Tells the address, such as the access point name of GPRS or a telephone number.
     *
     * @return NAP-ADDRESS, or {@code null} when the message does not set it
     */
    public String getAddress() {
        return value("NAP-ADDRESS");
    }

    /**
     * Tells the protocol of the call.
     *
     * @return CALLTYPE, or {@code null} when the message does not set it
     */
    public String getCallType() {
        return value("CALLTYPE");
    }

    /**
     * Tells the address of the device itself.
     *
     * @return LOCAL-ADDR, or {@code null} when the message does not set it
     */
    public String getLocalAddress() {
        return value("LOCAL-ADDR");
    }

    /**
     * Tells what kind of address {@link #getLocalAddress} is.
     *
     * @return LOCAL-ADDRTYPE, or {@code null} when the message does not set it
     */
    public String getLocalAddressType() {
        return value("LOCAL-ADDRTYPE");
    }

    /**
     * Tells the speed of the connection.
     *
     * @return LINKSPEED, or {@code null} when the message does not set it
     */
    public String getLinkSpeed() {
        return value("LINKSPEED");
    }

    /**
     * Tells the speed of the connection towards the device.
     *
     * @return DNLINKSPEED, or {@code null} when the message does not set it
     */
    public String getDownlinkSpeed() {
        return value("DNLINKSPEED");
    }

    /**
     * Tells for how many seconds an idle connection is kept.
     *
     * @return LINGER, or {@code null} when the message does not set it
     */
    public String getLinger() {
        return value("LINGER");
    }

    /**
     * Tells how erroneous packets are dealt with.
     *
     * @return DELIVERY-ERR-SDU, or {@code null} when the message does not set it
     */
    public String getDeliveryOfErroneousSdus() {
        return value("DELIVERY-ERR-SDU");
    }

    /**
     * Tells whether packets are delivered in order.
     *
     * @return DELIVERY-ORDER, or {@code null} when the message does not set it
     */
    public String getDeliveryOrder() {
        return value("DELIVERY-ORDER");
    }

    /**
     * Tells the class of the traffic.
     *
     * @return TRAFFIC-CLASS, or {@code null} when the message does not set it
     */
    public String getTrafficClass() {
        return value("TRAFFIC-CLASS");
    }

    /**
     * Tells the size of the largest packet.
     *
     * @return MAX-SDU-SIZE, or {@code null} when the message does not set it
     */
    public String getMaxSduSize() {
        return value("MAX-SDU-SIZE");
    }

    /**
     * Tells the highest rate from the device.
     *
     * @return MAX-BITRATE-UPLINK, or {@code null} when the message does not set it
     */
    public String getMaxBitrateUplink() {
        return value("MAX-BITRATE-UPLINK");
    }

    /**
     * Tells the highest rate towards the device.
     *
     * @return MAX-BITRATE-DNLINK, or {@code null} when the message does not set it
     */
    public String getMaxBitrateDownlink() {
        return value("MAX-BITRATE-DNLINK");
    }

    /**
     * Tells how often a registration is tried again.
     *
     * @return MAX-NUM-RETRY, or {@code null} when the message does not set it
     */
    public String getMaxRetries() {
        return value("MAX-NUM-RETRY");
    }

    /**
     * Tells how long to wait before the first further try.
     *
     * @return FIRST-RETRY-TIMEOUT, or {@code null} when the message does not set it
     */
    public String getFirstRetryTimeout() {
        return value("FIRST-RETRY-TIMEOUT");
    }

    /**
     * Tells how long before its end a registration is renewed.
     *
     * @return REREG-THRESHOLD, or {@code null} when the message does not set it
     */
    public String getReregistrationThreshold() {
        return value("REREG-THRESHOLD");
    }

    /**
     * Tells the T bit of the registration.
     *
     * @return T-BIT, or {@code null} when the message does not set it
     */
    public String getTBit() {
        return value("T-BIT");
    }

    /**
     * Lists the bearers that the message gives as tokens, by name, such as {@code GSM-GPRS}; {@code
     * Unkown Bearer} stands for a token that is none. The library does not answer a bearer that the
     * message gives as a text: such a one is left out here, and {@link #getBearerCount} counts it.
     * When the address of the access point reads like the name of a bearer, the two cannot be told
     * apart and that name stands for such a bearer.
     *
     * @return the names of every BEARER but those given as texts; not modifiable, empty when there
     *     is none
     */
    public List<String> getBearers() {
        return bearers;
    }

    /**
     * Lists the addresses of the name servers.
     *
     * @return every DNS-ADDR; not modifiable, empty when there is none
     */
    public List<String> getDnsAddresses() {
        return dnsAddresses;
    }

    /**
     * Lists how to authenticate towards the access point.
     *
     * @return every NAPAUTHINFO; not modifiable, empty when there is none
     */
    public List<AccessPointAuthentication> getAuthentications() {
        return authentications;
    }

    /**
     * Lists where and until when the access point may be used.
     *
     * @return every VALIDITY; not modifiable, empty when there is none
     */
    public List<Validity> getValidities() {
        return validities;
    }

    /**
     * Tells what kind of address {@link #getAddress} is, if the library answers it.
     *
     * <p>It does so only for a type that it holds as the token itself. The usual ones it holds as
     * texts, and those it does not answer: then this is {@code null} and {@link
     * #isAddressTypeHidden} is true.
     *
     * @return the token of NAP-ADDRTYPE in hexadecimal, from {@code 0x85} (IPV4) to {@code 0x8c}
     *     (MAN), or {@code null}
     */
    public String getAddressType() {
        return value("NAP-ADDRTYPE");
    }

    /**
     * Tells whether the message sets a NAP-ADDRTYPE that the library does not answer.
     *
     * @return true when NAP-ADDRTYPE is set and {@link #getAddressType} is {@code null}
     */
    public boolean isAddressTypeHidden() {
        return addressTypeHidden;
    }

    /**
     * Counts the bearers.
     *
     * @return the number of BEARER values that the message sets, those given as texts included
     */
    public int getBearerCount() {
        return bearerCount;
    }

    /**
     * Tells whether the message sets INIT without a value.
     *
     * @return true for an INIT without a value
     */
    public boolean isInit() {
        return value("INIT") != null;
    }
}
