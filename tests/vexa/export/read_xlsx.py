"""Prints a workbook as JSON for the export tests, read by openpyxl (an independent reader).

{"sheets": [names], "<sheet>": {"cells": {"B3": {"v": value, "t": data_type, "fmt": number_format,
 "fill": "RRGGBB" or null, "bold": bool, "date": bool}}, "widths": {"A": w}, "heights": {"1": h},
 "images": [[row, col]], "max_row": n}}
"""
import datetime
import json
import sys

try:
    import openpyxl
    import PIL  # openpyxl reads a sheet's images only through Pillow
except ImportError as error:
    package = {"openpyxl": "python3-openpyxl", "PIL": "python3-pil"}.get(error.name, "python3-" + str(error.name))
    sys.stderr.write("read_xlsx.py: the Python module %s is missing: install the Debian package %s "
                     "(scripts/setup.sh does)\n" % (error.name, package))
    sys.exit(2)


def main(path):
    workbook = openpyxl.load_workbook(path)
    result = {"sheets": workbook.sheetnames}
    for sheet in workbook.worksheets:
        cells = {}
        for row in sheet.iter_rows():
            for cell in row:
                if cell.value is None and cell.fill.fill_type is None:
                    continue
                value = cell.value
                if isinstance(value, (datetime.datetime, datetime.date, datetime.time)):
                    value = value.isoformat()
                fill = None
                if cell.fill.fill_type == "solid":
                    fill = str(cell.fill.fgColor.rgb)[-6:].upper()
                cells[cell.coordinate] = {
                    "v": value,
                    "t": cell.data_type,
                    "fmt": cell.number_format,
                    "fill": fill,
                    "bold": bool(cell.font.b),
                    "date": bool(cell.is_date),
                }
        widths = {key: dim.width for key, dim in sheet.column_dimensions.items() if dim.customWidth}
        heights = {str(key): dim.height for key, dim in sheet.row_dimensions.items() if dim.height is not None}
        images = []
        for image in getattr(sheet, "_images", []):
            anchor = image.anchor._from
            images.append([anchor.row + 1, anchor.col + 1])
        result[sheet.title] = {
            "cells": cells,
            "widths": widths,
            "heights": heights,
            "images": images,
            "max_row": sheet.max_row,
        }
    json.dump(result, sys.stdout)


if __name__ == "__main__":
    main(sys.argv[1])
