"""Instructions and heap blocks by callgrind, of what a program does COUNT times."""

import os
import re
import subprocess
import sys
import tempfile
from pathlib import Path

ROOT = Path(__file__).resolve().parent.parent
BENCH = ROOT / "benchmarks"
BUILD = ROOT / "build" / "bench"
SOURCES = ROOT / "jni" / "src" / "ClientProv"

# The documents, and how often each is parsed in the two runs whose difference counts. What only the
# first rounds cost is in both.
ROUNDS = {
    "160": (10, 60), "300": (10, 60), "547": (10, 60), "2k": (5, 25), "8k": (4, 12), "29k": (3, 7),
    "200k": (2, 8), "1m": (2, 5),
}

# A repeated string instruction counts once for each byte that it moves, which says nothing of what
# it takes: memcpy and memset are told to do without, in the library and in the floor.
ENVIRONMENT = {
    **os.environ,
    "GLIBC_TUNABLES": ":".join(
        f"glibc.cpu.x86_rep_{name}_threshold=0x7fffffff" for name in ("movsb", "stosb")
    ),
}

ALLOCATORS = ("malloc", "calloc", "realloc")


def fail(message):
    sys.exit(f"{Path(sys.argv[0]).name}: {message}")


def width_of(library):
    """32 or 64."""
    image = Path(library).read_bytes()[:5]
    if image[:4] != b"\x7fELF":
        fail(f"{library} is no ELF file")
    return 32 if image[4] == 1 else 64


def newest(paths):
    return max(path.stat().st_mtime for path in paths)


def made(paths, sources, command):
    """Runs a command that makes files from others unless they are newer."""
    if not all(path.exists() for path in paths) or newest(sources) > newest(paths):
        subprocess.run([str(word) for word in command], check=True, stdout=subprocess.DEVNULL)


def prepare():
    """Makes the documents and the steps of their floors."""
    BUILD.mkdir(parents=True, exist_ok=True)
    model = sorted((ROOT / "tests" / "model").glob("*.py"))
    encoder = ROOT / "tools" / "encode-sample"
    documents = [BUILD / f"{name}.push" for name in ROUNDS]
    made(documents, [BENCH / "documents", encoder], [BENCH / "documents"])
    blocks = [BUILD / f"{name}.blocks" for name in ROUNDS]
    made(blocks, [BENCH / "blocks", *model, *documents], [BENCH / "blocks"])


def program(bits):
    """The program that is counted. malloc and memset stay two calls, as they are written."""
    BUILD.mkdir(parents=True, exist_ok=True)
    path = BUILD / f"counted-{bits}"
    sources = [BENCH / "counted.cpp", BENCH / "floor.cpp"]
    headers = [BENCH / "floor.h", *SOURCES.glob("*.h")]
    made([path], sources + headers, [
        "g++", "-std=c++20", "-O2", "-fno-builtin", f"-m{bits}", "-Wall", "-Wextra",
        "-I", SOURCES, *sources, "-ldl", "-o", path,
    ])
    return path


class Counts:
    """What callgrind has counted: instructions, and calls that ask for a heap block."""

    def __init__(self, instructions, blocks):
        self.instructions = instructions
        self.blocks = blocks

    def __sub__(self, other):
        return Counts(self.instructions - other.instructions, self.blocks - other.blocks)

    def __truediv__(self, count):
        return Counts(self.instructions / count, self.blocks / count)


def read_counts(profile):
    """The counts in a profile that callgrind has written."""
    names, called = {}, None
    instructions = blocks = 0
    for line in profile.splitlines():
        if found := re.match(r"c?fn=\((\d+)\)(?: (.*))?$", line):
            if found[2]:
                names[found[1]] = found[2]
            called = names[found[1]]
        elif line.startswith("calls=") and called in ALLOCATORS:
            blocks += int(line[6:].split()[0])
        elif found := re.match(r"(?:summary|totals): (\d+)", line):
            instructions = int(found[1])
    return Counts(instructions, blocks)


def run(bits, library, what, name, count):
    with tempfile.NamedTemporaryFile(dir=BUILD) as profile:
        command = ["valgrind", "-q", "--tool=callgrind", f"--callgrind-out-file={profile.name}",
                   program(bits), library, what, name, count]
        done = subprocess.run([str(word) for word in command], capture_output=True, text=True,
                              env=ENVIRONMENT)
        if done.returncode:
            fail(f"counting {name} ended with {done.returncode}\n{done.stderr}")
        return read_counts(Path(profile.name).read_text(encoding="utf-8"))


def count(bits, library, what, path, rounds):
    """What one round costs: "header", "parse", "message" or "floor", see counted.cpp."""
    few, many = rounds
    runs = [run(bits, library, what, path, times) for times in (many, few)]
    return (runs[0] - runs[1]) / (many - few)
