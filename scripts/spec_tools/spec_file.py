"""Spec files as bytes: mark, declaration, elements two blanks deeper than their parent."""

from typing import Iterable, Union

MARK = b"\xef\xbb\xbf"
DECLARATION = '<?xml version="1.0" encoding="UTF-8" ?>'

# An element is (tag, text) or (tag, [elements]); an empty list or text gives an empty element.
Element = tuple[str, Union[str, list]]


def escape(text: str) -> str:
    for char, entity in (("&", "&amp;"), ("<", "&lt;"), (">", "&gt;"), ('"', "&quot;")):
        text = text.replace(char, entity)
    return text


def render(element: Element, depth: int = 0) -> str:
    tag, content = element
    indent = "  " * depth
    if not content:
        return f"{indent}<{tag}></{tag}>\n"
    if isinstance(content, str):
        return f"{indent}<{tag}>{escape(content)}</{tag}>\n"
    return f"{indent}<{tag}>\n{render_all(content, depth + 1)}{indent}</{tag}>\n"


def render_all(elements: Iterable[Element], depth: int) -> str:
    return "".join(render(element, depth) for element in elements)


def document(body: str) -> bytes:
    """A whole file: without the mark, or with "<" as first byte, a phone does not read it."""
    return MARK + (DECLARATION + "\n" + body).encode("utf-8")


def cut(text: str, width: int) -> str:
    """As a field of `width` bytes keeps it: one byte less, cut at a whole character."""
    return text.encode("utf-8")[: width - 1].decode("utf-8", errors="ignore")
