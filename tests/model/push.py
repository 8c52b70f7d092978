"""The push header: content type, SEC, MAC and where the body lies."""

CONTENT_TYPES = (
    (54, b"application/vnd.wap.connectivity-wbxml"),
    (53, b"application/vnd.wap.connectivity-xml"),
    (68, b"application/vnd.syncml.notification"),
    (78, b"application/vnd.syncml.ds.notification"),
    (66, b"application/vnd.syncml.dm+wbxml"),
)
SHORT_CODES = {code for code, _ in CONTENT_TYPES}
BY_NAME = {name: code for code, name in CONTENT_TYPES}

FIXED_SIZE = 3  # transaction identifier, PDU type, header length
PDU_PUSH = 0x06
LENGTH_QUOTE = 0x1F
LONGEST_TYPE = 63
LONGEST_MAC = 43


class Header:
    """What a parsed header tells."""

    def __init__(self, content_type, header_length, sec, mac, body):
        self.content_type = content_type
        self.header_length = header_length
        self.sec = sec
        self.mac = mac
        self.body = body


def _content_type(message, at):
    """Returns (code, place behind it), or None when the message is rejected."""
    if at >= len(message):
        return None
    byte = message[at]
    short = byte & 0x7F
    if 0x20 <= byte <= 0x7F:
        # A text without an end, or too long, is no name; its first byte may still be a code.
        end = message.find(b"\0", at, at + LONGEST_TYPE + 1)
        code = BY_NAME.get(message[at:end]) if end >= 0 else None
        if code:
            return code, end + 1
    return (short, at + 1) if short in SHORT_CODES else None


def _parameter(message, at, token, name):
    """The place of the parameter's value; None when it is absent or would lie past the end."""
    if message[at : at + 1] == token:
        value = at + 1
    elif message[at : at + 3].upper() == name:
        value = at + 4
    else:
        return None
    return value if value < len(message) else None


def parse(message):
    """Returns the header, or None when the message is rejected."""
    if len(message) <= FIXED_SIZE or message[1] != PDU_PUSH:
        return None
    header_length = message[2]
    if len(message) < FIXED_SIZE + header_length:
        return None
    found = _content_type(message, 5 if message[3] == LENGTH_QUOTE else 3)
    if not found:
        return None
    content_type, at = found
    sec = 0
    value = _parameter(message, at, b"\x91", b"SEC")
    if value is not None:
        sec = message[value]
        at = value + 1
    mac = b""
    value = _parameter(message, at, b"\x92", b"MAC")
    if value is not None:
        end = message.find(b"\0", value)
        if end < 0 or end - value > LONGEST_MAC:
            return None
        mac = message[value:end]
    body = message[FIXED_SIZE + header_length :]
    return Header(content_type, header_length, sec, mac, body)
