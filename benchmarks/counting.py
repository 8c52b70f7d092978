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

# The eight documents, and how often each is parsed in the two runs whose difference counts. What
# only the first rounds cost is in both.
ROUNDS = {
    "160": (50, 250), "300": (50, 250), "547": (50, 250), "2k": (20, 120), "8k": (10, 40),
    "29k": (4, 14), "200k": (2, 8), "1m": (2, 6),
}

# How often a sample is.
SAMPLE_ROUNDS = 20, 120

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


def documents():
    """Every document and how often it is parsed: the eight, then the samples."""
    samples = sorted(path.stem for path in BUILD.glob("*.push") if path.stem not in ROUNDS)
    return {**ROUNDS, **{name: SAMPLE_ROUNDS for name in samples}}


def prepare():
    """Makes the documents and the steps of their floors."""
    BUILD.mkdir(parents=True, exist_ok=True)
    model = sorted((ROOT / "tests" / "model").glob("*.py"))
    encoder = [BENCH / "encoding.py", ROOT / "tools" / "tokens.py"]
    samples = sorted((ROOT / "samples").iterdir())
    eight = [BUILD / f"{name}.push" for name in ROUNDS]
    made(eight, [BENCH / "documents", *encoder, *samples], [BENCH / "documents"])
    messages = sorted(BUILD.glob("*.push"))
    blocks = [path.with_suffix(".blocks") for path in messages]
    made(blocks, [BENCH / "blocks", *model, *messages], [BENCH / "blocks"])


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
    """What callgrind has counted: instructions, calls that ask for a heap block, and the instructions
    by (file, function)."""

    def __init__(self, instructions, blocks, functions):
        self.instructions = instructions
        self.blocks = blocks
        self.functions = functions

    def per_round(self, fewer, rounds):
        """What a round costs when there were so many more than in the other run."""
        functions = {name: (cost - fewer.functions.get(name, 0)) / rounds
                     for name, cost in self.functions.items()}
        return Counts((self.instructions - fewer.instructions) / rounds,
                      (self.blocks - fewer.blocks) / rounds, functions)


def read_counts(profile):
    """The counts in a profile that callgrind has written."""
    names, images = {}, {}
    image = function = called = ""
    instructions = blocks = 0
    functions = {}
    of_call = False  # the next line of costs is that of a call
    for line in profile.splitlines():
        if found := re.match(r"(c?)(fn|ob)=\((\d+)\)(?: (.*))?$", line):
            is_called, what, number, name = found.groups()
            known = names if what == "fn" else images
            name = known.setdefault(number, name)
            if what == "ob":
                image = image if is_called else Path(name).name
            elif is_called:
                called = name
            else:
                function = name
        elif line.startswith("calls="):
            of_call = True
            if called in ALLOCATORS:
                blocks += int(line[6:].split()[0])
        elif found := re.match(r"(?:summary|totals): (\d+)", line):
            instructions = int(found[1])
        elif found := re.match(r"[+*-]?\d* (\d+)$", line):
            if not of_call:
                key = image, function.split("'")[0]
                functions[key] = functions.get(key, 0) + int(found[1])
            of_call = False
    return Counts(instructions, blocks, functions)


def run(bits, library, what, name, count):
    BUILD.mkdir(parents=True, exist_ok=True)
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
    fewer, more = (run(bits, library, what, path, times) for times in rounds)
    return more.per_round(fewer, many - few)
