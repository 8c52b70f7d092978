"""Provisioning tokens: which PARM fills which field, what a value token stands for."""

SWITCH_PAGE = 0x00
END = 0x01
STR_I = 0x03
STR_T = 0x83
OPAQUE = 0xC3

TAG_DOCUMENT = 0x05
TAG_CHARACTERISTIC = 0x06
TAG_PARM = 0x07

NAME_TEXT = 0x05  # the PARM's name follows as text
VALUE = 0x06
VERSION_ATTRIBUTES = (0x45, 0x46)
TYPE_TEXT = 0x50  # the type's name follows as text
LAST_TYPE = 0x5B

# Bytes behind which the attributes of the document element are taken as skipped.
SKIP_ATTRIBUTE_STOPS = (0x01, 0x04, 0x80)

DOCUMENT_TYPE = b"-//WAPFORUM//DTD PROV 1.0//EN"
PUBLIC_ID_PROV = 11

TEXT = "text"
LIST = "list"
NAMED = "named"
COMMA = "comma"

# --- Value tokens -------------------------------------------------------------------------------

APPEND = "append"  # directly behind the text that is there
JOIN = "join"  # behind a comma
LOST = "lost"  # written behind the terminator of the text that is there: not visible

ADDRESS_TYPES = (
    (0x85, b"IPV4"),
    (0x86, b"IPV6"),
    (0x87, b"E164"),
    (0x88, b"ALPHA"),
    (0x89, b"APN"),
    (0x8A, b"SCODE"),
    (0x8B, b"TETRA-ITSI"),
    (0x8C, b"MAN"),
    (0x93, b"DIGEST"),
)
AUTH_TYPES = (
    (0x9A, b"PAP"),
    (0x9B, b"CHAP"),
    (0x9C, b"HTTP-BASIC"),
    (0x9D, b"HTTP-DIGEST"),
    (0x9E, b"WTLS_SS"),
    (0x9F, b"MD5"),
)
AUTH_SCHEMES = ((0x91, b"HTTP"), (0x92, b"BASIC"), (0x93, b"DIGEST"))
CALL_TYPES = (
    (0x90, b"ANALOG-MODEM"),
    (0x91, b"V.120"),
    (0x92, b"V.110"),
    (0x93, b"X.31"),
    (0x94, b"BIT-TRANSPARENT"),
    (0x95, b"DIRECT-ASYNCHRONOUS-DATA-SERVICE"),
)


def _value_tokens():
    """Token -> (text, way of joining). Row by row through the four tables; the first hit counts."""
    found = {}
    tables = (
        (ADDRESS_TYPES, APPEND),
        (AUTH_TYPES, JOIN),
        (AUTH_SCHEMES, JOIN),
        (CALL_TYPES, LOST),
    )
    for row in range(9):
        for table, joining in tables:
            if row < len(table):
                token, text = table[row]
                found.setdefault(token, (text, joining))
    return found


VALUE_TOKENS = _value_tokens()

# --- PARMs of each characteristic: NAME token -> (kind, field) -----------------------------------

PX_LOGICAL = {
    0x07: (TEXT, "pszName"),
    0x15: (TEXT, "pszProxyId"),
    0x16: (TEXT, "pszProxyProviderId"),
    0x17: (LIST, "ptDomain"),
    0x1C: (TEXT, "pszStartPage"),
    0x2A: (TEXT, "pszTrust"),
    0x2B: (TEXT, "pszMaster"),
    0x3E: (TEXT, "pszProxyPw"),
    0x3F: (TEXT, "pszPpgAuthType"),
}
PX_AUTH_INFO = {
    0x19: (TEXT, "pszPxAuthType"),
    0x1A: (TEXT, "pszPxAuthId"),
    0x1B: (TEXT, "pszPxAuthPw"),
}
PORT = {0x23: (TEXT, "pszPortNbr"), 0x24: (LIST, "ptService")}
PX_PHYSICAL = {
    0x17: (LIST, "ptDomain"),
    0x1F: (TEXT, "pszPushEnabled"),
    0x20: (TEXT, "pszPxAddr"),
    0x21: (TEXT, "pszPxAddrType"),
    0x22: (LIST, "ptToNapId"),
    0x2E: (TEXT, "pszWspVersion"),
    0x2F: (TEXT, "pszPhysicalProxyId"),
    0x3D: (TEXT, "pszPxAddrFqdn"),
    0x47: (TEXT, "pszPullEnabled"),
}
NAP_DEF = {
    0x05: (NAMED, None),
    0x07: (TEXT, "pszName"),
    0x08: (TEXT, "pszNapAddress"),
    0x09: (TEXT, "pszNapAddrType"),
    0x0A: (TEXT, "pszCallType"),
    0x0F: (TEXT, "pszLinger"),
    0x10: (LIST, "ptBearer"),
    0x11: (TEXT, "pszNapId"),
    0x14: (TEXT, "pszInternet"),
    0x25: (TEXT, "pszLinkSpeed"),
    0x26: (TEXT, "pszDnLinkSpeed"),
    0x27: (TEXT, "pszLocalAddr"),
    0x28: (TEXT, "pszLocalAddrType"),
    0x31: (TEXT, "pszDeliveryErrSdu"),
    0x32: (TEXT, "pszDeliveryOrder"),
    0x33: (TEXT, "pszTrafficClass"),
    0x34: (TEXT, "pszMaxSduSize"),
    0x35: (TEXT, "pszMaxBitrateUplink"),
    0x36: (TEXT, "pszMaxBitrateDnlink"),
    0x48: (LIST, "ptDnsAddr"),
    0x49: (TEXT, "pszMaxNumRetry"),
    0x4A: (TEXT, "pszFirstRetryTimeout"),
    0x4B: (TEXT, "pszReregThreshold"),
    0x4C: (TEXT, "pszTBit"),
}
NAP_AUTH_INFO = {
    0x0C: (TEXT, "pszAuthType"),
    0x0D: (TEXT, "pszAuthName"),
    0x0E: (TEXT, "pszAuthSecret"),
    0x4E: (LIST, "ptAuthEntity"),
}
VALIDITY = {
    0x0B: (TEXT, "pszValidUntil"),
    0x12: (TEXT, "pszCountry"),
    0x13: (TEXT, "pszNetwork"),
    0x2C: (TEXT, "pszSid"),
    0x2D: (TEXT, "pszSoc"),
}
APPLICATION = {
    0x05: (NAMED, None),
    0x07: (TEXT, "pszName"),
    0x14: (TEXT, "pszInternet"),
    0x22: (LIST, "ptToNapId"),
    0x2E: (TEXT, "pszAAccept"),
    0x34: (LIST, "ptToAddr"),
    0x36: (TEXT, "pszAppId"),
    0x37: (TEXT, "pszAProtocol"),
    0x38: (TEXT, "pszProviderId"),
    0x39: (LIST, "ptToProxy"),
}
APP_ADDR = {0x34: (TEXT, "pszAddr"), 0x35: (TEXT, "pszAddrType")}
APP_AUTH = {
    0x2F: (TEXT, "pszAAuthData"),
    0x30: (TEXT, "pszAAuthLevel"),
    0x31: (TEXT, "pszAAuthName"),
    0x32: (TEXT, "pszAAuthSecret"),
    0x33: (TEXT, "pszAAuthType"),
    0x90: (COMMA, "pszAAuthType"),
}
RESOURCE = {
    0x07: (TEXT, "pszName"),
    0x1C: (TEXT, "pszStartPage"),
    0x2E: (TEXT, "pszAAccept"),
    0x2F: (TEXT, "pszAAuthData"),
    0x31: (TEXT, "pszAAuthName"),
    0x32: (TEXT, "pszAAuthSecret"),
    0x33: (TEXT, "pszAAuthType"),
    0x3A: (TEXT, "pszUri"),
}
BOOTSTRAP = {
    0x07: (TEXT, "pszName"),
    0x12: (TEXT, "pszCountry"),
    0x13: (LIST, "ptNetwork"),
    0x15: (LIST, "ptProxyId"),
    0x18: (TEXT, "pszProvUrl"),
    0x29: (TEXT, "pszContextAllow"),
}
VENDOR_CONFIG = {0x05: (NAMED, None), 0x07: (TEXT, "pszName")}
CLIENT_IDENTITY = {0x30: (TEXT, "pszClientId")}
ACCESS = {
    0x17: (LIST, "ptDomain"),
    0x22: (LIST, "ptToNapId"),
    0x23: (LIST, "ptPortNbr"),
    0x36: (LIST, "ptAppId"),
    0x39: (LIST, "ptToProxy"),
    0x3B: (LIST, "ptRule"),
}
NAMED_ONLY = {0x05: (NAMED, None)}

APPLICATION_NAMES = {
    b"XCAP_AUID_DCS": "pszXcapAuidDcs",
    b"XCAP_AUID_PMS": "pszXcapAuidPms",
    b"XCAP_AUID_CDMS": "pszXcapAuidCdms",
    b"XCAP_IMEI_HEADER": "pszXcapImeiHeader",
    b"XCAP_TID_HEADER": "pszXcapTidHeader",
    b"FROM": "pszFrom",
}
ROAMING_NAMES = {b"SYNC-ALLOWED": "pszSyncAllowed", b"SYNC-DEFAULT": "pszSyncDefault"}
WIFI_NAMES = {
    b"NETSSID": "pszNetSsid",
    b"SECMODE": "pszSecMode",
    b"EAPMETHOD": "pszEapMethod",
    b"EAPTYPE": "pszEapType",
    b"USERNAME": "pszUserName",
    b"ANONUSERNAME": "pszAnonUserName",
    b"PASSWORD": "pszPassword",
    b"CACERT": "pszCaCert",
    b"USERCERT": "pszUserCert",
    b"PHASE1": "pszPhase1",
    b"AUTHALGORITHM": "pszAuthAlgorithm",
    b"PRIORITY": "pszPriority",
}
VO_WIFI_NAMES = {b"ePDG FQDN": "pszEpdgFqdn"}


class Kind:
    """One kind of characteristic: its slot in a node, its PARMs, whether others may nest in it.

    after_switch says how the PARM loop looks at the token behind a page switch: masked to six bits
    or afresh.
    """

    def __init__(self, slot, parms, nests=False, names=None, after_switch="masked"):
        self.slot = slot
        self.parms = parms
        self.nests = nests
        self.names = names
        self.fresh_after_switch = after_switch == "fresh"

    def __repr__(self):
        return self.slot


KIND_PX_LOGICAL = Kind("PxLogical", PX_LOGICAL, nests=True)
KIND_PX_PHYSICAL = Kind("PxPhysical", PX_PHYSICAL, nests=True)
KIND_PORT = Kind("Port", PORT)
KIND_VALIDITY = Kind("Validity", VALIDITY)
KIND_NAP_DEF = Kind("NapDef", NAP_DEF, nests=True)
KIND_APPLICATION = Kind("Application", APPLICATION, nests=True, names=APPLICATION_NAMES)
KIND_BOOTSTRAP = Kind("Bootstrap", BOOTSTRAP)
KIND_APP_ADDR = Kind("AppAddr", APP_ADDR, nests=True)
KIND_VENDOR_CONFIG = Kind("VendorConfig", VENDOR_CONFIG)
KIND_APP_AUTH = Kind("AppAuth", APP_AUTH, after_switch="fresh")
KIND_CLIENT_IDENTITY = Kind("ClientIdentity", CLIENT_IDENTITY)
KIND_PX_AUTH_INFO = Kind("PxAuthInfo", PX_AUTH_INFO)
KIND_RESOURCE = Kind("Resource", RESOURCE, after_switch="fresh")
KIND_NAP_AUTH_INFO = Kind("NapAuthInfo", NAP_AUTH_INFO)
KIND_ACCESS = Kind("Access", ACCESS)
KIND_ROAMING = Kind("Roaming", NAMED_ONLY, names=ROAMING_NAMES)
KIND_WIFI = Kind("Wifi", NAMED_ONLY, names=WIFI_NAMES)
KIND_VO_WIFI = Kind("VoWifi", NAMED_ONLY, names=VO_WIFI_NAMES)

# TYPE token -> the kind on code page 0 and on code page 1.
TYPES = {
    0x51: (KIND_PX_LOGICAL, KIND_PX_LOGICAL),
    0x52: (KIND_PX_PHYSICAL, KIND_PX_PHYSICAL),
    0x53: (KIND_PORT, KIND_PORT),
    0x54: (KIND_VALIDITY, KIND_VALIDITY),
    0x55: (KIND_NAP_DEF, KIND_APPLICATION),
    0x56: (KIND_BOOTSTRAP, KIND_APP_ADDR),
    0x57: (KIND_VENDOR_CONFIG, KIND_APP_AUTH),
    0x58: (KIND_CLIENT_IDENTITY, KIND_CLIENT_IDENTITY),
    0x59: (KIND_PX_AUTH_INFO, KIND_RESOURCE),
    0x5A: (KIND_NAP_AUTH_INFO, KIND_NAP_AUTH_INFO),
    0x5B: (KIND_ACCESS, KIND_ACCESS),
}

# TYPE given as text.
TYPE_NAMES = {b"ROAMING": KIND_ROAMING, b"WI-FI": KIND_WIFI, b"Vodafone VoWiFi": KIND_VO_WIFI}
