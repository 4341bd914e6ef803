#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Holds that every error of the library and of the program has been read by a test: the longest part
of each text with which src/ and apps/ make an error stands in a test, too, or below with the reason
why none can provoke it.

error_texts.py SOURCES
"""

import pathlib
import re
import sys

UNTESTABLE = {
    "a text of more than 4294967295 characters cannot be recorded":
        "cells hold 16,777,216 at most; it would take 8 GB",
    "there is no memory for an image of %1 by %2 pixels; choose a lower resolution":
        "depends on the machine's memory",
    "is a variable or coloured font": "no such font is among the packages of the tests",
    "has no outlines of a kind that can be embedded": "likewise",
    " takes no jobs": "of a printer that vanishes between two questions, see `choosePrinter`",
    "Item needs an index": "the library itself always gives one",
    "the file cannot be copied into %1 to be converted: %2": "takes a full disk of temporary files",
    "the database cannot be copied to read its log: ": "likewise",
    "this Qt has no converter for GB18030": "the packages' Qt has one",
    "%1 goes on after 4 GB; save it to a file and name that": "takes 4 GB to come to",
    "the sample tables are not found; name their folder with --samples":
        "those of the sources are always found",
    "an object of the library cannot be handed to a script's grid":
        "no member of a grid takes one",
    "the preview window did not close": "of a walk through the program's own windows",
    "%1 was not written": "likewise; a full disk is told by the writer before",
    "the preview window is not open": "likewise",
    "there is no tool %1": "likewise",
    "the saved document has other pages": "likewise",
    "%1: %2": "a file and what the system says of it",
    "member number": "members are handed out by the object itself",
}

LEAST = 80  # errors; fewer, and the sources were not understood
MADE = re.compile(
    r"(?:RunTimeError\(\s*ErrorNumber::\w+,|\brefuse\w*\(|(?:Command|Usage)Error\()"
    r"((?:'.'|\"(?:[^\"\\]|\\.)*\"|[^;\"])*);",
    re.DOTALL)
LITERAL = re.compile(r'"((?:[^"\\]|\\.)*)"')


def joined(code):
    """Without comments, and with the texts put together that are written in several pieces."""
    code = re.sub(r"^\s*//.*$|\s//[^\"\n]*$", "", code, flags=re.MULTILINE)
    return re.sub(r'"\s*\n\s*u?"', "", code)


def plain(text):
    """Without the places of values at its ends."""
    return re.sub(r"^%\d|%\d$", "", text.strip()).strip()


def sources(folder):
    for path in sorted(folder.rglob("*")):
        if path.suffix in (".cpp", ".h"):
            yield path, joined(path.read_text(encoding="utf-8"))


def main(root):
    root = pathlib.Path(root)
    tests = "".join(code for _, code in sources(root / "tests"))
    count = 0
    wrong = []
    for path, code in [*sources(root / "src"), *sources(root / "apps")]:
        for made in MADE.finditer(code):
            texts = [text for text in LITERAL.findall(made[1]) if len(text) >= 6]
            if not texts:
                continue
            count += 1
            text = max(texts, key=len)
            parts = [part.strip()[:24] for part in re.split(r"%\d", text) if len(part) >= 5]
            if plain(text) not in map(plain, UNTESTABLE) and not any(part in tests for part in parts):
                wrong.append(f"{path.relative_to(root)}: no test reads \"{text}\"")
    if wrong or count < LEAST:
        sys.exit("\n".join([f"{count} errors looked at; wrong:", *wrong]))
    print(f"{count} errors looked at")


main(*sys.argv[1:])
