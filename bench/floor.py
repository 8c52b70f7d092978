"""The heap work that the records of a message need, one operation to a line:

    zero SLOT RECORD        a block for that record, cleared
    copy SLOT LENGTH        a block of so many bytes that are copied into it
    clear SLOT LENGTH       a block of so many bytes, cleared
    free SLOT               that block is released

It is derived from the document alone: a block for each record, each list and its nodes, each text of
the tree and its copy in the context, and for what the parse itself holds. The blocks of the tree
live until the context is there, and everything is released in the order in which a parse does it.
The reading of the document is that of the tests' model, which shares nothing with the library.
"""

import sys
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parent.parent / "tests" / "model"))

import context
import decoder
import kept
import push
from vocabulary import TYPE_NAMES

# The order in which the chains of the context are released; ptWifi never is.
ROOT_RELEASES = (
    "ptAccess",
    "ptApplication",
    "ptBootstrap",
    "ptClientIdent",
    "ptNapDef",
    "ptPxLogical",
    "ptVendorConfig",
    "ptVoWifi",
)
CHAINS = {chain: kind for chains in context.CHILD_CHAINS.values() for kind, chain in chains}
CHAINS.update({chain: kind for kind, chain in context.ROOT_CHAINS})
NAMED = {
    kind.slot: {field: name for name, field in kind.names.items()} for kind in TYPE_NAMES.values()
}
NAMED["Application"] = {
    field: name for name, field in decoder.KIND_APPLICATION.names.items()
}


class Work:
    """The operations so far."""

    def __init__(self):
        self.lines = []
        self.slots = 0

    def block(self, what, size):
        self.lines.append(f"{what} {self.slots} {size}")
        self.slots += 1
        return self.slots - 1

    def record(self, name):
        return self.block("zero", name)

    def text(self, value):
        """A text with its terminator."""
        return self.block("copy", len(value) + 1)

    def free(self, *slots):
        self.lines += [f"free {slot}" for slot in slots]


def plain_fields(record):
    """Texts and lists of texts; not the chains of children that the context added."""
    return [(field, value) for field, value in record.items() if field not in CHAINS]


class Tree:
    """The tree of a document: built whole, then released."""

    def __init__(self, work):
        self.work = work

    def nodes(self, nodes):
        """A list of characteristics. Returns what releases it."""
        work = self.work
        releases = []
        head = work.record("qvsList")
        for node in nodes:
            release = self.node(node)
            link = work.record("qvsListNode")
            releases += [*release, link]
        return [*releases, head]

    def node(self, node):
        work = self.work
        releases = []
        own = work.record("qvsWapCharacter")
        for kind, record in node.items():
            release = self.record(kind, record)
            # A roaming record stays.
            releases += [] if kind == "Roaming" else release
        return [*releases, own]

    def record(self, kind, record):
        work = self.work
        own = work.record("qvsWap" + kind)
        texts, lists, children = [], [], []
        for field, value in plain_fields(record):
            if isinstance(value, list):
                head = work.record("qvsList")
                for text in value:
                    item = work.text(text)
                    lists += [item, work.record("qvsListNode")]
                lists.append(head)
            elif field == "pszInit":
                continue
            else:
                texts += self.named_text(kind, field, value)
        if record.children is not None:
            children = self.nodes(record.children)
        return [*texts, *lists, *children, own]

    def named_text(self, kind, field, value):
        """A text; its parameter's name is a block meanwhile where it is given as a text."""
        work = self.work
        known = NAMED.get(kind, {}).get(field)
        name = work.text(known) if known else None
        slot = work.text(value)
        if name is not None:
            work.free(name)
        return [] if field in kept.TREE_TEXTS.get(kind, ()) else [slot]


class Context:
    """The context of a tree: built whole, then released."""

    def __init__(self, work):
        self.work = work

    def chain(self, kind, records):
        """Records one behind another; the last one is released first, each behind what it owns."""
        owned, own = [], []
        for record in records:
            own.append(self.work.record(f"qvsCtx{NAMES_IN_CONTEXT.get(kind, kind)}+1"))
            owned += self.fields(kind, record)
        return [*owned, *reversed(own)]

    def fields(self, kind, record):
        work = self.work
        texts, lists, chains = [], [], []
        for field, value in record.items():
            if field in CHAINS:
                continue
            if isinstance(value, list):
                items, links = [], []
                for text in value:
                    links.append(work.record("qvsCtxStrNode+1"))
                    items.append(work.text(text))
                lists += [*items, *reversed(links)]
            else:
                slot = work.text(value)
                left = kind == "Application" and field in kept.XCAP_TEXTS or field == "pszInit"
                texts += [] if left else [slot]
        for field, value in record.items():
            if field in CHAINS:
                release = self.chain(CHAINS[field], value)
                chains += [] if field == "ptRoaming" else release
        return [*texts, *lists, *chains]

    def build(self, root):
        releases = {}
        own = self.work.record("qvsClientProvCtx+1")
        for field, records in root.items():
            releases[field] = self.chain(CHAINS[field], records)
        return [slot for field in ROOT_RELEASES for slot in releases.get(field, ())] + [own]


NAMES_IN_CONTEXT = {"ClientIdentity": "ClientIdent"}


def operations(message):
    """The lines for a message that is accepted."""
    work = Work()
    header = push.parse(message)
    body = header.body
    push_blocks = [work.record("smlpushHdlrInfo"), work.text(body)]

    parse_blocks = [work.record("qvsWbxmlDecoder"), work.record("smlBuffer"), work.text(body)]
    reading = decoder.Decoder(body)
    nodes = reading.decode()
    if reading.table is not None:
        parse_blocks.append(work.block("copy", len(reading.table) + 2))
    document = work.record("qvsWapDoc")
    tree = Tree(work).nodes(nodes)
    work.free(*reversed(parse_blocks))
    # A record of the context is the tree's with the chains of its children.
    root = context.build(nodes)
    built = Context(work).build(root)
    work.free(*tree, document)
    work.free(*built)
    work.free(*reversed(push_blocks))
    return work.lines
