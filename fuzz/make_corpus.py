#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Writes starting inputs for the fuzzers: from the conformance cases, and small files of each kind.

make_corpus.py CASES OUT: OUT gets a folder for each fuzzer.
"""

import io
import json
import pathlib
import random
import sqlite3
import sys
import tempfile
import zipfile


def crlf(lines):
    return "".join(line + "\r\n" for line in lines).encode()


def seeds_of_step(step):
    name, *arguments = step
    if name == "settingsFile":
        yield "settings_file", crlf(arguments[0])
    elif name == "settingsBytes":
        yield "settings_file", bytes.fromhex(arguments[0])
    elif name == "OpenFile":
        yield "ostl", crlf(arguments[0])
    elif name in ("page list", "copies", "val"):
        yield "page_list", arguments[0].encode()
    elif name == "press Print":
        yield "page_list", arguments[3].encode()
    elif name == "doPrint":
        yield "page_list", arguments[1].encode()


def quoted(cell):
    return '"' + str(cell).replace('"', '""') + '"' if set(str(cell)) & set(',"\r\n') else str(cell)


def seeds_of_case(case):
    given = case["input"]
    if given.get("settings"):
        yield "settings_file", crlf(given["settings"])
    if "ostl" in case["expected"]:
        yield "ostl", crlf(case["expected"]["ostl"]["lines"])
    rows = (given.get("grid") or {}).get("rows")
    if rows:
        text = "".join(",".join(map(quoted, row)) + "\r\n" for row in rows)
        yield "csv", b"\0" + text.encode()
    for step in given["steps"]:
        yield from seeds_of_step(step)


JSON_TEXTS = [
    '[{"a": 1, "b": "x"}, {"b": null, "c": [1, {"d": true}]}]',
    '{"a": 1}\n{"a": -2.5e300}\n\n{"b": "\\ud83d\\ude00\\u0000"}\n',
    '{"rows": [{"a": 1}]}',
    "[[1, 2], [3, 4]]",
    "[]",
    "[1, 2",
    '[{"\u5b8b\u4f53": 99999999999999999999, "": 1E-400}]',
]

CSV_TEXTS = [
    'a;b\n"x;y";"1""2"\n',
    "a\tb\r\n1\t\"2\r\n3\"\r\n",
    "a|b\n1,5|2,5\n\n3|",
    '"a\nb,c\nd,e',
    "sep=;\na;b\n1;2\n",
]

SHEET = (
    '<worksheet xmlns="http://schemas.openxmlformats.org/spreadsheetml/2006/main"><cols><col min="1" '
    'max="2" width="9.5" hidden="0"/></cols><sheetData><row r="1"><c r="A1" t="s"><v>0</v></c><c '
    'r="B1" t="inlineStr"><is><t>b</t></is></c></row><row r="2" hidden="1"><c r="A2" s="1"><v>39000.5'
    '</v></c><c r="C2" t="b"><v>1</v></c><c r="D2" t="e"><v>#N/A</v></c></row></sheetData><mergeCells '
    'count="1"><mergeCell ref="A1:B2"/></mergeCells></worksheet>'
)

XLSX = {
    "xl/workbook.xml": '<workbook xmlns="http://schemas.openxmlformats.org/spreadsheetml/2006/main" '
    'xmlns:r="http://schemas.openxmlformats.org/officeDocument/2006/relationships"><workbookPr '
    'date1904="0"/><sheets><sheet name="S" sheetId="1" r:id="rId1"/></sheets></workbook>',
    "xl/_rels/workbook.xml.rels": '<Relationships xmlns="http://schemas.openxmlformats.org/package/'
    '2006/relationships"><Relationship Id="rId1" Target="worksheets/sheet1.xml"/></Relationships>',
    "xl/sharedStrings.xml": "<sst><si><t>a</t></si><si><r><t>x</t></r><r><t>y</t></r></si></sst>",
    "xl/styles.xml": '<styleSheet><numFmts><numFmt numFmtId="164" formatCode="[Red]yyyy\\-mm\\-dd;'
    '#,##0.00\\ &quot;x&quot;;0%;@"/></numFmts><fonts><font><b/><sz val="9"/><color rgb="FF112233"/>'
    '</font></fonts><fills><fill><patternFill patternType="solid"><fgColor theme="1" tint="-0.5"/>'
    '</patternFill></fill></fills><cellXfs><xf numFmtId="0"/><xf numFmtId="164" fontId="0" fillId="0">'
    '<alignment horizontal="center" wrapText="1"/></xf></cellXfs></styleSheet>',
    "xl/worksheets/sheet1.xml": SHEET,
}

ODS = {
    "mimetype": "application/vnd.oasis.opendocument.spreadsheet",
    "content.xml": '<office:document-content xmlns:office="urn:oasis:names:tc:opendocument:xmlns:office:'
    '1.0" xmlns:table="urn:oasis:names:tc:opendocument:xmlns:table:1.0" xmlns:text="urn:oasis:names:tc:'
    'opendocument:xmlns:text:1.0" xmlns:style="urn:oasis:names:tc:opendocument:xmlns:style:1.0">'
    '<office:automatic-styles><style:style style:name="c" style:family="table-cell"/>'
    '</office:automatic-styles><office:body><office:spreadsheet><table:table table:name="S"><table:'
    'table-column table:number-columns-repeated="3"/><table:table-row table:number-rows-repeated="2">'
    '<table:table-cell table:style-name="c" table:number-columns-spanned="2" office:value-type="float" '
    'office:value="1.5"><text:p>1<text:s text:c="3"/>5</text:p></table:table-cell><table:covered-table-'
    'cell/><table:table-cell table:number-columns-repeated="2"><text:p>x</text:p><text:p>y</text:p>'
    "</table:table-cell></table:table-row></table:table></office:spreadsheet></office:body>"
    "</office:document-content>",
}

QUERIES = [
    "SELECT * FROM t",
    "WITH c(x) AS (VALUES (1), (2)) SELECT x, quote(x) AS q FROM c ORDER BY 1",
    "PRAGMA table_info(t)",
    "EXPLAIN SELECT 1",
    "SELECT group_concat(a, ','), zeroblob(9), 1e999, NULL FROM t GROUP BY b",
    "/* x */ -- y\n(SELECT 1) UNION VALUES (2)",
]


def zipped(parts):
    file = io.BytesIO()
    with zipfile.ZipFile(file, "w", zipfile.ZIP_STORED) as archive:
        for name, text in parts.items():
            archive.writestr(zipfile.ZipInfo(name), text)
    return file.getvalue()


def database(*statements):
    with tempfile.TemporaryDirectory() as folder:
        path = pathlib.Path(folder) / "d"
        connection = sqlite3.connect(path)
        for statement in ("PRAGMA page_size = 512", *statements):
            connection.execute(statement)
        connection.commit()
        connection.close()
        return path.read_bytes()


def seeds_of_files():
    """Of each kind of file that is read; the first byte tells the fuzzer how it is read."""
    for text in JSON_TEXTS:
        yield "json", b"\2" + text.encode("utf-8", "surrogatepass")
    yield "json", b"\0" + zipped(XLSX)
    yield "json", b"\1" + zipped(ODS)
    parts = ("xl/worksheets/sheet1.xml", "xl/styles.xml", "xl/sharedStrings.xml")
    yield "office", b"\0" + b"\x1e".join(XLSX[part].encode() for part in parts)
    yield "office", b"\1" + ODS["content.xml"].encode()
    for number, text in enumerate(CSV_TEXTS):
        yield "csv", bytes([number % 6]) + text.encode()
        yield "csv", b"\xfe" + bytes([number]) + text.encode()
        yield "csv", b"\4" + text.encode("utf-16-le")
    for text in QUERIES:
        yield "sqlite", b"\1" + text.encode()
    for name in ("t", "v", "c:d", 'x"y'):
        yield "sqlite", b"\3" + name.encode()
    yield "sqlite", b"\0" + database("CREATE TABLE t(a, b)", "INSERT INTO t VALUES (1, 'x')")
    yield "sqlite", b"\0" + database(
        "CREATE TABLE t(a)", "CREATE VIEW v AS SELECT a FROM t", "CREATE INDEX i ON t(a)")
    for shift in (0, 63, 200):
        for text in ("plain", "\u5b8b\u4f53 \u20ac \u3400 \U0001f600", "\u4e02\u0020\u4e02"):
            yield "codec", bytes([shift]) + text.encode("gb18030")
    yield "codec", b"\0\x81\xb3\xc7\xff\x81\x30\x81"


def seeds_of_bytes():
    """For fuzzers that take their inputs apart, byte by byte."""
    numbers = random.Random(20041023)
    for fuzzer in ("export", "layout", "late_bound", "renderer", "style_texts"):
        for size in (30, 100, 300, 900):
            for least in range(5):
                yield fuzzer, bytes([least]) + numbers.randbytes(size)


def seeds_of_cases(cases):
    for path in sorted(pathlib.Path(cases).glob("*.json")):
        case = json.loads(path.read_text(encoding="utf-8"))
        for number, (fuzzer, data) in enumerate(seeds_of_case(case)):
            yield f"{path.stem}-{number}", fuzzer, data


def named(seeds, name):
    for number, (fuzzer, data) in enumerate(seeds):
        yield f"{name}-{number}", fuzzer, data


def main(cases, out):
    count = 0
    for source in (seeds_of_cases(cases), named(seeds_of_files(), "file"),
                   named(seeds_of_bytes(), "bytes")):
        for name, fuzzer, data in source:
            folder = pathlib.Path(out) / fuzzer
            folder.mkdir(parents=True, exist_ok=True)
            (folder / name).write_bytes(data)
            count += 1
    print(f"{count} seeds")


main(*sys.argv[1:])
