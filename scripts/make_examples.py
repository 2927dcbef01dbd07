#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Makes everything below examples/: pictures of made-up things, sessions with what was measured on them, tables of
made-up measurements, and report templates. The same on every run; needs only Python's own library."""

import base64
import csv
import json
import math
import pathlib
import random
import sys

sys.dont_write_bytecode = True  # leaves nothing in the sources

import example_pictures as pictures
from example_pictures import coverage, png

ROOT = pathlib.Path(__file__).resolve().parent.parent / "examples"
MICROMETRES_PER_PIXEL = 12.5


def rounded(*numbers):
    return [round(number, 2) for number in numbers]


class Session:
    """What was measured on a picture."""

    def __init__(self, picture, micrometres_per_pixel):
        self.content = {"format": "statreport-session", "version": 1, "image": f"../pictures/{picture}.png",
                        "micrometresPerPixel": micrometres_per_pixel, "objects": [], "tables": []}

    def add(self, kind, points, **more):
        objects = self.content["objects"]
        number = sum(1 for entry in objects if entry["type"] == kind) + 1
        objects.append({"type": kind, "id": number, "points": [rounded(*point) for point in points], **more})


def plate_session(holes, slots):
    made = Session("plate", MICROMETRES_PER_PIXEL)
    add = made.add
    for left, top, width, height in slots:
        add("rectangle", [(left, top), (left + width, top + height)])
    for first, second in zip(holes[0:4], holes[1:5]):
        add("line", [first[:2], second[:2]])
    for index in (0, 4):
        cx, cy, radius = holes[index]
        add("arc", [(cx + radius, cy), (cx, cy - radius), (cx - radius, cy)])
    add("polygon", [holes[i][:2] for i in (0, 4, 14, 10)], name="Hole field")
    add("polyline", [holes[i][:2] for i in (0, 6, 12)], name="Diagonal")
    for upper, lower in ((0, 5), (5, 10)):
        add("parallelDistance", [holes[upper][:2], holes[upper + 4][:2],
                                 holes[lower][:2]])
    add("counter", [hole[:2] for hole in holes], name="Holes")
    add("counter", [(slot[0] + slot[2] / 2, slot[1] + slot[3] / 2) for slot in slots], name="Slots")
    for cx, cy, radius in holes:
        add("circle", [(cx, cy), (cx + radius, cy)])
    return made.content


def coin_session():
    """Calibrated, and nothing measured yet: that is left to the user."""
    return Session("coin", 1000 / pictures.COIN_PIXELS_PER_MILLIMETRE).content


def cells_session(cells):
    made = Session("cells", 0.8)
    for kind in pictures.CELL_KINDS:
        made.add("counter", [cell[1:3] for cell in cells if cell[0] == kind], name=kind)
    return made.content


def fibres_session(fibres):
    """The widths of fibres where they are seen: of thin ones by lines, of thick ones by parallel distances."""
    made = Session("fibres", 0.6)
    for depth, fibre in enumerate(fibres):
        for along in range(-330, 331, 66):
            places = [fibre.edges(along), fibre.edges(along + 14)]
            if not all(is_seen(point, fibres[depth + 1:]) for pair in places for point in pair):
                continue
            if fibre.width < 28:
                made.add("line", places[0])
            else:
                made.add("parallelDistance", [places[0][0], places[1][0], places[0][1]])
    return made.content


def is_seen(point, fibres_above):
    margin = 10
    if not (margin < point[0] < pictures.WIDTH - margin and margin < point[1] < pictures.HEIGHT - margin):
        return False
    return all(abs(across) > half + 3 for _, across, half in (fibre.local(*point) for fibre in fibres_above))


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


ACCENT, GREY = "#00659D", "#5b5f63"


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


def gap(points):
    return f'<p style="margin-top:0px; margin-bottom:0px; font-size:{points}pt;">&nbsp;</p>'


def title_block(title, subtitle):
    return text_block(
        paragraph(title, "font-size:26pt; font-weight:600; margin-bottom:2px;"),
        paragraph(subtitle, f"font-size:13pt; color:{ACCENT}; margin-bottom:0px;"), gap(6))


def heading(title, *paragraphs):
    """A title with what belongs below it: both are on the same page."""
    return text_block(gap(8), paragraph(title, "font-size:15pt; font-weight:600; margin-bottom:6px;"), *paragraphs)


def remarks(title, lines):
    """Room to write by hand or on the screen."""
    return heading(title, *[paragraph("\u2026" * 62, f"color:{GREY}; margin-bottom:12px;") for _ in range(lines)])


def fields(*rows):
    """What a report is about: names in grey, and values beside them, to be filled in where they are dots."""
    lines = "".join(f'<tr><td width="170" style="padding:3px 12px 3px 0px; color:{GREY};">{name}</td>'
                    f'<td style="padding:3px 0px;">{value}</td></tr>' for name, value in rows)
    return text_block(f'<table cellspacing="0" cellpadding="0" width="100%">{lines}</table>', gap(8))


def signatures(*roles):
    line = "border-top-width:1px; border-top-style:solid; border-top-color:#141414;"
    cells = '<td width="6%"></td>'.join(
        f'<td width="{(100 - 6 * (len(roles) - 1)) // len(roles)}%" style="{line} padding-top:4px; color:{GREY};">'
        f"{role}</td>" for role in roles)
    return text_block(gap(26), f'<table cellspacing="0" cellpadding="0" width="100%"><tr>{cells}</tr></table>')


def running_head(text):
    return f'<p style="margin-left:114px; margin-right:114px; font-size:9pt; color:{GREY};">{text}</p>'


PRINTED = "${CREATION_DATE_TEXT}, ${CREATION_TIME}"
ISSUER = "${PROGRAM_NAME} ${PROGRAM_VERSION}, ${PROGRAM_VENDOR}"
BLANK = "\u2026" * 16


def laboratory_templates(foot):
    """Reports for a laboratory to start from."""
    text = paragraph
    return {
        "summary": template([
            title_block("Measurement summary", "One page: the image and its statistics"),
            fields(("Sample", BLANK), ("Printed", PRINTED)),
            camera_image(70, True), heading("Statistics"), statistics_table(widthPercent=100)],
            "", foot, False),
        "protocol": template([
            title_block("Measurement protocol", "Image, statistics and every single value"),
            fields(("Sample", BLANK), ("Order", BLANK), ("Operator", BLANK), ("Instrument", BLANK),
                   ("Printed", PRINTED)),
            heading(
                "1 \u2002 Procedure",
                text("Describe here how the sample was prepared, which lens and which light were used, and how "
                     "the image was calibrated. The objects that were measured are drawn on the image."), gap(6)),
            camera_image(56, True),
            heading(
                "2 \u2002 Results",
                text("Statistics of each kind of value. The table after it lists every single value, in the order in "
                     "which it was measured."), gap(6)),
            statistics_table(widthPercent=100), measurements_table()],
            running_head("Measurement protocol \u00b7 ${CREATION_DATE_ISO}"), foot),
        "counting": template([
            title_block("Counting report", "Objects counted on the image, by class"),
            fields(("Sample", BLANK), ("Counted by", BLANK), ("Printed", PRINTED)),
            camera_image(56, True),
            heading("Counts and shares"),
            measurements_table(columns="Object Name;Value Name;Value", widthPercent=75),
            text_block(gap(6)), chart("Counters", widthPercent=56)],
            "", foot),
        "trend": template([
            title_block("Trend report", "Measured values in their order, and their spread"),
            fields(("Series", BLANK), ("Printed", PRINTED)),
            chart("Trend", groupBy=1, widthPercent=100),
            heading("Statistics"), statistics_table(widthPercent=100),
            remarks("Assessment", 4),
            chart("MinMedMaxBox", groupBy=1, widthPercent=100),
            heading("Image"), camera_image(75, True)],
            running_head("Trend report \u00b7 ${CREATION_DATE_ISO}"), foot),
        "certificate": template([
            text_block(f'<p><img width="66" src="{emblem()}" /></p>'),
            title_block("Certificate of measurement", "No. \u2026\u2026\u2026\u2026 \u2002 of ${CREATION_DATE_ISO}"),
            fields(("Customer", BLANK), ("Object", BLANK), ("Serial number", BLANK),
                   ("Date of issue", "${CREATION_DATE_TEXT}"), ("Time of issue", "${CREATION_TIME}"),
                   ("Measured with", "${PROGRAM_NAME}, version ${PROGRAM_VERSION}"),
                   ("Software by", "${PROGRAM_VENDOR}")),
            text_block(text("The object named above was measured on a calibrated image. The results below apply to this "
                            "object only, in the state in which it was received."), gap(6)),
            camera_image(38, True), heading("Results"), statistics_table(widthPercent=100),
            signatures("Place and date", "Measured by", "Approved by")],
            "", running_head("This certificate may be copied only as a whole. \u2003 " + ISSUER)),
    }


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
    templates.update(laboratory_templates(foot))
    for name, content in templates.items():
        write_json(ROOT / "templates" / f"{name}.rtp", content)


def write_json(path, content):
    path.write_text(json.dumps(content, indent=4, sort_keys=True, ensure_ascii=False) + "\n", encoding="utf-8")


def write_sessions():
    plate, cells, fibres = pictures.plate_features(), pictures.cells(), pictures.fibres()
    for name, session, drawn in (("plate", plate_session(*plate), pictures.draw_plate(*plate)),
                                 ("coin", coin_session(), pictures.draw_coin()),
                                 ("cells", cells_session(cells), pictures.draw_cells(cells)),
                                 ("fibres", fibres_session(fibres), pictures.draw_fibres(fibres))):
        (ROOT / "pictures" / f"{name}.png").write_bytes(drawn)
        write_json(ROOT / "sessions" / f"{'demo' if name == 'plate' else name}.json", session)


def main():
    for folder in ("pictures", "sessions", "tables", "templates"):
        (ROOT / folder).mkdir(parents=True, exist_ok=True)
    write_sessions()
    write_tables()
    write_templates()


if __name__ == "__main__":
    main()
