"""Decodes the WBXML body of a provisioning message into a list of characteristic nodes.

A second statement of what the library's decoder does, byte for byte, kept apart from its sources:
the two are compared on generated messages, so neither may be derived from the other.
"""

import kept
from reader import *
from vocabulary import *

class ParmReader(Reader):
    """PARM elements."""

    def parm_value(self, text):
        self.check_attribute(VALUE)
        token = self.peek()
        if token == SWITCH_PAGE:
            self.switch_page()
            token = self.peek_tag()
        if token != END:
            self.content(text)

    def parm_text(self, text, token):
        self.check_attribute(token)
        token = self.peek()
        if token == END:
            text.value = None
            return
        if token == SWITCH_PAGE:
            self.switch_page()
        elif token != VALUE:
            raise Refused(UNKNOWN_ELEMENT)
        self.parm_value(text)

    def parm_list(self, record, field):
        """Reads NAME and VALUE pairs up to END, each onto the text of the pair before it."""
        known = record.get(field)
        items = known if known is not None else []
        text = Text()
        while True:
            token = self.peek()
            if token == END:
                break
            writes = text.writes
            self.parm_text(text, token)
            if text.value is not None and text.writes != writes:
                items.append(text.value)
            known = items
        if known is not None:
            record[field] = items

    def comma_add(self, record, field):
        self.byte()
        token = self.peek()
        text = Text(record.get(field))
        if token in (STR_I, STR_T):
            text.append(b",")
            self.content(text)
        else:
            if token == SWITCH_PAGE:
                self.switch_page()
            text.add_token(self.byte())
        self.put(record, field, text)

    def store(self, record, field, text):
        """In place of what the field held, which is not released."""
        self.blocks_kept += field in record
        self.put(record, field, text)

    @staticmethod
    def put(record, field, text):
        if text.value is None:
            record.pop(field, None)
        else:
            record[field] = text.value

    def named_parm(self, kind, record):
        """A PARM whose name is given as text. What an unknown name leads to is the kind's own."""
        self.check_attribute(NAME_TEXT)
        name = Text()
        self.content(name)
        if kind is KIND_VENDOR_CONFIG:
            self.vendor_parm(record, name)
            return
        if not name.value:
            raise Refused(FAILED)
        token = self.peek()
        if token == END and kind is KIND_NAP_DEF and name.value == b"INIT":
            record["pszInit"] = b"empty"
        if token != VALUE:
            return
        field = kind.names.get(name.value) if kind.names else None
        if not field and kind in (KIND_ROAMING, KIND_WIFI, KIND_VO_WIFI):
            return
        value = Text()
        self.parm_value(value)
        if field:
            self.store(record, field, value)

    def vendor_parm(self, record, name):
        """Keeps whatever the name is."""
        if self.peek() == VALUE:
            value = Text()
            self.parm_value(value)
            self.store(record, "pszParamValue", value)
        self.store(record, "pszParamName", name)

    def token_behind_switch(self, kind):
        self.switch_page()
        if kind.fresh_after_switch:
            return self.peek()
        if self.at >= self.size:
            raise Refused(None)
        return self.peek_tag()

    def parm(self, kind, record):
        self.check_element(TAG_PARM)
        while True:
            token = self.peek()
            while token == SWITCH_PAGE:
                token = self.token_behind_switch(kind)
            if token == END:
                self.read_element()
                return
            what, field = kind.parms.get(token, (None, None))
            if what == TEXT:
                text = Text()
                self.parm_text(text, token)
                self.store(record, field, text)
                if kind is KIND_RESOURCE and field == "pszStartPage":
                    record.setdefault(field, b"startpage")
            elif what == LIST:
                self.list_or_go_on(kind, record, field)
            elif what == COMMA:
                self.comma_add(record, field)
            elif what == NAMED:
                self.named_parm(kind, record)
            else:
                raise Refused(UNKNOWN_ELEMENT)

    def list_or_go_on(self, kind, record, field):
        """A DOMAIN of PXPHYSICAL that cannot be read does not end the PARM."""
        try:
            self.parm_list(record, field)
        except Refused as refused:
            if kind is not KIND_PX_PHYSICAL or field != "ptDomain":
                raise
            if refused.code == TOO_MUCH_TEXT:
                raise


class Decoder(ParmReader):
    """Characteristics and the document."""

    def fill(self, node, kind):
        """A fresh record in the node's slot; one that was there is not released."""
        if kind:
            self.blocks_kept += kind.slot in node
            node[kind.slot] = Record()

    def type_as_text(self, node):
        """The record is made for a name that was read, even if something behind it cannot be."""
        name = Text()
        try:
            self.content(name)
        finally:
            kind = TYPE_NAMES.get(name.value)
            self.fill(node, kind)
        return kind

    def characteristic_attributes(self, node):
        """Fills the node's slots; returns the kind that the last attribute token leaves."""
        kind = None
        while True:
            token = self.peek()
            if token == END:
                self.read_element()
                return kind
            if token == SWITCH_PAGE:
                kind = None
                if not self.switch_page():
                    raise Refused(UNKNOWN_ELEMENT)
            elif token == TYPE_TEXT:
                self.at += 1
                kind = self.type_as_text(node)
            elif token in TYPES:
                kind = TYPES[token][self.page]
                self.at += 1
                self.fill(node, kind)
            else:
                raise Refused(UNKNOWN_ELEMENT)

    def characteristic(self):
        """One element; None for one without content."""
        self.check_element(TAG_CHARACTERISTIC)
        if not self.has_content:
            return None
        node = {}
        self.made.append(node)
        kind = self.characteristic_attributes(node) if self.has_attributes else None
        while True:
            tag = self.peek_tag()
            if tag == END:
                self.read_element()
                return node
            if tag == STR_I:
                self.skip_string()
            elif tag == SWITCH_PAGE:
                self.skip_page_switch()
            elif tag == TAG_CHARACTERISTIC and kind and kind.nests:
                record = node[kind.slot]
                record.children = self.siblings(record.children)
            elif tag == TAG_PARM and kind:
                self.parm(kind, node[kind.slot])
            else:
                raise Refused(UNKNOWN_ELEMENT)

    def siblings(self, nodes):
        """A run of characteristics. Only one string may stand behind each, nothing else."""
        nodes = nodes if nodes is not None else []
        while True:
            node = self.characteristic()
            if node is not None:
                nodes.append(node)
            tag = self.peek_tag()
            if tag == STR_I:
                self.skip_string()
                tag = self.peek_tag()
            if tag == END:
                return nodes

    def document_version(self):
        if self.byte() not in VERSION_ATTRIBUTES:
            raise Refused(UNKNOWN_ELEMENT)
        if self.at >= self.size:
            raise Refused(None)
        if self.peek_tag() not in (END, STR_I):
            raise Refused(UNKNOWN_ELEMENT)
        self.skip_attribute()

    def document(self):
        """The document element; None when it holds no characteristic at all."""
        self.check_element(TAG_DOCUMENT)
        if not self.has_content:
            return None
        if self.has_attributes:
            self.document_version()
        nodes = None
        while True:
            tag = self.peek_tag()
            if tag == END:
                self.read_element()
                return nodes
            if tag == STR_I:
                self.skip_string()
            elif tag == SWITCH_PAGE:
                self.skip_page_switch()
            elif tag == TAG_CHARACTERISTIC:
                nodes = self.siblings(nodes)
            else:
                raise Refused(UNKNOWN_ELEMENT)

    def body(self):
        tag = self.peek_tag()
        if tag == TAG_DOCUMENT:
            return self.document()
        if tag == TAG_CHARACTERISTIC:
            return self.siblings(None)
        if tag == SWITCH_PAGE:
            self.at += 1
            if self.at >= self.size:
                raise Refused(None)
            return None
        if tag in (TAG_PARM, END):
            return None
        raise Refused(UNKNOWN_ELEMENT)

    def decode(self):
        if not self.size:
            raise Refused(BAD_ARGUMENT)
        public_id = self.header()
        if public_id == 0:
            if self.table is None or self.table.split(b"\0", 1)[0] != DOCUMENT_TYPE:
                raise Refused(WRONG_TYPE)
        elif public_id != PUBLIC_ID_PROV:
            raise Refused(WRONG_TYPE)
        return self.body()


def decode(body):
    """Returns (result code, nodes, blocks that stay allocated when the tree is released): nodes is
    None where the document holds no list of them."""
    decoder = Decoder(body)
    code, nodes = 0, None
    try:
        nodes = decoder.decode()
    except Refused as refused:
        code = refused.code
    return code, nodes, decoder.blocks_kept + kept.in_tree(decoder.made)
