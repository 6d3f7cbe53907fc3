#!/usr/bin/env python3
"""Writes sample drawing files with stored previews, for trying the browser and for tests.

Usage:
    make_sample_drawings.py OUTDIR COUNT [--seed N] [--other-files M]

OUTDIR      folder to write into (made when missing)
COUNT       number of drawing files (*.dwg with names in mixed case)
--seed N    seed of the random choices (default 1): the same seed writes the same files
--other-files M
            also write M files that are not drawings (notes.txt, ...), for folder scans

Each drawing starts with a version string ("AC1018", "AC1024", "AC1027" or "AC1032") and keeps
at offset 0x0D the address of a preview directory laid out as the CAD application writes it: a
16-byte sentinel, the overall size, the entry count, entries of (code, start, size) with the
80-byte header data (code 1) first, the entries' bytes, and the closing sentinel. The pictures
are simple line drawings (door swing, stair, grid, circle, ...) as an 8-bit paletted bitmap
(code 2), a 24-bit bitmap (code 2) or a PNG (code 6); some drawings have no picture at all
(header data only, or no entries). Sizes and last-write times vary from file to file.
"""

import argparse
import math
import os
import random
import struct
import sys
import zlib

SENTINEL = bytes.fromhex("1F256D07D43628289D57CA3F9D44102B")
END_SENTINEL = bytes.fromhex("E0DA92F82BC9D7D762A835C062BBEFD4")
VERSIONS = ["AC1018", "AC1024", "AC1027", "AC1032"]
CODE_HEADER, CODE_BITMAP, CODE_PNG = 1, 2, 6
HEADER_DATA_SIZE = 80
PICTURE_SIZES = [(256, 160), (180, 112), (256, 102), (160, 160), (120, 200)]
OTHER_NAMES = ["notes{n}.txt", "Readme{n}.TXT", "plot{n}.plt", "drawing{n}.bak", "Logo{n}.png",
               "layers{n}.ini", "archive{n}.dwg.zip"]
COLOUR_SCHEMES = [((0, 0, 0), (255, 255, 255)), ((33, 40, 48), (255, 255, 255)),
                  ((255, 255, 255), (0, 0, 0))]
ONE_DAY = 86400
NEWEST_TIME = 1767225600  # 2026-01-01


class Canvas:
    """A picture of two colours: 0 background, 1 line."""

    def __init__(self, width, height):
        self.width, self.height = width, height
        self.rows = [bytearray(width) for _ in range(height)]

    def dot(self, x, y, thickness=2):
        for dy in range(thickness):
            for dx in range(thickness):
                px, py = int(x) + dx, int(y) + dy
                if 0 <= px < self.width and 0 <= py < self.height:
                    self.rows[py][px] = 1

    def line(self, x0, y0, x1, y1):
        steps = max(abs(x1 - x0), abs(y1 - y0), 1)
        for i in range(int(steps) + 1):
            t = i / steps
            self.dot(x0 + (x1 - x0) * t, y0 + (y1 - y0) * t)

    def arc(self, cx, cy, r, start_deg, end_deg):
        steps = max(int(r * math.radians(end_deg - start_deg) * 1.5), 8)
        for i in range(steps + 1):
            a = math.radians(start_deg + (end_deg - start_deg) * i / steps)
            self.dot(cx + r * math.cos(a), cy - r * math.sin(a))

    def rect(self, x0, y0, x1, y1):
        self.line(x0, y0, x1, y0)
        self.line(x1, y0, x1, y1)
        self.line(x1, y1, x0, y1)
        self.line(x0, y1, x0, y0)


def draw_door(c):
    w, h = c.width, c.height
    s = min(w, h) * 0.7
    x0, y0 = (w - s) / 2, (h + s) / 2
    c.line(x0 - s * 0.2, y0, x0, y0)             # wall left of the opening
    c.line(x0 + s, y0, x0 + s * 1.2, y0)         # wall right of it
    c.line(x0, y0, x0, y0 - s)                   # the leaf, open
    c.arc(x0, y0, s, 0, 90)                      # its swing


def draw_stair(c):
    w, h = c.width, c.height
    steps = 6
    sx, sy = w * 0.8 / steps, h * 0.8 / steps
    x, y = w * 0.1, h * 0.9
    for _ in range(steps):
        c.line(x, y, x, y - sy)
        c.line(x, y - sy, x + sx, y - sy)
        x, y = x + sx, y - sy
    c.line(w * 0.1, h * 0.9, x, h * 0.9)
    c.line(x, h * 0.9, x, y)


def draw_grid(c):
    w, h = c.width, c.height
    for i in range(5):
        x = w * 0.1 + w * 0.8 * i / 4
        y = h * 0.1 + h * 0.8 * i / 4
        c.line(x, h * 0.1, x, h * 0.9)
        c.line(w * 0.1, y, w * 0.9, y)


def draw_circle(c):
    w, h = c.width, c.height
    r = min(w, h) * 0.4
    c.arc(w / 2, h / 2, r, 0, 360)
    c.line(w / 2 - r * 1.15, h / 2, w / 2 + r * 1.15, h / 2)
    c.line(w / 2, h / 2 - r * 1.15, w / 2, h / 2 + r * 1.15)


def draw_house(c):
    w, h = c.width, c.height
    left, right, base, eaves = w * 0.25, w * 0.75, h * 0.9, h * 0.45
    c.rect(left, eaves, right, base)
    c.line(left, eaves, w / 2, h * 0.1)
    c.line(w / 2, h * 0.1, right, eaves)
    c.rect(w * 0.45, h * 0.65, w * 0.55, base)


def draw_window(c):
    w, h = c.width, c.height
    left, top, right, bottom = w * 0.2, h * 0.1, w * 0.8, h * 0.9
    c.rect(left, top, right, bottom)
    c.rect(left + 6, top + 6, right - 6, bottom - 6)
    c.line(w / 2, top + 6, w / 2, bottom - 6)
    c.line(left + 6, h / 2, right - 6, h / 2)


# Each name shows what its picture is, so a person can tell a tile by its drawing.
NAMES = [("Plan-{n:03d}.DWG", draw_grid), ("door-{n}.dwg", draw_door), ("Stair Detail {n}.Dwg", draw_stair),
         ("grid_{n:02d}.dwg", draw_grid), ("Circle {n}.DWG", draw_circle), ("Section B-{n}.dwg", draw_stair),
         ("site plan {n}.dWG", draw_house), ("WINDOW{n}.dwg", draw_window)]


def dib(canvas, bits, background, line):
    """A device-independent bitmap without file header, rows bottom-up."""
    width, height = canvas.width, canvas.height
    stride = (width * bits + 31) // 32 * 4
    palette = b""
    colours = 0
    if bits == 8:
        colours = 256
        entries = [background, line] + [(i, i, i) for i in range(2, 256)]
        palette = b"".join(bytes((b, g, r, 0)) for r, g, b in entries)
    rows = []
    for row in reversed(canvas.rows):
        if bits == 8:
            data = bytes(row)
        else:
            data = b"".join(bytes(reversed(line if v else background)) for v in row)
        rows.append(data + bytes(stride - len(data)))
    pixels = b"".join(rows)
    header = struct.pack("<IiiHHIIiiII", 40, width, height, 1, bits, 0, len(pixels), 0, 0, colours, 0)
    return header + palette + pixels


def png(canvas, background, line):
    def chunk(kind, data):
        return struct.pack(">I", len(data)) + kind + data + struct.pack(">I", zlib.crc32(kind + data))

    raw = b"".join(b"\0" + b"".join(bytes(line if v else background) for v in row) for row in canvas.rows)
    ihdr = struct.pack(">IIBBBBB", canvas.width, canvas.height, 8, 2, 0, 0, 0)
    return (b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", ihdr) + chunk(b"IDAT", zlib.compress(raw, 9))
            + chunk(b"IEND", b""))


def preview_block(address, entries):
    """The preview directory at address: sentinel, overall size, count, entries, their bytes."""
    table_size = 16 + 4 + 1 + 9 * len(entries)
    start = address + table_size
    table = b""
    for code, data in entries:
        table += struct.pack("<BII", code, start, len(data))
        start += len(data)
    overall = 1 + 9 * len(entries) + sum(len(data) for _, data in entries)
    return (SENTINEL + struct.pack("<IB", overall, len(entries)) + table
            + b"".join(data for _, data in entries) + END_SENTINEL)


def drawing_bytes(rng, version, entries):
    # Something that looks like the start of a file header, the preview address at 0x0D, then
    # filler up to the directory, as the real writers put other sections there.
    address = rng.choice([0x1C0, 0x200, 0x400 + rng.randrange(0, 0x400)])
    head = bytearray(version.encode("ascii") + bytes(address - 6))
    struct.pack_into("<I", head, 0x0D, address)
    head[0x11:] = rng.randbytes(address - 0x11)
    tail = rng.randbytes(rng.randrange(0, 4096))
    padding = bytes(rng.randrange(0, 60000))
    return bytes(head) + preview_block(address, entries) + tail + padding


def make_entries(rng, kind, drawing):
    header = (CODE_HEADER, bytes(HEADER_DATA_SIZE))
    if kind == "empty":
        return []
    if kind == "header":
        return [header]
    width, height = rng.choice(PICTURE_SIZES)
    canvas = Canvas(width, height)
    drawing(canvas)
    background, line = rng.choice(COLOUR_SCHEMES)
    if kind == "png":
        return [header, (CODE_PNG, png(canvas, background, line))]
    return [header, (CODE_BITMAP, dib(canvas, 8 if kind == "bmp8" else 24, background, line))]


def picture_kind(rng, index, version):
    # The first files cover every kind, so that even a small COUNT shows each of them.
    kinds = ["png", "bmp8", "bmp24", "header", "empty"]
    if index < len(kinds):
        return kinds[index]
    newer = version in ("AC1027", "AC1032")
    return rng.choices(kinds, weights=[5 if newer else 1, 4, 2, 1, 1])[0]


def main():
    parser = argparse.ArgumentParser(description="Write sample drawings with stored previews.")
    parser.add_argument("outdir")
    parser.add_argument("count", type=int)
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--other-files", type=int, default=0, metavar="M")
    args = parser.parse_args()
    if args.count < 0 or args.other_files < 0:
        parser.error("counts must not be negative")

    rng = random.Random(args.seed)
    os.makedirs(args.outdir, exist_ok=True)
    for index in range(args.count):
        version = rng.choice(VERSIONS)
        kind = picture_kind(rng, index, version)
        pattern, drawing = NAMES[index % len(NAMES)]
        path = os.path.join(args.outdir, pattern.format(n=index + 1))
        with open(path, "wb") as out:
            out.write(drawing_bytes(rng, version, make_entries(rng, kind, drawing)))
        stamp = NEWEST_TIME - rng.randrange(0, 5 * 365) * ONE_DAY - rng.randrange(0, ONE_DAY)
        os.utime(path, (stamp, stamp))
    for index in range(args.other_files):
        name = OTHER_NAMES[index % len(OTHER_NAMES)].format(n=index + 1)
        path = os.path.join(args.outdir, name)
        with open(path, "wb") as out:
            out.write(b"Not a drawing.\r\n" * rng.randrange(1, 200))
    print(f"{args.count} drawings and {args.other_files} other files in {args.outdir}")
    return 0


if __name__ == "__main__":
    sys.exit(main())
