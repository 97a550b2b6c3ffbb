#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Draws the library's embedded pictures anew, beside this file: run it after a change and commit the result.

Each picture is a list of layers, a layer a shape and a colour; a shape is a signed distance in pixels, negative
inside, so that edges come out smooth. The PNG files are written by hand because readers rely on their colour types.
"""
import math
import os
import struct
import zlib

GREY_ALPHA, RGB, RGBA = 4, 2, 6  # the colour types of the format


def circle(cx, cy, r):
    return lambda x, y: math.hypot(x - cx, y - cy) - r


def ring(cx, cy, r, width):
    return lambda x, y: abs(math.hypot(x - cx, y - cy) - r) - width / 2


def box(left, top, right, bottom, radius=0.0):
    cx, cy, hw, hh = (left + right) / 2, (top + bottom) / 2, (right - left) / 2, (bottom - top) / 2

    def distance(x, y):
        dx, dy = abs(x - cx) - hw + radius, abs(y - cy) - hh + radius
        return math.hypot(max(dx, 0), max(dy, 0)) + min(max(dx, dy), 0) - radius
    return distance


def line(x1, y1, x2, y2, width):
    """A line with round ends."""
    dx, dy = x2 - x1, y2 - y1

    def distance(x, y):
        t = max(0, min(1, ((x - x1) * dx + (y - y1) * dy) / (dx * dx + dy * dy)))
        return math.hypot(x - x1 - t * dx, y - y1 - t * dy) - width / 2
    return distance


def polygon(*points):
    """A convex polygon, corners clockwise on the screen."""
    def distance(x, y):
        worst = -1e9
        for (x1, y1), (x2, y2) in zip(points, points[1:] + points[:1]):
            worst = max(worst, ((x - x1) * (y2 - y1) - (y - y1) * (x2 - x1)) / math.hypot(x2 - x1, y2 - y1))
        return worst
    return distance


def everywhere(x, y):
    return -1e9


def fall(top, bottom, height):
    """A colour that runs from top to bottom."""
    return lambda y: tuple(a + (b - a) * y / height for a, b in zip(top, bottom))


def plain(*colour):
    return lambda y: colour


def render(width, height, layers):
    """Rows of (red, green, blue, alpha), 0 to 255, not premultiplied."""
    rows = []
    for py in range(height):
        row = []
        for px in range(width):
            x, y = px + 0.5, py + 0.5
            red = green = blue = alpha = 0.0
            for shape, colour in layers:
                source = colour(y)
                cover = max(0.0, min(1.0, 0.5 - shape(x, y)))
                cover *= source[3] / 255 if len(source) > 3 else 1.0
                if cover > 0:
                    total = cover + alpha * (1 - cover)
                    red, green, blue = (
                        (s * cover + d * alpha * (1 - cover)) / total
                        for s, d in zip(source[:3], (red, green, blue)))
                    alpha = total
            row.append(tuple(int(v + 0.5) for v in (red, green, blue, alpha * 255)))
        rows.append(row)
    return rows


def write(name, kind, rows):
    pick = {GREY_ALPHA: lambda p: (p[1], p[3]), RGB: lambda p: p[:3], RGBA: lambda p: p}[kind]
    raw = b"".join(b"\0" + bytes(v for pixel in row for v in pick(pixel)) for row in rows)

    def chunk(tag, data):
        return struct.pack(">I", len(data)) + tag + data + struct.pack(">I", zlib.crc32(tag + data))
    path = os.path.join(os.path.dirname(os.path.abspath(__file__)), name)
    os.makedirs(os.path.dirname(path), exist_ok=True)
    with open(path, "wb") as file:
        file.write(b"\x89PNG\r\n\x1a\n"
                   + chunk(b"IHDR", struct.pack(">IIBBBBB", len(rows[0]), len(rows), 8, kind, 0, 0, 0))
                   + chunk(b"IDAT", zlib.compress(raw, 9)) + chunk(b"IEND", b""))


def switch_strip():
    # The switch shows a window of 62/96 of the strip, behind which the strip slides: the knob stands where the
    # window's right end is when on and its left end when off.
    scale = 109 / 96
    left, right = 34.5 * scale, 62.5 * scale
    return [
        (box(-5, -5, (left + right) / 2, 30), fall((52, 120, 200), (92, 160, 232), 18)),
        (box((left + right) / 2, -5, 120, 30), fall((176, 180, 186), (222, 225, 229), 18)),
        (box(-5, -5, 120, 1), plain(0, 0, 0, 60)),
        (box(-5, 17, 120, 23), plain(0, 0, 0, 40)),
        (line(left / 2 + 1, 5.5, left / 2 + 1, 12.5, 2.2), plain(255, 255, 255)),
        (ring((right + 109) / 2 - 1, 9, 3.6, 2.0), plain(112, 118, 126)),
        (box(left - 1.5, 0, right + 1.5, 18, 2.5), plain(0, 0, 0, 70)),
        (box(left, 0.5, right, 17.5, 2.5), plain(138, 142, 148)),
        (box(left + 1, 1.5, right - 1, 16.5, 1.8), fall((255, 255, 255), (228, 230, 233), 18)),
    ] + [(box(x - 0.6, 5.5, x + 0.6, 12.5, 0.5), plain(176, 180, 186))
         for x in ((left + right) / 2 - 4, (left + right) / 2, (left + right) / 2 + 4)]


def grip():
    # Dark lines with a light edge below, to be seen on any ground.
    return [(box(2, y + 1, 21, y + 2), plain(255, 255, 255, 90)) for y in (3, 8, 13)] + \
        [(box(2, y, 21, y + 1), plain(120, 120, 120)) for y in (3, 8, 13)]


def delete_mark():
    return [
        (circle(11.5, 11.5, 10.6), plain(150, 24, 20)),
        (circle(11.5, 11.5, 9.7), fall((236, 86, 74), (196, 38, 32), 23)),
        (box(5.5, 10, 17.5, 13, 1.5), plain(255, 255, 255)),
    ]


def loop():
    grey = plain(128, 132, 138)
    return [(ring(58, 58, 38, 15), grey), (line(89, 89, 121, 121, 20), grey)]


def clear_mark():
    white = plain(255, 255, 255)
    return [
        (circle(70, 70, 58), plain(140, 144, 150)),
        (line(49, 49, 91, 91, 13), white),
        (line(91, 49, 49, 91, 13), white),
    ]


def pen():
    # Drawn along the diagonal from the tip at the bottom left; (a, b) is a place along and across it.
    root = math.sqrt(0.5)

    def at(along, across):
        return 24 + (along + across) * root, 128 + (-along + across) * root

    def part(*places):
        return polygon(*(at(*place) for place in places))
    shaft = plain(110, 115, 122)
    return [
        (part((0, 0), (34, -17), (34, 17)), plain(150, 154, 160)),
        (part((0, 0), (13, -6.5), (13, 6.5)), plain(60, 64, 70)),
        (part((36, -17), (112, -17), (112, 17), (36, 17)), shaft),
        (part((36, -5.5), (112, -5.5), (112, 5.5), (36, 5.5)), plain(142, 147, 154)),
        (part((117, -17), (128, -17), (128, 17), (117, 17)), plain(170, 174, 180)),
        (line(*at(131, -9), *at(131, 9), 16), plain(196, 82, 74)),
    ]


def main():
    write("iOSCheckBox/iOSCheckBox.png", RGB, render(109, 18, switch_strip()))
    write("iOSListWidget/iOSRiffleArea.png", GREY_ALPHA, render(23, 17, grip()))
    write("iOSListWidget/iOSDeleteListEntry.png", RGBA, render(23, 23, delete_mark()))
    write("SearchItem/searchLoop.png", RGBA, render(140, 140, loop()))
    write("SearchItem/searchClear.png", RGBA, render(140, 140, clear_mark()))
    write("SearchItem/btn_pen.png", RGBA, render(152, 152, pen()))


if __name__ == "__main__":
    main()
