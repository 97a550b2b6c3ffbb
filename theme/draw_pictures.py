#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Draws the pictures of popovers, dial, stick, time line, switch and overlays anew, in pictures/: run it after a change, commit."""
import math
import os
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, os.path.join(HERE, "..", "src", "resources"))
sys.dont_write_bytecode = True
from draw_pictures import RGBA, box, circle, fall, line, plain, polygon, render, ring, write  # noqa: E402

SIZE = 64
FLAGS = {"red": ((240, 92, 88), (206, 44, 49)), "green": ((70, 196, 120), (33, 140, 80)),
         "gray": ((168, 176, 188), (120, 130, 145))}


def flag(colours, mirrored):
    """A pole at the edge of the range and a pennant that points into it."""
    cloth = polygon((14, 6), (58, 20), (14, 34))
    layers = [(box(6, 3, 13, 61, 3), fall(*colours, SIZE)), (cloth, fall(*colours, SIZE)),
              (box(8, 5, 9.5, 59, 0.7), plain(255, 255, 255, 90))]
    return [(lambda x, y, shape=shape: shape(SIZE - x, y), colour) for shape, colour in layers] if mirrored else layers


def glow(size=100):
    """White that is thickest around a disc of two thirds and fades out to the edge."""
    rows = []
    for y in range(size):
        row = []
        for x in range(size):
            r = math.hypot(x + 0.5 - size / 2, y + 0.5 - size / 2) / (size / 2)
            cover = max(0.0, 1 - r) / 0.4 if r > 0.6 else 0.35 + 0.65 * (r / 0.6) ** 3
            row.append((255, 255, 255, int(255 * min(1.0, cover) + 0.5)))
        rows.append(row)
    return rows


def switch(width=36, height=20):
    """Three frames: checked, unchecked, partially checked."""
    layers = []
    for frame, (colours, knob) in enumerate((
            (((62, 130, 230), (36, 104, 208)), width - height / 2),
            (((164, 172, 184), (184, 191, 201)), height / 2),
            (((126, 152, 196), (110, 138, 186)), width / 2))):
        left = frame * width
        layers += [(box(left + 0.5, 0.5, left + width - 0.5, height - 0.5, height / 2), fall(*colours, height)),
                   (circle(left + knob, height / 2 + 0.6, height / 2 - 2), plain(0, 0, 0, 60)),
                   (circle(left + knob, height / 2, height / 2 - 2.6), plain(255, 255, 255))]
    return render(3 * width, height, layers)


def union(*shapes):
    return lambda x, y: min(shape(x, y) for shape in shapes)


def cross(n):
    a, b = 0.24 * n, 0.76 * n
    return union(line(a, a, b, b, 0.1 * n), line(b, a, a, b, 0.1 * n))


def question(n):
    """Three quarters of a circle, a stem and a dot."""
    turns = [math.radians(180 + 15 * i) for i in range(16)]
    bow = [((0.5 + 0.2 * math.cos(t)) * n, (0.34 + 0.2 * math.sin(t)) * n) for t in turns]
    bow += [(0.5 * n, 0.56 * n), (0.5 * n, 0.64 * n)]
    lines = [line(*a, *b, 0.1 * n) for a, b in zip(bow, bow[1:])]
    return union(*lines, circle(0.5 * n, 0.83 * n, 0.07 * n))


def popovers():
    for theme, colour in (("light", (93, 106, 126)), ("dark", (152, 165, 185))):
        for name, shape in (("close", cross), ("help", question)):
            for suffix, size in (("", 16), ("@2x", 32)):
                write(os.path.join(HERE, "pictures", theme, name + suffix + ".png"), RGBA,
                      render(size, size, [(shape(size), plain(*colour))]))


def disc(*glyph):
    """A sign for a moment: a white glyph on a dark disc."""
    return render(96, 96, [(circle(48, 48, 46), plain(12, 16, 22, 170))] + [(part, plain(255, 255, 255)) for part in glyph])


def half(rows):
    """Each pixel the mean of four; the alpha weighs the colours."""
    result = []
    for y in range(0, len(rows), 2):
        row = []
        for x in range(0, len(rows[0]), 2):
            four = [rows[y + j][x + i] for j in (0, 1) for i in (0, 1)]
            alpha = sum(p[3] for p in four)
            row.append(tuple(sum(p[c] * p[3] for p in four) // max(1, alpha) for c in range(3)) + (alpha // 4,))
        result.append(row)
    return result


def overlays():
    folder = os.path.join(HERE, "pictures", "overlays")
    signs = {"play": [polygon((38, 28), (70, 48), (38, 68))],
             "pause": [box(33, 29, 43, 67, 2), box(53, 29, 63, 67, 2)],
             "online": [line(28, 50, 42, 64, 4), line(42, 64, 69, 34, 4)],
             "snapshot": [box(24, 36, 72, 68, 6), box(38, 29, 58, 40, 4)]}
    for name, glyph in signs.items():
        layers = disc(*glyph) if name != "snapshot" else render(96, 96, [
            (circle(48, 48, 46), plain(12, 16, 22, 170)), (glyph[0], plain(255, 255, 255)),
            (glyph[1], plain(255, 255, 255)), (circle(48, 52, 12), plain(12, 16, 22)),
            (circle(48, 52, 7), plain(255, 255, 255))])
        write(os.path.join(folder, "sign-%s.png" % name), RGBA, layers)
        if name in ("online", "snapshot"):
            write(os.path.join(folder, "sign-%s-small.png" % name), RGBA, half(layers))
    white = plain(255, 255, 255)
    # 94 wide and 108 high, as the time label has its symbol.
    write(os.path.join(folder, "from-camera.png"), RGBA, render(94, 108, [
        (box(12, 34, 60, 76, 8), white), (polygon((62, 55), (82, 38), (82, 72)), white),
        (circle(26, 55, 7), plain(214, 62, 62))]))
    write(os.path.join(folder, "from-server.png"), RGBA, render(94, 108, [
        (box(16, 30 + 18 * row, 78, 44 + 18 * row, 4), white) for row in range(3)] + [
        (circle(68, 37 + 18 * row, 3.5), plain(40, 160, 90)) for row in range(3)]))
    write(os.path.join(folder, "from-nowhere.png"), RGBA, render(94, 108, [
        (polygon((47, 24), (84, 86), (10, 86)), plain(255, 190, 60)), (box(43.5, 46, 50.5, 68, 3), plain(40, 30, 0)),
        (circle(47, 76, 4), plain(40, 30, 0))]))


# Dial, stick and handle: strong lines, faces from top to bottom, text, accent, bad
LOOKS = {"light": ((150, 160, 176), ((255, 255, 255), (230, 234, 241)), (31, 102, 214), (200, 55, 60), (255, 255, 255)),
         "dark": ((92, 106, 128), ((58, 69, 86), (38, 47, 60)), (91, 155, 255), (255, 123, 123), (27, 33, 43))}


def around(cx, cy, radius, degrees):
    return cx + radius * math.cos(math.radians(degrees)), cy + radius * math.sin(math.radians(degrees))


def dial_plate(n, strong):
    """From the lower left over the top to the lower right, as the dial turns."""
    c = n / 2
    return render(n, n, [
        (line(*around(c, c, (0.455 if i % 10 else 0.43) * n, -240 + 15 * i), *around(c, c, 0.485 * n, -240 + 15 * i),
              (0.011 if i % 10 else 0.016) * n), plain(*strong)) for i in range(21)])


def dial_knob(n, strong, face, accent):
    c, r = n / 2, 0.46 * n
    layers = [(circle(c, c + 0.012 * n, r + 0.012 * n), plain(0, 0, 0, 50)), (circle(c, c, r), fall(*face, n)),
              (ring(c, c, r, 0.014 * n), plain(*strong))]
    return render(n, n, layers + ([(line(c, c - 0.84 * r, c, c - 0.45 * r, 0.06 * n), plain(*accent))] if accent else []))


def stick_cross(n, strong):
    c, r = n / 2, 0.4 * n
    width = n / 130
    return render(n, n, [(shape, plain(*strong)) for shape in (
        ring(c, c, r, width), ring(c, c, r / 2, width), line(c - r, c, c + r, c, width), line(c, c - r, c, c + r, width))])


def dot(n, colour, rim, inset=0.08):
    c = n / 2
    return render(n, n, [(circle(c, c, (0.5 - inset) * n), plain(*rim)), (circle(c, c, (0.5 - inset - 0.09) * n), plain(*colour))])


def controls():
    for theme, (strong, face, accent, bad, rim) in LOOKS.items():
        for suffix, scale in (("", 1), ("@2x", 2)):
            for name, rows in (("dial-plate", dial_plate(108 * scale, strong)),
                               ("dial-knob", dial_knob(80 * scale, strong, face, accent)),
                               ("dial-disc", dial_knob(80 * scale, strong, face, None)),
                               ("dial-dot", dot(14 * scale, accent, rim, 0.02)),
                               ("stick-cross", stick_cross(164 * scale, strong)),
                               ("stick-point", dot(33 * scale, accent, rim)),
                               ("playhead", dot(36 * scale, accent, rim)), ("playhead-off", dot(36 * scale, bad, rim))):
                write(os.path.join(HERE, "pictures", theme, name + suffix + ".png"), RGBA, rows)


def main():
    popovers()
    controls()
    overlays()
    write(os.path.join(HERE, "pictures", "switch", "btn_schalter.png"), RGBA, switch())
    folder = os.path.join(HERE, "pictures", "time-line")
    write(os.path.join(folder, "glow.png"), RGBA, glow())
    for name, colours in FLAGS.items():
        for number in (1, 2):
            write(os.path.join(folder, "btn_flag_%s%d.png" % (name, number)), RGBA,
                  render(SIZE, SIZE, flag(colours, number == 2)))


if __name__ == "__main__":
    main()
