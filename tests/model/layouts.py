"""How an answer is written, the names that stand for stored values, and every String[] layout.

    int      N;              null     ~;
    text     "LENGTH:BYTES;  array    [answers];      bytes    #LENGTH:BYTES;
"""

from vocabulary import tokens

NULL = b"~;"
ZERO = b"0;"


def number(value):
    return b"%d;" % value


def text(value):
    return NULL if value is None else b'"%d:%s;' % (len(value), value)


def data(value):
    return NULL if value is None else b"#%d:%s;" % (len(value), value)


def array(values):
    return b"[%s];" % b"".join(map(text, values))


# --- Names that stand for stored values ----------------------------------------------------------


def texts(names):
    """Names in the order of their tokens."""
    return tuple(name.encode() for name in sorted(names, key=names.get))


SERVICES = (*texts(tokens.SERVICES), b"Unkown Service")

FIRST_BEARER = tokens.BEARERS["GSM-USSD"]
BEARERS = texts(tokens.BEARERS)
UNKNOWN_BEARER = b"Unkown Bearer"

AUTH_TYPES = tuple(
    (name.encode(), bytes((token,))) for name, token in tokens.AUTHENTICATION_TYPES.items()
)


def px_addr_type(value):
    if value is None:
        return None
    if value == b"IPV4" or value[:1] == b"\x85":
        return b"NET_ADDR_IPV4"
    if value == b"IPV6" or value[:1] == b"\x86":
        return b"NET_ADDR_IPV6"
    return b"NET_ADDR_IPV4"


def auth_type(value):
    if value is None:
        return None
    for name, code in AUTH_TYPES:
        if value == name or value[:1] == code:
            return name
    return b"NONE"


def auth_level(value):
    if value is None:
        return None
    if value[:1] == b"\x8d" or value == b"APPSRV":
        return b"APPSRV"
    if value.upper() == b"CLIENT":
        return b"CLIENT"
    return None


def bearer(nap_def, value):
    first = value[0] if value else 0
    if 0x20 <= first <= 0x7E:
        return nap_def.get("pszNapAddress")
    row = first - FIRST_BEARER
    return BEARERS[row] if 0 <= row < len(BEARERS) else UNKNOWN_BEARER


# --- String[] layouts ----------------------------------------------------------------------------


def layout(*fields):
    """Fields in order, each a name or (name, translation), and the null that ends every array."""
    cells = [(field, None) if isinstance(field, str) else field for field in fields]

    def answer(record):
        answers = []
        for field, translate in cells:
            value = record.get(field)
            answers.append(text(translate(value) if translate else value))
        answers.append(NULL)
        return b"[%s];" % b"".join(answers)

    return answer


NAP_DEF_FIRST = ("pszNapId", "pszName", "pszInternet", "pszNapAddress")
NAP_DEF_REST = (
    "pszCallType",
    "pszLocalAddr",
    "pszLocalAddrType",
    "pszLinkSpeed",
    "pszDnLinkSpeed",
    "pszLinger",
    "pszDeliveryErrSdu",
    "pszDeliveryOrder",
    "pszTrafficClass",
    "pszMaxSduSize",
    "pszMaxBitrateUplink",
    "pszMaxBitrateDnlink",
    "pszReserved1",
    "pszReserved2",
    "pszReserved3",
    "pszReserved4",
    "pszReserved5",
    "pszReserved6",
    "pszMaxNumRetry",
    "pszFirstRetryTimeout",
    "pszReregThreshold",
    "pszTBit",
    "pszInit",
)


def nap_def_array(record):
    """An address type that is no token byte gets no element: what follows moves down by one."""
    values = [record.get(field) for field in NAP_DEF_FIRST]
    kind = record.get("pszNapAddrType")
    rest = [record.get(field) for field in NAP_DEF_REST]
    if kind is None:
        return array(values + [None] + rest + [None])
    if 0x85 <= (kind[0] if kind else 0) <= 0x8C:
        return array(values + [b"0x%02x" % kind[0]] + rest + [None])
    return array(values + rest + [None, b""])


PROXY_ARRAY = layout(
    "pszProxyId",
    "pszProxyPw",
    "pszPpgAuthType",
    "pszProxyProviderId",
    "pszName",
    "pszTrust",
    "pszMaster",
    "pszStartPage",
    "pszReserved1",
    "pszReserved2",
    "pszReserved3",
    "pszReserved4",
    "pszReserved5",
)
PX_AUTH_INFO_ARRAY = layout("pszPxAuthType", "pszPxAuthId", "pszPxAuthPw")
PX_PHYSICAL_ARRAY = layout(
    "pszPhysicalProxyId",
    "pszPxAddr",
    ("pszPxAddrType", px_addr_type),
    "pszPxAddrFqdn",
    "pszWspVersion",
    "pszPushEnabled",
    "pszPullEnabled",
)
NAP_AUTH_INFO_ARRAY = layout(
    ("pszAuthType", auth_type), "pszAuthName", "pszAuthSecret", "pszReserved"
)
VALIDITY_ARRAY = layout("pszCountry", "pszNetwork", "pszSid", "pszSoc", "pszValidUntil")
BOOTSTRAP_ARRAY = layout("pszName", "pszCountry", "pszProvUrl", "pszContextAllow")
VENDOR_CONFIG_ARRAY = layout("pszName", "pszParamName", "pszParamValue")
APPLICATION_ARRAY = layout(
    "pszAppId",
    "pszProviderId",
    "pszFrom",
    "pszName",
    "pszAAccept",
    "pszAProtocol",
    "pszInternet",
    "pszXcapAuidDcs",
    "pszXcapAuidPms",
    "pszXcapAuidCdms",
    "pszXcapImeiHeader",
    "pszXcapTidHeader",
)
APP_ADDR_ARRAY = layout("pszAddr", "pszAddrType")
APP_AUTH_ARRAY = layout(
    ("pszAAuthLevel", auth_level),
    "pszAAuthType",
    "pszAAuthName",
    "pszAAuthSecret",
    "pszAAuthData",
)
RESOURCE_ARRAY = layout(
    "pszUri",
    "pszName",
    "pszAAccept",
    "pszAAuthType",
    "pszAAuthName",
    "pszAAuthSecret",
    "pszAAuthData",
    "pszStartPage",
)
ROAMING_ARRAY = layout("pszSyncAllowed", "pszSyncDefault")
WIFI_ARRAY = layout(
    "pszNetSsid",
    "pszSecMode",
    "pszEapMethod",
    "pszEapType",
    "pszUserName",
    "pszAnonUserName",
    "pszPassword",
    "pszCaCert",
    "pszUserCert",
    "pszPhase1",
    "pszAuthAlgorithm",
    "pszPriority",
)
VO_WIFI_ARRAY = layout("pszEpdgFqdn")
