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

    /** {@return every NAPAUTHINFO: how to authenticate towards the access point} */
    public List<AccessPointAuthentication> authentications() {
        return views(AccessPointAuthentication.class, Kind.NAPAUTHINFO);
    }

    /** {@return every VALIDITY: where and until when the access point may be used} */
    public List<Validity> validities() {
        return views(Validity.class, Kind.VALIDITY);
    }
}
