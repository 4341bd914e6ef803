// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <array>
#include <cstdint>
#include <optional>

namespace pelloric {

/// A font and its colour as the settings hold them.
struct FontSettings {
    Text name = u"宋体"; ///< of the face
    double size = 9; ///< points
    bool bold = false;
    bool italic = false;
    bool strikethrough = false; ///< kept; reports are printed without it
    bool underline = false; ///< kept; reports are printed without it
    double color = 0; ///< 0x00BBGGRR

    bool operator==(const FontSettings&) const = default;
};

/// Everything that the settings file says about a report; the start values are those of the
/// default file.
///
/// The numbers are those of the file; what is no number in the file is 0.
struct ReportSettings {
    bool showHeaders = true; ///< the row of column titles on every page
    bool horizontalLines = true; ///< between rows
    bool verticalLines = true; ///< between columns
    bool mergeCells = false; ///< equal neighbouring cells of a column are printed once
    double headerColor = 0xE0E0E0; ///< 0x00BBGGRR; fill colour that grid lines are recorded with
    double gridLineColor = 0; ///< 0x00BBGGRR
    FontSettings body;
    FontSettings header; ///< of the line above each page
    FontSettings footer; ///< of the line below each page
    Text paperName = u"A4"; ///< as the page setup dialog lists it; the layout goes by the size
    double orientation = 1; ///< 1 portrait, 2 landscape; the layout goes by the size
    /// The paper's place in the printer's list of forms, from 1; nothing: what is stored is no
    /// whole number, and no report can be made.
    std::optional<std::int16_t> paperCode = std::int16_t { 9 };
    double topMm = 10; ///< printed 1.6 times as high; 0: two centimetres
    double bottomMm = 10; ///< printed 1.8 times as high; 0: two centimetres
    double leftMm = 10; ///< printed 1.2 times as wide; 0: two centimetres
    double rightMm = 10; ///< printed 1.2 times as wide; 0: two centimetres
    double paperWidthMm = 210;
    double paperHeightMm = 297;
    /// Left, centre and right; each may hold one of the fields.
    std::array<Text, 3> headerTexts {};
    std::array<Text, 3> footerTexts { Text(), Text(u"[Page # of Pages #]"), Text() };

    bool operator==(const ReportSettings&) const = default;
};

} // namespace pelloric
