#!/usr/bin/env python3
"""Draws the command bar pictures, the logo and the window icons and writes them to
image_data.h as raw RGB arrays (the mask colour marks transparent pixels).

Only needed to re-draw the artwork: the generated header is kept with the sources.

    python3 make_images.py [--preview DIR]

--preview also writes each picture as PNG, 8 times enlarged and at its own size on grey.
"""

import argparse
import os
import shutil
import struct
import subprocess
import zlib

MASK = (236, 233, 216)

# Outlines
INK = (40, 40, 40)
PAGE_EDGE = (96, 96, 96)
FOLDER_EDGE = (150, 100, 20)
GREEN_EDGE = (0, 96, 0)
RED_EDGE = (140, 0, 0)
BLUE_EDGE = (20, 40, 110)

# Fills
WHITE = (255, 255, 255)
PAGE_SHADE = (226, 226, 226)
FOLD = (200, 200, 200)
TEXT_LINE = (140, 140, 150)
FOLDER_BACK = (230, 178, 50)
FOLDER_FRONT = (255, 220, 100)
FOLDER_LIGHT = (255, 240, 170)
GREEN = (40, 180, 40)
GREEN_LIGHT = (130, 230, 110)
RED = (225, 40, 30)
RED_LIGHT = (255, 130, 110)
DISK = (60, 90, 190)
DISK_DARK = (40, 60, 140)
DISK_LIGHT = (110, 140, 230)
METAL = (200, 204, 212)
METAL_DARK = (120, 124, 134)
LABEL_LINE = (150, 170, 220)
TREE_DOT = (80, 80, 80)
PIN = (90, 90, 90)
DIAMOND_DARK = (20, 50, 140)
DIAMOND = (50, 100, 210)
DIAMOND_LIGHT = (110, 160, 240)
BULB_EDGE = (170, 120, 0)
BULB = (255, 225, 40)
BULB_LIGHT = (255, 250, 190)
BASE = (170, 170, 180)
BASE_DARK = (90, 90, 100)


class Canvas:
    def __init__(self, size):
        self.size = size
        self.px = [[MASK] * size for _ in range(size)]

    def put(self, x, y, colour):
        assert colour != MASK, "a picture colour would turn transparent"
        if 0 <= x < self.size and 0 <= y < self.size:
            self.px[y][x] = colour

    def paint(self, shape, fill=None, outline=None):
        """Fills a set of pixels; with an outline, its 4-connected border gets that colour."""
        for x, y in shape:
            edge = outline is not None and any(
                n not in shape for n in ((x - 1, y), (x + 1, y), (x, y - 1), (x, y + 1))
            )
            if edge:
                self.put(x, y, outline)
            elif fill is not None:
                self.put(x, y, fill(x, y) if callable(fill) else fill)

    def rgb(self):
        return bytes(c for row in self.px for p in row for c in p)


# Shapes are sets of pixel coordinates; pixel (x, y) has its centre at (x, y).


def rect(x0, y0, x1, y1):
    return {(x, y) for x in range(x0, x1 + 1) for y in range(y0, y1 + 1)}


def _on_segment(px, py, ax, ay, bx, by):
    cross = (bx - ax) * (py - ay) - (by - ay) * (px - ax)
    if abs(cross) > 1e-6:
        return False
    return min(ax, bx) - 1e-6 <= px <= max(ax, bx) + 1e-6 and (
        min(ay, by) - 1e-6 <= py <= max(ay, by) + 1e-6
    )


def poly(*points):
    """Pixels whose centre lies inside the polygon or on its edges."""
    xs = [p[0] for p in points]
    ys = [p[1] for p in points]
    shape = set()
    n = len(points)
    for y in range(int(min(ys)), int(max(ys)) + 1):
        for x in range(int(min(xs)), int(max(xs)) + 1):
            inside = False
            for i in range(n):
                (ax, ay), (bx, by) = points[i], points[(i + 1) % n]
                if _on_segment(x, y, ax, ay, bx, by):
                    inside = True
                    break
            else:
                for i in range(n):
                    (ax, ay), (bx, by) = points[i], points[(i + 1) % n]
                    if (ay > y) != (by > y) and x < ax + (y - ay) * (bx - ax) / (by - ay):
                        inside = not inside
            if inside:
                shape.add((x, y))
    return shape


def ellipse(cx, cy, rx, ry):
    return {
        (x, y)
        for x in range(int(cx - rx) - 1, int(cx + rx) + 2)
        for y in range(int(cy - ry) - 1, int(cy + ry) + 2)
        if ((x - cx) / rx) ** 2 + ((y - cy) / ry) ** 2 <= 1.0 + 1e-6
    }


def line(x0, y0, x1, y1):
    shape = set()
    dx, dy = abs(x1 - x0), -abs(y1 - y0)
    sx, sy = (1 if x0 < x1 else -1), (1 if y0 < y1 else -1)
    err = dx + dy
    while True:
        shape.add((x0, y0))
        if (x0, y0) == (x1, y1):
            return shape
        e2 = 2 * err
        if e2 >= dy:
            err += dy
            x0 += sx
        if e2 <= dx:
            err += dx
            y0 += sy


def vertical_gradient(top, bottom, y0, y1):
    def colour(_x, y):
        t = min(max((y - y0) / max(y1 - y0, 1), 0.0), 1.0)
        return tuple(round(a + (b - a) * t) for a, b in zip(top, bottom))

    return colour


def diagonal_gradient(first, last, span):
    def colour(x, y):
        t = min(max((x + y) / span, 0.0), 1.0)
        return tuple(round(a + (b - a) * t) for a, b in zip(first, last))

    return colour


# Reusable parts -------------------------------------------------------------------------


def page(c, x0, y0, x1, y1, corner, text_lines=()):
    """A sheet with its top right corner folded down; text_lines are (y, x_from, x_to)."""
    sheet = poly((x0, y0), (x1 - corner, y0), (x1, y0 + corner), (x1, y1), (x0, y1))
    c.paint(sheet, diagonal_gradient(WHITE, PAGE_SHADE, x1 + y1), PAGE_EDGE)
    fold = poly((x1 - corner, y0), (x1 - corner, y0 + corner), (x1, y0 + corner))
    c.paint(fold, FOLD, PAGE_EDGE)
    for y, a, b in text_lines:
        c.paint(rect(a, y, b, y), TEXT_LINE)


def closed_folder(c, x0, y0, x1, y1):
    tab = rect(x0, y0, x0 + (x1 - x0) // 2 - 1, y0 + 2)
    c.paint(tab | rect(x0, y0 + 2, x1, y1), FOLDER_BACK, FOLDER_EDGE)
    front = rect(x0, y0 + 3, x1, y1)
    c.paint(front, vertical_gradient(FOLDER_LIGHT, FOLDER_BACK, y0 + 3, y1), FOLDER_EDGE)


def floppy(c, x0, y0, s):
    """A 3.5 inch disk of s x s pixels: shutter at the top, label at the bottom."""
    x1, y1 = x0 + s - 1, y0 + s - 1
    body = poly((x0, y0), (x1 - 2, y0), (x1, y0 + 2), (x1, y1), (x0, y1))
    c.paint(body, vertical_gradient(DISK_LIGHT, DISK, y0, y1), BLUE_EDGE)
    sw = s * 9 // 16
    sx = x0 + (s - sw) // 2 + 1
    shutter = rect(sx, y0, sx + sw - 1, y0 + s * 5 // 16)
    c.paint(shutter, METAL, METAL_DARK)
    c.paint(rect(sx + sw - 4, y0 + 1, sx + sw - 3, y0 + s * 5 // 16 - 1), BLUE_EDGE)
    label = rect(x0 + 2, y0 + s * 7 // 16 + 1, x1 - 2, y1)
    c.paint(label, WHITE, BLUE_EDGE)
    for y in range(y0 + s * 7 // 16 + 3, y1 - 1, 2):
        c.paint(rect(x0 + 4, y, x1 - 4, y), LABEL_LINE)
    c.put(x0 + 1, y1 - 1, DISK_DARK)


def tree_lines(c, x, y0, y1, branches, x_end):
    for y in range(y0, y1 + 1, 2):
        c.put(x, y, TREE_DOT)
    for by in branches:
        for bx in range(x + 2, x_end + 1, 2):
            c.put(bx, by, TREE_DOT)


def arrow_right(x0, cy, length, head, shaft):
    """A fat arrow pointing right; head is the half height of the arrow head."""
    hx = x0 + length - head - 1
    body = rect(x0, cy - shaft, hx, cy + shaft)
    tip = poly((hx, cy - head), (x0 + length - 1, cy), (hx, cy + head))
    return body | tip


# Tool pictures ---------------------------------------------------------------------------


def draw_new():
    c = Canvas(24)
    page(c, 4, 1, 19, 22, 5)
    return c


def draw_open():
    c = Canvas(24)
    back = rect(1, 6, 7, 8) | rect(1, 8, 17, 20)
    c.paint(back, FOLDER_BACK, FOLDER_EDGE)
    front = poly((5, 12), (22, 12), (18, 20), (1, 20))
    c.paint(front, vertical_gradient(FOLDER_LIGHT, FOLDER_FRONT, 12, 20), FOLDER_EDGE)
    # A bent arrow leaving the folder upwards and turning right.
    shaftv = rect(11, 4, 13, 10)
    shafth = rect(11, 3, 17, 5)
    tip = poly((17, 0), (21, 4), (17, 8))
    c.paint(shaftv | shafth | tip, GREEN, GREEN_EDGE)
    c.paint({(12, 5), (12, 6), (12, 7), (12, 8), (13, 4), (14, 4), (15, 4), (16, 4)}, GREEN_LIGHT)
    return c


def draw_save():
    c = Canvas(24)
    floppy(c, 2, 2, 20)
    return c


def draw_save_as():
    c = Canvas(24)
    floppy(c, 0, 0, 17)
    page(c, 11, 8, 22, 23, 4, [(13, 13, 17), (15, 13, 20), (17, 13, 20), (19, 13, 20), (21, 13, 18)])
    return c


def draw_tree_arrow(right):
    c = Canvas(24)
    closed_folder(c, 1, 1, 13, 10)
    tree_lines(c, 4, 12, 22, [16, 22], 8)
    arrow = arrow_right(10, 16, 14, 6, 2)
    if not right:
        arrow = {(33 - x, y) for x, y in arrow}
    c.paint(arrow, RED, RED_EDGE)
    return c


def draw_generate():
    c = Canvas(24)
    page(c, 1, 0, 15, 20, 4, [(4, 3, 9), (6, 3, 12), (8, 3, 12), (10, 3, 8), (12, 3, 10), (14, 3, 7)])
    # An integrated circuit: legs on both sides, notch at the top.
    for y in range(12, 23, 3):
        c.paint(rect(9, y, 22, y), PIN)
    chip = rect(12, 10, 19, 23)
    c.paint(chip, vertical_gradient(RED_LIGHT, RED, 10, 23), RED_EDGE)
    c.paint(rect(15, 10, 16, 11), RED_EDGE)
    return c


# Logo and icons --------------------------------------------------------------------------


def draw_logo(s):
    """A yellow light bulb on a blue diamond, s x s pixels."""
    c = Canvas(s)
    m = (s - 1) / 2
    diamond = {(x, y) for x in range(s) for y in range(s) if abs(x - m) + abs(y - m) <= m + 0.5}
    c.paint(diamond, diagonal_gradient(DIAMOND_LIGHT, DIAMOND, 1.4 * s), DIAMOND_DARK)
    k = s / 32
    glass = ellipse(m, 12.5 * k, 7.5 * k, 7.5 * k) | poly(
        (m - 5 * k, 17 * k), (m + 5 * k, 17 * k), (m + 3.5 * k, 21 * k), (m - 3.5 * k, 21 * k)
    )
    c.paint(glass, BULB, BULB_EDGE)
    c.paint(ellipse(m - 2.5 * k, 10 * k, 2 * k, 2.5 * k), BULB_LIGHT)
    base = rect(round(m - 3.5 * k), round(21.5 * k), round(m + 3.5 * k), round(25.5 * k))
    c.paint(base, BASE, BASE_DARK)
    if s >= 32:
        for y in range(round(22.5 * k), round(25.5 * k), 2):
            c.paint(rect(round(m - 3.5 * k), y, round(m + 3.5 * k), y), BASE_DARK)
    c.paint(rect(round(m - 1.5 * k), round(26 * k), round(m + 1.5 * k), round(27 * k)), BASE_DARK)
    return c


# Output ----------------------------------------------------------------------------------

TOOLS = [
    ("new", draw_new),
    ("open", draw_open),
    ("save", draw_save),
    ("save_as", draw_save_as),
    ("expand", lambda: draw_tree_arrow(True)),
    ("collapse", lambda: draw_tree_arrow(False)),
    ("generate", draw_generate),
]


def c_array(name, data, comment):
    body = ", ".join("0x%02X" % b for b in data)
    return "// %s\nconst unsigned char %s[%d] = {%s};\n" % (comment, name, len(data), body)


def write_header(path, tools, logo, icons):
    parts = [
        "#pragma once\n\n",
        "// Generated by make_images.py: raw RGB rows, top to bottom; the colour 236, 233, 216\n",
        "// is transparent.\n\n",
        "const unsigned char COMMAND_BAR_PIXELS[%d][24 * 24 * 3] = {\n" % len(tools),
    ]
    for name, canvas in tools:
        body = ", ".join("0x%02X" % b for b in canvas.rgb())
        parts.append("    // %s\n    {%s},\n" % (name.replace("_", " "), body))
    parts.append("};\n\n")
    parts.append(c_array("LOGO_PIXELS", logo.rgb(), "light bulb on a diamond, 32 x 32"))
    for size, canvas in icons:
        parts.append("\n")
        parts.append(c_array("ICON%d_PIXELS" % size, canvas.rgb(), "window icon, %d x %d" % (size, size)))
    with open(path, "w") as f:
        f.write("".join(parts))
    if shutil.which("clang-format"):
        subprocess.run(["clang-format", "-i", path], check=True)


def png(path, rows):
    raw = b"".join(b"\0" + bytes(c for p in row for c in p) for row in rows)

    def chunk(kind, data):
        return struct.pack(">I", len(data)) + kind + data + struct.pack(">I", zlib.crc32(kind + data))

    head = struct.pack(">IIBBBBB", len(rows[0]), len(rows), 8, 2, 0, 0, 0)
    with open(path, "wb") as f:
        f.write(b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", head) + chunk(b"IDAT", zlib.compress(raw)))
        f.write(chunk(b"IEND", b""))


def on_grey(canvases, zoom, gap):
    """The pictures side by side on a tool bar grey, transparent pixels showing the grey."""
    grey = (212, 208, 200)
    height = max(c.size for c in canvases) * zoom + 2 * gap
    width = sum(c.size * zoom + gap for c in canvases) + gap
    rows = [[grey] * width for _ in range(height)]
    left = gap
    for c in canvases:
        for y in range(c.size * zoom):
            for x in range(c.size * zoom):
                p = c.px[y // zoom][x // zoom]
                if p != MASK:
                    rows[gap + y][left + x] = p
        left += c.size * zoom + gap
    return rows


def checker(canvas, zoom):
    """Enlarged, with transparent pixels as a checker board."""
    rows = []
    for y in range(canvas.size * zoom):
        row = []
        for x in range(canvas.size * zoom):
            p = canvas.px[y // zoom][x // zoom]
            if p == MASK:
                p = (200, 200, 200) if ((x // zoom + y // zoom) % 2) else (170, 170, 170)
            row.append(p)
        rows.append(row)
    return rows


def preview(directory, name, canvas):
    png(os.path.join(directory, name + "_8x.png"), checker(canvas, 8))
    png(os.path.join(directory, name + "_1x.png"), on_grey([canvas], 1, 4))


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--preview", metavar="DIR")
    args = parser.parse_args()

    tools = [(name, draw()) for name, draw in TOOLS]
    logo = draw_logo(32)
    icons = [(16, draw_logo(16)), (48, draw_logo(48))]
    here = os.path.dirname(os.path.abspath(__file__))
    write_header(os.path.join(here, "image_data.h"), tools, logo, icons)
    if args.preview:
        os.makedirs(args.preview, exist_ok=True)
        for i, (name, canvas) in enumerate(tools):
            preview(args.preview, "tool%d_%s" % (i, name), canvas)
        preview(args.preview, "logo", logo)
        for size, canvas in icons:
            preview(args.preview, "icon%d" % size, canvas)
        bar = [canvas for _name, canvas in tools]
        png(os.path.join(args.preview, "toolbar_1x.png"), on_grey(bar, 1, 4))
        png(os.path.join(args.preview, "toolbar_4x.png"), on_grey(bar, 4, 8))
        logos = [icons[0][1], logo, icons[1][1]]
        png(os.path.join(args.preview, "logos_1x.png"), on_grey(logos, 1, 4))
        png(os.path.join(args.preview, "logos_4x.png"), on_grey(logos, 4, 8))


if __name__ == "__main__":
    main()
