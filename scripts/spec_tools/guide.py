"""The tables of docs/package-format.md: what the guide tells authors is what packages are checked against."""

import re
from pathlib import Path
from typing import NamedTuple, Optional

GUIDE = Path(__file__).resolve().parents[2] / "docs/package-format.md"
_HEAD = re.compile(r"^\| Element \| Inside \| Text \|")
_WORD = re.compile(r'"([^"]*)"')
_LANGUAGE_ROW = re.compile(r"^\| ([a-z_]+) \| ([a-z]{2}_[A-Z]{2}) \|$", re.MULTILINE)


class Entry(NamedTuple):
    tag: str
    inside: str
    inside_needed: bool
    text: str

    @property
    def key(self) -> tuple[str, str]:
        """Tag and the parent that its row of the element table must have."""
        return self.tag, self.inside if self.inside_needed else ""


def _entry(line: str) -> Entry:
    tag, inside, text = (cell.strip() for cell in line.strip("|\n").split("|")[:3])
    return Entry(tag.strip("`"), inside.strip("()"), bool(inside) and not inside.startswith("("), text)


def read(path: Path = GUIDE) -> list[Entry]:
    """In the guide's order, which is that of the element table."""
    entries: list[Entry] = []
    in_table = False
    for line in path.read_text("utf-8").splitlines():
        if _HEAD.match(line):
            in_table = True
        elif in_table and line.startswith("|--"):
            continue
        elif in_table and line.startswith("|"):
            entries.append(_entry(line))
        else:
            in_table = False
    return entries


def languages(path: Path = GUIDE) -> dict[str, str]:
    return dict(_LANGUAGE_ROW.findall(path.read_text("utf-8")))


def refusal(entry: Entry, text: str, known_languages: dict[str, str]) -> Optional[str]:
    """Why the phone would not take this text as it stands, or None. An empty text is never delivered."""
    kind = entry.text
    words = _WORD.findall(kind)
    size = len(text.encode("utf-8"))
    if text == "" or kind == "unused":
        return None
    if words:
        return None if text in words else f"not one of {', '.join(words)}"
    if kind in ("none", "src"):
        return "no text is expected"
    if kind == "language":
        fits = text in known_languages or text == "automatic" and entry.tag == "DefLanguage" or "_" in text[1:]
        return None if fits else "not a known language"
    if kind == "time":
        return None if re.fullmatch(r"\d+(\.\d+)?", text) else "not a time in seconds"
    if kind.startswith("number"):
        bounds = [int(n) for n in re.findall(r"\d+", kind)] or [0, 2**31 - 1]
        fits = re.fullmatch(r"0|[1-9]\d*", text) and bounds[0] <= int(text) <= bounds[1]
        return None if fits else f"not a {kind}"
    most = int(kind.split()[1])
    if size > most:
        return f"{size} bytes, {most} are kept"
    return "not digits" if kind.startswith("digits") and not text.isdecimal() else None
