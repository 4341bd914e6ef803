// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

class QString;
class QTableWidget;
class QTreeWidget;

namespace pelloric {
class TableGrid;
}

namespace pelloric::app {

/// A table as a widget: numbers stand at the right, strong wines are bold, and each class has a
/// colour of its own.
/// @param wines  the sample of that name
QTableWidget* makeWineTable(const TableGrid& wines);

/// What the wines of each class have in common: spans, ticks and colours.
QTableWidget* makeWineClasses(const TableGrid& wines);

/// Time zones below their regions: branches, spans, icons and ticks.
/// @param zones  the sample of that name
QTreeWidget* makeZoneTree(const TableGrid& zones);

} // namespace pelloric::app
