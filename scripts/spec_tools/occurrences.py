"""A spec file as the list of its elements, with the row of the element table that each one means."""

import xml.parsers.expat
from dataclasses import dataclass, field
from pathlib import Path
from typing import Optional

from spec_tools import element_table, spec_file
from spec_tools.element_table import Row


@dataclass
class Occurrence:
    tag: str
    line: int
    parent: Optional["Occurrence"]
    row: Optional[Row]
    attributes: dict[str, str]
    text: str = ""
    children: list["Occurrence"] = field(default_factory=list)

    def child_text(self, tag: str) -> str:
        return next((c.text for c in self.children if c.tag == tag), "")

    @property
    def key(self) -> tuple[str, str]:
        """Tag and the parent that its row names."""
        return (self.row.tag, self.row.parent) if self.row else (self.tag, "?")


class NotASpecFile(Exception):
    pass


def read(path: Path, rows: list[Row]) -> list[Occurrence]:
    """In document order. A file that a phone would not read, or an XML parser refuses, is an error."""
    data = path.read_bytes()
    if not data.startswith(spec_file.MARK):
        raise NotASpecFile(f"{path}:1: begins with {data[:3].hex(' ')}, not with the mark ef bb bf")
    found: list[Occurrence] = []
    open_elements: list[Occurrence] = []
    parser = xml.parsers.expat.ParserCreate()

    def start(tag: str, attributes: dict[str, str]) -> None:
        parent = open_elements[-1] if open_elements else None
        enclosing = parent.tag if parent and parent.tag != "SW-Configuration" else ""
        row = element_table.find(rows, tag, enclosing)
        here = Occurrence(tag, parser.CurrentLineNumber, parent, row, attributes)
        if parent:
            parent.children.append(here)
        found.append(here)
        open_elements.append(here)

    def text(data: str) -> None:
        if open_elements:
            open_elements[-1].text += data

    parser.StartElementHandler = start
    parser.EndElementHandler = lambda _: open_elements.pop()
    parser.CharacterDataHandler = text
    try:
        parser.Parse(data, True)
    except xml.parsers.expat.ExpatError as error:
        raise NotASpecFile(f"{path}:{error.lineno}:{error.offset}: {xml.parsers.expat.errors.messages[error.code]}")
    return found
