#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""What the guides show as code, taken out of their pages to be compiled and run.

snippets.py write FOLDER PAGE...
    Writes every C++ program of the pages to FOLDER/PAGE_NUMBER.cpp, and all shorter pieces as the
    bodies of functions to FOLDER/fragments.cpp. Tells the names of the programs, a line each.
snippets.py run PAGE PELLORIC SOURCES PROGRAMS
    Runs the shell commands and scripts of a page with the program PELLORIC, and those of its C++
    programs in the folder PROGRAMS that end by themselves, in a folder of their own where the
    samples and examples of SOURCES are. Each file that a command names as its output must be there.
"""

import os
import pathlib
import re
import subprocess
import sys
import tempfile

LONGEST = 120  # seconds
FENCE = re.compile(r"^```(\w+)\n(.*?)^```$", re.MULTILINE | re.DOTALL)
OUTPUT = re.compile(r"(?:-o|>)\s+([\w./-]+\.\w+)|SaveFile\(\"([^\"]+)\"\)|\"([\w.-]+\.pdf)\"")


def pieces(page, language):
    text = pathlib.Path(page).read_text(encoding="utf-8")
    return [code for name, code in FENCE.findall(text) if name == language]


def is_program(code):
    return "int main(" in code


def programs(page):
    """The name and the code of each whole program of a page."""
    whole = [code for code in pieces(page, "cpp") if is_program(code)]
    return [(f"{pathlib.Path(page).stem}_{number}", code) for number, code in enumerate(whole, 1)]


def write(path, text):
    """Leaves a file with the same text as it is, so that nothing is compiled again."""
    if not path.exists() or path.read_text(encoding="utf-8") != text:
        path.write_text(text, encoding="utf-8")


def write_sources(folder, pages):
    folder.mkdir(parents=True, exist_ok=True)
    fragments = '#include "docs/given.h"\n\nclass Form : public QWidget {\n'
    for page in pages:
        for name, code in programs(page):
            write(folder / f"{name}.cpp", code)
            print(name)
        shorter = [code for code in pieces(page, "cpp") if not is_program(code)]
        for number, code in enumerate(shorter, 1):
            fragments += f"    void {pathlib.Path(page).stem}{number}()\n    {{\n{code}    }}\n"
    write(folder / "fragments.cpp", fragments + "};\n")


def run(command, folder, environment):
    ended = subprocess.run(command, cwd=folder, env=environment, timeout=LONGEST,
                           stdin=subprocess.DEVNULL, capture_output=True, text=True, check=False)
    shown = command[-1] if command[0] == "sh" else " ".join(map(str, command))
    if ended.returncode != 0:
        sys.exit(f"status {ended.returncode} of: {shown}\n{ended.stdout}{ended.stderr}")
    return 1


def require_outputs(code, folder):
    for names in OUTPUT.findall(code):
        name = next(name for name in names if name)
        path = folder / name
        if not path.is_file() or path.stat().st_size == 0:
            sys.exit(f"not made: {name}, by:\n{code}")


def run_page(page, pelloric, sources, built):
    count = 0
    with tempfile.TemporaryDirectory() as name:
        folder = pathlib.Path(name)
        for shared in ("samples", "examples", "tests"):
            (folder / shared).symlink_to(sources / shared)
        environment = {key: value for key, value in os.environ.items()
                       if key not in ("DISPLAY", "WAYLAND_DISPLAY")}
        environment.update(PATH=f"{pelloric.parent}:{environment['PATH']}", QT_QPA_PLATFORM="offscreen",
                           XDG_CONFIG_HOME=str(folder / "config"))
        for code in pieces(page, "sh"):
            count += run(["sh", "-e", "-c", code], folder, environment)
            require_outputs(code, folder)
        for code in pieces(page, "js"):
            (folder / "script.js").write_text(code, encoding="utf-8")
            count += run([pelloric, "run", "script.js"], folder, environment)
            require_outputs(code, folder)
        for program, code in programs(page):
            if "::exec()" not in code:
                count += run([built / program], folder, environment)
                require_outputs(code, folder)
    if count == 0:
        sys.exit(f"{page}: nothing to run")
    print(f"{count} pieces of {page} were run")


if __name__ == "__main__":
    if sys.argv[1] == "write":
        write_sources(pathlib.Path(sys.argv[2]), sys.argv[3:])
    else:
        run_page(*(pathlib.Path(name).absolute() for name in sys.argv[2:6]))
