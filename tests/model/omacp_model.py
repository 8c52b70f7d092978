"""What the library answers to a pushed message, stated a second time and independently of it.

A Session takes messages as the parse method does and writes every answer of every native in the
canonical form of natives.py. The replay program writes the same from the library's own answers.
"""

import sys

import context
import decoder
import kept
import natives
import push

# Nesting is the message's to choose, and the decoder here follows it by calls.
sys.setrecursionlimit(4_000_000)

HEADER_ONLY = 1
NO_HEADER = (natives.number(-1),) * 5 + (natives.NULL,) * 2
HEADER_LABELS = [method for method, _ in natives.SESSION_METHODS[2:]]


def _no_context(queries):
    return b"".join([native.missing[-1] for native in queries]).replace(
        natives.BLANK_PROXY, natives.NULL
    )


NO_CONTEXT = _no_context(natives.QUERIES)
NO_CONTEXT_NAP_DEF = _no_context(natives.NAP_DEF_NATIVES)


class Message:
    """A message as the parse method gets it, and what is asked afterwards.

    length is the length argument; selections are handed to the index setter one after the other,
    the access points being asked again after each; keep leaves the session as it is afterwards.
    """

    def __init__(self, data, length=None, mode=0, selections=(2, 1, 99), keep=False):
        self.data = data
        self.length = len(data) if length is None else length
        self.mode = mode
        self.selections = selections
        self.keep = keep


class Session:
    """The one parse result that the library holds."""

    def __init__(self):
        self.header = None
        self.root = None
        self.code = None
        self.blocks_kept = 0

    def parse(self, message):
        """The parse method. Leaves the decoder's result code in `code`, None where it has none, and
        in `blocks_kept` the blocks that a later delete does not release, None where it is open."""
        self.code = None
        self.blocks_kept = 0 if self.root is None else None
        length = message.length & 0xFFFFFFFF
        self.header = None
        if length <= len(message.data):
            self.header = push.parse(message.data[:length])
        if not self.header:
            return False
        if message.mode == HEADER_ONLY:
            return True
        self.code, nodes, blocks_kept = decoder.decode(self.header.body)
        if self.blocks_kept is not None:
            self.blocks_kept = blocks_kept
        self.root = context.build(nodes)
        if self.root is None:
            self.header = None
            return False
        return True

    def delete(self):
        if self.root is not None and self.blocks_kept is not None:
            self.blocks_kept += kept.in_context(self.root)
        self.header = None
        self.root = None

    def select(self, index):
        """The index setter: moves the start of the access points."""
        chain = self.root.get("ptNapDef") if self.root is not None else None
        if chain and index != 1:
            start = index - 1 if 0 < index <= len(chain) else len(chain)
            self.root["ptNapDef"] = chain[start:]
            if self.blocks_kept is not None:
                self.blocks_kept += kept.passed_over(chain[:start])

    def header_answers(self):
        header = self.header
        if not header:
            return NO_HEADER
        return (
            natives.number(header.content_type),
            natives.number(header.header_length),
            natives.number(len(header.body)),
            natives.number(len(header.mac)),
            natives.number(header.sec),
            natives.data(header.mac),
            natives.data(header.body),
        )

    def _query(self, queries, without):
        if self.root is None:
            return without
        return b"".join([native.answers(self.root) for native in queries])

    def _everything(self):
        return b"".join(self.header_answers()) + self._query(natives.QUERIES, NO_CONTEXT)

    def run(self, message):
        """Every answer to one message, in canonical form."""
        parts = [natives.number(self.parse(message)), self._everything()]
        for index in message.selections:
            self.select(index)
            parts.append(self._query(natives.NAP_DEF_NATIVES, NO_CONTEXT_NAP_DEF))
        if not message.keep:
            self.delete()
            parts.append(self._everything())
        return b"".join(parts)

    # --- The same with a name for every answer, to show where two runs part -----------------------

    def _labelled_query(self, queries, note):
        root = self.root
        for native in queries:
            for indexes, answer in native.labelled(root if root is not None else decoder.Record()):
                if root is None and answer == natives.BLANK_PROXY:
                    answer = natives.NULL
                yield "%s(%s)%s" % (native.name, ", ".join(map(str, indexes)), note), answer

    def _labelled_everything(self, note):
        for name, answer in zip(HEADER_LABELS, self.header_answers()):
            yield "%s()%s" % (name, note), answer
        yield from self._labelled_query(natives.QUERIES, note)

    def run_labelled(self, message):
        """Yields (label, answer) for what run() writes."""
        yield "qvomacp_parser", natives.number(self.parse(message))
        yield from self._labelled_everything("")
        for index in message.selections:
            self.select(index)
            note = " after index %d was set" % index
            yield from self._labelled_query(natives.NAP_DEF_NATIVES, note)
        if not message.keep:
            self.delete()
            yield from self._labelled_everything(" after delete")
