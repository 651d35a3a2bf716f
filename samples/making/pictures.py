"""Pictures, drawn by arithmetic so that they are the same everywhere."""

import math
import struct
import zlib


def png(width, height, colour):
    """A PNG of width x height pixels, each as colour(x, y) has it: (red, green, blue)."""
    rows = b"".join(
        b"\0" + bytes(value for x in range(width) for value in colour(x, y)) for y in range(height)
    )

    def chunk(kind, data):
        return (struct.pack(">I", len(data)) + kind + data
                + struct.pack(">I", zlib.crc32(kind + data)))

    header = struct.pack(">IIBBBBB", width, height, 8, 2, 0, 0, 0)
    return (b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", header)
            + chunk(b"IDAT", zlib.compress(rows, 9)) + chunk(b"IEND", b""))


def quill(x, y):
    """The sign of the print room: a feather on a disc."""
    size = 180
    u, v = (x - size / 2) / (size / 2), (y - size / 2) / (size / 2)
    if math.hypot(u, v) > 0.97:
        return 255, 255, 255
    along, across = (u - v) / math.sqrt(2), (u + v) / math.sqrt(2)
    width = 0.24 * max(0.0, 1 - (along / 0.72) ** 2) ** 0.7
    if -0.86 < along < 0.72 and abs(across) < max(0.018, width if along > -0.45 else 0.018):
        barb = abs(across) > 0.02 and math.sin(38 * (along - 0.7 * abs(across))) > 0.86
        return (24, 70, 110) if barb or abs(across) < 0.012 else (250, 246, 232)
    shade = int(28 * v)
    return 24 + shade // 2 + 14, 84 + shade, 132 + shade
