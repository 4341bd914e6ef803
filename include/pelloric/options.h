// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// What a report is told: settings of its own instead of those of the settings file, what it may do
/// beyond the plain page, and how a long work tells how far it is.
///
/// @code
/// canvas->useSettings(pelloric::ReportSettings { .mergeCells = true, .topMm = 15 });
/// pelloric::ReportOptions options;
/// options.fit.toSheet = true;
/// options.totals = { { u"Pieces" } };
/// canvas->setReportOptions(options);
/// @endcode

#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace pelloric {

/// Is told how many steps of a long work are done and how many there are in all, 0 while nobody
/// knows; answers whether to go on. May be empty.
///
/// After a no the work ends by the error `Cancelled`, and nothing of it is left.
using Progress = std::function<bool(std::int64_t done, std::int64_t total)>;

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

/// How a table that is too wide for the sheet is brought onto it.
///
/// Where it is asked for, or key columns are, a column that would leave the paper is narrowed.
struct FitOptions {
    bool toSheet = false; ///< as it is, else landscape, else shrunk, else in bands
    int pagesAcross = 0; ///< 1 or more: shrunk so far that so many bands hold all columns
    float leastSize = 6; ///< points; texts are not shrunk below
    double leastScale = 0.6; ///< nothing is shrunk further

    bool isAsked() const { return toSheet || pagesAcross > 0; }
    bool operator==(const FitOptions&) const = default;
};

/// What was done to bring a table onto the sheet.
enum class FitRule : std::uint8_t { NotAsked, AsItIs, Landscape, Shrunk, Bands };

/// What was done, and how far it went.
struct FitResult {
    FitRule rule = FitRule::NotAsked;
    double scale = 1; ///< of column widths and body font
    bool isTurned = false; ///< the sheet lies on its long side for this report
    int pagesAcross = 1; ///< bands of columns, which make so many pages of each run of rows

    bool operator==(const FitResult&) const = default;
};

/// Which rows are printed.
enum class RowChoice : std::uint8_t { All, Marked, Range };

/// In which order the pages of several bands follow each other.
enum class PageOrder : std::uint8_t { AcrossThenDown, DownThenAcross };

/// What is made of the numbers of a column.
enum class AggregateFunction : std::uint8_t { Sum, Count, Mean, Minimum, Maximum };

/// A total of one column: it stands in that column, behind every group and at the end.
///
/// Numbers are read as the table shows them. A sign, one currency sign, blanks, and brackets for
/// "negative" may stand around the digits. Of "." and "," the one that comes last separates the
/// decimals and the other one groups, as blanks and apostrophes do; one that occurs twice groups.
/// Where a number may be read in two ways, as "1,234", the first cell of the column that can be
/// read in one way only decides for all, or else the locale. A view that holds a number tells it
/// exactly.
///
/// Cells that show no number are left out, and counted in `LeftOut`; where no cell shows one, the
/// total is blank. `Count` counts the cells that are not empty. A total has as many decimals as the
/// most precise of its cells, a mean up to two more, and is grouped where one of its cells is.
struct Aggregation {
    std::u16string column {}; ///< its title
    AggregateFunction function = AggregateFunction::Sum;

    bool operator==(const Aggregation&) const = default;
};

/// What the rows of totals are called on paper: "Total: Sum". A word that is empty is the one of
/// the language in force, which is English unless `installTranslation` was called.
struct TotalWords {
    std::u16string total {}; ///< of the rows at the end; those of a group bear its texts
    std::u16string sum {};
    std::u16string count {};
    std::u16string mean {};
    std::u16string minimum {};
    std::u16string maximum {};

    bool operator==(const TotalWords&) const = default;
};

/// Cells of a column that are not empty but show no number, so that its totals leave them out.
struct LeftOut {
    std::u16string column {}; ///< its title
    std::int64_t cells = 0; ///< 1 or more

    bool operator==(const LeftOut&) const = default;
};

/// What a document file (`.ostl`) does not hold of the pages that are saved in it.
struct OstlLosses {
    int pages = 0; ///< behind the 131st
    bool pictures = false; ///< watermark or logo
    bool icons = false; ///< of cells
    std::int64_t texts = 0; ///< that hold characters which the file's code page has not

    bool any() const { return pages > 0 || pictures || icons || texts > 0; }
    bool operator==(const OstlLosses&) const = default;
};

/// A text or a picture on every page, centred on the paper.
struct Watermark {
    std::u16string text {}; ///< stands across the page, from the lower left to the upper right
    std::u16string imageFile {}; ///< counts where there is no text
    double opacity = 0.15; ///< 0 to 1
    bool isAbove = false; ///< above what is printed; else behind it

    bool isAsked() const { return !text.empty() || !imageFile.empty(); }
    bool operator==(const Watermark&) const = default;
};

/// A picture in a slot of the page header, at the top margin; the header's texts stand below it.
struct Logo {
    std::u16string imageFile {}; ///< empty: no logo
    int slot = 0; ///< 0 left, 1 centre, any other right
    /// Twips, a centimetre at first. The width follows; less where that needs more room.
    std::int32_t height = 567;

    bool operator==(const Logo&) const = default;
};

/// Decides about a row: its number from 1 and the texts of its printed columns.
using RowFilter = std::function<bool(std::int64_t row, std::span<const std::u16string_view> texts)>;

/// What a report may do beyond the plain page. Everything is off at first, and then every page is
/// the plain one.
struct ReportOptions {
    bool asShown = false; ///< cells look as the view shows them, where the grid is a view
    FitOptions fit {};
    int keyColumns = 0; ///< so many columns from the left stand at the left of every band
    std::vector<std::u16string> keyColumnNames {}; ///< or these
    /// The titles of the columns to print, in order. Empty: all as they stand.
    std::vector<std::u16string> columns {};
    RowChoice rows = RowChoice::All;
    std::int64_t firstRow = 1; ///< of a range, from 1
    std::int64_t lastRow = 0; ///< of a range
    RowFilter filter {}; ///< empty: every row that is chosen
    /// Not empty: only rows that hold `whereText` in the column of this title.
    std::u16string whereColumn {};
    std::u16string whereText {};
    PageOrder pageOrder = PageOrder::AcrossThenDown;
    std::vector<std::u16string> groupColumns {}; ///< rows with equal texts in these make a group
    bool keepsGroups = false; ///< a group stays on a page where one can hold it
    std::vector<Aggregation> totals {};
    TotalWords totalWords {}; ///< empty: those of the language in force
    Watermark watermark {};
    Logo logo {};

    /// Whether rows or columns are left out or moved.
    bool choosesCells() const
    {
        return !columns.empty() || rows != RowChoice::All || static_cast<bool>(filter)
            || !whereColumn.empty();
    }

    /// Whether anything but the plain arrangement of rows and bands is asked for.
    /// @param hasLooks  whether the grid tells how its cells look
    bool shapesPages(bool hasLooks) const
    {
        return (asShown && hasLooks) || fit.isAsked() || keyColumns > 0 || !keyColumnNames.empty()
            || pageOrder != PageOrder::AcrossThenDown || keepsGroups || !totals.empty();
    }
};

} // namespace pelloric
