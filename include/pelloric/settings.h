// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// The settings of a report as a value, for hosts that give a report its own.
///
/// @code
/// canvas->useSettings(pelloric::ReportSettings { .mergeCells = true, .topMm = 15 });
/// @endcode

#include <array>
#include <cstdint>
#include <optional>
#include <string>

namespace pelloric {

/// The slots of a header or footer line.
enum class AlignmentType : std::int16_t { LocLeft = 0, LocCenter = 1, LocRight = 2 };

/// A font and its colour as the settings hold them.
struct FontSettings {
    std::u16string name = u"宋体"; ///< of the face
    double size = 9; ///< points
    bool bold = false; ///< heavy strokes
    bool italic = false; ///< slanted strokes
    bool strikethrough = false; ///< kept; reports are printed without it
    bool underline = false; ///< kept; reports are printed without it
    double color = 0; ///< 0x00BBGGRR

    /// Whether all members are equal.
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
    FontSettings body; ///< of titles and cells
    FontSettings header; ///< of the line above each page
    FontSettings footer; ///< of the line below each page
    std::u16string paperName
        = u"A4"; ///< as the page setup dialog lists it; the layout goes by the size
    double orientation = 1; ///< 1 portrait, 2 landscape; the layout goes by the size
    /// The paper's place in the printer's list of forms, from 1; nothing: what is stored is no
    /// whole number, and no report can be made.
    std::optional<std::int16_t> paperCode = std::int16_t { 9 };
    double topMm = 10; ///< printed 1.6 times as high; 0: two centimetres
    double bottomMm = 10; ///< printed 1.8 times as high; 0: two centimetres
    double leftMm = 10; ///< printed 1.2 times as wide; 0: two centimetres
    double rightMm = 10; ///< printed 1.2 times as wide; 0: two centimetres
    double paperWidthMm = 210; ///< of the page as it is read
    double paperHeightMm = 297; ///< of the page as it is read
    /// Left, centre and right; each may hold one of the fields.
    std::array<std::u16string, 3> headerTexts {};
    /// The same of the line below each page.
    std::array<std::u16string, 3> footerTexts { u"", u"[Page # of Pages #]", u"" };

    /// Whether all members are equal.
    bool operator==(const ReportSettings&) const = default;
};

} // namespace pelloric
