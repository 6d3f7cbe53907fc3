#!/usr/bin/env python3
"""Draws the module's pictures into a folder for the resource compiler.

Usage: draw_resources.py OUTDIR

Writes:
  toolbar_top.bmp     7 buttons of 16 x 20 (Begin, Increase, Decrease, Aligne and the
                      three slots that the search label, search box and layer label cover)
  toolbar_bottom.bmp  2 buttons of 80 x 20 (accept and cancel; captions lie over them)
  mainframe.ico       window icon: a drawing sheet under a magnifier, 16 and 32 pixels
  about.ico           about box icon: a window full of drawing thumbnails, 16 and 32 pixels
  loading.ani         animated cursor: ten frames of an hourglass with running sand

Tool bar strips are 4-bit bitmaps with the standard 16-colour palette, so that the
framework can map light grey (192, 192, 192) to the button face and the other greys
and black to the system's 3-D colours. Icons and cursor frames are 32-bit with alpha
and a matching AND mask. Only the standard library is used.
"""

import math
import os
import struct
import sys

# ---------------------------------------------------------------------------
# Tool bar strips: pixel art over the standard 16-colour palette.

VGA_PALETTE = [
    (0, 0, 0), (128, 0, 0), (0, 128, 0), (128, 128, 0),
    (0, 0, 128), (128, 0, 128), (0, 128, 128), (192, 192, 192),
    (128, 128, 128), (255, 0, 0), (0, 255, 0), (255, 255, 0),
    (0, 0, 255), (255, 0, 255), (0, 255, 255), (255, 255, 255),
]
BACKGROUND = 7  # light grey: becomes the button face

# One letter per palette entry; '.' lets what lies below show through.
INK = {
    'k': 0, 'r': 1, 'n': 2, 'y': 3, 'b': 4, 'm': 5, 'c': 6, 's': 7,
    'g': 8, 'R': 9, 'N': 10, 'Y': 11, 'B': 12, 'M': 13, 'C': 14, 'w': 15,
}

BEGIN = [
    "................",
    ".kkkkkkkkkkkkkk.",
    ".kbbbbbbbbbbbbk.",
    ".kkkkkkkkkkkkkk.",
    "................",
    ".......kk.......",
    "......kBBk......",
    ".....kBBBBk.....",
    "....kBBBBBBk....",
    "...kBBBBBBBBk...",
    "..kkkkBBBBkkkk..",
    ".....kBBBBk.....",
    ".....kBBBBk.....",
    ".....kBBBBk.....",
    ".....kBBBBk.....",
    ".....kkkkkk.....",
]

LENS = [
    "................",
    "....kkkk........",
    "..kkwwwwkk......",
    "..kwwwwwwk......",
    ".kwwwwwwwwk.....",
    ".kwwwwwwwwk.....",
    ".kwwwwwwwwk.....",
    ".kwwwwwwwwk.....",
    "..kwwwwwwk......",
    "..kkwwwwkk......",
    "....kkkk.rrr....",
    "..........rrr...",
    "...........rrr..",
    "............rrr.",
    ".............rrr",
    "..............rr",
]

ALIGNE = [
    "RRR..........RRR",
    "R..............R",
    "R.kkkkk..kkkkk.R",
    "..kwwwk..kwwwk..",
    "..kwbwk..kwbwk..",
    "..kwwwk..kwwwk..",
    "..kkkkk..kkkkk..",
    "................",
    "................",
    "..kkkkk..kkkkk..",
    "..kwwwk..kwwwk..",
    "..kwbwk..kwbwk..",
    "..kwwwk..kwwwk..",
    "R.kkkkk..kkkkk.R",
    "R..............R",
    "RRR..........RRR",
]

TEXT_BOX = [
    "................",
    "................",
    "................",
    "................",
    "gggggggggggggggw",
    "gkkkkkkkkkkkkkkw",
    "gkwwwwwwwwwkwwsw",
    "gkwbbwbwwbwkwwsw",
    "gkwbwwbbwbwkwwsw",
    "gkwbbwbbwbbkwwsw",
    "gkwwwwwwwwwwwwsw",
    "gssssssssssssssw",
    "wwwwwwwwwwwwwwww",
    "................",
    "................",
    "................",
]

LAYER = [
    ".......kk.......",
    ".....kk@@kk.....",
    "...kk@@@@@@kk...",
    ".kk@@@@@@@@@@kk.",
    "...kk@@@@@@kk...",
    ".....kk@@kk.....",
    ".......kk.......",
]

CHECK = [
    "...........nn",
    "..........nnn",
    ".........nnn.",
    "........nnn..",
    ".nn....nnn...",
    "nnnn..nnn....",
    ".nnnnnnn.....",
    "..nnnnn......",
    "...nnn.......",
    "....n........",
]


class IndexedImage:
    """A palette-index raster with sprite stamping."""

    def __init__(self, width, height, fill):
        self.width = width
        self.height = height
        self.pixels = [[fill] * width for _ in range(height)]

    def stamp(self, rows, left, top):
        for dy, row in enumerate(rows):
            for dx, ch in enumerate(row):
                if ch == '.':
                    continue
                self.pixels[top + dy][left + dx] = INK[ch]


def magnifier(sign):
    """A lens with a handle; sign is '+', '-' or '' for a plain glass."""
    rows = [list(r) for r in LENS]
    if sign in ('+', '-'):
        for y in (5, 6):
            for x in range(3, 9):
                rows[y][x] = 'b'
    if sign == '+':
        for y in range(3, 9):
            for x in (5, 6):
                rows[y][x] = 'b'
    if sign == '':
        # Glass tint and a highlight, so the plain lens reads as a search glass.
        for y in range(2, 10):
            for x in range(1, 11):
                if rows[y][x] == 'w':
                    rows[y][x] = 'C'
        for x, y in ((3, 4), (3, 5), (4, 3), (5, 3)):
            rows[y][x] = 'w'
    return ["".join(r) for r in rows]


def layers():
    cell = [['.'] * 16 for _ in range(16)]
    for top, ink in ((7, 'B'), (4, 'N'), (1, 'Y')):
        for dy, row in enumerate(LAYER):
            for dx, ch in enumerate(row):
                if ch == '.':
                    continue
                cell[top + dy][dx] = ink if ch == '@' else ch
    return ["".join(r) for r in cell]


def cross(size):
    rows = []
    for y in range(size):
        row = ""
        for x in range(size):
            on = abs(x - y) <= 1 or abs(x + y - (size - 1)) <= 1
            row += 'R' if on else '.'
        rows.append(row)
    return rows


def top_toolbar():
    # Button images in the order of the non-separator items of tool bar 128:
    # 32771 Begin, 32774 Increase, 32775 Decrease, 32782 Aligne,
    # 32804 search label slot, 32790 search box slot, 32805 layer label slot.
    glyphs = [BEGIN, magnifier('+'), magnifier('-'), ALIGNE, magnifier(''), TEXT_BOX, layers()]
    image = IndexedImage(16 * len(glyphs), 20, BACKGROUND)
    for i, glyph in enumerate(glyphs):
        assert len(glyph) == 16 and all(len(r) == 16 for r in glyph), i
        image.stamp(glyph, 16 * i, 2)
    return image


def bottom_toolbar():
    # Accept and cancel: the caption statics cover the middle, so the sign sits at the left.
    image = IndexedImage(160, 20, BACKGROUND)
    image.stamp(CHECK, 4, 5)
    image.stamp(cross(10), 80 + 5, 5)
    return image


def write_bmp4(path, image):
    row_bytes = ((image.width + 1) // 2 + 3) & ~3
    palette = b"".join(struct.pack("<BBBB", b, g, r, 0) for (r, g, b) in VGA_PALETTE)
    bits = bytearray()
    for y in reversed(range(image.height)):  # bottom-up
        row = bytearray(row_bytes)
        for x, index in enumerate(image.pixels[y]):
            row[x // 2] |= index << (4 if x % 2 == 0 else 0)
        bits += row
    info = struct.pack("<IiiHHIIiiII", 40, image.width, image.height, 1, 4, 0,
                       len(bits), 2835, 2835, 16, 0)
    offset = 14 + len(info) + len(palette)
    header = struct.pack("<2sIHHI", b"BM", offset + len(bits), 0, 0, offset)
    with open(path, "wb") as f:
        f.write(header + info + palette + bits)


# ---------------------------------------------------------------------------
# Icons and cursor frames: anti-aliased vector drawing on an RGBA canvas.

SUBSAMPLES = 4


class Canvas:
    """Premultiplication-free RGBA float canvas; shapes are coverage predicates."""

    def __init__(self, size):
        self.size = size
        self.rgba = [[(0.0, 0.0, 0.0, 0.0)] * size for _ in range(size)]

    def fill(self, inside, colour, alpha=1.0, bounds=None):
        """Paints colour (r, g, b) where inside(x, y) holds, with coverage per pixel."""
        x0, y0, x1, y1 = bounds if bounds else (0, 0, self.size, self.size)
        x0 = max(0, int(math.floor(x0)))
        y0 = max(0, int(math.floor(y0)))
        x1 = min(self.size, int(math.ceil(x1)))
        y1 = min(self.size, int(math.ceil(y1)))
        n = SUBSAMPLES
        for py in range(y0, y1):
            for px in range(x0, x1):
                hits = 0
                for sy in range(n):
                    for sx in range(n):
                        if inside(px + (sx + 0.5) / n, py + (sy + 0.5) / n):
                            hits += 1
                if hits:
                    self._blend(px, py, colour, alpha * hits / (n * n))

    def _blend(self, x, y, colour, a):
        r, g, b, da = self.rgba[y][x]
        out_a = a + da * (1 - a)
        if out_a <= 0:
            return
        mix = lambda s, d: (s * a + d * da * (1 - a)) / out_a
        self.rgba[y][x] = (mix(colour[0], r), mix(colour[1], g), mix(colour[2], b), out_a)

    # Shapes, in canvas units (pixels of this canvas).
    def rect(self, x0, y0, x1, y1, colour, alpha=1.0):
        self.fill(lambda x, y: x0 <= x < x1 and y0 <= y < y1, colour, alpha, (x0, y0, x1, y1))

    def round_rect(self, x0, y0, x1, y1, radius, colour, alpha=1.0):
        def inside(x, y):
            if not (x0 <= x < x1 and y0 <= y < y1):
                return False
            cx = min(max(x, x0 + radius), x1 - radius)
            cy = min(max(y, y0 + radius), y1 - radius)
            return (x - cx) ** 2 + (y - cy) ** 2 <= radius ** 2
        self.fill(inside, colour, alpha, (x0, y0, x1, y1))

    def disc(self, cx, cy, r, colour, alpha=1.0):
        self.fill(lambda x, y: (x - cx) ** 2 + (y - cy) ** 2 <= r * r, colour, alpha,
                  (cx - r, cy - r, cx + r, cy + r))

    def ring(self, cx, cy, r, width, colour, alpha=1.0):
        outer, inner = r + width / 2, r - width / 2
        self.fill(lambda x, y: inner ** 2 <= (x - cx) ** 2 + (y - cy) ** 2 <= outer ** 2,
                  colour, alpha, (cx - outer, cy - outer, cx + outer, cy + outer))

    def line(self, ax, ay, bx, by, width, colour, alpha=1.0):
        """A capsule: every point within width/2 of the segment."""
        dx, dy = bx - ax, by - ay
        length2 = dx * dx + dy * dy or 1e-9
        half = width / 2

        def inside(x, y):
            t = max(0.0, min(1.0, ((x - ax) * dx + (y - ay) * dy) / length2))
            ex, ey = x - (ax + t * dx), y - (ay + t * dy)
            return ex * ex + ey * ey <= half * half
        self.fill(inside, colour, alpha,
                  (min(ax, bx) - half, min(ay, by) - half, max(ax, bx) + half, max(ay, by) + half))

    def polygon(self, points, colour, alpha=1.0):
        def inside(x, y):
            result = False
            j = len(points) - 1
            for i, (xi, yi) in enumerate(points):
                xj, yj = points[j]
                if (yi > y) != (yj > y) and x < (xj - xi) * (y - yi) / (yj - yi) + xi:
                    result = not result
                j = i
            return result
        xs = [p[0] for p in points]
        ys = [p[1] for p in points]
        self.fill(inside, colour, alpha, (min(xs), min(ys), max(xs), max(ys)))


class Scaled:
    """Draws a scene designed on a 32-unit grid onto a canvas of any size."""

    def __init__(self, canvas):
        self.c = canvas
        self.k = canvas.size / 32.0

    def w(self, width):
        # Keep strokes at least one pixel wide on small canvases.
        return max(width * self.k, 1.0)

    def fill(self, inside, colour, bounds):
        k = self.k
        self.c.fill(lambda x, y: inside(x / k, y / k), colour, 1.0, tuple(b * k for b in bounds))

    def rect(self, x0, y0, x1, y1, colour, alpha=1.0):
        k = self.k
        self.c.rect(x0 * k, y0 * k, x1 * k, y1 * k, colour, alpha)

    def round_rect(self, x0, y0, x1, y1, r, colour, alpha=1.0):
        k = self.k
        self.c.round_rect(x0 * k, y0 * k, x1 * k, y1 * k, r * k, colour, alpha)

    def disc(self, cx, cy, r, colour, alpha=1.0):
        k = self.k
        self.c.disc(cx * k, cy * k, r * k, colour, alpha)

    def ring(self, cx, cy, r, width, colour, alpha=1.0):
        k = self.k
        self.c.ring(cx * k, cy * k, r * k, self.w(width), colour, alpha)

    def line(self, ax, ay, bx, by, width, colour, alpha=1.0):
        k = self.k
        self.c.line(ax * k, ay * k, bx * k, by * k, self.w(width), colour, alpha)

    def polygon(self, points, colour, alpha=1.0):
        k = self.k
        self.c.polygon([(x * k, y * k) for x, y in points], colour, alpha)


INK_DARK = (30, 40, 60)
PAPER = (255, 255, 255)
PAPER_SHADE = (205, 214, 228)
BLUEPRINT = (20, 90, 200)
GLASS = (170, 220, 250)
HANDLE = (120, 70, 30)
TITLE_BLUE = (25, 70, 160)
MARK_BLUE = (50, 110, 220)


def draw_mainframe(size):
    """The 32-pixel window icon: a drawing sheet with a small plan, a magnifier over its lower right corner."""
    canvas = Canvas(size)
    s = Scaled(canvas)
    # Sheet with a folded corner.
    sheet = [(4, 2), (21, 2), (27, 8), (27, 29), (4, 29)]
    s.polygon([(x + 1, y + 1) for x, y in sheet], (0, 0, 0), 0.25)  # shadow
    s.polygon(sheet, INK_DARK)
    s.polygon([(5, 3), (20.5, 3), (26, 8.5), (26, 28), (5, 28)], PAPER)
    s.polygon([(21, 2), (21, 8), (27, 8)], PAPER_SHADE)
    s.line(21, 2.5, 21, 8, 1, INK_DARK)
    s.line(21, 8, 26.5, 8, 1, INK_DARK)
    # A small floor plan.
    s.line(8, 7, 17, 7, 1.4, BLUEPRINT)
    s.line(8, 7, 8, 20, 1.4, BLUEPRINT)
    s.line(8, 20, 14, 20, 1.4, BLUEPRINT)
    s.line(17, 7, 17, 12, 1.4, BLUEPRINT)
    s.line(8, 13, 13, 13, 1.0, BLUEPRINT)
    s.line(8, 24, 15, 24, 1.0, BLUEPRINT)
    # Magnifier.
    s.line(22.5, 22.5, 29.5, 29.5, 3.6, HANDLE)
    s.disc(18.5, 18.5, 6.2, GLASS, 0.85)
    s.ring(18.5, 18.5, 6.2, 2.2, INK_DARK)
    s.line(15.2, 16.8, 17.0, 15.0, 1.2, PAPER, 0.9)
    return canvas


def draw_mainframe_small():
    """The 16-pixel window icon, drawn on whole pixels so that it stays crisp."""
    canvas = Canvas(16)
    canvas.polygon([(1, 0), (10, 0), (14, 4), (14, 16), (1, 16)], INK_DARK)
    canvas.polygon([(2, 1), (10, 1), (13, 4), (13, 15), (2, 15)], PAPER)
    canvas.polygon([(10, 1), (10, 4), (13, 4)], PAPER_SHADE)
    canvas.rect(3, 3, 8, 4, BLUEPRINT)
    canvas.rect(3, 3, 4, 10, BLUEPRINT)
    canvas.rect(3, 10, 6, 11, BLUEPRINT)
    canvas.rect(3, 13, 7, 14, BLUEPRINT)
    canvas.line(11.5, 11.5, 15, 15, 2.2, HANDLE)
    canvas.disc(9, 9, 3.6, GLASS, 0.9)
    canvas.ring(9, 9, 3.6, 1.3, INK_DARK)
    return canvas


def draw_about_small():
    """The 16-pixel about icon: the window with its four tiles, on whole pixels."""
    canvas = Canvas(16)
    canvas.rect(0, 1, 16, 15, TITLE_BLUE)
    canvas.rect(1, 4, 15, 14, (225, 230, 238))
    for row in range(2):
        for col in range(2):
            x0, y0 = 2 + col * 7, 5 + row * 5
            canvas.rect(x0, y0, x0 + 5, y0 + 3, PAPER)
            canvas.rect(x0 + 1, y0 + 1, x0 + 4, y0 + 2, BLUEPRINT)
            canvas.rect(x0, y0 + 3, x0 + 5, y0 + 4,
                        MARK_BLUE if (row, col) == (0, 1) else (150, 155, 165))
    return canvas


def draw_about(size):
    """The 32-pixel about icon, the browser itself: a window with four drawing tiles, one of them marked."""
    canvas = Canvas(size)
    s = Scaled(canvas)
    s.round_rect(2, 3, 31, 30, 2, (0, 0, 0), 0.25)  # shadow
    s.round_rect(1, 2, 30, 29, 2, TITLE_BLUE)
    s.rect(2.5, 6.5, 28.5, 27.5, (225, 230, 238))
    for row in range(2):
        for col in range(2):
            x0 = 4 + col * 12.5
            y0 = 8 + row * 10
            s.rect(x0, y0, x0 + 10.5, y0 + 6.5, PAPER)
            s.rect(x0, y0 + 6.5, x0 + 10.5, y0 + 8.5,
                   MARK_BLUE if (row, col) == (0, 1) else (150, 155, 165))
            # a different little drawing in each tile
            if (row, col) == (0, 0):
                s.line(x0 + 2, y0 + 5, x0 + 8.5, y0 + 1.5, 1.2, BLUEPRINT)
                s.line(x0 + 2, y0 + 1.5, x0 + 2, y0 + 5, 1.2, BLUEPRINT)
            elif (row, col) == (0, 1):
                s.ring(x0 + 5.25, y0 + 3.25, 2.2, 1.1, BLUEPRINT)
            elif (row, col) == (1, 0):
                s.rect(x0 + 2, y0 + 1.5, x0 + 8.5, y0 + 5.2, BLUEPRINT)
                s.rect(x0 + 3.2, y0 + 2.7, x0 + 7.3, y0 + 4.0, PAPER)
            else:
                s.polygon([(x0 + 5.25, y0 + 1), (x0 + 9, y0 + 5.5), (x0 + 1.5, y0 + 5.5)],
                          BLUEPRINT)
    s.disc(5, 4.3, 0.9, (240, 240, 240))
    return canvas


SAND = (226, 176, 62)
SAND_DARK = (176, 124, 30)
WOOD = (128, 78, 36)
WOOD_LIGHT = (176, 116, 60)
GLASS_EDGE = (60, 90, 120)

FRAMES = 10


def hourglass_half_width(y):
    """Inner half width of the glass at height y of the 32-unit grid (neck at y = 16)."""
    d = abs(y - 16.0)
    if d > 10.0:
        return 0.0
    return 1.0 + 5.0 * math.sin(min(d / 8.0, 1.0) * math.pi / 2) ** 1.2


def glass_outline(grow):
    """The glass from y = 6 to 26, widened by grow on both sides."""
    ys = [6.0 + i for i in range(21)]
    right = [(16.0 + hourglass_half_width(y) + grow, y) for y in ys]
    left = [(16.0 - hourglass_half_width(y) - grow, y) for y in reversed(ys)]
    return right + left


def draw_hourglass(frame):
    """Frame 0: the upper bulb full; the last: almost all sand below, the stream still running.
    Strokes lie on even pixels, so that every other pixel still makes the whole picture."""
    canvas = Canvas(32)
    s = Scaled(canvas)
    progress = frame / (FRAMES - 1)
    cx = 16.0
    s.polygon(glass_outline(2.0), GLASS_EDGE)
    s.polygon(glass_outline(0.0), (215, 238, 252))

    # Sand in the upper bulb: its surface sinks towards the neck.
    top_level = 8.0 + progress * 7.0
    s.fill(lambda x, y: top_level <= y <= 16.0 and abs(x - cx) < hourglass_half_width(y),
           SAND, (8, 6, 24, 17))
    # Sand below: a pile that grows.
    pile_height = 2.0 + progress * 7.0

    def in_pile(x, y):
        if y < 16.0 or y > 26.0:
            return False
        surface = 26.0 - pile_height + abs(x - cx) * 0.45
        return y >= surface and abs(x - cx) < hourglass_half_width(y)
    s.fill(in_pile, SAND, (8, 16, 24, 26))
    # The falling stream: grains in motion, shifted each frame.
    stream_bottom = 26.0 - pile_height
    s.rect(cx - 1, 14.0, cx + 1, 18.0, SAND_DARK)
    y = 18.0 + (frame % 3) * 2.0
    while y < stream_bottom:
        s.rect(cx - 1, y, cx + 1, min(y + 2.0, stream_bottom), SAND_DARK)
        y += 4.0

    s.line(11.0, 9.0, 12.0, 12.0, 1.0, PAPER, 0.7)  # a glint on the glass
    # Wooden caps and posts.
    for top in (2.0, 26.0):
        s.round_rect(4, top, 28, top + 4.0, 1.0, WOOD)
        s.rect(6, top + 1.0, 26, top + 2.0, WOOD_LIGHT)
    s.rect(6, 6, 8, 26, WOOD)
    s.rect(24, 6, 26, 26, WOOD)
    return canvas


def half_size(canvas):
    """Every other pixel: keeps the hard edges that a filtered reduction would blur."""
    half = Canvas(canvas.size // 2)
    for y in range(half.size):
        for x in range(half.size):
            half.rgba[y][x] = canvas.rgba[2 * y + 1][2 * x + 1]
    return half


def to_bgra(canvas):
    """32-bit bottom-up pixel rows and the 1-bit AND mask of a canvas."""
    size = canvas.size
    xor = bytearray()
    mask_row_bytes = ((size + 31) // 32) * 4
    mask = bytearray()
    for y in reversed(range(size)):
        mask_row = bytearray(mask_row_bytes)
        for x in range(size):
            r, g, b, a = canvas.rgba[y][x]
            alpha = int(round(a * 255))
            xor += bytes((int(round(b)), int(round(g)), int(round(r)), alpha))
            if alpha < 128:
                mask_row[x // 8] |= 0x80 >> (x % 8)
        mask += mask_row
    return bytes(xor), bytes(mask)


def dib_image(canvas):
    size = canvas.size
    xor, mask = to_bgra(canvas)
    info = struct.pack("<IiiHHIIiiII", 40, size, size * 2, 1, 32, 0, len(xor) + len(mask),
                       0, 0, 0, 0)
    return info + xor + mask


def icon_file(canvases, kind, hotspot=(0, 0)):
    """An .ico (kind 1) or .cur (kind 2) file holding one 32-bit image per canvas.
    A cursor's hot spot is given on the 32-unit grid and scaled to each image."""
    images = [dib_image(c) for c in canvases]
    out = struct.pack("<HHH", 0, kind, len(images))
    offset = 6 + 16 * len(images)
    for canvas, data in zip(canvases, images):
        size = canvas.size % 256
        if kind == 1:
            planes, bits = 1, 32
        else:
            planes, bits = (hotspot[0] * canvas.size // 32, hotspot[1] * canvas.size // 32)
        out += struct.pack("<BBBBHHII", size, size, 0, 0, planes, bits, len(data), offset)
        offset += len(data)
    return out + b"".join(images)


def riff_chunk(tag, data):
    pad = b"\0" if len(data) % 2 else b""
    return tag + struct.pack("<I", len(data)) + data + pad


def ani_file(frames, jiffies, hotspot, name):
    AF_ICON = 1
    anih = struct.pack("<9I", 36, len(frames), len(frames), 0, 0, 0, 0, jiffies, AF_ICON)
    info = riff_chunk(b"LIST", b"INFO" + riff_chunk(b"INAM", name.encode("ascii") + b"\0"))
    fram = riff_chunk(b"LIST", b"fram" + b"".join(
        riff_chunk(b"icon", icon_file(list(f), 2, hotspot)) for f in frames))
    body = b"ACON" + info + riff_chunk(b"anih", anih) + fram
    return riff_chunk(b"RIFF", body)


def main(argv):
    if len(argv) != 2:
        sys.stderr.write("usage: draw_resources.py OUTDIR\n")
        return 2
    out = argv[1]
    os.makedirs(out, exist_ok=True)
    write_bmp4(os.path.join(out, "toolbar_top.bmp"), top_toolbar())
    write_bmp4(os.path.join(out, "toolbar_bottom.bmp"), bottom_toolbar())
    with open(os.path.join(out, "mainframe.ico"), "wb") as f:
        f.write(icon_file([draw_mainframe_small(), draw_mainframe(32)], 1))
    with open(os.path.join(out, "about.ico"), "wb") as f:
        f.write(icon_file([draw_about_small(), draw_about(32)], 1))
    # 8 jiffies of 1/60 s: about the 125 ms tick that steps the animation in the tree.
    # Each frame holds 32 and 16 pixels: the tree draws it into a small-icon square.
    frames = [(big, half_size(big)) for big in (draw_hourglass(i) for i in range(FRAMES))]
    with open(os.path.join(out, "loading.ani"), "wb") as f:
        f.write(ani_file(frames, 8, (16, 16), "Loading"))
    return 0


if __name__ == "__main__":
    sys.exit(main(sys.argv))
