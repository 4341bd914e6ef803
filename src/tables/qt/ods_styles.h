// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "tables/qt/sheet_cells.h"

#include <QHash>
#include <QString>

namespace pelloric::qt {

class ZipEntries;

/// The looks of cells of an .ods file by the names of their styles; what a style does not say, the
/// one that it is derived from does.
/// @throws RunTimeError TypeMismatch: the file is damaged
QHash<QString, SheetLook> readOdsStyles(const ZipEntries& file);

/// The widths of columns by the names of their styles: twips.
/// @throws RunTimeError TypeMismatch: the file is damaged
QHash<QString, Twips> readOdsWidths(const ZipEntries& file);

} // namespace pelloric::qt
