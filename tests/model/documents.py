"""Writes random provisioning documents.

A body is made as a list of chunks, one for each token with what belongs to it, so that a mutation
can work on tokens. The writer follows the code page as the decoder does.
"""

from vocabulary import *

WORDS = (
    b"internet",
    b"proxy",
    b"w2",
    b"143",
    b"25",
    b"10.0.0.1",
    b"2001:db8::1",
    b"http://mms.example.net/",
    b"APN",
    b"IPV4",
    b"IPV6",
    b"E164",
    b"PAP",
    b"CHAP",
    b"HTTP-BASIC",
    b"HTTP-DIGEST",
    b"WTLS-SS",
    b"WTLS_SS",
    b"MD5",
    b"APPSRV",
    b"appsrv",
    b"CLIENT",
    b"client",
    b"cLiEnT",
    b"OBEX",
    b"INIT",
    b"init",
    b"empty",
    b"startpage",
    b"\x85",
    b"\x86x",
    b"\x87",
    b"\x8c",
    b"\x8d",
    b"\x9b",
    b"\xab",
    b"\xca",
    b"\xc3\xa4\xc3\xb6",
    b"\x7f",
    b"\x01\x06",
    b" ",
    b"~",
    b"\xff\xfe",
)
NAMES = tuple(name for kind in KINDS for name in kind.names)
ODD_NAMES = (b"INIT", b"init", b"from", b"netssid", b"X-VENDOR", b"")

KINDS = (
    KIND_PX_LOGICAL,
    KIND_NAP_DEF,
    KIND_APPLICATION,
    KIND_BOOTSTRAP,
    KIND_CLIENT_IDENTITY,
    KIND_VENDOR_CONFIG,
    KIND_ACCESS,
    KIND_WIFI,
    KIND_VO_WIFI,
    KIND_PX_PHYSICAL,
    KIND_PX_AUTH_INFO,
    KIND_PORT,
    KIND_NAP_AUTH_INFO,
    KIND_VALIDITY,
    KIND_APP_ADDR,
    KIND_APP_AUTH,
    KIND_RESOURCE,
    KIND_ROAMING,
)
TOP_WEIGHTS = (8, 8, 8, 3, 2, 3, 4, 2, 2) + (1,) * 9
CHILDREN = {
    KIND_PX_LOGICAL: (KIND_PX_AUTH_INFO, KIND_PX_PHYSICAL, KIND_PX_PHYSICAL, KIND_PORT),
    KIND_PX_PHYSICAL: (KIND_PORT,),
    KIND_NAP_DEF: (KIND_NAP_AUTH_INFO, KIND_VALIDITY),
    KIND_APPLICATION: (KIND_APP_ADDR, KIND_APP_ADDR, KIND_APP_AUTH, KIND_RESOURCE, KIND_ROAMING),
    KIND_APP_ADDR: (KIND_PORT,),
}
# Kind -> the pages on which its TYPE token means it, and the token.
TYPE_OF = {}
for _token, _kinds in TYPES.items():
    for _page, _kind in enumerate(_kinds):
        TYPE_OF.setdefault(_kind, (_token, []))[1].append(_page)
TYPE_NAME_OF = {kind: name for name, kind in TYPE_NAMES.items()}

def integer(value, extra=0):
    """A multi-byte integer, with so many bytes that add nothing before it."""
    digits = [value & 0x7F]
    while value := value >> 7:
        digits.append(0x80 | value & 0x7F)
    return b"\x80" * extra + bytes(reversed(digits))


class Body:
    """One document being written. `odd` is how often something unusual is done."""

    def __init__(self, rng, odd):
        self.rng = rng
        self.odd = odd
        self.page = 0
        self.chunks = []
        self.table = b""
        if rng.random() < 0.5:
            words = [rng.choice(WORDS) for _ in range(rng.randint(1, 5))]
            self.table = b"\0".join(words) + (b"\0" if rng.random() < 0.8 else b"")

    def oddly(self, factor=1.0):
        return self.rng.random() < self.odd * factor

    def put(self, *chunks):
        self.chunks.extend(chunks)

    def switch(self, page):
        self.put(bytes((SWITCH_PAGE, page)))
        if page & 0x3F < 2:
            self.page = page & 0x3F

    def text(self):
        rng = self.rng
        how = rng.random()
        if how < 0.75:
            return rng.choice(WORDS)
        if how < 0.95:
            return bytes(rng.randint(1, 255) for _ in range(rng.randint(0, 12)))
        return rng.choice(WORDS) * rng.randint(2, 40)

    # --- Values --------------------------------------------------------------------------------

    def inline(self, text=None):
        return b"\x03" + (self.text() if text is None else text) + b"\0"

    def reference(self):
        rng = self.rng
        size = len(self.table)
        index = rng.randrange(size) if size else rng.randint(0, 1)
        if self.oddly(0.3):
            index = rng.choice((size, size + 1, size + 2, 0x7F, 0xFFFFFFFF))
        return b"\x83" + integer(index, rng.choice((0, 0, 0, 1)))

    def opaque(self, text=None):
        data = self.text() if text is None else text
        if self.oddly(0.5):
            data = data + b"\0" + self.text()
        return b"\xc3" + integer(len(data), self.rng.choice((0, 0, 0, 2))) + data

    def known_token(self):
        return bytes((self.rng.choice(tuple(VALUE_TOKENS)),))

    def unknown_token(self):
        rng = self.rng
        while True:
            first, last = rng.choice(((0xA2, 0xBD), (0xCA, 0xD3), (0x80, 0xFF)))
            token = rng.randint(first, last)
            if token not in VALUE_TOKENS and token not in (STR_T, OPAQUE):
                return bytes((token,))

    def string(self):
        return self.inline() if self.rng.random() < 0.7 else self.reference()

    def run(self):
        """Strings and tokens in one value; it lasts up to END or VALUE."""
        rng = self.rng
        more = rng.randint(0, 3) if rng.random() < 0.3 else 0
        pieces = [self.string() if rng.random() < 0.5 else self.known_token() for _ in range(more)]
        self.put(self.string(), *pieces)

    def value(self):
        """Writes what stands behind VALUE. Returns True when it lasts up to END or VALUE."""
        rng = self.rng
        if rng.random() < 0.03:
            self.switch(rng.randint(0, 1))
        how = rng.random()
        if how < 0.55:
            self.run()
            return True
        if how < 0.68:
            self.put(self.opaque())
        elif how < 0.80:
            self.put(self.known_token())
        elif how < 0.94:
            self.put(self.unknown_token())
        elif how < 0.96 or not self.odd:
            return True  # no value: END must follow
        else:
            # An unknown low token: skipped up to the END that closes it.
            self.put(bytes((rng.choice((0x02, 0x2A, 0x10, 0x50)),)))
            return True
        return False

    # --- PARMs ---------------------------------------------------------------------------------

    def name_and_value(self, token):
        """A NAME token and what follows it up to END. Returns whether the value lasts up to it."""
        rng = self.rng
        self.put(bytes((token,)))
        if rng.random() < 0.06:
            return True
        if rng.random() < 0.04:
            self.switch(rng.randint(0, 1))
        self.put(b"\x06")
        return self.value()

    def list_parm(self, token):
        rng = self.rng
        lasts = self.name_and_value(token)
        while self.oddly(0.6):
            # Behind a string only VALUE's own byte can stand as the next NAME.
            lasts = self.name_and_value(VALUE if lasts else rng.choice((token, VALUE, 0x9A, 0x30)))

    def named_parm(self, kind):
        rng = self.rng
        known = tuple(kind.names) if kind.names else (b"INIT", b"X-NAME", b"PROFILE")
        name = rng.choice(known)
        if rng.random() < 0.2 and kind in (KIND_APPLICATION, KIND_NAP_DEF, KIND_VENDOR_CONFIG):
            name = rng.choice(NAMES)
        if self.oddly(0.5):
            name = rng.choice(NAMES + ODD_NAMES)
        self.put(b"\x05")
        self.put(self.inline(name) if rng.random() < 0.8 else self.opaque(name))
        if rng.random() < 0.9:
            self.put(b"\x06")
            self.value()

    def parm(self, kind):
        rng = self.rng
        self.put(rng.choice((b"\x07", b"\x47", b"\xc7", b"\x87")) if self.oddly(0.2) else b"\x87")
        token = rng.choice(tuple(kind.parms))
        while token == 0x90:  # the comma is written behind a value only
            token = rng.choice(tuple(kind.parms))
        if self.oddly(0.1):
            token = rng.randint(0x05, 0x5B)
        if rng.random() < 0.03 and (token < 0x40 or kind.fresh_after_switch or self.oddly()):
            self.switch(rng.choice((0, 1, 2, 0x41)) if self.oddly() else rng.randint(0, 1))
        what, field = kind.parms.get(token, (TEXT, None))
        if what == LIST:
            self.list_parm(token)
        elif what == NAMED:
            self.named_parm(kind)
        else:
            self.name_and_value(token)
        if kind is KIND_APP_AUTH and field == "pszAAuthType" and rng.random() < 0.4:
            self.commas()
        self.put(b"\x41" if self.oddly(0.05) else b"\x01")

    def commas(self):
        rng = self.rng
        for _ in range(rng.randint(1, 3)):
            self.put(b"\x90")
            how = rng.random()
            if how < 0.3:
                self.put(self.string())
                return  # a string lasts up to END
            if how < 0.4:
                self.switch(rng.randint(0, 1))
            self.put(self.known_token() if how < 0.8 else self.unknown_token())

    # --- Characteristics -----------------------------------------------------------------------

    def type_of(self, kind):
        rng = self.rng
        if kind in TYPE_NAME_OF:
            name = TYPE_NAME_OF[kind]
            if self.oddly(0.1):
                name = rng.choice((b"wi-fi", b"ROAMIN", b"", b"Vodafone"))
            self.put(b"\x50")
            self.put(self.inline(name) if rng.random() < 0.7 else self.opaque(name))
            return
        token, pages = TYPE_OF[kind]
        if self.page not in pages:
            self.switch(pages[0])
        elif rng.random() < 0.1:
            self.switch(self.page)
        self.put(bytes((token,)))

    def attributes(self, kind):
        rng = self.rng
        while self.oddly(0.3):
            first = rng.choice(KINDS)
            if first in TYPE_NAME_OF:
                self.put(b"\x50")
                self.put(self.opaque(TYPE_NAME_OF[first]))
            else:
                self.type_of(first)
        self.type_of(kind)
        if self.oddly(0.05):
            self.switch(rng.randint(0, 2))
        self.put(b"\x01")

    def between(self):
        """What may stand between the parts of an element without meaning anything."""
        if self.rng.random() < 0.02:
            self.put(b"\x03 \n\0")
        if self.rng.random() < 0.02:
            self.put(b"\x00" + bytes((self.rng.randint(0, 3),)))

    def characteristic(self, kind, depth=0):
        rng = self.rng
        if rng.random() < 0.02:
            self.put(b"\x86" if rng.random() < 0.1 else b"\x06")
            if rng.random() < 0.5:
                self.put(b"\x01")
            return
        self.put(b"\x46" if self.oddly(0.05) else b"\xc6")
        self.attributes(kind)
        self.between()
        for _ in range(rng.choice((0, 1, 2, 3, 3, 4, 6))):
            self.parm(kind)
            self.between()
        children = CHILDREN.get(kind, ())
        for _ in range(rng.choice((0, 1, 1, 2, 3)) if children else int(self.oddly(0.1))):
            child = rng.choice(children or KINDS)
            if rng.random() < 0.03:
                child = rng.choice(KINDS)
            self.characteristic(child, depth + 1)
            if rng.random() < 0.02:
                self.put(b"\x03\n\0")
        self.put(b"\x41" if self.oddly(0.05) else b"\x01")

    def document(self):
        rng = self.rng
        root = rng.random() >= 0.05
        if root:
            self.put(rng.choice((b"\xc5\x46\x01", b"\x45", b"\xc5\x45\x031.0\0\x01")))
            self.between()
        for _ in range(rng.choice((1, 1, 2, 2, 3, 4, 6))):
            self.characteristic(rng.choices(KINDS, TOP_WEIGHTS)[0])
            if rng.random() < 0.02:
                self.put(b"\x03\n\0")
        self.put(b"\x01")
        if rng.random() < 0.05:
            self.put(bytes(rng.randbytes(rng.randint(1, 5))))

    def header(self):
        rng = self.rng
        if rng.random() < 0.15:
            self.table = DOCUMENT_TYPE + b"\0" + self.table
            public_id = b"\x00" + integer(rng.choice((0, 0, 5, 1000)))
        else:
            public_id = integer(PUBLIC_ID_PROV, rng.choice((0, 0, 0, 1, 4)))
        version = bytes((rng.choice((3, 3, 3, 1, 2, 0xFF)),))
        charset = integer(rng.choice((0, 3, 0x6A, 0x6A, 1000)))
        return [version, public_id, charset, integer(len(self.table)), self.table]
