"""Exceptions that are listed in a file, each with its reason. An entry is a paragraph:

    FILE KIND
        a line of the source as it stands there, or two: what it is changed from and to
    The reason.

Lines that begin with # are comments. What is found by a check and not listed, and what is listed and
not found any more, both fail."""

import sys
from pathlib import Path


def read(path):
    """The entries: {(FILE, KIND, source line, ...): reason}."""
    entries = {}
    for paragraph in Path(path).read_text().split("\n\n"):
        lines = [line for line in paragraph.splitlines() if line and not line.startswith("#")]
        if not lines:
            continue
        source = tuple(line.strip() for line in lines[1:] if line.startswith("    "))
        reason = " ".join(line for line in lines[1:] if not line.startswith("    "))
        key = (*lines[0].split(), *source)
        if not source or not reason or key in entries:
            sys.exit(f"{path}: {lines[0]}: no source line, no reason, or listed twice")
        entries[key] = reason
    return entries


def entry(key, kind_and_file=2):
    """An entry as it stands in the file, but for its reason."""
    lines = [" ".join(key[:kind_and_file])] + ["    " + line for line in key[kind_and_file:]]
    return "\n".join(lines)


def hold(path, found, what):
    """Holds what was found, {key: where}, against the list. False when they differ."""
    listed = read(path)
    for key in sorted(found.keys() - listed.keys()):
        print(f"{what}, and not listed in {path} ({found[key]}):\n{entry(key)}\n")
    for key in sorted(listed.keys() - found.keys()):
        print(f"Listed in {path}, and not found any more:\n{entry(key)}\n")
    return found.keys() == listed.keys()
