package com.qvomacp.eng.omacp;

/** The security methods of OMA Provisioning Bootstrap: what the key of the MAC is made of. */
public enum SecurityMethod {
    /** The message states no security method. */
    NONE,

    /** The key is known to network and device: in GSM, the IMSI. */
    NETWPIN,

    /** The key is a PIN that the user has been told. */
    USERPIN,

    /** The key is that of {@link #NETWPIN} followed by that of {@link #USERPIN}. */
    USERNETWPIN,

    /** The user has been told key and MAC, as one PIN of twice the length. */
    USERPINMAC,

    /** The message states a security method that is none of these. */
    UNKNOWN;

    private static final SecurityMethod[] BY_CODE = {NETWPIN, USERPIN, USERNETWPIN, USERPINMAC};

    /** The method that a SEC byte stands for, with or without its high bit. */
    static SecurityMethod ofSec(int sec) {
        if (sec == 0) {
            return NONE;
        }
        int code = sec & 0x7F;
        return code < BY_CODE.length ? BY_CODE[code] : UNKNOWN;
    }
}
