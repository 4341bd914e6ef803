#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Runs clang-tidy over the sources of the libraries and programs, many sources at a time.

    tools/tidy.py BUILD [FILE...]

BUILD is a folder with compile_commands.json, whose build is up to date. With FILEs only these are
looked at.

What clang-tidy does with a source is little beside what it does with the headers of the standard
library and of the toolkit, which every source includes. So sources are put together: a file that
includes several is looked at in their place, as a unity build would compile it. A name that stands
in the unnamed namespaces of two of them is another for the second. Sources that do not compile
together all the same are looked at one by one.
"""

import concurrent.futures
import json
import os
import pathlib
import re
import shlex
import subprocess
import sys

MOST_SOURCES = 40  # of one file, so that the files are alike in size
TOGETHER = "--checks=-bugprone-suspicious-include"

NOT_NAMES = {"public", "private", "protected", "final", "static_assert", "typename"}


def tracked(*patterns):
    return subprocess.check_output(["git", "ls-files", *patterns], text=True).split()


def private_names(source):
    """The names in the unnamed namespaces of a source; they begin their lines."""
    names = set()
    for body in re.findall(r"^namespace \{\n(.*?)^\} // namespace$", source, re.S | re.M):
        for enumerators in re.findall(r"^enum (?!class)[^{]*\{([^}]*)\}", body, re.S | re.M):
            names.update(re.findall(r"[A-Za-z_]\w*", enumerators))
        for line in re.findall(r"^[A-Za-z\[].*$", body, re.M):
            declared = re.split(r"[(={;]|(?<!:):(?!:)", line)[0]
            names.update(re.findall(r"[A-Za-z_]\w*", declared)[-1:])
    return names - NOT_NAMES


def shared_names(headers):
    """The types that headers declare."""
    declared = r"^(?:struct|class|enum class|enum|using) (\w+)"
    return {name for header in headers for name in re.findall(declared, header, re.M)}


def kind_of(source):
    """Sources of one kind are compiled alike."""
    program = re.match(r"apps/\w+", source)
    return program[0] if program else "qt" if "/qt/" in source else "core"


def put_together(sources):
    """The sources in groups of one kind, all of a kind about as large."""
    kinds = {}
    for source in sources:
        kinds.setdefault(kind_of(source), []).append(source)
    groups = []
    for alike in kinds.values():
        count = -(-len(alike) // MOST_SOURCES)
        groups.extend(alike[first::count] for first in range(count))
    return groups


def project_includes(top, source, text):
    """The lines that include the project's headers as a file elsewhere has to spell them."""
    lines = re.findall(r"^#include <pelloric/.*>$", text, re.M)
    for header in re.findall(r'^#include "(.*)"$', text, re.M):
        places = [top / source.parent / header, top / "src" / header]
        lines += [f'#include "{place}"' for place in places if place.exists()][:1]
    return lines


def together(top, sources, known):
    """A file that includes sources, behind all their headers, which no new name reaches."""
    headers, bodies, taken = [], [], set(known)
    for number, source in enumerate(sources):
        text = pathlib.Path(source).read_text()
        headers += project_includes(top, pathlib.Path(source), text)
        names = private_names(text)
        twice = sorted(names & taken)
        taken |= names
        bodies += [f"#define {name} {name}_{number}" for name in twice]
        bodies += [f'#include "{top / source}"']
        bodies += [f"#undef {name}" for name in twice]
    return "\n".join([*dict.fromkeys(headers), *bodies, ""])


def words_of(command):
    """The words of a compile command without what it reads and writes."""
    words = shlex.split(command["command"])
    while not pathlib.Path(words[0]).name.startswith("clang++"):
        words.pop(0)  # a cache, and what it is told
    output = words.index("-o")
    del words[output : output + 2]
    return words[: words.index("-c")]


def search_paths(words):
    """The options of a command that say where headers are and what is defined."""
    paths = [(word,) for word in words if re.match(r"-[ID].", word)]
    return paths + [(word, words[at + 1]) for at, word in enumerate(words) if word == "-isystem"]


def command_for(sources, commands, file):
    words = words_of(commands[sources[0]])
    for source in sources[1:]:
        for option in search_paths(words_of(commands[source])):
            if option[-1] not in words:
                words.extend(option)
    return {"directory": commands[sources[0]]["directory"], "file": str(file),
        "command": shlex.join([*words, "-c", str(file)])}


def tidy(folder, file, *options):
    command = ["clang-tidy-14", "-p", str(folder), "--quiet", *options, str(file)]
    done = subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True)
    return done.returncode, done.stdout + (done.stderr if "rror" in done.stderr else "")


def look_at(job):
    """Answers whether all is well, and what clang-tidy said."""
    build, folder, file, sources = job
    if len(sources) > 1:
        status, said = tidy(folder, file, TOGETHER)
        if "clang-diagnostic-error" not in said:
            return status == 0, said
    answers = [tidy(build, source) for source in sources]
    return all(status == 0 for status, _ in answers), "".join(said for _, said in answers)


def main(build, chosen):
    top = pathlib.Path.cwd()
    build = pathlib.Path(build)
    entries = json.loads((build / "compile_commands.json").read_text())
    commands = {os.path.relpath(entry["file"], top): entry for entry in entries}
    sources = [source for source in chosen or tracked("src/*.cpp", "apps/*.cpp") if source in commands]
    if not sources:
        sys.exit(f"tidy.py: no sources with a command in {build}")

    known = shared_names(pathlib.Path(header).read_text() for header in tracked("include/*.h", "src/*.h"))
    folder = (build / "tidy").absolute()
    folder.mkdir(exist_ok=True)
    jobs = []
    for number, group in enumerate(put_together(sources)):
        file = folder / f"together_{number}.cpp"
        file.write_text(together(top, group, known))
        jobs.append((build, folder, file, group))
    made = [command_for(group, commands, file) for _, _, file, group in jobs]
    (folder / "compile_commands.json").write_text(json.dumps(made, indent=1))

    is_good = True
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        for is_fine, said in pool.map(look_at, jobs):
            is_good = is_good and is_fine
            print(said, end="", flush=True)
    sys.exit(0 if is_good else 1)


if __name__ == "__main__":
    if len(sys.argv) < 2:
        sys.exit(__doc__)
    main(sys.argv[1], sys.argv[2:])
