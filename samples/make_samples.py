#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT
"""Makes the sample tables and samples.sqlite from files of three Debian packages.

Reads tzdata, iso-codes and python3-sklearn, either as installed or, with --root,
as unpacked below a folder; needs Python's standard library and the sqlite3 tool.
"""

import argparse
import csv
import gettext
import json
import re
import subprocess
import sys
from dataclasses import dataclass
from pathlib import Path

ZONE_INFO = "usr/share/zoneinfo"
ISO_CODES = "usr/share/iso-codes/json/iso_3166-1.json"
CHINESE_CATALOGUE = "usr/share/locale/zh_CN/LC_MESSAGES/iso_3166-1.mo"
WINE_DATA = "usr/lib/python3/dist-packages/sklearn/datasets/data/wine_data.csv"

# Degrees of two or three digits, then minutes, then perhaps seconds.
ANGLE = r"([+-])(\d{%d})(\d\d)(\d\d)?"
COORDINATES = re.compile(ANGLE % 2 + ANGLE % 3)


class SampleError(Exception):
    """A source file does not hold what is expected of it."""


@dataclass(frozen=True)
class Sample:
    """One table: its file, its name in the database, its typed columns and its rows."""

    file_name: str
    table: str
    columns: list[tuple[str, str]]
    rows: list[list[str]]

    def separator(self) -> str:
        """Tells the separator from the file's suffix: .tsv or .csv."""
        return "\t" if self.file_name.endswith(".tsv") else ","


def tabbed_lines(path: Path) -> list[list[str]]:
    """Returns the fields of each line that is no comment."""
    lines = path.read_text(encoding="utf-8").splitlines()
    return [line.split("\t") for line in lines if line and not line.startswith("#")]


def decimal_degrees(sign: str, degrees: str, minutes: str, seconds: str | None) -> str:
    """Turns degrees, minutes and seconds into degrees with four decimals."""
    value = int(degrees) + int(minutes) / 60 + int(seconds or 0) / 3600
    return f"{-value if sign == '-' else value:.4f}"


def time_zones(root: Path) -> Sample:
    """One row per time zone; the country is the first of the zone's country codes."""
    countries = dict(tabbed_lines(root / ZONE_INFO / "iso3166.tab"))
    rows = []
    for fields in tabbed_lines(root / ZONE_INFO / "zone1970.tab"):
        codes, coordinates, zone, comments = (fields + [""])[:4]
        match = COORDINATES.fullmatch(coordinates)
        if match is None:
            raise SampleError(f"{zone}: coordinates {coordinates!r}")
        latitude = decimal_degrees(*match.groups()[:4])
        longitude = decimal_degrees(*match.groups()[4:])
        country = countries[codes.split(",")[0]]
        rows.append([codes, country, zone, coordinates, comments, latitude, longitude])
    columns = [
        ("Country codes", "TEXT"),
        ("Country", "TEXT"),
        ("Zone", "TEXT"),
        ("Coordinates", "TEXT"),
        ("Comments", "TEXT"),
        ("Latitude", "REAL"),
        ("Longitude", "REAL"),
    ]
    return Sample("time-zones.tsv", "time_zones", columns, rows)


def countries_zh(root: Path) -> Sample:
    """One row per country, by its two-letter code; full names only where there is one."""
    countries = json.loads((root / ISO_CODES).read_text(encoding="utf-8"))["3166-1"]
    with (root / CHINESE_CATALOGUE).open("rb") as catalogue:
        chinese = gettext.GNUTranslations(catalogue).gettext
    rows = []
    for country in sorted(countries, key=lambda each: each["alpha_2"]):
        name = country["name"]
        full_name = country.get("official_name", "")
        rows.append(
            [
                country["alpha_2"],
                name,
                chinese(name),
                country["alpha_3"],
                country["numeric"],
                full_name,
                chinese(full_name) if full_name else "",
            ]
        )
    # The numeric code is text: its leading zeros belong to it.
    names = ["代码", "英文名", "中文名", "三位代码", "数字代码", "英文全称", "中文全称"]
    return Sample("countries-zh.csv", "countries_zh", [(name, "TEXT") for name in names], rows)


def wine(root: Path) -> Sample:
    """One row per wine: its number, the name of its class and thirteen measurements."""
    with (root / WINE_DATA).open(encoding="utf-8", newline="") as source:
        head, *records = csv.reader(source)
    classes = head[2:]
    rows = [
        [str(number), classes[int(record[-1])], *record[:-1]]
        for number, record in enumerate(records, start=1)
    ]
    columns = [
        ("Sample", "INTEGER"),
        ("Class", "TEXT"),
        ("Alcohol", "REAL"),
        ("Malic acid", "REAL"),
        ("Ash", "REAL"),
        ("Alcalinity of ash", "REAL"),
        ("Magnesium", "INTEGER"),
        ("Total phenols", "REAL"),
        ("Flavanoids", "REAL"),
        ("Nonflavanoid phenols", "REAL"),
        ("Proanthocyanins", "REAL"),
        ("Color intensity", "REAL"),
        ("Hue", "REAL"),
        ("OD280/OD315 of diluted wines", "REAL"),
        ("Proline", "INTEGER"),
    ]
    return Sample("wine.csv", "wine", columns, rows)


def write_table(sample: Sample, folder: Path) -> None:
    """Writes a header row and the rows as UTF-8 without byte order mark, lines ended by LF."""
    for row in sample.rows:
        if len(row) != len(sample.columns):
            raise SampleError(f"{sample.file_name}: {len(row)} fields in {row}")
    with (folder / sample.file_name).open("w", encoding="utf-8", newline="") as target:
        writer = csv.writer(target, delimiter=sample.separator(), lineterminator="\n")
        writer.writerow([name for name, _ in sample.columns])
        writer.writerows(sample.rows)


def import_commands(sample: Sample) -> list[str]:
    """Returns the sqlite3 tool's commands that read a written table; empty fields become NULL."""
    columns = ", ".join(f'"{name}" {kind}' for name, kind in sample.columns)
    empty_to_null = ", ".join(f"\"{name}\" = nullif(\"{name}\", '')" for name, _ in sample.columns)
    escaped_separator = sample.separator().replace("\t", "\\t")
    return [
        f"CREATE TABLE {sample.table} ({columns});",
        ".mode csv",
        f'.separator "{escaped_separator}" "\\n"',
        f".import --skip 1 {sample.file_name} {sample.table}",
        f"UPDATE {sample.table} SET {empty_to_null};",
    ]


def write_database(samples: list[Sample], folder: Path) -> None:
    """Makes samples.sqlite anew from the written tables."""
    (folder / "samples.sqlite").unlink(missing_ok=True)
    commands = [command for sample in samples for command in import_commands(sample)]
    subprocess.run(
        ["sqlite3", "-batch", "-bail", "samples.sqlite"],
        input="\n".join([*commands, "VACUUM;", ""]),
        encoding="utf-8",
        cwd=folder,
        check=True,
    )


def main() -> int:
    parser = argparse.ArgumentParser(description="Makes the sample tables and samples.sqlite.")
    parser.add_argument("--root", type=Path, default=Path("/"), help="where the packages are")
    parser.add_argument("--output", type=Path, default=Path(__file__).resolve().parent)
    options = parser.parse_args()
    try:
        samples = [make(options.root) for make in (time_zones, countries_zh, wine)]
        for sample in samples:
            write_table(sample, options.output)
            print(f"{sample.file_name}: {len(sample.rows)} rows")
        write_database(samples, options.output)
    except (OSError, LookupError, ValueError, SampleError, subprocess.CalledProcessError) as error:
        print(f"make_samples.py: {error}", file=sys.stderr)
        return 1
    return 0


if __name__ == "__main__":
    sys.exit(main())
