"""The tokens of OMA Client Provisioning by their names, and what a kind of characteristic takes: for the
documents that are measured, the model and the fuzz targets. Written apart from the library's own tables."""

from typing import NamedTuple

# TYPE of a characteristic as one token, by code page (OMA-WAP-ProvCont, attribute start tokens).
# Every other TYPE is written as text.
TYPES = (
    {
        "PXLOGICAL": 0x51, "PXPHYSICAL": 0x52, "PORT": 0x53, "VALIDITY": 0x54, "NAPDEF": 0x55,
        "BOOTSTRAP": 0x56, "VENDORCONFIG": 0x57, "CLIENTIDENTITY": 0x58, "PXAUTHINFO": 0x59,
        "NAPAUTHINFO": 0x5A, "ACCESS": 0x5B,
    },
    {
        "PORT": 0x53, "CLIENTIDENTITY": 0x58, "APPLICATION": 0x55, "APPADDR": 0x56, "APPAUTH": 0x57,
        "RESOURCE": 0x59,
    },
)

# NAME of a parm as one token, by code page (same table of OMA-WAP-ProvCont). Every other NAME is
# written as text.
NAMES = (
    {
        "NAME": 0x07, "NAP-ADDRESS": 0x08, "NAP-ADDRTYPE": 0x09, "CALLTYPE": 0x0A,
        "VALIDUNTIL": 0x0B, "AUTHTYPE": 0x0C, "AUTHNAME": 0x0D, "AUTHSECRET": 0x0E, "LINGER": 0x0F,
        "BEARER": 0x10, "NAPID": 0x11, "COUNTRY": 0x12, "NETWORK": 0x13, "INTERNET": 0x14,
        "PROXY-ID": 0x15, "PROXY-PROVIDER-ID": 0x16, "DOMAIN": 0x17, "PROVURL": 0x18,
        "PXAUTH-TYPE": 0x19, "PXAUTH-ID": 0x1A, "PXAUTH-PW": 0x1B, "STARTPAGE": 0x1C,
        "BASAUTH-ID": 0x1D, "BASAUTH-PW": 0x1E, "PUSHENABLED": 0x1F, "PXADDR": 0x20,
        "PXADDRTYPE": 0x21, "TO-NAPID": 0x22, "PORTNBR": 0x23, "SERVICE": 0x24, "LINKSPEED": 0x25,
        "DNLINKSPEED": 0x26, "LOCAL-ADDR": 0x27, "LOCAL-ADDRTYPE": 0x28, "CONTEXT-ALLOW": 0x29,
        "TRUST": 0x2A, "MASTER": 0x2B, "SID": 0x2C, "SOC": 0x2D, "WSP-VERSION": 0x2E,
        "PHYSICAL-PROXY-ID": 0x2F, "CLIENT-ID": 0x30, "DELIVERY-ERR-SDU": 0x31,
        "DELIVERY-ORDER": 0x32, "TRAFFIC-CLASS": 0x33, "MAX-SDU-SIZE": 0x34,
        "MAX-BITRATE-UPLINK": 0x35, "MAX-BITRATE-DNLINK": 0x36, "RESIDUAL-BER": 0x37,
        "SDU-ERROR-RATIO": 0x38, "TRAFFIC-HANDL-PRIO": 0x39, "TRANSFER-DELAY": 0x3A,
        "GUARANTEED-BITRATE-UPLINK": 0x3B, "GUARANTEED-BITRATE-DNLINK": 0x3C, "PXADDR-FQDN": 0x3D,
        "PROXY-PW": 0x3E, "PPGAUTH-TYPE": 0x3F, "PULLENABLED": 0x47, "DNS-ADDR": 0x48,
        "MAX-NUM-RETRY": 0x49, "FIRST-RETRY-TIMEOUT": 0x4A, "REREG-THRESHOLD": 0x4B, "T-BIT": 0x4C,
        "AUTH-ENTITY": 0x4E, "SPI": 0x4F,
    },
    {
        "NAME": 0x07, "INTERNET": 0x14, "STARTPAGE": 0x1C, "TO-NAPID": 0x22, "PORTNBR": 0x23,
        "SERVICE": 0x24, "AACCEPT": 0x2E, "AAUTHDATA": 0x2F, "AAUTHLEVEL": 0x30, "AAUTHNAME": 0x31,
        "AAUTHSECRET": 0x32, "AAUTHTYPE": 0x33, "ADDR": 0x34, "ADDRTYPE": 0x35, "APPID": 0x36,
        "APROTOCOL": 0x37, "PROVIDER-ID": 0x38, "TO-PROXY": 0x39, "URI": 0x3A, "RULE": 0x3B,
    },
)

# Values as one token (OMA-WAP-ProvCont, attribute value tokens). Written as text, although they
# have tokens there: the call types V.120, V.110 and X.31, whose tokens the library reads as
# authentication schemes, and the link speed AUTOBAUDING, whose token it would hand on as a byte.
ADDRESS_TYPES = {
    "IPV4": 0x85, "IPV6": 0x86, "E164": 0x87, "ALPHA": 0x88, "APN": 0x89, "SCODE": 0x8A,
    "TETRA-ITSI": 0x8B, "MAN": 0x8C,
}
CALL_TYPES = {
    "ANALOG-MODEM": 0x90, "BIT-TRANSPARENT": 0x94, "DIRECT-ASYNCHRONOUS-DATA-SERVICE": 0x95,
}
AUTHENTICATION_TYPES = {
    "PAP": 0x9A, "CHAP": 0x9B, "HTTP-BASIC": 0x9C, "HTTP-DIGEST": 0x9D, "WTLS-SS": 0x9E,
    "MD5": 0x9F,
}
BEARERS = {
    "GSM-USSD": 0xA2, "GSM-SMS": 0xA3, "ANSI-136-GUTS": 0xA4, "IS-95-CDMA-SMS": 0xA5,
    "IS-95-CDMA-CSD": 0xA6, "IS-95-CDMA-PACKET": 0xA7, "ANSI-136-CSD": 0xA8, "ANSI-136-GPRS": 0xA9,
    "GSM-CSD": 0xAA, "GSM-GPRS": 0xAB, "AMPS-CDPD": 0xAC, "PDC-CSD": 0xAD, "PDC-PACKET": 0xAE,
    "IDEN-SMS": 0xAF, "IDEN-CSD": 0xB0, "IDEN-PACKET": 0xB1, "FLEX/REFLEX": 0xB2, "PHS-SMS": 0xB3,
    "PHS-CSD": 0xB4, "TETRA-SDS": 0xB5, "TETRA-PACKET": 0xB6, "ANSI-136-GHOST": 0xB7,
    "MOBITEX-MPAK": 0xB8, "CDMA2000-1X-SIMPLE-IP": 0xB9, "CDMA2000-1X-MOBILE-IP": 0xBA,
    "3G-GSM": 0xBB, "WLAN": 0xBC,
}
SERVICES = {
    "CL-WSP": 0xCA, "CO-WSP": 0xCB, "CL-SEC-WSP": 0xCC, "CO-SEC-WSP": 0xCD, "CL-SEC-WTA": 0xCE,
    "CO-SEC-WTA": 0xCF, "OTA-HTTP-TO": 0xD0, "OTA-HTTP-TLS-TO": 0xD1, "OTA-HTTP-PO": 0xD2,
    "OTA-HTTP-TLS-PO": 0xD3,
}
AUTHENTICATION_LEVELS = {"APPSRV": 0x8D, "OBEX": 0x8E}
# 0x91 is "HTTP-" there, to be completed by the token behind it; the library reads it as "HTTP".
AUTHENTICATION_SCHEMES = {"HTTP": 0x91, "BASIC": 0x92, "DIGEST": 0x93}
COMMA = 0x90

# Which values a parm takes, by code page.
VALUES = (
    {
        "NAP-ADDRTYPE": ADDRESS_TYPES, "LOCAL-ADDRTYPE": ADDRESS_TYPES, "PXADDRTYPE": ADDRESS_TYPES,
        "CALLTYPE": CALL_TYPES, "AUTHTYPE": AUTHENTICATION_TYPES,
        "PXAUTH-TYPE": AUTHENTICATION_TYPES, "PPGAUTH-TYPE": AUTHENTICATION_TYPES,
        "BEARER": BEARERS, "SERVICE": SERVICES,
    },
    {
        "ADDRTYPE": {name: ADDRESS_TYPES[name] for name in ("IPV6", "E164", "ALPHA")},
        "AAUTHLEVEL": AUTHENTICATION_LEVELS, "AAUTHTYPE": AUTHENTICATION_SCHEMES,
    },
)

# --- What the library makes of them -----------------------------------------------------------------

# The token of WTLS-SS is read as another text.
READ_AUTHENTICATION_TYPES = {
    name.replace("WTLS-SS", "WTLS_SS"): token for name, token in AUTHENTICATION_TYPES.items()
}

# What a characteristic does with a parm whose NAME is given as text.
REFUSED = "refused"  # it has none
DROPPED = "dropped"  # their values are read and dropped
OTHERS_DROPPED = "others dropped"  # the listed ones are stored, the values of others dropped
OTHERS_REFUSED = "others refused"  # the listed ones are stored, the value of any other is refused
STORED = "stored"  # name and value are stored, whatever the name


class Kind(NamedTuple):
    """A kind of characteristic: its TYPE, its slot in a node, and its parms by NAME, each with the field
    of the context that it fills, psz for one text, pt for a list."""

    type: str
    slot: str
    parms: dict
    holds: tuple = ()  # what its place in the context takes
    names: str = REFUSED
    named: dict = {}  # parms whose NAME is given as text

    def token(self):
        """The token of its TYPE; None for one that is given as text."""
        return next((page[self.type] for page in TYPES if self.type in page), None)

    def pages(self):
        """The pages on which the token is not another kind's."""
        others = [[token for name, token in page.items() if name != self.type] for page in TYPES]
        return [page for page in (0, 1) if self.token() not in others[page]]

    def fields(self):
        """NAME token -> field. A name has the same token on both pages."""
        tokens = NAMES[1] | NAMES[0]
        return {tokens[name]: field for name, field in self.parms.items()}


KINDS = (
    Kind("PXLOGICAL", "PxLogical", {
        "NAME": "pszName",
        "PROXY-ID": "pszProxyId",
        "PROXY-PROVIDER-ID": "pszProxyProviderId",
        "DOMAIN": "ptDomain",
        "STARTPAGE": "pszStartPage",
        "TRUST": "pszTrust",
        "MASTER": "pszMaster",
        "PROXY-PW": "pszProxyPw",
        "PPGAUTH-TYPE": "pszPpgAuthType",
    }, holds=("PXAUTHINFO", "PXPHYSICAL", "PORT")),
    Kind("PXPHYSICAL", "PxPhysical", {
        "DOMAIN": "ptDomain",
        "PUSHENABLED": "pszPushEnabled",
        "PXADDR": "pszPxAddr",
        "PXADDRTYPE": "pszPxAddrType",
        "TO-NAPID": "ptToNapId",
        "WSP-VERSION": "pszWspVersion",
        "PHYSICAL-PROXY-ID": "pszPhysicalProxyId",
        "PXADDR-FQDN": "pszPxAddrFqdn",
        "PULLENABLED": "pszPullEnabled",
    }, holds=("PORT",)),
    Kind("PORT", "Port", {
        "PORTNBR": "pszPortNbr",
        "SERVICE": "ptService",
    }),
    Kind("VALIDITY", "Validity", {
        "VALIDUNTIL": "pszValidUntil",
        "COUNTRY": "pszCountry",
        "NETWORK": "pszNetwork",
        "SID": "pszSid",
        "SOC": "pszSoc",
    }),
    Kind("NAPDEF", "NapDef", {
        "NAME": "pszName",
        "NAP-ADDRESS": "pszNapAddress",
        "NAP-ADDRTYPE": "pszNapAddrType",
        "CALLTYPE": "pszCallType",
        "LINGER": "pszLinger",
        "BEARER": "ptBearer",
        "NAPID": "pszNapId",
        "INTERNET": "pszInternet",
        "LINKSPEED": "pszLinkSpeed",
        "DNLINKSPEED": "pszDnLinkSpeed",
        "LOCAL-ADDR": "pszLocalAddr",
        "LOCAL-ADDRTYPE": "pszLocalAddrType",
        "DELIVERY-ERR-SDU": "pszDeliveryErrSdu",
        "DELIVERY-ORDER": "pszDeliveryOrder",
        "TRAFFIC-CLASS": "pszTrafficClass",
        "MAX-SDU-SIZE": "pszMaxSduSize",
        "MAX-BITRATE-UPLINK": "pszMaxBitrateUplink",
        "MAX-BITRATE-DNLINK": "pszMaxBitrateDnlink",
        "DNS-ADDR": "ptDnsAddr",
        "MAX-NUM-RETRY": "pszMaxNumRetry",
        "FIRST-RETRY-TIMEOUT": "pszFirstRetryTimeout",
        "REREG-THRESHOLD": "pszReregThreshold",
        "T-BIT": "pszTBit",
    }, holds=("NAPAUTHINFO", "VALIDITY"), names=DROPPED, named={
        "INIT": None,
    }),
    Kind("APPLICATION", "Application", {
        "NAME": "pszName",
        "INTERNET": "pszInternet",
        "TO-NAPID": "ptToNapId",
        "AACCEPT": "pszAAccept",
        "ADDR": "ptToAddr",
        "APPID": "pszAppId",
        "APROTOCOL": "pszAProtocol",
        "PROVIDER-ID": "pszProviderId",
        "TO-PROXY": "ptToProxy",
    }, holds=("APPADDR", "APPAUTH", "RESOURCE", "ROAMING"), names=OTHERS_DROPPED, named={
        "XCAP_AUID_DCS": "pszXcapAuidDcs",
        "XCAP_AUID_PMS": "pszXcapAuidPms",
        "XCAP_AUID_CDMS": "pszXcapAuidCdms",
        "XCAP_IMEI_HEADER": "pszXcapImeiHeader",
        "XCAP_TID_HEADER": "pszXcapTidHeader",
        "FROM": "pszFrom",
    }),
    Kind("BOOTSTRAP", "Bootstrap", {
        "NAME": "pszName",
        "COUNTRY": "pszCountry",
        "NETWORK": "ptNetwork",
        "PROXY-ID": "ptProxyId",
        "PROVURL": "pszProvUrl",
        "CONTEXT-ALLOW": "pszContextAllow",
    }),
    Kind("APPADDR", "AppAddr", {
        "ADDR": "pszAddr",
        "ADDRTYPE": "pszAddrType",
    }, holds=("PORT",)),
    Kind("VENDORCONFIG", "VendorConfig", {
        "NAME": "pszName",
    }, names=STORED),
    Kind("APPAUTH", "AppAuth", {
        "AAUTHDATA": "pszAAuthData",
        "AAUTHLEVEL": "pszAAuthLevel",
        "AAUTHNAME": "pszAAuthName",
        "AAUTHSECRET": "pszAAuthSecret",
        "AAUTHTYPE": "pszAAuthType",
    }),
    Kind("CLIENTIDENTITY", "ClientIdentity", {
        "CLIENT-ID": "pszClientId",
    }),
    Kind("PXAUTHINFO", "PxAuthInfo", {
        "PXAUTH-TYPE": "pszPxAuthType",
        "PXAUTH-ID": "pszPxAuthId",
        "PXAUTH-PW": "pszPxAuthPw",
    }),
    Kind("RESOURCE", "Resource", {
        "NAME": "pszName",
        "STARTPAGE": "pszStartPage",
        "AACCEPT": "pszAAccept",
        "AAUTHDATA": "pszAAuthData",
        "AAUTHNAME": "pszAAuthName",
        "AAUTHSECRET": "pszAAuthSecret",
        "AAUTHTYPE": "pszAAuthType",
        "URI": "pszUri",
    }),
    Kind("NAPAUTHINFO", "NapAuthInfo", {
        "AUTHTYPE": "pszAuthType",
        "AUTHNAME": "pszAuthName",
        "AUTHSECRET": "pszAuthSecret",
        "AUTH-ENTITY": "ptAuthEntity",
    }),
    Kind("ACCESS", "Access", {
        "DOMAIN": "ptDomain",
        "TO-NAPID": "ptToNapId",
        "PORTNBR": "ptPortNbr",
        "APPID": "ptAppId",
        "TO-PROXY": "ptToProxy",
        "RULE": "ptRule",
    }),
    Kind("ROAMING", "Roaming", {
    }, names=OTHERS_REFUSED, named={
        "SYNC-ALLOWED": "pszSyncAllowed",
        "SYNC-DEFAULT": "pszSyncDefault",
    }),
    Kind("WI-FI", "Wifi", {
    }, names=OTHERS_REFUSED, named={
        "NETSSID": "pszNetSsid",
        "SECMODE": "pszSecMode",
        "EAPMETHOD": "pszEapMethod",
        "EAPTYPE": "pszEapType",
        "USERNAME": "pszUserName",
        "ANONUSERNAME": "pszAnonUserName",
        "PASSWORD": "pszPassword",
        "CACERT": "pszCaCert",
        "USERCERT": "pszUserCert",
        "PHASE1": "pszPhase1",
        "AUTHALGORITHM": "pszAuthAlgorithm",
        "PRIORITY": "pszPriority",
    }),
    Kind("Vodafone VoWiFi", "VoWifi", {
    }, names=OTHERS_REFUSED, named={
        "ePDG FQDN": "pszEpdgFqdn",
    }),
)
