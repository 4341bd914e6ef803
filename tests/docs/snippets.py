#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""What the guides show as code, taken out of their pages to be compiled and run.

snippets.py write FOLDER PAGE...
    Writes every C++ program of the pages to FOLDER/PAGE_NUMBER.cpp, and all shorter pieces as the
    bodies of functions to FOLDER/fragments.cpp. Tells the names of the programs, a line each.
snippets.py consoles PELLORIC SOURCES PAGE...
    Holds every command of the pages that wants a desktop, a printer or a password against what it
    calls: the commands and options of the program PELLORIC, those of ./run, and CMake's.
snippets.py cmake FOLDER BUILD PAGE...
    Configures every piece of CMake of the pages in FOLDER, with the libraries of BUILD installed there.
    What is no project of its own stands in one with a target named host.
snippets.py run PAGE PELLORIC SOURCES PROGRAMS
    Runs the shell commands and scripts of a page with the program PELLORIC, and those of its C++
    programs in the folder PROGRAMS that end by themselves, in a folder of their own where the
    samples and examples of SOURCES are. Each file that a command names as its output must be there.
"""

import os
import pathlib
import re
import shlex
import shutil
import subprocess
import sys
import tempfile

LONGEST = 120  # seconds
LEAST_COMMANDS = 15  # of consoles: pages that show fewer were not understood
FENCE = re.compile(r"^```(\w*)\n(.*?)^```$", re.MULTILINE | re.DOTALL)
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


def helped(pelloric, command, environment):
    """What the program says of one of its commands; nothing where there is none."""
    ended = subprocess.run([pelloric, "help", command], env=environment, capture_output=True, text=True,
                           timeout=LONGEST, check=False)
    return ended.stdout if ended.returncode == 0 else ""


def wrong_pelloric(words, pelloric, environment):
    if not words or words[0].startswith("-"):
        return "" if words == ["--version"] else "no command"
    known = helped(pelloric, words[0], environment)
    options = [word for word in words[1:] if re.fullmatch(r"--?[a-z][\w-]*", word)]
    unknown = [option for option in options
               if not re.search(rf"(?<![\w-]){option}(?![\w-])", known)]
    return "no command" if not known else " ".join(unknown)


def wrong_run(words, sources):
    usage = subprocess.run([sources / "run", "help"], capture_output=True, text=True, timeout=LONGEST,
                           check=True).stdout
    return "" if words and re.search(rf"^  {words[0]} ", usage, re.MULTILINE) else "no command"


def wrong_command(command, pelloric, sources, environment):
    """Why a command of a console cannot be; an empty text where it can."""
    words = shlex.split(command, comments=True)
    while words and words[0] in ("sudo", "env"):
        words.pop(0)
    if not words:
        return ""
    program = words[0]
    if program == "pelloric":
        return wrong_pelloric(words[1:], pelloric, environment)
    if program == "./run":
        return wrong_run(words[1:], sources)
    if program == "cmake":
        wanted = [word for word in words[1:] if word.startswith("-") and not word.startswith("-D")]
        return " ".join(set(wanted) - {"-B", "-S", "--build", "--install", "--prefix", "--target"})
    known = ("apt-get", "psql", "jq", "build/host", "for", "do", "done", "python3", "git", "cd")
    return "" if program in known else "nobody knows this program"


def check_consoles(pelloric, sources, pages):
    environment = dict(os.environ, QT_QPA_PLATFORM="offscreen")
    wrong = []
    count = 0
    for page in pages:
        for code in pieces(page, "console") + pieces(page, ""):
            for line in code.splitlines():
                told = re.split(r"\s{3,}|\s+# ", line.strip())[0]  # what stands behind is prose
                for command in re.split(r"\s*(?:&&|\||;)\s*", told):
                    if re.match(r"(sudo |\./|cmake |pelloric |apt-get |build/)", command):
                        count += 1
                        why = wrong_command(command.split(" > ")[0], pelloric, sources, environment)
                        wrong += [f"{page}: {command}: {why}"] if why else []
    if wrong or count < LEAST_COMMANDS:
        sys.exit("\n".join([f"{count} commands; wrong:", *wrong]))
    print(f"{count} commands were held against what they call")


def configure(code, folder, prefix):
    folder.mkdir(parents=True, exist_ok=True)
    (folder / "main.cpp").write_text("int main() { }\n", encoding="utf-8")
    if "project(" not in code:
        code = ("cmake_minimum_required(VERSION 3.25)\nproject(Host LANGUAGES CXX)\n"
                + "add_executable(host main.cpp)\n" + code)
    (folder / "CMakeLists.txt").write_text(code, encoding="utf-8")
    ended = subprocess.run(["cmake", "-S", folder, "-B", folder / "build", f"-DCMAKE_PREFIX_PATH={prefix}"],
                           capture_output=True, text=True, timeout=LONGEST, check=False)
    if ended.returncode != 0:
        sys.exit(f"not configured:\n{code}\n{ended.stdout}{ended.stderr}")


def check_cmake(folder, build, pages):
    shutil.rmtree(folder, ignore_errors=True)
    prefix = folder / "prefix"
    for component in ("runtime", "development"):
        subprocess.run(["cmake", "--install", build, "--prefix", prefix, "--component", component],
                       timeout=LONGEST, check=True, stdout=subprocess.DEVNULL)
    count = 0
    for page in pages:
        for code in pieces(page, "cmake"):
            count += 1
            configure(code, folder / f"{pathlib.Path(page).stem}_{count}", prefix)
    if count == 0:
        sys.exit("no piece of CMake was found")
    print(f"{count} pieces of CMake were configured")


if __name__ == "__main__":
    if sys.argv[1] == "consoles":
        check_consoles(pathlib.Path(sys.argv[2]), pathlib.Path(sys.argv[3]).absolute(), sys.argv[4:])
    elif sys.argv[1] == "cmake":
        check_cmake(pathlib.Path(sys.argv[2]).absolute(), sys.argv[3], sys.argv[4:])
    elif sys.argv[1] == "write":
        write_sources(pathlib.Path(sys.argv[2]), sys.argv[3:])
    else:
        run_page(*(pathlib.Path(name).absolute() for name in sys.argv[2:6]))
