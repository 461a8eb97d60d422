"""Tiny pictures and tones of our own. Whole numbers only, and nothing is compressed: the same bytes everywhere."""

import io
import struct
import wave
import zlib


def _chunk(kind: bytes, data: bytes) -> bytes:
    return struct.pack(">I", len(data)) + kind + data + struct.pack(">I", zlib.crc32(kind + data))


def _stored(data: bytes) -> bytes:
    """A zlib stream of one uncompressed block; what a compressor makes differs between its versions."""
    size = struct.pack("<HH", len(data), len(data) ^ 0xFFFF)
    return b"\x78\x01\x01" + size + data + struct.pack(">I", zlib.adler32(data))


def png(top: tuple[int, int, int], bottom: tuple[int, int, int], width: int = 9, height: int = 16) -> bytes:
    """A wallpaper that fades from one colour to another."""
    rows = b""
    for y in range(height):
        pixel = bytes((a * (height - 1 - y) + b * y) // (height - 1) for a, b in zip(top, bottom))
        rows += b"\0" + pixel * width
    header = struct.pack(">IIBBBBB", width, height, 8, 2, 0, 0, 0)
    return (b"\x89PNG\r\n\x1a\n" + _chunk(b"IHDR", header) + _chunk(b"IDAT", _stored(rows)) + _chunk(b"IEND", b""))


def wav(period: int, samples: int = 800, rate: int = 8000) -> bytes:
    """A tone of a tenth of a second: a triangle wave of `period` samples."""
    half = period // 2
    wave_form = bytes(128 + 100 * (half - 2 * abs(half - i % period)) // half // 2 for i in range(samples))
    buffer = io.BytesIO()
    with wave.open(buffer, "wb") as out:
        out.setnchannels(1)
        out.setsampwidth(1)
        out.setframerate(rate)
        out.writeframes(wave_form)
    return buffer.getvalue()


def edj(text: bytes) -> bytes:
    """A container of the animation player's file format with one plain entry and no animation."""
    name = b"about\0"
    entry_start = 12 + 24
    data_start = entry_start + len(name)
    header = struct.pack(">III", 0x1EE70F42, 1, 0)
    entry = struct.pack(">IIIIII", data_start, len(text), len(text), entry_start, len(name), 0)
    return header + entry + name + text
