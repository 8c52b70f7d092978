package com.qvomacp.eng.parser;

/**
 * The network access points of the message: its NAPDEF characteristics, with their DNS-ADDR,
 * BEARER, NAPAUTHINFO and VALIDITY below them.
 *
 * <p>Parameter names used here: {@code napDef} counts the NAPDEF of the message, or those that
 * {@link #qvomacp_SetPxNapDefIndex} has left; everything counts from 1.
 *
 * <pre>{@code
 * XCPCtxNapDef napDefs = new XCPCtxNapDef();
 * for (int n = 1; n <= napDefs.qvomacp_GetPxNapDefCount(); ++n) {
 *     System.out.println(napDefs.qvomacp_GetPxNapDefData(n)[0]);
 * }
 * }</pre>
 */
public class XCPCtxNapDef {
    /**
     * {@return the number of the NAPDEF of the message, from the one on that {@link
     * #qvomacp_SetPxNapDefIndex} has made the first}
     */
    public native int qvomacp_GetPxNapDefCount();

    /** {@return the number of DNS-ADDR values of an access point} */
    public native int qvomacp_GetPxDnsAddrCount(int napDef);

    /** {@return one DNS-ADDR of an access point: its text, or {@code null}} */
    public native String qvomacp_GetPxDnsAddrData(int napDef, int address);

    /**
     * Makes another access point the first one. This is the only query that changes something.
     *
     * <p>Index 1 changes nothing. The access points in front of the new first one are lost until
     * the next parse: every native of this class counts from the new first one, so that a second
     * call with 2 moves on by one more. An index that finds nothing (0 and negative ones too)
     * leaves no access point at all.
     */
    public native void qvomacp_SetPxNapDefIndex(int napDef);

    /**
     * {@return the number of BEARER values of an access point; unlike its siblings, an index of 0
     * or below answers for the first access point}
     */
    public native int qvomacp_GetPxBearerCount(int napDef);

    /**
     * One BEARER of an access point, as a name.
     *
     * <p>A bearer that the message gives as a token answers the token's name, such as
     * {@code GSM-GPRS}, or {@code Unkown Bearer} for a token that is none. A bearer that the
     * message gives as text answers not that text but the NAP-ADDRESS of the access point.
     *
     * @return the name, or {@code null}
     */
    public native String qvomacp_GetPxBearerData(int napDef, int bearer);

    /** {@return the number of NAPAUTHINFO of an access point} */
    public native int qvomacp_GetPxNapAuthInfoCount(int napDef);

    /**
     * One NAPAUTHINFO of an access point.
     *
     * <p>Element 0 is one of {@code PAP}, {@code CHAP}, {@code HTTP-BASIC}, {@code HTTP-DIGEST},
     * {@code WTLS-SS} and {@code MD5}, and {@code NONE} for any other value that the message gives:
     * for the token of WTLS-SS too, which the library holds under a name with an underscore.
     *
     * @return 5 elements: 0 AUTHTYPE as a name, 1 AUTHNAME, 2 AUTHSECRET, 3 reserved (no parameter
     *     fills it), 4 always {@code null}; or {@code null}
     */
    public native String[] qvomacp_GetPxNapAuthInfoData(int napDef, int authInfo);

    /** {@return the number of AUTH-ENTITY values of a NAPAUTHINFO} */
    public native int qvomacp_GetPxNapAuthEntityCount(int napDef, int authInfo);

    /** {@return one AUTH-ENTITY of a NAPAUTHINFO: its text, or {@code null}} */
    public native String qvomacp_GetPxAuthInfopAuthEntityData(int napDef, int authInfo, int entity);

    /** {@return the number of VALIDITY of an access point} */
    public native int qvomacp_GetPxNapValidityCount(int napDef);

    /**
     * {@return one VALIDITY of an access point in 6 elements: 0 COUNTRY, 1 NETWORK, 2 SID, 3 SOC,
     * 4 VALIDUNTIL, 5 always {@code null}; or {@code null}}
     */
    public native String[] qvomacp_GetPxValidityData(int napDef, int validity);

    /**
     * The parameters of an access point.
     *
     * <p>Elements 0 to 3 are NAPID, NAME, INTERNET and NAP-ADDRESS. What follows depends on
     * NAP-ADDRTYPE:
     *
     * <ul>
     *   <li>not set: element 4 is {@code null}; a text that begins with a byte from 85 to 8C: element
     *       4 is that byte in hexadecimal, {@code 0x85} to {@code 0x8c}. The other parameters stand on
     *       elements 5 to 27 and element 28 is {@code null}.
     *   <li>any other text, which is the usual case, since a token that the message carries is held
     *       under its name: there is no element for it, the other parameters move down to elements
     *       4 to 26, element 27 is {@code null} and element 28 is the empty string. So an array of
     *       this shape is known by its last element.
     * </ul>
     *
     * <p>The other parameters, by their elements without (and with) the shift: 5 (4) CALLTYPE, 6
     * (5) LOCAL-ADDR, 7 (6) LOCAL-ADDRTYPE, 8 (7) LINKSPEED, 9 (8) DNLINKSPEED, 10 (9) LINGER, 11
     * (10) DELIVERY-ERR-SDU, 12 (11) DELIVERY-ORDER, 13 (12) TRAFFIC-CLASS, 14 (13) MAX-SDU-SIZE,
     * 15 (14) MAX-BITRATE-UPLINK, 16 (15) MAX-BITRATE-DNLINK, 17 to 22 (16 to 21) reserved (no
     * parameter fills them), 23 (22) MAX-NUM-RETRY, 24 (23) FIRST-RETRY-TIMEOUT, 25 (24)
     * REREG-THRESHOLD, 26 (25) T-BIT, 27 (26) INIT, which is the text {@code empty} when the
     * message has it without a value and {@code null} otherwise.
     *
     * @return 29 elements, or {@code null}
     */
    public native String[] qvomacp_GetPxNapDefData(int napDef);
}
