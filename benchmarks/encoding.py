"""Encodes the documents that are measured, each text in its place or in a string table of the caller's."""

import hashlib
import hmac
import sys
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parent.parent / "tools"))

from tokens import COMMA, NAMES, TYPES, VALUES

# Global tokens (Binary XML Content Format, WAP-192-WBXML).
SWITCH_PAGE, END, STR_I, STR_T = 0x00, 0x01, 0x03, 0x83

# Tags, with the flags for attributes (0x80) and content (0x40), and attributes that take a value
# (OMA-WAP-ProvCont, binary encoding). They stand on both pages.
DOCUMENT, CHARACTERISTIC, PARM = 0x05 | 0xC0, 0x06 | 0xC0, 0x07 | 0x80
NAME, VALUE, VERSION_1_0, TYPE = 0x05, 0x06, 0x46, 0x50

PUBLIC_ID = 0x0B
UTF_8 = 0x6A

# The key of the MACs: the IMSI 001010123456789 as it stands on a SIM card.
IMSI = bytes.fromhex("0910101032547698")


def mb_uint32(number):
    """A number in groups of seven bits, each but the last marked 0x80."""
    groups = [number & 0x7F]
    while number := number >> 7:
        groups.insert(0, 0x80 | number & 0x7F)
    return bytes(groups)


class Body:
    """The document element in WBXML, and the texts that it spells out."""

    def __init__(self, root, table):
        self.table = table  # index of a text in the string table
        self.texts = []
        self.page = 0
        self.out = bytearray()
        self.document(root)

    def document(self, root):
        self.out += bytes((DOCUMENT, VERSION_1_0, END))
        self.children(root)

    def children(self, parent):
        for element in parent.childNodes:
            if element.tagName == "characteristic":
                self.characteristic(element)
            else:
                self.parm(element)
        self.out.append(END)

    def characteristic(self, element):
        self.out.append(CHARACTERISTIC)
        self.start(TYPES, element.getAttribute("type"), TYPE)
        self.out.append(END)
        self.children(element)

    def parm(self, element):
        name = element.getAttribute("name")
        self.out.append(PARM)
        self.start(NAMES, name, NAME)
        if element.hasAttribute("value"):
            self.out.append(VALUE)
            self.value(name, element.getAttribute("value"))
        self.out.append(END)

    def start(self, tables, text, literal):
        """The token of a TYPE or NAME behind a switch to its page, or `literal` and the text."""
        for page in (self.page, 1 - self.page):
            token = tables[page].get(text)
            if token is not None:
                if page != self.page:
                    self.out += bytes((SWITCH_PAGE, page))
                    self.page = page
                self.out.append(token)
                return
        self.out.append(literal)
        self.text(text)

    def value(self, name, text):
        tokens = VALUES[self.page].get(name, {})
        *first, last = text.split(",") if name == "AAUTHTYPE" else [text]
        # A comma is a token of its own, and joins nothing to a text in front of it.
        if all(part in tokens for part in first):
            for part in first:
                self.out += bytes((tokens[part], COMMA))
            text = last
        if text in tokens:
            self.out.append(tokens[text])
        else:
            self.text(text)

    def text(self, text):
        self.texts.append(text)
        if text in self.table:
            self.out.append(STR_T)
            self.out += mb_uint32(self.table[text])
        else:
            self.out.append(STR_I)
            self.out += text.encode() + b"\0"


def encode_push(body):
    """A whole message with SEC and MAC, in a content type of quoted length."""
    mac = hmac.new(IMSI, body, hashlib.sha1).hexdigest().upper()
    content_type = b"\xB6\x91\x80\x92" + mac.encode() + b"\0"
    headers = bytes((0x1F, len(content_type))) + content_type
    return bytes((0x01, 0x06, len(headers))) + headers + body
