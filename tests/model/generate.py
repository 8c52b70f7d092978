"""Makes messages: well-formed ones, odd ones and hostile ones, repeatable from a seed.

Well-formed ones come from documents.py; odd ones are changed token by token, hostile ones byte by
byte.
"""

import random

from documents import Body, integer
from omacp_model import Message
from vocabulary import TYPE_TEXT

ODD_CHUNKS = (
    b"\x00\x00",
    b"\x00\x01",
    b"\x00\x02",
    b"\x00\x41",
    b"\x40\x01",
    b"\x80\x80",
    b"\x00",
    b"\x01",
    b"\x01\x01",
    b"\x41",
    b"\x81",
    b"\x03ab\0",
    b"\x03\0",
    b"\x03",
    b"\x43x\0",
    b"\x83\x00",
    b"\x83\x02",
    b"\x83\x8f\xff\xff\xff\x7f",
    b"\x83\xff\xff\xff\xff\xff",
    b"\xc3\x00",
    b"\xc3\x02hi",
    b"\xc3\x03a\0b",
    b"\xc3\x85\x80\x80\x80\x00",
    b"\xc3\x8f\xff\xff\xff\x7f",
    b"\x04",
    b"\x05",
    b"\x45",
    b"\x46",
    b"\x06",
    b"\x86",
    b"\xc6",
    b"\x07",
    b"\x47",
    b"\x87",
    b"\xc7",
    b"\x87\x01",
    b"\xc6\x01\x01",
    b"\x50",
    b"\x50\x03WI-FI\0",
    b"\x50\xc3\x05WI-FI",
    b"\x50\xc3\x07ROAMING",
    b"\x5c",
    b"\x80",
    b"\x84",
    b"\x8d",
    b"\x90",
    b"\x94",
    b"\x9a",
    b"\xfe",
    b"\x17\x06",
    b"\x06\x01",
)


def mutate_chunks(rng, chunks):
    """One change on the level of tokens."""
    place = rng.randrange(len(chunks)) if chunks else 0
    how = rng.randrange(9)
    if not chunks or how == 0:
        chunks.insert(place, rng.choice(ODD_CHUNKS))
    elif how == 1:
        del chunks[place]
    elif how == 2:
        chunks.insert(place, chunks[place])
    elif how == 3:
        other = rng.randrange(len(chunks))
        chunks[place], chunks[other] = chunks[other], chunks[place]
    elif how == 4:
        chunks[place] = rng.choice(ODD_CHUNKS)
    elif how == 5:
        chunks[place] = bytes((rng.randrange(256),))
    elif how == 6:
        other = rng.randrange(len(chunks))
        chunks[place:place] = chunks[other : other + rng.randint(1, 12)]
    elif how == 7:
        del chunks[place + 1 :]
    else:
        chunks.insert(place, rng.choice(ODD_CHUNKS) + rng.choice(ODD_CHUNKS))


def mutate_bytes(rng, data):
    """A few changes on the level of bytes."""
    data = bytearray(data)
    for _ in range(rng.choice((1, 1, 1, 2, 3, 8))):
        place = rng.randrange(len(data)) if data else 0
        how = rng.randrange(7)
        if not data or how == 0:
            data[place:place] = rng.randbytes(rng.randint(1, 4))
        elif how == 1:
            data[place] = rng.randrange(256)
        elif how == 2:
            data[place] ^= 1 << rng.randrange(8)
        elif how == 3:
            data[place] = rng.choice((0, 1, 3, 6, 7, 0x7F, 0x80, 0x83, 0xC3, 0xFF))
        elif how == 4:
            del data[place : place + rng.randint(1, 6)]
        elif how == 5:
            del data[place:]
        else:
            other = rng.randrange(len(data))
            data[place:place] = data[other : other + rng.randint(1, 30)]
    return bytes(data)


def large_bodies():
    """Messages around the limit on decoded text, on either side of each of its two bounds, and deep
    nesting."""

    def references(kind, token, table, count):
        parm = bytes((token,)) + b"\x06\x83\x00"
        parms = b"\x87" + (parm + b"\x01\x87") * (count - 1) + parm + b"\x01"
        content = b"\xc6" + kind + b"\x01" + parms + b"\x01"
        header = b"\x03\x0b\x6a" + integer(table) + b"x" * table
        return b"\x01\x06\x01\xb6" + header + b"\x45" + content + b"\x01"

    depth = 20000
    return [
        references(b"\x5b", 0x3B, 60000, 90),
        references(b"\x5b", 0x3B, 60000, 300),
        references(b"\x5b", 0x3B, 200000, 60),
        references(b"\x5b", 0x3B, 1000, 5000),
        references(b"\x51\x01\xc6\x52", 0x17, 60000, 300),
        references(b"\x51", 0x15, 60000, 300),
        b"\x01\x06\x01\xb6\x03\x0b\x6a" + integer(60000) + b"x" * 60000
        + b"\xc6\x51\x01\x87\x15\x06" + b"\x83\x00" * 300 + b"\x01\x01\x01",
        b"\x01\x06\x01\xb6\x03\x0b\x6a\x00" + b"\xc6\x51\x01" * depth + b"\x01" * depth,
        b"\x01\x06\x01\xb6\x03\x0b\x6a\x00" + b"\xc6\x51\x01" * depth + b"\x01" * (depth + 1),
        b"\x01\x06\x01\xb6\x03\x0b\x6a\x00\x45" + b"\xc6\x55\x01\x01" * 2000 + b"\x01",
    ]


LONG_RUN = 1000  # messages, from which on the large ones are among them


class Generator:
    """Messages of every class, drawn from one seed."""

    def __init__(self, seed, samples=()):
        self.rng = random.Random(seed)
        self.samples = list(samples)

    def content_type(self):
        rng = self.rng
        how = rng.random()
        if how < 0.7:
            return b"\xb6"
        if how < 0.8:
            return bytes((rng.choice((0xB5, 0xC4, 0xCE, 0xC2, 0x36, 0x42, 0xAF, 0x05)),))
        name = rng.choice(
            (
                b"application/vnd.wap.connectivity-wbxml",
                b"application/vnd.wap.connectivity-xml",
                b"application/vnd.syncml.notification",
                b"application/vnd.syncml.ds.notification",
                b"application/vnd.syncml.dm+wbxml",
            )
        )
        if rng.random() < 0.1:
            name = rng.choice((name.upper(), name + b"x", b"6" + name, b"D" * 63, b"D" * 64, b"5"))
        return name + b"\0"

    def mac(self):
        rng = self.rng
        size = 40 if rng.random() < 0.9 else rng.choice((0, 1, 43, 44, 60))
        return bytes(rng.choice(b"0123456789ABCDEF") for _ in range(size)) + b"\0"

    def security(self):
        rng = self.rng
        parts = []
        if rng.random() < 0.6:
            level = bytes((rng.choice((0x80, 0x81, 0x82, 0x83, 0, 1, 0xFF)),))
            name = rng.choice((b"SEC\0", b"sec\0", b"Sec\0", b"SEC!"))
            parts.append((b"\x91" if rng.random() < 0.7 else name) + level)
        if rng.random() < 0.6:
            name = rng.choice((b"MAC\0", b"mac\0", b"mAc?"))
            parts.append((b"\x92" if rng.random() < 0.7 else name) + self.mac())
        if rng.random() < 0.05:
            parts.reverse()
        if rng.random() < 0.1:
            parts.insert(rng.randint(0, len(parts)), rng.choice((b"\xaf\x82", b"\x8d\x90", b"S")))
        return b"".join(parts)

    def push(self, body):
        """The body behind a push header."""
        rng = self.rng
        content = self.content_type() + self.security()
        if rng.random() < 0.6:
            content = bytes((0x1F, len(content) & 0xFF)) + content
        if rng.random() < 0.2:
            content += rng.choice((b"\xaf\x82", b"\x84\x81\xea", rng.randbytes(3)))
        size = len(content)
        if rng.random() < 0.03:
            size += rng.randint(-6, 6)
        pdu = 0x06 if rng.random() < 0.99 else rng.randrange(256)
        return bytes((rng.randrange(256), pdu, min(max(size, 0), 255))) + content + body

    def simple_push(self, body):
        return b"\x01\x06\x01\xb6" + body

    def body(self, odd, mutations=0):
        body = Body(self.rng, odd)
        body.document()
        chunks = body.chunks
        if mutations and self.rng.random() < 0.1:
            chunks = body.header() + chunks
            for _ in range(mutations):
                mutate_chunks(self.rng, chunks)
            return b"".join(chunks)
        for _ in range(mutations):
            mutate_chunks(self.rng, chunks)
        return b"".join(body.header() + chunks)

    # --- Classes of messages -------------------------------------------------------------------

    def well_formed(self):
        return self.push(self.body(0))

    def odd(self):
        return self.simple_push(self.body(0.3))

    def mutated(self):
        return self.simple_push(self.body(0.1, self.rng.choice((1, 1, 2, 3))))

    def hostile(self):
        if self.samples and self.rng.random() < 0.3:
            return mutate_bytes(self.rng, self.rng.choice(self.samples))
        make = self.push if self.rng.random() < 0.3 else self.simple_push
        return mutate_bytes(self.rng, make(self.body(0.05)))

    def nearly_a_sample(self):
        """A prefix of a sample or a sample with one byte changed."""
        rng = self.rng
        if not self.samples:
            return self.hostile()
        data = bytearray(rng.choice(self.samples))
        place = rng.randrange(len(data))
        if rng.random() < 0.3:
            return bytes(data[:place])
        data[place] = rng.randrange(256)
        return bytes(data)

    def tiny(self):
        """A few tokens behind the opening of a characteristic or of the document."""
        rng = self.rng
        opening = [b"\x03\x0b\x6a\x00", b"\xc5\x46\x01", b"\x45"][: rng.choice((1, 2, 3))]
        if len(opening) == 3:
            del opening[1]
        if len(opening) == 2 and rng.random() < 0.8:
            page, token = rng.randint(0, 1), rng.randint(0x50, 0x5B)
            opening.append(b"\xc6" + (b"\x00\x01" if page else b""))
            opening.append(b"\x50\xc3\x05WI-FI" if token == TYPE_TEXT else bytes((token,)))
            if rng.random() < 0.9:
                opening.append(b"\x01")
            if rng.random() < 0.7:
                opening.append(b"\x87")
        tail = b"".join(
            rng.choice(ODD_CHUNKS) if rng.random() < 0.6 else bytes((rng.randrange(256),))
            for _ in range(rng.randint(0, 5))
        )
        closing = b"\x01" * rng.randint(0, 4)
        return self.simple_push(b"".join(opening) + tail + closing)

    def many(self):
        """Long runs of one thing."""
        rng = self.rng
        count = rng.choice((50, 300))
        head = b"\x03\x0b\x6a\x00\x45"
        parm = b"\x87\x17\x06\x03a\0\x01"
        family = rng.randrange(5)
        if family == 0:
            middle = b"\xc6\x51\x01" + parm * count + b"\x01"
        elif family == 1:
            middle = (b"\xc6\x55\x01\x87\x11\x06\xc3\x01b\x01\x01") * count
        elif family == 2:
            middle = b"\xc6\x51\x01" * count + b"\x01" * count
        elif family == 3:
            middle = b"\xc6\x52\x01" + b"\xc6\x53\x01\x01" * count + b"\x01"
        else:
            middle = b"\xc6\x51\x01\x87\x15\x06" + b"\x03x\0\x9a" * count + b"\x01\x01"
        return self.simple_push(head + middle + b"\x01")

    CLASSES = (
        (well_formed, 34),
        (odd, 24),
        (mutated, 16),
        (hostile, 10),
        (nearly_a_sample, 7),
        (tiny, 8.7),
        (many, 0.3),
    )

    def selections(self):
        rng = self.rng
        if rng.random() < 0.5:
            return (2, 1, 99)
        return tuple(rng.choice((1, 2, 3, 0, -1, 99)) for _ in range(rng.randint(0, 2)))

    def length(self, size):
        """The length argument: mostly the size of the array, else one that lies."""
        rng = self.rng
        how = rng.random()
        if how < 0.96:
            return size
        if how < 0.98:
            return rng.randint(0, size)
        lies = (size + 1, size + 4096, -1, -size, size | 1 << 32, 1 << 31, 1 << 62, size - 1)
        return rng.choice(lies)

    def message(self):
        rng = self.rng
        makers, weights = zip(*self.CLASSES)
        data = rng.choices(makers, weights)[0](self)
        mode = 0 if rng.random() < 0.95 else rng.choice((1, 1, 2, -1))
        keep = rng.random() < 0.02
        return Message(data, self.length(len(data)), mode, self.selections(), keep)

    def messages(self, count):
        """The samples, in a long run the large messages, then drawn ones up to `count` in all."""
        fixed = self.samples + (large_bodies() if count >= LONG_RUN else [])
        fixed = fixed[:count]
        for data in fixed:
            yield Message(data)
        for _ in range(len(fixed), count):
            yield self.message()
