# SPDX-License-Identifier: MIT
"""Draws the pictures of the examples, and knows where everything on them is. The same on every run; needs only
Python's own library. Lengths and places are in pixels."""

import math
import random
import struct
import zlib

WIDTH, HEIGHT = 720, 540
PLATE_WIDTH, PLATE_HEIGHT = 960, 720


def png(width, height, channels, pixels, is_smooth=False):
    """PNG file bytes of 8-bit samples, row after row; 1 channel is grey, 3 are red, green, blue, 4 with alpha. Smooth
    pictures become smaller when each row is stored as what differs from the one above."""
    stride = width * channels
    rows = [bytes(pixels[y * stride:(y + 1) * stride]) for y in range(height)]
    if is_smooth:
        above = [bytes(stride)] + rows
        rows = [bytes((a - b) & 255 for a, b in zip(row, last)) for row, last in zip(rows, above)]
    raw = b"".join((b"\2" if is_smooth else b"\0") + row for row in rows)

    def chunk(name, data):
        body = name + data
        return struct.pack(">I", len(data)) + body + struct.pack(">I", zlib.crc32(body))

    header = struct.pack(">IIBBBBB", width, height, 8, {1: 0, 3: 2, 4: 6}[channels], 0, 0, 0)
    return (b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", header) + chunk(b"IDAT", zlib.compress(raw, 9))
            + chunk(b"IEND", b""))


def coverage(distance):
    """How much of a pixel lies inside of an edge at a signed distance (negative inside)."""
    return min(1.0, max(0.0, 0.5 - distance))


def clamped(value):
    return int(min(255, max(0, value)))


class Canvas:
    """Red, green and blue samples of a picture."""

    def __init__(self):
        self.pixels = bytearray(3 * WIDTH * HEIGHT)

    def set(self, x, y, red, green, blue):
        index = (y * WIDTH + x) * 3
        self.pixels[index:index + 3] = bytes((clamped(red), clamped(green), clamped(blue)))

    def blend(self, x, y, colour, share):
        if share <= 0 or not (0 <= x < WIDTH and 0 <= y < HEIGHT):
            return
        index = (y * WIDTH + x) * 3
        for channel in range(3):
            old = self.pixels[index + channel]
            self.pixels[index + channel] = clamped(old + (colour[channel] - old) * share + 0.5)

    def disc(self, cx, cy, radius, colour, share=1.0):
        for y in range(int(cy - radius) - 1, int(cy + radius) + 3):
            for x in range(int(cx - radius) - 1, int(cx + radius) + 3):
                self.blend(x, y, colour, coverage(math.hypot(x - cx, y - cy) - radius) * share)

    def stroke(self, points, width, colour):
        """A line of round ends through some points."""
        half = width / 2
        left, right = (int(f(p[0] for p in points)) for f in (min, max))
        top, bottom = (int(f(p[1] for p in points)) for f in (min, max))
        for y in range(top - int(half) - 2, bottom + int(half) + 3):
            for x in range(left - int(half) - 2, right + int(half) + 3):
                distance = min(segment_distance((x, y), a, b) for a, b in zip(points, points[1:]))
                self.blend(x, y, colour, coverage(distance - half))

    def png(self):
        return png(WIDTH, HEIGHT, 3, self.pixels, True)


def segment_distance(point, start, end):
    dx, dy = end[0] - start[0], end[1] - start[1]
    length = dx * dx + dy * dy
    along = 0 if length == 0 else ((point[0] - start[0]) * dx + (point[1] - start[1]) * dy) / length
    along = min(1.0, max(0.0, along))
    return math.hypot(point[0] - start[0] - along * dx, point[1] - start[1] - along * dy)


# The plate: holes and slots in brushed metal.

def plate_features():
    """Holes (centre, radius) and slots (left, top, width, height) of the plate."""
    rng = random.Random(20260101)
    holes = []
    for row in range(3):
        for column in range(5):
            holes.append((130 + column * 165 + rng.uniform(-3, 3), 120 + row * 150 + rng.uniform(-3, 3),
                          34 + rng.uniform(-2.5, 2.5)))
    slots = []
    for column in range(6):
        slots.append((80 + column * 140 + rng.uniform(-3, 3), 560 + rng.uniform(-3, 3),
                      88 + rng.uniform(-3, 3), 36 + rng.uniform(-2, 2)))
    return holes, slots


def draw_plate(holes, slots):
    rng = random.Random(7)
    pixels = bytearray(PLATE_WIDTH * PLATE_HEIGHT)
    for y in range(PLATE_HEIGHT):
        shade = 168 + 22 * math.sin(y / 230.0)
        for x in range(PLATE_WIDTH):
            grain = 5 * math.sin((x * 0.9 + 11 * math.sin(y * 0.05)) * 0.7)
            pixels[y * PLATE_WIDTH + x] = int(min(255, max(0, shade + grain + rng.uniform(-7, 7))))

    def darken(x, y, inside):
        index = y * PLATE_WIDTH + x
        pixels[index] = int(pixels[index] * (1 - inside) + (26 + rng.uniform(-5, 5)) * inside)

    for cx, cy, radius in holes:
        for y in range(int(cy - radius - 2), int(cy + radius + 3)):
            for x in range(int(cx - radius - 2), int(cx + radius + 3)):
                inside = coverage(math.hypot(x - cx, y - cy) - radius)
                if inside:
                    darken(x, y, inside)
    for left, top, width, height in slots:
        for y in range(int(top) - 1, int(top + height) + 2):
            for x in range(int(left) - 1, int(left + width) + 2):
                inside = (coverage(left - x) * coverage(x - left - width)
                          * coverage(top - y) * coverage(y - top - height))
                if inside:
                    darken(x, y, inside)
    return png(PLATE_WIDTH, PLATE_HEIGHT, 1, pixels)


# The coin: a disc with a rim, beads and a rosette, above a rule in millimetres.

COIN_CENTRE, COIN_RADIUS = (360.0, 228.0), 180.0
COIN_PIXELS_PER_MILLIMETRE = 16
RULE_TOP = 448
DIGITS = {
    "0": [[(0.5, 0), (0.85, 0.15), (1, 0.5), (0.85, 0.85), (0.5, 1), (0.15, 0.85), (0, 0.5), (0.15, 0.15), (0.5, 0)]],
    "1": [[(0.15, 0.25), (0.55, 0), (0.55, 1)]],
    "2": [[(0.02, 0.25), (0.2, 0.04), (0.6, 0), (0.95, 0.15), (0.95, 0.4), (0, 1), (1, 1)]],
    "3": [[(0.05, 0.08), (0.5, 0), (0.95, 0.12), (0.95, 0.35), (0.45, 0.47), (1, 0.62), (0.95, 0.88), (0.5, 1),
           (0.02, 0.92)]],
    "4": [[(0.7, 1), (0.7, 0), (0, 0.7), (1, 0.7)]],
    "m": [[(0, 1), (0, 0.3)], [(0, 0.45), (0.2, 0.3), (0.4, 0.3), (0.5, 0.45), (0.5, 1)],
          [(0.5, 0.45), (0.7, 0.3), (0.9, 0.3), (1, 0.45), (1, 1)]],
}


def smooth(edge, width, value):
    """0 below an edge, 1 above, in an S over some width."""
    t = min(1.0, max(0.0, (value - edge) / width + 0.5))
    return t * t * (3 - 2 * t)


def coin_height(x, y):
    """Height of the coin's face, in pixels."""
    radius = math.hypot(x, y)
    angle = math.atan2(y, x)
    height = 6 * smooth(COIN_RADIUS - 15, 5, radius) - 12 * smooth(COIN_RADIUS - 1, 7, radius)
    bead = math.pi / 36
    offset = (angle + bead / 2) % bead - bead / 2
    height += 3 * max(0.0, 1 - (math.hypot(radius - 154, 154 * offset) / 5) ** 2)
    petal = 60 + 46 * math.cos(6 * angle + math.pi)
    height += 5 * smooth(0, 11, petal - radius) - 2.5 * smooth(0, 8, petal * 0.62 - radius)
    height += 6 * smooth(0, 7, 18 - radius) - 1.5 * smooth(0, 4, 8 - radius)
    height += 2.5 * (smooth(120, 4, radius) - smooth(126, 4, radius))
    return height


def draw_coin():
    canvas = Canvas()
    rng = random.Random(3)
    cx, cy = COIN_CENTRE
    for y in range(HEIGHT):
        for x in range(WIDTH):
            # Cloth below a lamp at the upper left, with the soft shadow of the coin.
            distance = math.hypot(x - cx - 7, y - cy - 9) - COIN_RADIUS
            light = (1.05 - math.hypot(x - 195, y - 120) / 2700) * (0.55 + 0.45 * smooth(5, 26, distance))
            grain = 3 * ((x ^ y) & 1) + rng.randrange(3)
            canvas.set(x, y, 92 * light + grain, 104 * light + grain, 112 * light + grain)
    reach = int(COIN_RADIUS) + 2
    heights = [[coin_height(dx, dy) for dx in range(-reach, reach + 2)] for dy in range(-reach, reach + 2)]
    for dy in range(-reach, reach + 1):
        for dx in range(-reach, reach + 1):
            radius = math.hypot(dx, dy)
            if radius <= COIN_RADIUS + 1:
                here = heights[dy + reach][dx + reach]
                colour = coin_colour(dx, dy, heights[dy + reach][dx + reach + 1] - here,
                                     heights[dy + reach + 1][dx + reach] - here)
                canvas.blend(int(cx) + dx, int(cy) + dy, colour, coverage(radius - COIN_RADIUS))
    draw_rule(canvas)
    return canvas.png()


def coin_colour(x, y, slope_x, slope_y):
    """Brass, lit from the upper left."""
    length = math.sqrt(slope_x * slope_x + slope_y * slope_y + 1)
    light = max(0.0, (0.5 * slope_x + 0.6 * slope_y + 0.62) / length)
    shine = light ** 10 * 70
    base = (0.35 + 0.75 * light) * (1 + 0.08 * math.cos(2 * math.atan2(y, x) - 1.9))
    return 214 * base + shine, 172 * base + shine, 96 * base + shine


def draw_rule(canvas):
    ink = (30, 32, 34)
    for y in range(RULE_TOP, HEIGHT):
        for x in range(20, WIDTH - 20):
            canvas.set(x, y, 238, 236, 228)
    for millimetre in range(41):
        x = 40 + millimetre * COIN_PIXELS_PER_MILLIMETRE
        length = 40 if millimetre % 10 == 0 else 30 if millimetre % 5 == 0 else 20
        for y in range(RULE_TOP, RULE_TOP + length):
            for side, share in ((0, 1), (-1, 0.35), (1, 0.35)):
                canvas.blend(x + side, y, ink, share)
        if millimetre % 10 == 0 and millimetre < 40:
            text = str(millimetre)
            draw_text(canvas, text, x - (len(text) * 17 - 5) / 2, RULE_TOP + 50, ink)
    draw_text(canvas, "mm", 28 + 40 * COIN_PIXELS_PER_MILLIMETRE - 16, RULE_TOP + 50, ink)


def draw_text(canvas, text, left, top, ink):
    for letter in text:
        for line in DIGITS[letter]:
            canvas.stroke([(left + 12 * px, top + 20 * py) for px, py in line], 2.4, ink)
        left += 17


# The cells: living, dead and dividing ones in a counting chamber.

CELL_KINDS = ("Living", "Dead", "Dividing")


def cells():
    """Kind, centre and radius of each cell; they keep clear of each other and of the border."""
    rng = random.Random(1729)
    found = []
    while len(found) < 72:
        radius = rng.uniform(13, 18)
        x, y = rng.uniform(32, WIDTH - 32), rng.uniform(32, HEIGHT - 32)
        if all(math.hypot(x - other[1], y - other[2]) > radius + other[3] + 12 for other in found):
            kind = "Living" if rng.random() < 0.74 else "Dead" if rng.random() < 0.62 else "Dividing"
            found.append((kind, x, y, radius))
    return found


def draw_cells(found):
    canvas = Canvas()
    for y in range(HEIGHT):
        for x in range(WIDTH):
            light = 1 - 0.10 * ((x - 350) ** 2 + (y - 260) ** 2) / 200000
            line = 1 - 0.07 * (x % 180 in (0, 1)) - 0.07 * (y % 180 in (0, 1))
            canvas.set(x, y, 228 * light * line, 231 * light * line, 222 * light * line)
    rng = random.Random(99)
    for kind, cx, cy, radius in found:
        if kind == "Dividing":
            angle = rng.uniform(0, math.pi)
            for side in (-1, 1):
                draw_cell(canvas, cx + side * radius * 0.62 * math.cos(angle),
                          cy + side * radius * 0.62 * math.sin(angle), radius * 0.72, kind, rng)
        else:
            draw_cell(canvas, cx, cy, radius, kind, rng)
    return canvas.png()


def draw_cell(canvas, cx, cy, radius, kind, rng):
    inner, edge, core = {"Living": ((242, 244, 236), (128, 140, 120), (196, 204, 178)),
                         "Dead": ((78, 104, 176), (38, 52, 110), (36, 48, 112)),
                         "Dividing": ((238, 226, 232), (150, 96, 128), (176, 92, 138))}[kind]
    phase, depth = rng.uniform(0, 6.28), rng.uniform(0.02, 0.05)
    reach = int(radius * 1.2) + 3
    for y in range(int(cy) - reach, int(cy) + reach + 1):
        for x in range(int(cx) - reach, int(cx) + reach + 1):
            dx, dy = x - cx, y - cy
            border = radius * (1 + depth * math.sin(3 * math.atan2(dy, dx) + phase))
            distance = math.hypot(dx, dy) - border
            # A bright fringe outside of the membrane, as phase contrast shows it.
            canvas.blend(x, y, (250, 250, 246), 0.8 * max(0.0, 1 - abs(distance - 3) / 3))
            canvas.blend(x, y, inner, coverage(distance))
            canvas.blend(x, y, edge, 0.9 * max(0.0, 1 - abs(distance + 1) / 2))
    shift = radius * 0.18
    canvas.disc(cx + shift * math.cos(phase), cy + shift * math.sin(phase), radius * 0.42, core, 0.8)


# The fibres: thick and thin ones, bright on dark, as an electron microscope shows them.

SHADOW = 11


class Fibre:
    """A fibre along a gently bent line from border to border."""

    def __init__(self, rng, width):
        self.angle = rng.uniform(-0.55, 0.55) + (math.pi / 2 if rng.random() < 0.35 else 0)
        self.width = width
        self.centre = (rng.uniform(110, WIDTH - 110), rng.uniform(100, HEIGHT - 100))
        self.bend, self.phase = rng.uniform(6, 20), rng.uniform(0, 6.28)
        self.cos, self.sin = math.cos(self.angle), math.sin(self.angle)

    def local(self, x, y):
        """Distance along the fibre, signed distance from its middle, and its half width there."""
        along = (x - self.centre[0]) * self.cos + (y - self.centre[1]) * self.sin
        across = (y - self.centre[1]) * self.cos - (x - self.centre[0]) * self.sin
        middle = self.bend * math.sin(along / 200 + self.phase)
        slope = self.bend / 200 * math.cos(along / 200 + self.phase)
        return along, (across - middle) / math.sqrt(1 + slope * slope), self.half(along)

    def half(self, along):
        return self.width / 2 * (1 + 0.05 * math.sin(along / 36 + 2 * self.phase))

    def surroundings(self):
        """The pixels of the picture that the fibre and its shadow may cover, and some around them."""
        reach = self.width * 0.6 + SHADOW + self.bend
        flat = abs(self.cos) > abs(self.sin)
        for first in range(WIDTH if flat else HEIGHT):
            slope, start = ((self.sin / self.cos, 0) if flat else (self.cos / self.sin, 1))
            middle = self.centre[1 - start] + (first - self.centre[start]) * slope
            spread = reach / (abs(self.cos) if flat else abs(self.sin))
            last = HEIGHT if flat else WIDTH
            for second in range(max(0, int(middle - spread)), min(last, int(middle + spread) + 1)):
                yield (first, second) if flat else (second, first)

    def edges(self, along):
        """The two points of its edges at some place, across from each other."""
        middle = self.bend * math.sin(along / 200 + self.phase)
        slope = math.atan(self.bend / 200 * math.cos(along / 200 + self.phase))
        x = self.centre[0] + along * self.cos - middle * self.sin
        y = self.centre[1] + along * self.sin + middle * self.cos
        normal = self.angle + slope + math.pi / 2
        half = self.half(along)
        return tuple((x + side * half * math.cos(normal), y + side * half * math.sin(normal)) for side in (-1, 1))


def fibres():
    """From the lowest to the topmost; thin ones between 17 and 23 pixels wide, thick ones between 30 and 39."""
    rng = random.Random(31415)
    return [Fibre(rng, rng.uniform(30, 39) if index % 3 == 0 else rng.uniform(17, 23)) for index in range(13)]


def draw_fibres(found):
    rng = random.Random(5)
    values = [22 + 5 * math.sin(x / 52) * math.sin(y / 38) for y in range(HEIGHT) for x in range(WIDTH)]
    for depth, fibre in enumerate(found):
        for x, y in fibre.surroundings():
            along, across, half = fibre.local(x, y)
            distance = abs(across) - half
            value = values[y * WIDTH + x]
            if 0.5 < distance < SHADOW:
                value *= 1 - 0.35 * (1 - distance / SHADOW)
            elif distance <= 0.5:
                # Edges are brighter than the middle: there more electrons leave.
                bright = 74 + 5 * depth + 66 * min(1.0, abs(across) / half) ** 4 + 5 * math.sin(along / 7 + across / 3)
                value += (bright - value) * coverage(distance)
            values[y * WIDTH + x] = value
    pixels = bytearray(clamped(value + rng.randrange(-2, 3)) for value in values)
    return png(WIDTH, HEIGHT, 1, pixels)
