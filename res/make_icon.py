#!/usr/bin/env python3
"""Writes checker.ico: a 32x32, 256-colour icon of a computer linked to a globe.

The picture is drawn on a small palette, row by row, and stored as one 8-bit DIB with its
AND mask, which every Windows version reads. Run it again after changing the drawing:
    python3 res/make_icon.py res/checker.ico
"""
import math
import struct
import sys

SIZE = 32
PALETTE = [
    (0, 0, 0),        # 0 transparent (masked)
    (40, 40, 48),     # 1 outline
    (200, 204, 212),  # 2 case grey
    (36, 96, 200),    # 3 screen blue
    (120, 180, 250),  # 4 screen highlight
    (30, 110, 190),   # 5 sea
    (60, 170, 80),    # 6 land
    (250, 200, 40),   # 7 link
    (255, 255, 255),  # 8 white
]


def draw():
    px = [[0] * SIZE for _ in range(SIZE)]

    def rect(x0, y0, x1, y1, c):
        for y in range(y0, y1 + 1):
            for x in range(x0, x1 + 1):
                px[y][x] = c

    # The computer: a monitor with its stand, at the lower left.
    rect(1, 12, 18, 25, 1)
    rect(2, 13, 17, 24, 2)
    rect(4, 15, 15, 22, 3)
    rect(5, 16, 8, 17, 4)
    rect(8, 26, 11, 27, 1)
    rect(5, 28, 14, 30, 1)
    rect(6, 28, 13, 29, 2)
    # The globe at the upper right: sea, land, a meridian and the equator.
    cx, cy, r = 25.0, 7.0, 6.2
    for y in range(SIZE):
        for x in range(SIZE):
            d = math.hypot(x - cx, y - cy)
            if d <= r:
                land = (x - cx) * 0.8 + math.sin(y * 0.9) * 2.5 > 1 or (y > cy + 3 and x < cx)
                px[y][x] = 6 if land else 5
                if abs(x - cx) < 0.6 or abs(y - cy) < 0.6:
                    px[y][x] = 4
            elif d <= r + 1.0:
                px[y][x] = 1
    # The link between them.
    # The link: a cable from the top of the monitor up to the globe.
    for x, y in [(9, 11), (9, 10), (9, 9), (10, 8), (11, 7), (12, 7), (13, 7), (14, 7), (15, 7),
                 (16, 7), (17, 7)]:
        px[y][x] = 7
        if px[y + 1][x] == 0 and y < 11:
            px[y + 1][x] = 1
    return px


def ico(px):
    colours = PALETTE + [(0, 0, 0)] * (256 - len(PALETTE))
    header = struct.pack("<IiiHHIIiiII", 40, SIZE, SIZE * 2, 1, 8, 0, 0, 0, 0, 256, 0)
    palette = b"".join(struct.pack("<BBBB", b, g, r, 0) for (r, g, b) in colours)
    xor = b"".join(bytes(px[y]) for y in reversed(range(SIZE)))  # bottom-up rows
    mask_rows = []
    for y in reversed(range(SIZE)):
        bits = 0
        for x in range(SIZE):
            bits = (bits << 1) | (1 if px[y][x] == 0 else 0)
        mask_rows.append(struct.pack(">I", bits))  # 32 pixels: one 4-byte row
    image = header + palette + xor + b"".join(mask_rows)
    directory = struct.pack("<HHH", 0, 1, 1)
    entry = struct.pack("<BBBBHHII", SIZE, SIZE, 0, 0, 1, 8, len(image), 6 + 16)
    return directory + entry + image


if __name__ == "__main__":
    out = sys.argv[1] if len(sys.argv) > 1 else "checker.ico"
    with open(out, "wb") as f:
        f.write(ico(draw()))
