#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Writes starting inputs for the fuzzers, taken from the conformance cases.

make_corpus.py CASES OUT: OUT gets a folder for each fuzzer.
"""

import json
import pathlib
import sys


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


def main(cases, out):
    count = 0
    for path in sorted(pathlib.Path(cases).glob("*.json")):
        case = json.loads(path.read_text(encoding="utf-8"))
        for number, (fuzzer, data) in enumerate(seeds_of_case(case)):
            folder = pathlib.Path(out) / fuzzer
            folder.mkdir(parents=True, exist_ok=True)
            (folder / f"{path.stem}-{number}").write_bytes(data)
            count += 1
    print(f"{count} seeds")


main(*sys.argv[1:])
