// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QString>

#include <optional>

class QWidget;

namespace pelloric::app {

/// A table that a person has opened, and what it is called.
struct OwnTable {
    QString name;
    TableGrid table;
};

/// Asks for a CSV, TSV or SQLite file, and which table of a database; tells in a box why a file
/// cannot be read.
/// @return  nothing: there is none
std::optional<OwnTable> askOwnTable(QWidget& window);

/// Reads a file, asking for one of a database's tables where there are several.
std::optional<OwnTable> openOwnTable(QWidget& window, const QString& file);

} // namespace pelloric::app
