// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"
#include "support/test_paths.h"

#include <QFile>
#include <QString>

#include <gtest/gtest.h>

#include <ostream>

namespace pelloric::qt {

/// A table of the samples folder.
struct Sample {
    const char* file;
    QChar separator;
};

inline std::ostream& operator<<(std::ostream& stream, const Sample& sample)
{
    return stream << sample.file;
}

/// The cells of a line; a cell in double quotes may hold the separator.
inline std::vector<Text> cellsOf(const QString& line, QChar separator)
{
    std::vector<Text> cells(1);
    bool isQuoted = false;
    for (const QChar character : line) {
        if (character == u'"')
            isQuoted = !isQuoted;
        else if (character == separator && !isQuoted)
            cells.emplace_back();
        else
            cells.back().push_back(character.unicode());
    }
    return cells;
}

/// Its rows.
/// @param width  of every column: twips
inline TableGrid gridOf(const Sample& sample, Twips width = 1600)
{
    QFile file(QString::fromUtf8(PELLORIC_TESTS_DIR "/../samples/") + QLatin1String(sample.file));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    QStringList lines = QString::fromUtf8(file.readAll()).remove(u'\r').split(u'\n');
    std::vector<TableColumn> columns;
    for (const Text& title : cellsOf(lines.takeFirst(), sample.separator))
        columns.push_back({ title, width });
    TableGrid grid(columns);
    for (const QString& line : lines) {
        if (line.isEmpty())
            continue;
        const std::vector<Text> cells = cellsOf(line, sample.separator);
        grid.addRow(std::vector<TextView>(cells.begin(), cells.end()));
    }
    return grid;
}

} // namespace pelloric::qt
