"""The changes that tools/mutate makes: every single one that can be made in a source, found by
regular expressions over the text without its comments. Lines stay where they are."""

import re
from dataclasses import dataclass


@dataclass(frozen=True)
class Change:
    file: str
    kind: str
    start: int  # offsets into the source
    end: int
    text: str  # what stands there instead
    line: int
    before: str  # the changed lines, as one
    after: str

    def apply(self, source):
        return source[:self.start] + self.text + source[self.end:]


# KIND, expression, what group 1 is replaced by. Order matters to nobody.
OPERATORS = [
    ("comparison", r"( == )", " != "),
    ("comparison", r"( != )", " == "),
    ("comparison", r"( < )", " <= "),
    ("comparison", r"( <= )", " < "),
    ("comparison", r"( > )", " >= "),
    ("comparison", r"( >= )", " > "),
    ("logic", r"( && )", " || "),
    ("logic", r"( \|\| )", " && "),
    ("arithmetic", r"( \+ )", " - "),
    ("arithmetic", r"( - )", " + "),
    ("arithmetic", r"( \* )(?=[\w(])", " + "),
    ("arithmetic", r"( << )", " >> "),
    ("arithmetic", r"( >> )", " << "),
    ("arithmetic", r"( & )", " | "),
    ("arithmetic", r"( \| )", " & "),
    ("arithmetic", r"( \+= )", " -= "),
    ("arithmetic", r"( -= )", " += "),
    ("arithmetic", r"( &= )", " |= "),
    ("arithmetic", r"( \|= )", " &= "),
    ("step", r"(\+\+)(?=[\w(*])|(?<=[\w)\]])(\+\+)", "--"),
    ("step", r"(--)(?=[\w(*])|(?<=[\w)\]])(--)", "++"),
    ("negation", r"(!)(?=[\w(*])", ""),
    ("choice", r"( \? )", " && false ? "),
    ("choice", r"( \? )", " || true ? "),
    ("jump", r"\b(break);", "continue"),
    ("jump", r"\b(continue);", "break"),
    ("value", r"\b(true)\b", "false"),
    ("value", r"\b(false)\b", "true"),
    ("return", r"\breturn (QVS_OK);", "QVS_ERROR_FAILED"),
    ("return", r"\breturn (QVS_ERROR_\w+);", "QVS_OK"),
    ("return", r"\breturn (?!QVS_ERROR_FAILED)(QVS_ERROR_\w+);", "QVS_ERROR_FAILED"),
    ("return", r"\breturn (result|failure);", "QVS_OK"),
    ("return", r"\breturn ((?!nullptr|true|false|result|failure|QVS_|0;)[\w>.-]+);", "{}"),
    ("result", r"[?:] (QVS_OK)\b", "QVS_ERROR_FAILED"),
    ("result", r"[?:] (QVS_ERROR_\w+)\b", "QVS_OK"),
]
NUMBER = re.compile(r"(?<![\w.'])(0[xX][0-9a-fA-F]+|\d+)([uUlL]*)(?![\w.'])")
CONDITION = re.compile(r"\b(?:if|while) (\()")
TEXT = re.compile(r'"((?:[^"\\\n]|\\.)*)"')
# Rows of tables: what stands between two commas, or a comma and a brace, and is made of braces or of
# a call whose name says that it makes a row.
ROW = re.compile(r"(?<=[{,\n])[ \n]*(\{|&\w+::|NATIVE\(|kindOf\(|[a-z]\w*(?:<[^;{}()]*>)?[({]|\.\w+ = |\w+,\s*$)",
                 re.MULTILINE)
STATEMENT = re.compile(r"(?<=[;{}:\n])\n? *((?:\(void\))?[\w:>.*\[\]-]+(?:<[^;{}()]*>)?\(|"
                       r"\*?[\w:>.\[\]()*-]+ [-+&|]?= |(?:\+\+|--)[\w>.*()-]+;|[\w>.-]+(?:\+\+|--);)")
NO_STATEMENT = re.compile(r"(?:return|if|while|for|switch|sizeof|static_assert|template|defined|requires)\b")


def masked(source):
    """The source with blanks for comments, texts and preprocessor lines, as long as before."""
    blank = lambda match: re.sub(r"[^\n]", " ", match.group())
    code = re.sub(r"//[^\n]*|/\*.*?\*/|^#(?:[^\n]*\\\n)*[^\n]*|static_assert\([^;]*;|\[\[[^\]\n]*\]\]|"
                  r"\bextern \"C\"|'(?:[^'\\\n]|\\.)+'", blank, source, flags=re.DOTALL | re.MULTILINE)
    return code, TEXT.sub(lambda m: '"' + " " * len(m.group(1)) + '"', code)


def balanced(code, start):
    """Behind the bracket that closes the one at `start`; None without it."""
    depth = 0
    for i in range(start, len(code)):
        depth += {"(": 1, "{": 1, "[": 1, ")": -1, "}": -1, "]": -1}.get(code[i], 0)
        if depth == 0:
            return i + 1
    return None


def up_to(code, start, ends):
    """Where one of `ends` stands outside of all brackets; None when a bracket closes before."""
    depth = 0
    for i in range(start, len(code)):
        depth += {"(": 1, "{": 1, "[": 1, ")": -1, "}": -1, "]": -1}.get(code[i], 0)
        if depth < 0:
            return i if code[i] in ends else None
        if depth == 0 and code[i] in ends and code[i] not in ")}]":
            return i
    return None


def found(code, texts):
    """(KIND, start, end, replacement) of every change."""
    for kind, expression, replacement in OPERATORS:
        for match in re.finditer(expression, code):
            group = match.lastindex
            yield kind, match.start(group), match.end(group), replacement
    for match in NUMBER.finditer(code):
        digits, suffix = match.groups()
        value = int(digits, 16 if digits[1:2] in ("x", "X") else 10)
        for moved in (value + 1, value - 1):
            if moved >= 0:
                written = f"0x{moved:02X}" if digits[1:2] in ("x", "X") else str(moved)
                yield "constant", *match.span(), written + suffix
    for match in CONDITION.finditer(code):
        start = match.start(1)
        end = balanced(code, start)
        inner = code[start + 1:end - 1] if end else ";"
        if end and ";" not in inner and not re.match(r"(?:const )?\w+ \*?\w+ = ", inner):
            yield "condition", start, start + 1, "(!("  # closed by complete()
            yield "condition", start, end, "(true)" if code.startswith("if", match.start()) else ""
            yield "condition", start, end, "(false)"
    for match in TEXT.finditer(texts):
        start = match.start(1)
        if match.group(1):
            changed = "#" if match.group(1)[0] not in "\\%" else "#" + match.group(1)[0]
            yield "text", start, start + 1, changed
    for match in STATEMENT.finditer(code):
        start = match.start(1)
        if NO_STATEMENT.match(code, start):
            continue
        end = up_to(code, start, ";")
        if end is not None and code[start:end].count("{") == code[start:end].count("}"):
            yield "dropped", start, end + 1, ";"
    for match in ROW.finditer(code):
        start = match.start(1)
        end = up_to(code, start, ",}")
        ahead = code[code.rfind("\n", 0, start) + 1:start]
        if end is not None and ";" not in code[start:end] and all(
                ahead.count(a) == ahead.count(b) for a, b in ("()", "{}")):
            yield "row", start, end + (code[end] == ","), ""


def changes(file, source):
    """All changes of a source, in the order in which they stand there."""
    texts, code = masked(source)
    made = {}
    for kind, start, end, text in found(code, texts):
        if not text and kind == "condition":
            continue
        if text == "(!(":
            end = balanced(code, start)
            text = "(!" + source[start:end] + ")"
        gone = source[start:end].count("\n") - text.count("\n")
        text += "\n" * gone
        first = source.rfind("\n", 0, start) + 1
        last = source.find("\n", end)
        before = " ".join(source[first:last].split())
        after = " ".join((source[first:start] + text + source[end:last]).split())
        if before != after:
            made[start, end, text] = Change(file, kind, start, end, text,
                                            source.count("\n", 0, start) + 1, before, after)
    return [made[key] for key in sorted(made)]
