"""What a spec file is checked for without knowing what a setting means."""

import re
from typing import Iterator

from spec_tools.occurrences import Occurrence

NAME_MAX = 31
_ENTITY = re.compile(rb"&(?!amp;|#10;|lt;|gt;|quot;)[^;\s]{0,12};?")
_COMMENT = re.compile(rb"<!--.*?-->", re.DOTALL)
_SINGLE_QUOTED = re.compile(rb"<[A-Za-z][^<>]*=\s*'")

Problem = tuple[int, str]  # line, what is wrong


def _line_of(data: bytes, offset: int) -> int:
    return data.count(b"\n", 0, offset) + 1


def raw_problems(data: bytes) -> Iterator[Problem]:
    """Well-formed XML that the phone reads otherwise. Comments may hold anything."""
    data = _COMMENT.sub(lambda comment: b"\n" * comment.group().count(b"\n"), data)
    for match in _ENTITY.finditer(data):
        yield _line_of(data, match.start()), f"{match.group().decode()} is not decoded by the phone"
    for match in _SINGLE_QUOTED.finditer(data):
        yield _line_of(data, match.start()), "a value in single quotes runs on to the next double quote"
    for match in re.finditer(rb"<!\[CDATA\[", data):
        yield _line_of(data, match.start()), "text in a CDATA section is not seen"


def _name_problems(element: Occurrence) -> Iterator[Problem]:
    for name in (element.tag, *element.attributes):
        if len(name) > NAME_MAX:
            yield element.line, f"name {name} has {len(name)} characters, {NAME_MAX} are allowed"


def _row_problems(element: Occurrence) -> Iterator[Problem]:
    where = f"inside {element.parent.tag}" if element.parent else "as root"
    if element.row is None:
        yield element.line, f"{element.tag} {where} has no row in the element table"


def _text_problems(element: Occurrence) -> Iterator[Problem]:
    if element.children:
        if element.text.strip():
            yield element.line, f"{element.tag} holds elements and the text {element.text.strip()!r}"
    elif element.text != element.text.strip():
        yield element.line, f"{element.tag}: blanks around {element.text!r}; trailing ones belong to the value"


def element_problems(elements: list[Occurrence]) -> Iterator[Problem]:
    for element in elements:
        yield from _name_problems(element)
        yield from _row_problems(element)
        yield from _text_problems(element)
