#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Makes everything below examples/: a picture of a made-up punched plate, the session with what was measured on it,
tables of made-up measurements, and report templates. The same on every run; needs only Python's own library."""

import base64
import csv
import json
import math
import pathlib
import random
import struct
import zlib

ROOT = pathlib.Path(__file__).resolve().parent.parent / "examples"
WIDTH, HEIGHT = 960, 720
MICROMETRES_PER_PIXEL = 12.5


def png(width, height, channels, pixels):
    """PNG file bytes of 8-bit samples, row after row; 1 channel is grey, 4 are red, green, blue, alpha."""
    stride = width * channels
    raw = b"".join(b"\0" + bytes(pixels[y * stride:(y + 1) * stride]) for y in range(height))

    def chunk(name, data):
        body = name + data
        return struct.pack(">I", len(data)) + body + struct.pack(">I", zlib.crc32(body))

    header = struct.pack(">IIBBBBB", width, height, 8, {1: 0, 4: 6}[channels], 0, 0, 0)
    return (b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", header) + chunk(b"IDAT", zlib.compress(raw, 9))
            + chunk(b"IEND", b""))


def plate_features():
    """Holes (centre, radius) and slots (left, top, width, height) of the plate, in pixels."""
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


def coverage(distance):
    """How much of a pixel lies inside of an edge at a signed distance (negative inside)."""
    return min(1.0, max(0.0, 0.5 - distance))


def draw_plate(holes, slots):
    rng = random.Random(7)
    pixels = bytearray(WIDTH * HEIGHT)
    for y in range(HEIGHT):
        shade = 168 + 22 * math.sin(y / 230.0)
        for x in range(WIDTH):
            grain = 5 * math.sin((x * 0.9 + 11 * math.sin(y * 0.05)) * 0.7)
            pixels[y * WIDTH + x] = int(min(255, max(0, shade + grain + rng.uniform(-7, 7))))

    def darken(x, y, inside):
        index = y * WIDTH + x
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
    return png(WIDTH, HEIGHT, 1, pixels)


def rounded(*numbers):
    return [round(number, 2) for number in numbers]


def session(holes, slots):
    objects = []

    def add(kind, points, **more):
        number = sum(1 for entry in objects if entry["type"] == kind) + 1
        objects.append({"type": kind, "id": number, "points": points, **more})

    for left, top, width, height in slots:
        add("rectangle", [rounded(left, top), rounded(left + width, top + height)])
    for first, second in zip(holes[0:4], holes[1:5]):
        add("line", [rounded(*first[:2]), rounded(*second[:2])])
    for index in (0, 4):
        cx, cy, radius = holes[index]
        add("arc", [rounded(cx + radius, cy), rounded(cx, cy - radius), rounded(cx - radius, cy)])
    add("polygon", [rounded(*holes[i][:2]) for i in (0, 4, 14, 10)], name="Hole field")
    add("polyline", [rounded(*holes[i][:2]) for i in (0, 6, 12)], name="Diagonal")
    for upper, lower in ((0, 5), (5, 10)):
        add("parallelDistance", [rounded(*holes[upper][:2]), rounded(*holes[upper + 4][:2]),
                                 rounded(*holes[lower][:2])])
    add("counter", [rounded(*hole[:2]) for hole in holes], name="Holes")
    add("counter", [rounded(slot[0] + slot[2] / 2, slot[1] + slot[3] / 2) for slot in slots], name="Slots")
    for cx, cy, radius in holes:
        add("circle", [rounded(cx, cy), rounded(cx + radius, cy)])
    return {"format": "statreport-session", "version": 1, "image": "../pictures/plate.png",
            "micrometresPerPixel": MICROMETRES_PER_PIXEL, "objects": objects, "tables": []}


def write_tables():
    rng = random.Random(4711)
    with open(ROOT / "tables" / "bolts.csv", "w", newline="", encoding="utf-8") as file:
        table = csv.writer(file, lineterminator="\n")
        table.writerow(["size", "length_mm", "head_diameter_mm", "head_height_mm", "angle_deg"])
        for size, length, head, height in (("M4", 20, 7.0, 2.8), ("M5", 25, 8.0, 3.5), ("M6", 30, 10.0, 4.0)):
            for _ in range(40):
                table.writerow([size] + [f"{rng.gauss(value, value * 0.004):.3f}" for value in (length, head, height)]
                               + [f"{rng.gauss(60, 0.4):.2f}"])
    with open(ROOT / "tables" / "fibres.csv", "w", newline="", encoding="utf-8") as file:
        table = csv.writer(file, lineterminator="\n", delimiter=";")
        table.writerow(["object_type", "object_index", "value_name", "unit", "value"])
        for kind, mean in (("Carbon fibre", 7.2), ("Glass fibre", 13.5)):
            for index in range(1, 31):
                for name, unit, value in (("Diameter", "\u00b5m", rng.gauss(mean, mean * 0.03)),
                                          ("Length", "mm", rng.gauss(3.2, 0.5))):
                    table.writerow([kind, index, name, unit, f"{value:.3f}".replace(".", ",")])
    with open(ROOT / "tables" / "particles.csv", "w", newline="", encoding="utf-8") as file:
        table = csv.writer(file, lineterminator="\n")
        table.writerow([" ", "Area", "Mean", "Circ.", "Feret", "Angle"])
        for index in range(1, 81):
            feret = rng.uniform(6, 40)
            table.writerow([index, f"{feret * feret * rng.uniform(0.4, 0.75):.3f}", f"{rng.uniform(90, 210):.3f}",
                            f"{rng.uniform(0.5, 1):.3f}", f"{feret:.3f}", f"{rng.uniform(0, 180):.3f}"])


def emblem():
    """A small picture for the demo's heading: three holes of a gauge."""
    size = 132
    pixels = bytearray(size * size * 4)
    for y in range(size):
        for x in range(size):
            plate = coverage(max(abs(x - 65.5), abs(y - 65.5)) - 60)
            hole = max(coverage(math.hypot(x - cx, y - cy) - r) for cx, cy, r in
                       ((42, 42, 20), (90, 58, 14), (56, 94, 10)))
            index = (y * size + x) * 4
            pixels[index:index + 3] = bytes((0x00, 0x65, 0x9D))
            pixels[index + 3] = int(255 * plate * (1 - hole))
    return "data:image/png;base64, " + base64.b64encode(png(size, size, 4, pixels)).decode("ascii")


def section(text, enabled=True):
    return {"text": text, "enabled": enabled}


def paragraph(text, style=""):
    return f'<p style="margin-top:0px; margin-bottom:6px; {style}">{text}</p>'


def text_block(*paragraphs):
    return {"name": "Text Document", "config": {"text": "<html><body>" + "".join(paragraphs) + "</body></html>"}}


def measurements_table(**settings):
    config = {"theme": "Light", "alignment": 132, "widthPercent": 100, "orderColumn": "", "orderAscending": True,
              "columns": "Object Name;Object Type;Value Name;Value"}
    return {"name": "Measurement table", "config": {**config, **settings}}


def chart(name, **settings):
    """A statistics block; its theme, alignment, width and grouping as those of the measurements table."""
    return {"name": name, "config": {"theme": "Light", "alignment": 132, "widthPercent": 100, **settings}}


def statistics_table(**settings):
    return chart("Statistics Table", **{"alignment": 4, "groupBy": 1, "columns": "Average;Sigma;Min;Max", **settings})


def image(data_url, width_percent):
    return {"name": "Image View", "config": {"imgPath": "", "alignment": "1", "widthPercent": str(width_percent),
                                             "rotationAngles": "0", "imgData": data_url.split(", ")[1]}}


def every_block(theme):
    """All block types, one after the other."""
    def heading(text):
        return text_block(paragraph(text, "font-size:15pt; font-weight:600;"))

    return [
        image(emblem(), 12),
        text_block(paragraph("Statistical report", "font-size:26pt; font-weight:600;"),
                   paragraph("Printed ${CREATION_DATE_TEXT}, ${CREATION_TIME}")),
        camera_image(75, True),
        heading("Counted objects"), chart("Counters", theme=theme, widthPercent=80),
        heading("Spread of each kind of value"), chart("MinMedMaxBox", theme=theme, groupBy=1, widthPercent=80),
        heading("Values in the order of measurement"), chart("Trend", theme=theme, groupBy=1, widthPercent=80),
        heading("Statistics"), statistics_table(theme=theme), statistics_table(theme=theme, groupBy=0),
        measurements_table(theme=theme),
    ]


def camera_image(width_percent, render_measurements):
    return {"name": "Camera Image View", "config": {"alignment": "132", "widthPercent": str(width_percent),
                                                    "rotationAngles": "0", "renderMeasurements": render_measurements}}


def template(nodes, header="", footer="", page_numbers=True):
    return {"config": {"pageWidth": 952, "marginWidth": 0.12}, "header": section(header, bool(header)),
            "footer": section(footer, bool(footer)), "pageNumbering": section("", page_numbers), "nodes": nodes}


def write_templates():
    head = ('<p style="margin-left:114px; margin-right:114px; font-size:9pt; color:#5b5f63;">'
            "Inspection report \u00b7 ${CREATION_DATE_ISO}</p>")
    foot = ('<p style="margin-left:114px; margin-right:114px; font-size:9pt; color:#5b5f63;">'
            "${PROGRAM_NAME} ${PROGRAM_VERSION}</p>")
    title = text_block(
        f'<p><img width="66" src="{emblem()}" /></p>',
        paragraph("Punched plate", "font-size:26pt; font-weight:600; margin-bottom:2px;"),
        paragraph("Dimensions of holes and slots", "font-size:13pt; color:#00659D; margin-bottom:18px;"),
        paragraph("<b>Sample</b> \u2003 Plate 17, upper side"),
        paragraph("<b>Measured</b> \u2003 on the calibrated image, 12.5 \u03bcm per pixel"),
        paragraph("<b>Printed</b> \u2003 ${CREATION_DATE_TEXT}, ${CREATION_TIME}", "margin-bottom:18px;"),
        paragraph("The plate carries fifteen round holes in three rows and six slots below them. The pages that follow "
                  "list every value in the order in which it was measured: width, height and area of the slots, the "
                  "distances between neighbouring holes, the rounding of the corner holes, the hole field as a whole, "
                  "and the diameter and area of each hole."))
    templates = {
        "demo": template([title, camera_image(80, True), measurements_table()], head, foot),
        "all-values": template([text_block(paragraph("Measured values", "font-size:20pt; font-weight:600;")),
                                measurements_table()], "", foot),
        "by-value": template([measurements_table(orderColumn="Value", orderAscending=False,
                                                 columns="Object Name;Value Name;Value", widthPercent=75)]),
        "dark": template([measurements_table(theme="Dark")]),
        "every-block": template(every_block("Light"), head, foot),
        "every-block-dark": template(every_block("Dark"), head, foot),
    }
    for name, content in templates.items():
        write_json(ROOT / "templates" / f"{name}.rtp", content)


def write_json(path, content):
    path.write_text(json.dumps(content, indent=4, sort_keys=True, ensure_ascii=False) + "\n", encoding="utf-8")


def main():
    for folder in ("pictures", "sessions", "tables", "templates"):
        (ROOT / folder).mkdir(parents=True, exist_ok=True)
    holes, slots = plate_features()
    (ROOT / "pictures" / "plate.png").write_bytes(draw_plate(holes, slots))
    write_json(ROOT / "sessions" / "demo.json", session(holes, slots))
    write_tables()
    write_templates()


if __name__ == "__main__":
    main()
