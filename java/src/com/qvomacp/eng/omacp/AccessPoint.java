package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A network access point: a NAPDEF.
 *
 * <pre>{@code
 * for (AccessPoint accessPoint : message.accessPoints()) {
 *     System.out.println(accessPoint.napId() + ": " + accessPoint.address());
 *     System.out.println(accessPoint.bearers() + " " + accessPoint.addressType());
 * }
 * }</pre>
 */
public final class AccessPoint extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "NAPDEF";

    AccessPoint(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Names the access point; proxies and applications refer to it by this name.
     *
     * @return NAPID; {@code null} when it is not set
     */
    public String napId() {
        return value("NAPID");
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
     * Tells whether INTERNET stands here, with or without a value: by the standard, whether the
     * access point leads to the Internet.
     *
     * @return true when it does
     */
    public boolean hasInternet() {
        return has("INTERNET");
    }

    /**
     * Tells the value of INTERNET, which by the standard has none.
     *
     * @return INTERNET; {@code null} when it has no value, and when it is not set
     */
    public String internet() {
        return value("INTERNET");
    }

    /**
     * Tells the address, such as the access point name of GPRS or a telephone number.
     *
     * @return NAP-ADDRESS; {@code null} when it is not set
     */
    public String address() {
        return value("NAP-ADDRESS");
    }

    /**
     * Tells what kind of address {@link #address} is.
     *
     * @return NAP-ADDRTYPE, {@link AddressType#UNKNOWN} for a text that is none of the kinds;
     *     {@code null} when it is not set
     */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /**
     * Tells what kind of address {@link #address} is, as the message says it.
     *
     * @return NAP-ADDRTYPE; {@code null} when it is not set
     */
    public String addressTypeText() {
        return value("NAP-ADDRTYPE");
    }

    /**
     * Lists the bearers, such as {@code GSM-GPRS}.
     *
     * @return every BEARER, in the order of the message; not modifiable
     */
    public List<String> bearers() {
        return values("BEARER");
    }

    /**
     * Lists the addresses of the name servers.
     *
     * @return every DNS-ADDR, in the order of the message; not modifiable
     */
    public List<String> dnsAddresses() {
        return values("DNS-ADDR");
    }

    /**
     * Tells the protocol of the call, such as {@code ANALOG-MODEM}.
     *
     * @return CALLTYPE; {@code null} when it is not set
     */
    public String callType() {
        return value("CALLTYPE");
    }

    /**
     * Tells the address of the device itself.
     *
     * @return LOCAL-ADDR; {@code null} when it is not set
     */
    public String localAddress() {
        return value("LOCAL-ADDR");
    }

    /**
     * Tells what kind of address {@link #localAddress} is.
     *
     * @return LOCAL-ADDRTYPE, {@link AddressType#UNKNOWN} for a text that is none of the kinds;
     *     {@code null} when it is not set
     */
    public AddressType localAddressType() {
        return AddressType.of(localAddressTypeText());
    }

    /**
     * Tells what kind of address {@link #localAddress} is, as the message says it.
     *
     * @return LOCAL-ADDRTYPE; {@code null} when it is not set
     */
    public String localAddressTypeText() {
        return value("LOCAL-ADDRTYPE");
    }

    /**
     * Tells the speed of the connection in bit/s, or {@code AUTOBAUDING}.
     *
     * @return LINKSPEED; {@code null} when it is not set
     */
    public String linkSpeed() {
        return value("LINKSPEED");
    }

    /**
     * Tells the speed of the connection towards the device in bit/s, or {@code AUTOBAUDING}.
     *
     * @return DNLINKSPEED; {@code null} when it is not set
     */
    public String downlinkSpeed() {
        return value("DNLINKSPEED");
    }

    /**
     * Tells for how many seconds an idle connection is kept.
     *
     * @return LINGER; {@code null} when it is not set
     */
    public String linger() {
        return value("LINGER");
    }

    /**
     * Tells how erroneous packets are dealt with.
     *
     * @return DELIVERY-ERR-SDU; {@code null} when it is not set
     */
    public String deliveryOfErroneousSdus() {
        return value("DELIVERY-ERR-SDU");
    }

    /**
     * Tells whether packets are delivered in order.
     *
     * @return DELIVERY-ORDER; {@code null} when it is not set
     */
    public String deliveryOrder() {
        return value("DELIVERY-ORDER");
    }

    /**
     * Tells the class of the traffic.
     *
     * @return TRAFFIC-CLASS; {@code null} when it is not set
     */
    public String trafficClass() {
        return value("TRAFFIC-CLASS");
    }

    /**
     * Tells the size of the largest packet, as 3GPP codes it.
     *
     * @return MAX-SDU-SIZE; {@code null} when it is not set
     */
    public String maxSduSize() {
        return value("MAX-SDU-SIZE");
    }

    /**
     * Tells the highest rate from the device, as 3GPP codes it.
     *
     * @return MAX-BITRATE-UPLINK; {@code null} when it is not set
     */
    public String maxBitrateUplink() {
        return value("MAX-BITRATE-UPLINK");
    }

    /**
     * Tells the highest rate towards the device, as 3GPP codes it.
     *
     * @return MAX-BITRATE-DNLINK; {@code null} when it is not set
     */
    public String maxBitrateDownlink() {
        return value("MAX-BITRATE-DNLINK");
    }

    /**
     * Tells the rate of bit errors that are not detected, as 3GPP codes it.
     *
     * @return RESIDUAL-BER; {@code null} when it is not set
     */
    public String residualBitErrorRatio() {
        return value("RESIDUAL-BER");
    }

    /**
     * Tells the rate of packets that are lost or erroneous, as 3GPP codes it.
     *
     * @return SDU-ERROR-RATIO; {@code null} when it is not set
     */
    public String sduErrorRatio() {
        return value("SDU-ERROR-RATIO");
    }

    /**
     * Tells the priority of the traffic.
     *
     * @return TRAFFIC-HANDL-PRIO; {@code null} when it is not set
     */
    public String trafficHandlingPriority() {
        return value("TRAFFIC-HANDL-PRIO");
    }

    /**
     * Tells the longest delay of a packet, as 3GPP codes it.
     *
     * @return TRANSFER-DELAY; {@code null} when it is not set
     */
    public String transferDelay() {
        return value("TRANSFER-DELAY");
    }

    /**
     * Tells the guaranteed rate from the device, as 3GPP codes it.
     *
     * @return GUARANTEED-BITRATE-UPLINK; {@code null} when it is not set
     */
    public String guaranteedBitrateUplink() {
        return value("GUARANTEED-BITRATE-UPLINK");
    }

    /**
     * Tells the guaranteed rate towards the device, as 3GPP codes it.
     *
     * @return GUARANTEED-BITRATE-DNLINK; {@code null} when it is not set
     */
    public String guaranteedBitrateDownlink() {
        return value("GUARANTEED-BITRATE-DNLINK");
    }

    /**
     * Tells how often a registration of Mobile IP is tried again.
     *
     * @return MAX-NUM-RETRY; {@code null} when it is not set
     */
    public String maxRetries() {
        return value("MAX-NUM-RETRY");
    }

    /**
     * Tells how long to wait before the first further try.
     *
     * @return FIRST-RETRY-TIMEOUT; {@code null} when it is not set
     */
    public String firstRetryTimeout() {
        return value("FIRST-RETRY-TIMEOUT");
    }

    /**
     * Tells how long before its end a registration is renewed.
     *
     * @return REREG-THRESHOLD; {@code null} when it is not set
     */
    public String reregistrationThreshold() {
        return value("REREG-THRESHOLD");
    }

    /**
     * Tells whether T-BIT stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasTBit() {
        return has("T-BIT");
    }

    /**
     * Tells the value of T-BIT.
     *
     * @return T-BIT; {@code null} when it has no value, and when it is not set
     */
    public String tBit() {
        return value("T-BIT");
    }

    /**
     * Tells whether INIT stands here, with or without a value.
     *
     * @return true when it does
     */
    public boolean hasInit() {
        return has("INIT");
    }

    /**
     * Tells the value of INIT.
     *
     * @return INIT; {@code null} when it has no value, and when it is not set
     */
    public String init() {
        return value("INIT");
    }

    /**
     * Lists how to authenticate towards the access point.
     *
     * @return every NAPAUTHINFO that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<AccessPointAuthentication> authentications() {
        return views(AccessPointAuthentication.TYPE, AccessPointAuthentication::new);
    }

    /**
     * Lists where and until when the access point may be used.
     *
     * @return every VALIDITY that stands directly in this characteristic, in its order; not
     *     modifiable
     */
    public List<Validity> validities() {
        return views(Validity.TYPE, Validity::new);
    }

    /**
     * Lists the wireless networks behind the access point.
     *
     * @return every WLAN that stands directly in this characteristic, in its order; not modifiable
     */
    public List<Wlan> wlans() {
        return views(Wlan.TYPE, Wlan::new);
    }
}
