"""Counts the blocks that stay allocated by design when a message has been parsed and deleted."""

# Fields that the release of the tree leaves alone, those of the context that its release leaves.
TREE_TEXTS = {
    "Application": (
        "pszFrom",
        "pszXcapAuidDcs",
        "pszXcapAuidPms",
        "pszXcapAuidCdms",
        "pszXcapImeiHeader",
        "pszXcapTidHeader",
    ),
    "VendorConfig": ("pszParamName", "pszParamValue"),
}
XCAP_TEXTS = TREE_TEXTS["Application"][1:]
NAP_DEF_CHAINS = ("ptNapAuthInfo", "ptValidity")


def _texts(record):
    return sum(isinstance(value, bytes) for value in record.values())


def in_tree(nodes):
    """Blocks that the release of these nodes leaves."""
    kept = 0
    for node in nodes:
        for slot, record in node.items():
            kept += sum(field in record for field in TREE_TEXTS.get(slot, ()))
            if slot == "Roaming":
                kept += 1 + _texts(record)
    return kept


def _record(record):
    """A record of an access point with its texts and lists."""
    lists = [value for value in record.values() if isinstance(value, list)]
    return 1 + _texts(record) + sum(2 * len(texts) for texts in lists)


def passed_over(nap_defs):
    """Access points that the index setter has left behind, with all that hangs from them."""
    kept = 0
    for nap_def in nap_defs:
        fields = {key: value for key, value in nap_def.items() if key not in NAP_DEF_CHAINS}
        kept += _record(fields)
        for chain in NAP_DEF_CHAINS:
            kept += sum(_record(record) for record in nap_def.get(chain, ()))
    return kept


def in_context(root):
    """Blocks that the release of the context leaves, and a text that its build has copied twice."""
    kept = sum(1 + _texts(record) for record in root.get("ptWifi", ()))
    kept += sum("pszInit" in record for record in root.get("ptNapDef", ()))
    for application in root.get("ptApplication", ()):
        kept += sum(field in application for field in XCAP_TEXTS)
        kept += "pszFrom" in application
        kept += sum(1 + _texts(record) for record in application.get("ptRoaming", ()))
    return kept
