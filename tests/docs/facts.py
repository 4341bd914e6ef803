#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Holds what the guides say about the program against the program itself.

facts.py messages PAGE SOURCES     every message that a heading of the page quotes is in the sources
facts.py settings PAGE PELLORIC    the table of keys is what the program writes, defaults included
facts.py options PELLORIC PAGE...  every option of a shell command is one of the program's
"""

import os
import pathlib
import re
import subprocess
import sys
import tempfile

LEAST = 10  # of each: a page that says less was not understood


def output(pelloric, *arguments):
    with tempfile.TemporaryDirectory() as folder:
        environment = dict(os.environ, XDG_CONFIG_HOME=folder, QT_QPA_PLATFORM="offscreen")
        return subprocess.run([pelloric, *arguments], env=environment, capture_output=True, text=True,
                              timeout=60, check=True).stdout


def judge(wrong, count):
    if wrong or count < LEAST:
        sys.exit("\n".join([f"{count} looked at; wrong:", *wrong]))
    print(f"{count} looked at")


def literals(sources):
    """The texts of all sources, with those that are written in several pieces put together."""
    text = ""
    for folder in ("src", "apps"):
        for path in sorted((sources / folder).rglob("*.cpp")) + sorted((sources / folder).rglob("*.h")):
            text += path.read_text(encoding="utf-8")
    return re.sub(r'"\s*u?"', "", text).replace('\\"', '"')


def check_messages(page, sources):
    texts = literals(pathlib.Path(sources))
    quoted = re.findall(r'^### "(.*)"$', pathlib.Path(page).read_text(encoding="utf-8"), re.MULTILINE)
    wrong = [message for message in quoted
             if not all(part.strip() in texts for part in message.split("…"))]
    judge(wrong, len(quoted))


def check_settings(page, pelloric):
    rows = re.findall(r"^\| `(\w+)` \| (.*?) ?\|", pathlib.Path(page).read_text(encoding="utf-8"),
                      re.MULTILINE)
    told = {key: value.strip() for key, value in rows}
    lines = [line.partition("=") for line in output(pelloric, "settings").splitlines() if "=" in line]
    written = {key.strip(): value.strip() for key, _, value in lines}
    wrong = [f"{key}: the page has {told.get(key)!r}, the program {written.get(key)!r}"
             for key in sorted(told.keys() | written.keys()) if told.get(key) != written.get(key)]
    judge(wrong, len(rows))


def check_options(pelloric, pages):
    wrong = []
    count = 0
    for page in pages:
        blocks = re.findall(r"^```(?:console|sh)?\n(.*?)^```$", pathlib.Path(page).read_text(encoding="utf-8"),
                            re.MULTILINE | re.DOTALL)
        for command, rest in re.findall(r"\bpelloric (\w+)([^\n|]*)", "\n".join(blocks)):
            known = output(pelloric, "help", command)
            options = re.findall(r"(?<=\s)--?[a-z][\w-]*", rest.split("    ")[0])
            count += 1 + len(options)
            wrong += [f"{page}: pelloric {command} {option}" for option in options
                      if not re.search(rf"(?<![\w-]){option}(?![\w-])", known)]
    judge(wrong, count)


if __name__ == "__main__":
    if sys.argv[1] == "messages":
        check_messages(*sys.argv[2:4])
    elif sys.argv[1] == "settings":
        check_settings(*sys.argv[2:4])
    else:
        check_options(sys.argv[2], sys.argv[3:])
