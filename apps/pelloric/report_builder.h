// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include "document/page_document.h"

#include <QJsonObject>

#include <vector>

namespace pelloric {
class Canvas;
class TableGrid;
struct Platform;
}

namespace pelloric::qt {
class QtPlatform;
}

namespace pelloric::app {

class ProgressLine;

/// Gives a table's columns the widths that the options name, and the others widths that suit what
/// they hold, narrowed where that saves a second sheet beside the first.
///
/// @param canvas  has loaded the settings in force
/// @throws CommandError the widths cannot be used
void setColumnWidths(TableGrid& grid, const CommandLine& line, Canvas& canvas);

/// Lays a table out with the settings in force.
/// @throws CommandError settings that cannot be used; RunTimeError of the layout, or Cancelled
void buildReport(Canvas& canvas, TableGrid& grid, const CommandLine& line, ProgressLine& progress);

/// What is told in JSON of how a table was brought onto its pages.
QJsonObject shapeFacts(const Canvas& canvas);

/// A document that was saved.
struct SavedDocument {
    PageDocument document;
    PageSetup setup;
};

/// Reads a document file; of the options for reports only the title applies to it.
/// @throws CommandError it is no document file, or other options are given; RunTimeError of reading
SavedDocument readDocument(const QString& file, const CommandLine& line, const Platform& platform);

/// The zero-based pages that a list such as 1,3,5-12 names; empty for an empty list.
/// @throws CommandError the list names no page of the document
std::vector<int> pagesOf(const QString& list, int pageCount);

} // namespace pelloric::app
