"""The element table of the library, read from its source, so that no second list can go stale."""

import re
from pathlib import Path
from typing import NamedTuple, Optional

SOURCE = Path(__file__).resolve().parents[2] / "zel-lib/zel-svc/spec/zel-svc-element-table.cpp"
ROW_COUNT = 304
_ROW = re.compile(r'\{\s*ZEL_SVC_ELEMENT_\w+,\s*"([^"]+)",\s*"([^"]*)",')


class Row(NamedTuple):
    index: int
    tag: str
    parent: str  # "" for any


def read(path: Path = SOURCE) -> list[Row]:
    rows = [Row(i, tag, parent) for i, (tag, parent) in enumerate(_ROW.findall(path.read_text("utf-8")))]
    if len(rows) != ROW_COUNT:
        raise SystemExit(f"{path}: {len(rows)} rows found, {ROW_COUNT} expected")
    return rows


def find(rows: list[Row], tag: str, enclosing: str) -> Optional[Row]:
    """The row that a start tag inside `enclosing` means. The first match wins, as on the phone."""
    for row in rows:
        if row.tag == tag and row.parent in ("", enclosing):
            return row
    return None
