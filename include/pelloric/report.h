// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// Reports without a window: pages that are laid out from a grid, then exported, printed or saved.
///
/// @code
/// pelloric::qt::Report report;
/// report.useSettings(pelloric::ReportSettings { .topMm = 15 });
/// report.build(*tableView);
/// exportPdf(report, { .path = "stock.pdf" });
/// @endcode

#include <pelloric/errors.h>
#include <pelloric/options.h>
#include <pelloric/version.h>

#include <QString>

#include <memory>
#include <optional>

class QObject;

namespace pelloric {

class AutomationObject;
class Canvas;

} // namespace pelloric

namespace pelloric::qt {

/// The pages of one report; needs a QGuiApplication and lives in its thread.
class PELLORIC_EXPORT Report {
public:
    /// A report of one empty page.
    Report();
    ~Report();
    /// Takes the pages of another one, which must not be used then.
    Report(Report&& other) noexcept;
    /// The same.
    Report& operator=(Report&& other) noexcept;

    /// Gives the report settings of its own: the settings file is not read for it then.
    /// @param settings  nothing: the file's hold again, from the next build on
    void useSettings(std::optional<ReportSettings> settings);

    /// What the report is to do beyond the plain page, from the next build on.
    void setReportOptions(const ReportOptions& options);
    /// What was set; everything is off at first.
    const ReportOptions& reportOptions() const;
    /// What was done to bring the table of the last build onto the sheet.
    FitResult fitResult() const;
    /// The cells that the totals of the last build leave out, because they show no number.
    std::vector<LeftOut> leftOutOfTotals() const;

    /// Lays the pages out from a grid, whose kind is found by the members that it has.
    ///
    /// A build that fails leaves the pages as they were.
    /// @param grid  see grids.h; borrowed for the build
    /// @throws RunTimeError of the settings, the grid or the layout; ObjectMissing: no column of
    /// the
    ///         grid is wide enough to be printed
    void build(QObject& grid);

    /// Takes the pages of a document file.
    /// @throws RunTimeError FileNotFound, with the path; TypeMismatch: it is no document file; the
    ///         report has one empty page then
    void open(const QString& path);

    /// The number of pages, 1 to 32,767.
    int pageCount() const;

    /// Size of the pages: twips (1440 an inch).
    int pageWidth() const;
    /// See `pageWidth`.
    int pageHeight() const;

    /// The text of a page, a line for each printed text, in the order in which they were laid out.
    /// @param pageNumber  from 1
    /// @throws RunTimeError SubscriptOutOfRange: there is no such page
    QString pageText(int pageNumber) const;

    /// What the page canvas works on; for the library itself.
    Canvas& canvas() const;

private:
    struct Parts;
    std::unique_ptr<Parts> parts_;
};

} // namespace pelloric::qt
