# SPDX-License-Identifier: MIT
"""Pictures as rows of RGB bytes: parts of them, and PNG files in and out."""

import struct
import zlib

SIGNATURE = b"\x89PNG\r\n\x1a\n"


class Picture:
    """Rows of three bytes a pixel, top row first. Two pictures are equal when every pixel is."""

    def __init__(self, width, height, rows):
        self.width = width
        self.height = height
        self.rows = rows

    def __eq__(self, other):
        return (self.width, self.height, self.rows) == (other.width, other.height, other.rows)

    def pixel(self, x, y):
        return tuple(self.rows[y][3 * x:3 * x + 3])

    def part(self, left, top, right, bottom):
        """The pixels from (left, top) to (right, bottom), both included."""
        rows = [row[3 * left:3 * (right + 1)] for row in self.rows[top:bottom + 1]]
        return Picture(right - left + 1, bottom - top + 1, rows)

    def save(self, path):
        def chunk(kind, data):
            return struct.pack(">I", len(data)) + kind + data + struct.pack(">I", zlib.crc32(kind + data))

        header = struct.pack(">IIBBBBB", self.width, self.height, 8, 2, 0, 0, 0)
        data = zlib.compress(b"".join(b"\0" + row for row in self.rows), 1)
        path.write_bytes(SIGNATURE + chunk(b"IHDR", header) + chunk(b"IDAT", data) + chunk(b"IEND", b""))


def load(path):
    """Reads a PNG file of 8 bits a channel, RGB or RGBA, not interlaced; what is clear counts for nothing."""
    content = path.read_bytes()
    if not content.startswith(SIGNATURE):
        raise ValueError(f"{path} is no PNG file")
    chunks = {}
    at = len(SIGNATURE)
    while at < len(content):
        length, kind = struct.unpack_from(">I4s", content, at)
        chunks[kind] = chunks.get(kind, b"") + content[at + 8:at + 8 + length]
        at += length + 12
    width, height, depth, colors, _, _, interlaced = struct.unpack(">IIBBBBB", chunks[b"IHDR"])
    if depth != 8 or colors not in (2, 6) or interlaced:
        raise ValueError(f"{path} is a kind of PNG file that is not read here")

    size = 3 if colors == 2 else 4
    lines = unfiltered(zlib.decompress(chunks[b"IDAT"]), width * size, height, size)
    rows = []
    for line in lines:
        row = bytearray(3 * width)
        for channel in range(3):
            row[channel::3] = line[channel::size]
        rows.append(bytes(row))
    return Picture(width, height, rows)


def unfiltered(data, length, height, size):
    """The lines of a PNG image, each of which says how it was predicted from what is left of and above it."""
    above = bytearray(length)
    for y in range(height):
        start = y * (length + 1)
        method = data[start]
        line = bytearray(data[start + 1:start + 1 + length])
        for x in range(length if method != 0 else 0):
            left = line[x - size] if x >= size else 0
            corner = above[x - size] if x >= size else 0
            line[x] = (line[x] + predicted(method, left, above[x], corner)) & 0xFF
        yield line
        above = line


def predicted(method, left, up, corner):
    if method == 1:
        return left
    if method == 2:
        return up
    if method == 3:
        return (left + up) // 2
    if method != 4:
        raise ValueError(f"PNG has no filter {method}")
    guess = left + up - corner
    return min((left, up, corner), key=lambda value: abs(guess - value))
