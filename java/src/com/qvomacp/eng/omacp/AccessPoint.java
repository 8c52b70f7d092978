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
    AccessPoint(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return NAPID: the name, by which proxies and applications refer to the access point} */
    public String napId() {
        return value("NAPID");
    }

    /** {@return NAME: the name to show to the user} */
    public String name() {
        return value("NAME");
    }

    /** {@return whether INTERNET stands here: by the standard, this leads to the Internet} */
    public boolean hasInternet() {
        return has("INTERNET");
    }

    /** {@return the value of INTERNET, which by the standard has none} */
    public String internet() {
        return value("INTERNET");
    }

    /** {@return NAP-ADDRESS: the address, such as an access point name or a telephone number} */
    public String address() {
        return value("NAP-ADDRESS");
    }

    /** {@return NAP-ADDRTYPE: what kind of address {@link #address} is} */
    public AddressType addressType() {
        return AddressType.of(addressTypeText());
    }

    /** {@return NAP-ADDRTYPE as the message says it} */
    public String addressTypeText() {
        return value("NAP-ADDRTYPE");
    }

    /** {@return every BEARER: the bearers, such as {@code GSM-GPRS}} */
    public List<String> bearers() {
        return values("BEARER");
    }

    /** {@return every DNS-ADDR: the addresses of the name servers} */
    public List<String> dnsAddresses() {
        return values("DNS-ADDR");
    }

    /** {@return CALLTYPE: the protocol of the call, such as {@code ANALOG-MODEM}} */
    public String callType() {
        return value("CALLTYPE");
    }

    /** {@return LOCAL-ADDR: the address of the device itself} */
    public String localAddress() {
        return value("LOCAL-ADDR");
    }

    /** {@return LOCAL-ADDRTYPE: what kind of address {@link #localAddress} is} */
    public AddressType localAddressType() {
        return AddressType.of(localAddressTypeText());
    }

    /** {@return LOCAL-ADDRTYPE as the message says it} */
    public String localAddressTypeText() {
        return value("LOCAL-ADDRTYPE");
    }

    /** {@return LINKSPEED: the speed of the connection in bit/s, or {@code AUTOBAUDING}} */
    public String linkSpeed() {
        return value("LINKSPEED");
    }

    /** {@return DNLINKSPEED: the speed towards the device in bit/s, or {@code AUTOBAUDING}} */
    public String downlinkSpeed() {
        return value("DNLINKSPEED");
    }

    /** {@return LINGER: for how many seconds an idle connection is kept} */
    public String linger() {
        return value("LINGER");
    }

    /** {@return DELIVERY-ERR-SDU: how erroneous packets are dealt with} */
    public String deliveryOfErroneousSdus() {
        return value("DELIVERY-ERR-SDU");
    }

    /** {@return DELIVERY-ORDER: whether packets are delivered in order} */
    public String deliveryOrder() {
        return value("DELIVERY-ORDER");
    }

    /** {@return TRAFFIC-CLASS: the class of the traffic} */
    public String trafficClass() {
        return value("TRAFFIC-CLASS");
    }

    /** {@return MAX-SDU-SIZE: the size of the largest packet, as 3GPP codes it} */
    public String maxSduSize() {
        return value("MAX-SDU-SIZE");
    }

    /** {@return MAX-BITRATE-UPLINK: the highest rate from the device, as 3GPP codes it} */
    public String maxBitrateUplink() {
        return value("MAX-BITRATE-UPLINK");
    }

    /** {@return MAX-BITRATE-DNLINK: the highest rate towards the device, as 3GPP codes it} */
    public String maxBitrateDownlink() {
        return value("MAX-BITRATE-DNLINK");
    }

    /** {@return RESIDUAL-BER: the rate of bit errors that are not detected, as 3GPP codes it} */
    public String residualBitErrorRatio() {
        return value("RESIDUAL-BER");
    }

    /** {@return SDU-ERROR-RATIO: the rate of packets lost or erroneous, as 3GPP codes it} */
    public String sduErrorRatio() {
        return value("SDU-ERROR-RATIO");
    }

    /** {@return TRAFFIC-HANDL-PRIO: the priority of the traffic} */
    public String trafficHandlingPriority() {
        return value("TRAFFIC-HANDL-PRIO");
    }

    /** {@return TRANSFER-DELAY: the longest delay of a packet, as 3GPP codes it} */
    public String transferDelay() {
        return value("TRANSFER-DELAY");
    }

    /** {@return GUARANTEED-BITRATE-UPLINK: the rate guaranteed from it, as 3GPP codes it} */
    public String guaranteedBitrateUplink() {
        return value("GUARANTEED-BITRATE-UPLINK");
    }

    /** {@return GUARANTEED-BITRATE-DNLINK: the rate guaranteed towards it, as 3GPP codes it} */
    public String guaranteedBitrateDownlink() {
        return value("GUARANTEED-BITRATE-DNLINK");
    }

    /** {@return MAX-NUM-RETRY: how often a registration of Mobile IP is tried again} */
    public String maxRetries() {
        return value("MAX-NUM-RETRY");
    }

    /** {@return FIRST-RETRY-TIMEOUT: how long to wait before the first further try} */
    public String firstRetryTimeout() {
        return value("FIRST-RETRY-TIMEOUT");
    }

    /** {@return REREG-THRESHOLD: how long before its end a registration is renewed} */
    public String reregistrationThreshold() {
        return value("REREG-THRESHOLD");
    }

    /** {@return whether T-BIT stands here} */
    public boolean hasTBit() {
        return has("T-BIT");
    }

    /** {@return the value of T-BIT} */
    public String tBit() {
        return value("T-BIT");
    }

    /** {@return whether INIT stands here} */
    public boolean hasInit() {
        return has("INIT");
    }

    /** {@return the value of INIT} */
    public String init() {
        return value("INIT");
    }

    /** {@return every NAPAUTHINFO: how to authenticate towards the access point} */
    public List<AccessPointAuthentication> authentications() {
        return views(AccessPointAuthentication.class, "NAPAUTHINFO");
    }

    /** {@return every VALIDITY: where and until when the access point may be used} */
    public List<Validity> validities() {
        return views(Validity.class, "VALIDITY");
    }

    /** {@return every WLAN: the wireless networks behind the access point} */
    public List<Wlan> wlans() {
        return views(Wlan.class, "WLAN");
    }
}
