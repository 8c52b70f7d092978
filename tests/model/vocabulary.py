"""Provisioning tokens: which PARM fills which field, what a value token stands for."""

import pathlib
import sys

sys.dont_write_bytecode = True
sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[2] / "tools"))

import tokens

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



def rows(names):
    """(token, text) in the order of the tokens."""
    return tuple(sorted((token, name.encode()) for name, token in names.items()))


ADDRESS_TYPES = (*rows(tokens.ADDRESS_TYPES), (0x93, b"DIGEST"))
AUTH_TYPES = rows(tokens.READ_AUTHENTICATION_TYPES)
AUTH_SCHEMES = rows(tokens.AUTHENTICATION_SCHEMES)
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

# --- Kinds of characteristic --------------------------------------------------------------------


class Kind:
    """One kind of characteristic: its slot in a node, its PARMs by NAME token, each with how it is read
    and its field, those by a name given as text, and whether others may nest in it.

    The PARM loop looks at the token behind a page switch masked to six bits, or afresh.
    """

    def __init__(self, kind):
        self.slot = kind.slot
        self.parms = {} if kind.names == tokens.REFUSED else {NAME_TEXT: (NAMED, None)}
        for token, field in kind.fields().items():
            self.parms[token] = (TEXT if field.startswith("psz") else LIST, field)
        if self.slot == "AppAuth":
            self.parms[tokens.COMMA] = (COMMA, "pszAAuthType")
        self.names = {name.encode(): field for name, field in kind.named.items() if field}
        self.nests = bool(kind.holds)
        self.fresh_after_switch = self.slot in ("AppAuth", "Resource")

    def __repr__(self):
        return self.slot


KINDS = tuple(map(Kind, tokens.KINDS))
(
    KIND_PX_LOGICAL,
    KIND_PX_PHYSICAL,
    KIND_PORT,
    KIND_VALIDITY,
    KIND_NAP_DEF,
    KIND_APPLICATION,
    KIND_BOOTSTRAP,
    KIND_APP_ADDR,
    KIND_VENDOR_CONFIG,
    KIND_APP_AUTH,
    KIND_CLIENT_IDENTITY,
    KIND_PX_AUTH_INFO,
    KIND_RESOURCE,
    KIND_NAP_AUTH_INFO,
    KIND_ACCESS,
    KIND_ROAMING,
    KIND_WIFI,
    KIND_VO_WIFI,
) = KINDS

# TYPE token -> the kind on code page 0 and on code page 1.
TYPES = {
    token: tuple(
        next(mine for mine, kind in zip(KINDS, tokens.KINDS) if kind.token() == token and page in kind.pages())
        for page in (0, 1)
    )
    for token in range(TYPE_TEXT + 1, LAST_TYPE + 1)
}

# TYPE given as text.
TYPE_NAMES = {
    kind.type.encode(): mine for mine, kind in zip(KINDS, tokens.KINDS) if kind.token() is None
}
