"""The answers of the native methods, in one canonical form.

Every query is asked with every index from -1 to one past the end at each level; below a record that
is missing an index runs from -1 to 1. Answers are written one behind the other.
"""

from layouts import *

# --- Natives -------------------------------------------------------------------------------------


class Native:
    """A query: the chains that its indexes walk, from the root on, and what it answers there."""

    def __init__(self, name, path, answer, result, missing, signature=None):
        self.name = "qvomacp_" + name
        self.path = path.split()
        self.answer = answer
        levels = len(self.path)
        self.signature = signature or "(%s)%s" % ("I" * levels, result)
        # What is answered below a missing record with so many indexes still to come.
        self.missing = [missing * 3**left for left in range(levels + 1)]

    def chain(self, record, level):
        return record.get(self.path[level]) or ()

    def answers(self, record, level=0):
        if level == len(self.path):
            return self.answer(record)
        missing = self.missing[len(self.path) - level - 1]
        chain = self.chain(record, level)
        if not chain:
            return missing * 3
        below = b"".join([self.answers(child, level + 1) for child in chain])
        return missing * 2 + below + missing

    def labelled(self, root):
        """Yields (indexes, answer), in the order of answers()."""
        yield from self._labelled(root, 0, ())

    def _labelled(self, record, level, indexes):
        if level == len(self.path):
            yield indexes, self.answer(record) if record is not None else self.missing[0]
            return
        chain = self.chain(record, level) if record is not None else ()
        for index in range(-1, len(chain) + 2):
            found = chain[index - 1] if 0 < index <= len(chain) else None
            yield from self._labelled(found, level + 1, indexes + (index,))


INT = "I"
STRING = "Ljava/lang/String;"
STRINGS = "[Ljava/lang/String;"


def count_of(name, path, chain):
    return Native(
        name, path, lambda record: number(len(record.get(chain) or ())), INT, ZERO
    )


def item(name, path):
    return Native(name, path, text, STRING, NULL)


def field_of(name, path, field):
    return Native(name, path, lambda record: text(record.get(field)), STRING, NULL)


def array_of(name, path, answer, missing=NULL):
    return Native(name, path, answer, STRINGS, missing)


class NamedItem(Native):
    """A text that is not the list's item but made from its place or from the record it is in."""

    def __init__(self, name, path, name_of):
        super().__init__(name, path, None, STRING, NULL)
        self.name_of = name_of

    def answers(self, record, level=0):
        last = len(self.path) - 1
        if level != last:
            return super().answers(record, level)
        chain = self.chain(record, level)
        below = b"".join(
            [text(self.name_of(record, place, value)) for place, value in enumerate(chain, 1)]
        )
        return NULL * 2 + below + NULL

    def _labelled(self, record, level, indexes):
        last = len(self.path) - 1
        if level != last:
            yield from super()._labelled(record, level, indexes)
            return
        chain = self.chain(record, level) if record is not None else ()
        for index in range(-1, len(chain) + 2):
            found = 0 < index <= len(chain)
            value = self.name_of(record, index, chain[index - 1]) if found else None
            yield indexes + (index,), text(value)


def service(_port, place, _value):
    """The name follows from the place in the list, whatever stands there."""
    return SERVICES[place] if place < len(SERVICES) else None


class BearerCount(Native):
    """An index below 1 answers for the first access point."""

    def __init__(self):
        super().__init__("GetPxBearerCount", "ptNapDef", None, INT, ZERO)

    @staticmethod
    def count(chain, index):
        place = max(index, 1)
        return len(chain[place - 1].get("ptBearer") or ()) if place <= len(chain) else 0

    def _labelled(self, record, level, indexes):
        chain = self.chain(record, 0)
        for index in range(-1, len(chain) + 2):
            yield (index,), number(self.count(chain, index))

    def answers(self, record, level=0):
        return b"".join([answer for _, answer in self._labelled(record, 0, ())])


class BearerData(NamedItem):
    """Asked up to one past the count, which index 0 and -1 have from the first access point."""

    def __init__(self):
        super().__init__(
            "GetPxBearerData",
            "ptNapDef ptBearer",
            lambda nap_def, _place, value: bearer(nap_def, value),
        )

    def _labelled(self, record, level, indexes):
        if level != 0:
            yield from super()._labelled(record, level, indexes)
            return
        chain = self.chain(record, 0)
        for index in range(-1, len(chain) + 2):
            if 0 < index <= len(chain):
                yield from super()._labelled(chain[index - 1], 1, (index,))
            else:
                for place in range(-1, BearerCount.count(chain, index) + 2):
                    yield (index, place), NULL

    def answers(self, record, level=0):
        return b"".join([answer for _, answer in self._labelled(record, 0, ())])


class Single(Native):
    """A query without index, answered from the root."""

    def __init__(self, name, answer, result):
        super().__init__(name, "", answer, result, NULL)


def client_identity(root):
    identities = root.get("ptClientIdent")
    return text(identities[0].get("pszClientId")) if identities else NULL


def roaming(root):
    applications = root.get("ptApplication")
    records = applications[0].get("ptRoaming") if applications else None
    return ROAMING_ARRAY(records[0]) if records else NULL


PX = "ptPxLogical"
PHYSICAL = PX + " ptPxPhysical"
NAP = "ptNapDef"
BOOT = "ptBootstrap"
APP = "ptApplication"
ADDR = APP + " ptAppAddr"
ACC = "ptAccess"
BLANK_PROXY = b'["0:;' + b'"0:;' * 13 + b"];"

PX_LOGICAL_NATIVES = (
    count_of("GetPxLogicalCount", "", PX),
    count_of("GetPxDomainCount", PX, "ptDomain"),
    item("GetPxDomainData", PX + " ptDomain"),
    count_of("GetPxAuthInfoCount", PX, "ptPxAuthInfo"),
    array_of("GetPxAuthInfoData", PX + " ptPxAuthInfo", PX_AUTH_INFO_ARRAY),
    count_of("GetPxPortCount", PX, "ptPort"),
    field_of("GetPxPortData", PX + " ptPort", "pszPortNbr"),
    count_of("GetPxPortServiceCount", PX + " ptPort", "ptService"),
    NamedItem("GetPxPortServiceData", PX + " ptPort ptService", service),
    count_of("GetPxPhysicalCount", PX, "ptPxPhysical"),
    array_of("GetPxPhysicalData", PHYSICAL, PX_PHYSICAL_ARRAY),
    count_of("GetPxPhysicalDomainCount", PHYSICAL, "ptDomain"),
    item("GetPxPhsicalDomainData", PHYSICAL + " ptDomain"),
    count_of("GetPxPhsicalNapIdCount", PHYSICAL, "ptToNapId"),
    item("GetPxPhysicalNapIdData", PHYSICAL + " ptToNapId"),
    count_of("GetPxPhysicalPortCount", PHYSICAL, "ptPort"),
    field_of("GetPxPhysicalPortData", PHYSICAL + " ptPort", "pszPortNbr"),
    count_of("GetPxPhysicalPortServiceCount", PHYSICAL + " ptPort", "ptService"),
    NamedItem("GetPxPhysicalPortServiceData", PHYSICAL + " ptPort ptService", service),
    array_of("GetProxyData", PX, PROXY_ARRAY, missing=BLANK_PROXY),
)

NAP_DEF_NATIVES = (
    count_of("GetPxNapDefCount", "", NAP),
    count_of("GetPxDnsAddrCount", NAP, "ptDnsAddr"),
    item("GetPxDnsAddrData", NAP + " ptDnsAddr"),
    BearerCount(),
    BearerData(),
    count_of("GetPxNapAuthInfoCount", NAP, "ptNapAuthInfo"),
    array_of("GetPxNapAuthInfoData", NAP + " ptNapAuthInfo", NAP_AUTH_INFO_ARRAY),
    count_of("GetPxNapAuthEntityCount", NAP + " ptNapAuthInfo", "ptAuthEntity"),
    item("GetPxAuthInfopAuthEntityData", NAP + " ptNapAuthInfo ptAuthEntity"),
    count_of("GetPxNapValidityCount", NAP, "ptValidity"),
    array_of("GetPxValidityData", NAP + " ptValidity", VALIDITY_ARRAY),
    array_of("GetPxNapDefData", NAP, nap_def_array),
)

BOOTSTRAP_NATIVES = (
    count_of("GetPxBootstrapCount", "", BOOT),
    count_of("GetPxProxyIdCount", BOOT, "ptProxyId"),
    item("GetPxProxyIdData", BOOT + " ptProxyId"),
    count_of("GetPxNetworkCount", BOOT, "ptNetwork"),
    item("GetPxNetworkData", BOOT + " ptNetwork"),
    array_of("GetBootstrapData", BOOT, BOOTSTRAP_ARRAY),
)

CLIENT_IDENTITY_NATIVES = (Single("GetPxClientIdentityData", client_identity, STRING),)

VENDOR_CONFIG_NATIVES = (
    count_of("GetPxVenderConfigCount", "", "ptVendorConfig"),
    array_of("GetPxVenderConfigData", "ptVendorConfig", VENDOR_CONFIG_ARRAY),
)

APPLICATION_NATIVES = (
    count_of("GetPxApplicationCount", "", APP),
    count_of("GetPxToProxyCount", APP, "ptToProxy"),
    item("GetPxToProxyData", APP + " ptToProxy"),
    count_of("GetPxNapIdCount", APP, "ptToNapId"),
    item("GetPxNapIdData", APP + " ptToNapId"),
    count_of("GetPxToAddrCount", APP, "ptToAddr"),
    item("GetPxToAddrData", APP + " ptToAddr"),
    count_of("GetPxAppAddrCount", APP, "ptAppAddr"),
    array_of("GetPxAppAddrData", ADDR, APP_ADDR_ARRAY),
    count_of("GetPxAppPortCount", ADDR, "ptPort"),
    field_of("GetPxAppPortData", ADDR + " ptPort", "pszPortNbr"),
    count_of("GetPxServiceCount", ADDR + " ptPort", "ptService"),
    item("GetPxServiceData", ADDR + " ptPort ptService"),
    count_of("GetPxAppAuthCount", APP, "ptAppAuth"),
    array_of("GetPxAppAuthData", APP + " ptAppAuth", APP_AUTH_ARRAY),
    count_of("GetPxResourceCount", APP, "ptResource"),
    array_of("GetPxResourceData", APP + " ptResource", RESOURCE_ARRAY),
    array_of("GetApplicationData", APP, APPLICATION_ARRAY),
    Single("GetPxRoamingData", roaming, STRINGS),
)

ACCESS_NATIVES = (
    count_of("GetPxCtxAccessCount", "", ACC),
    count_of("GetPxRuleCount", ACC, "ptRule"),
    item("GetPxRuleData", ACC + " ptRule"),
    count_of("GetPxAppIdCount", ACC, "ptAppId"),
    item("GetPxAppIdData", ACC + " ptAppId"),
    count_of("GetPxPortNbrCount", ACC, "ptPortNbr"),
    item("GetPxPortNbrData", ACC + " ptPortNbr"),
    count_of("GetPxAccessDomainCount", ACC, "ptDomain"),
    item("GetPxAccessDomainData", ACC + " ptDomain"),
    count_of("GetPxAccessToNapIdCount", ACC, "ptToNapId"),
    item("GetPxAccessToNapIdData", ACC + " ptToNapId"),
    count_of("GetPxAccessToProxyCount", ACC, "ptToProxy"),
    item("GetPxAccessToProxyData", ACC + " ptToProxy"),
)

WIFI_NATIVES = (
    count_of("GetPxWifiCount", "", "ptWifi"),
    array_of("GetPxWifiData", "ptWifi", WIFI_ARRAY),
)

VO_WIFI_NATIVES = (
    count_of("GetPxVoWifiCount", "", "ptVoWifi"),
    array_of("GetPxVoWifiData", "ptVoWifi", VO_WIFI_ARRAY),
)

QUERIES = (
    PX_LOGICAL_NATIVES
    + NAP_DEF_NATIVES
    + BOOTSTRAP_NATIVES
    + CLIENT_IDENTITY_NATIVES
    + VENDOR_CONFIG_NATIVES
    + APPLICATION_NATIVES
    + ACCESS_NATIVES
    + WIFI_NATIVES
    + VO_WIFI_NATIVES
)

# --- Registration --------------------------------------------------------------------------------

SESSION_METHODS = (
    ("qvomacp_parser", "([BJI)Z"),
    ("qvomacp_parser_del", "()V"),
    ("qvomacp_GetParserContentType", "()I"),
    ("qvomacp_GetParserHeaderLen", "()I"),
    ("qvomacp_GetParserBodyLen", "()I"),
    ("qvomacp_GetParserMACLen", "()I"),
    ("qvomacp_GetParserSEC", "()I"),
    ("qvomacp_GetParserMAC", "()[B"),
    ("qvomacp_GetParserBody", "()[B"),
)


def _signatures(natives):
    return [(native.name, native.signature) for native in natives]


_NAP_DEF_METHODS = _signatures(NAP_DEF_NATIVES)
_NAP_DEF_METHODS.insert(3, ("qvomacp_SetPxNapDefIndex", "(I)V"))

# Classes and their methods in the order in which loading registers them.
REGISTRATION = [
    ("XCPCtxParser", list(SESSION_METHODS)),
    ("XCPCtxPxLogical", _signatures(PX_LOGICAL_NATIVES)),
    ("XCPCtxNapDef", _NAP_DEF_METHODS),
    ("XCPCtxBootstrap", _signatures(BOOTSTRAP_NATIVES)),
    ("XCPCtxClientIdentity", _signatures(CLIENT_IDENTITY_NATIVES)),
    ("XCPCtxVendorConfig", _signatures(VENDOR_CONFIG_NATIVES)),
    ("XCPCtxApplication", _signatures(APPLICATION_NATIVES)),
    ("XCPCtxAccess", _signatures(ACCESS_NATIVES)),
    ("XCPCtxWifi", _signatures(WIFI_NATIVES)),
    ("XCPCtxVoWifi", _signatures(VO_WIFI_NATIVES)),
]


def registration_lines():
    return [
        "com/qvomacp/eng/parser/%s %s %s" % (name, method, signature)
        for name, methods in REGISTRATION
        for method, signature in methods
    ]
