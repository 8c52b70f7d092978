"""Builds the context that the queries read from the decoded nodes.

A context record is the decoder's record itself with the chains of its accepted children added; the
root is a record of chains.
"""

from reader import Record

# Top-level kinds in the order in which a node's slots are looked at, and the chain of each.
ROOT_CHAINS = (
    ("PxLogical", "ptPxLogical"),
    ("NapDef", "ptNapDef"),
    ("Bootstrap", "ptBootstrap"),
    ("ClientIdentity", "ptClientIdent"),
    ("VendorConfig", "ptVendorConfig"),
    ("Wifi", "ptWifi"),
    ("VoWifi", "ptVoWifi"),
    ("Application", "ptApplication"),
    ("Access", "ptAccess"),
)

# What each parent accepts; the first kind that a child carries decides.
CHILD_CHAINS = {
    "PxLogical": (
        ("PxAuthInfo", "ptPxAuthInfo"),
        ("PxPhysical", "ptPxPhysical"),
        ("Port", "ptPort"),
    ),
    "PxPhysical": (("Port", "ptPort"),),
    "NapDef": (("NapAuthInfo", "ptNapAuthInfo"), ("Validity", "ptValidity")),
    "Application": (
        ("Roaming", "ptRoaming"),
        ("AppAddr", "ptAppAddr"),
        ("AppAuth", "ptAppAuth"),
        ("Resource", "ptResource"),
    ),
    "AppAddr": (("Port", "ptPort"),),
}


def _attach_children(slot, record):
    """Attaches children up to the first that carries no accepted kind."""
    chains = CHILD_CHAINS.get(slot)
    for node in record.children or ():
        for child_slot, chain in chains:
            child = node.get(child_slot)
            if child is not None:
                _attach_children(child_slot, child)
                record.setdefault(chain, []).append(child)
                break
        else:
            return


def build(nodes):
    """The root of the context; None when there is no list of nodes."""
    if nodes is None:
        return None
    root = Record()
    for node in nodes:
        for slot, chain in ROOT_CHAINS:
            record = node.get(slot)
            if record is None:
                continue
            if slot == "ClientIdentity" and chain in root:
                break  # a second one: the kinds behind it in this node are not looked at
            _attach_children(slot, record)
            root.setdefault(chain, []).append(record)
    return root
