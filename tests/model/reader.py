"""Bytes, strings, tokens and values of one WBXML body."""

from vocabulary import *

BAD_ARGUMENT = 2
FAILED = 1
UNKNOWN_ELEMENT = 4101
EXHAUSTED = 4103
WRONG_TYPE = 4107
TOO_MUCH_TEXT = 4111

MIB = 1 << 20
TEXT_FREE = 8 * MIB  # so much text is always decoded
TEXT_PER_BYTE = 100  # and so much for each byte of the body


class Refused(Exception):
    """Ends the decode with a result code; None where only the failure itself is certain."""

    def __init__(self, code):
        super().__init__(code)
        self.code = code


class Text:
    """A text in the making. `writes` tells whether a value was read onto it."""

    __slots__ = ("value", "writes")

    def __init__(self, value=None):
        self.value = value
        self.writes = 0

    def append(self, piece):
        self.value = piece if self.value is None else self.value + piece
        self.writes += 1

    def replace(self, value):
        self.value = value
        self.writes += 1

    def add_token(self, token):
        """Appends what a value token stands for; False for a token that stands for nothing."""
        known = VALUE_TOKENS.get(token)
        if not known:
            return False
        text, joining = known
        if self.value is None or joining == APPEND:
            self.append(text)
        elif joining == JOIN:
            self.append(b"," + text)
        else:
            self.writes += 1
        return True


class Record(dict):
    """Fields of one characteristic, absent ones missing; nested nodes in `children`."""

    __slots__ = ("children",)

    def __init__(self):
        super().__init__()
        self.children = None


class Reader:
    """Bytes, integers and strings of one body."""

    def __init__(self, data):
        self.data = data
        self.size = len(data)
        self.at = 0
        self.table = None  # string table; None when there is none to refer to
        self.page = 0
        self.has_content = False
        self.has_attributes = False
        self.text_decoded = 0
        self.blocks_kept = 0  # by what is replaced and not released
        self.made = []  # every node

    def byte(self):
        if self.at >= self.size:
            raise Refused(EXHAUSTED)
        self.at += 1
        return self.data[self.at - 1]

    def peek(self):
        if self.at >= self.size:
            raise Refused(EXHAUSTED)
        return self.data[self.at]

    def peek_tag(self):
        return self.peek() & 0x3F

    def integer(self):
        """A multi-byte integer; None when it is cut or longer than five bytes."""
        value = 0
        for _ in range(5):
            if self.at >= self.size:
                return None
            byte = self.data[self.at]
            self.at += 1
            value = (value << 7 | byte & 0x7F) & 0xFFFFFFFF
            if byte < 0x80:
                return value
        return None

    def read_element(self):
        byte = self.byte()
        self.has_content = bool(byte & 0x40)
        self.has_attributes = bool(byte & 0x80)
        return byte & 0x3F

    def count_text(self, piece):
        self.text_decoded += len(piece)
        if self.text_decoded > TEXT_FREE and self.text_decoded > TEXT_PER_BYTE * self.size:
            raise Refused(TOO_MUCH_TEXT)

    def inline(self, text):
        """Up to the next zero byte, the token included when it was only peeked at."""
        end = self.data.find(b"\0", self.at)
        if end < 0:
            end = self.size
        piece = self.data[self.at : end]
        self.at = end + 1
        self.count_text(piece)
        text.append(piece)

    def table_reference(self, text):
        index = self.integer()
        if index is None or self.table is None:
            return False
        # An empty table still answers its own two zero bytes.
        if index > (len(self.table) - 1 if self.table else 1):
            return False
        end = self.table.find(b"\0", index)
        piece = self.table[index : end if end >= 0 else len(self.table)]
        self.count_text(piece)
        text.append(piece)
        return True

    def opaque(self, text):
        length = self.integer()
        if length is None or length > self.size - self.at:
            return False
        piece = self.data[self.at : self.at + length]
        self.at += length
        self.count_text(piece)
        text.append(piece.split(b"\0", 1)[0])
        return True

    def string_table(self):
        length = self.integer()
        if length is None or length > 0xFFFFFFFD:
            return
        # A table longer than what is left takes all of it; nothing is left to refer to it then.
        self.table = self.data[self.at : self.at + length]
        self.at += len(self.table)

    def header(self):
        """Returns the public identifier, 0 when it was not read. A cut header is no failure."""
        if self.at >= self.size:
            return 0
        self.at += 1
        public_id = self.integer()
        if public_id is None:
            return 0
        if public_id == 0 and self.integer() is None:
            return 0
        if self.integer() is not None:  # charset
            self.string_table()
        return public_id

    # --- Tokens ------------------------------------------------------------------------------

    def check_element(self, tag):
        if self.read_element() != tag:
            raise Refused(UNKNOWN_ELEMENT)
        if not self.has_content and self.at < self.size and self.peek_tag() == END:
            self.at += 1

    def check_attribute(self, token):
        if self.byte() != token:
            raise Refused(UNKNOWN_ELEMENT)

    def switch_page(self):
        """True when the page exists. The page byte is masked like a tag."""
        try:
            self.read_element()
            page = self.read_element()
        except Refused:
            return False
        if page > 1:
            return False
        self.page = page
        return True

    def skip_page_switch(self):
        self.read_element()
        self.read_element()

    def skip_string(self):
        self.inline(Text())

    def skip_attribute(self):
        while self.at < self.size:
            self.at += 1
            if self.data[self.at - 1] in SKIP_ATTRIBUTE_STOPS:
                return

    def skip_element(self):
        depth = 0
        while True:
            byte = self.byte()
            if byte == SWITCH_PAGE:
                self.byte()
            elif byte == END:
                depth -= 1
                if depth == 0:
                    self.at -= 1
                    return
            elif byte in (STR_I, STR_T, OPAQUE):
                self.at -= 1
                self.content(Text())
            else:
                depth += 1

    def string_run(self, text):
        """Strings and value tokens up to END or VALUE; False when something else interrupts."""
        while self.at < self.size:
            byte = self.data[self.at]
            self.at += 1
            if byte == STR_I:
                self.inline(text)
            elif byte == STR_T:
                if not self.table_reference(text):
                    return False
            elif byte in (END, VALUE):
                self.at -= 1
                return True
            elif not text.add_token(byte):
                return False
        return False

    def content(self, text):
        """One value, appended to what `text` holds."""
        byte = self.byte()
        if byte & 0x7F == STR_I:
            self.at -= 1
            if not self.string_run(text):
                raise Refused(EXHAUSTED)
        elif byte == OPAQUE:
            if not self.opaque(text):
                raise Refused(EXHAUSTED)
        elif text.add_token(byte):
            return
        elif byte >= 0x80:
            text.replace(bytes((byte,)))
        else:
            self.at -= 1
            self.skip_element()
