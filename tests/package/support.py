"""Runs the project's scripts as their users do."""

import subprocess
import sys
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
PACKAGE = ROOT / "examples/package"
sys.path.insert(0, str(ROOT / "scripts"))


def run(script: str, *arguments: object) -> subprocess.CompletedProcess:
    command = [sys.executable, "-B", str(ROOT / "scripts" / script), *map(str, arguments)]
    return subprocess.run(command, capture_output=True, text=True)


def files_of(folder: Path) -> dict[str, bytes]:
    return {p.relative_to(folder).as_posix(): p.read_bytes() for p in folder.rglob("*") if p.is_file()}
