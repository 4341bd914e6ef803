// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// Pages as files: PDF, PNG, SVG and the document file `.ostl`.
///
/// A file takes its place when it is whole: until then, and after a failure, what was there stays.
///
/// @code
/// exportPng(report, { .path = "stock.png", .pageNumbers = { 1 }, .dpi = 300 });
/// @endcode
///
/// A live view takes one call; it is laid out as the request says.
/// @code
/// pelloric::qt::ExportRequest request { .path = "stock.pdf" };
/// request.options.asShown = true;
/// request.options.fit.toSheet = true;
/// exportPdf(*tableView, request);
/// @endcode

#include <pelloric/options.h>
#include <pelloric/version.h>

#include <QString>
#include <QStringList>

#include <cstdint>
#include <optional>
#include <vector>

class QObject;

namespace pelloric::qt {

class Report;
class Sorvane;

/// Which pages become a file, and how.
struct ExportRequest {
    /// Of the file; of several images or drawings "a.png" names "a-001.png" and so on.
    QString path;
    std::vector<int> pageNumbers {}; ///< from 1, in the order in which they are put out; empty: all
    int dpi = 150; ///< of images: pixels an inch, 1 or more
    int jobs = 0; ///< threads that make images; 0: as many as the machine runs at once
    QString title {}; ///< of a PDF or SVG file
    QString language {}; ///< of a PDF file's texts, as "zh-CN"; empty: the locale's
    /// A PDF file says what the parts of its pages are, for readers who do not see them.
    bool isTagged = false;
    bool isArchive = false; ///< a PDF file is PDF/A-2b, which can be read for good
    /// Told before each page how many are done; answers whether to go on. May be empty.
    Progress progress {};

    /// What a live view's pages do beyond the plain ones. Pages that are laid out already stay as
    /// they are.
    ReportOptions options {};
    /// Of a live view's pages; nothing: those of the settings file.
    std::optional<ReportSettings> settings {};
};

/// What became of a live view.
struct ExportResult {
    QStringList files {}; ///< in the order of the pages; one of a PDF or document file
    int pageCount = 0; ///< that were laid out, 1 to 32,767
    std::int64_t rowCount = 0; ///< of the view that are printed; 0: none was chosen
    FitResult fit {}; ///< how the table was brought onto the sheet
    std::vector<LeftOut> leftOutOfTotals {}; ///< cells that show no number
    OstlLosses ostlLosses {}; ///< of a document file: what it does not hold of the pages
};

/// Writes one PDF file whose pages have exactly the paper's size; its texts can be searched.
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path; Cancelled: the
///         progress said so; SubscriptOutOfRange: no such page; Overflow: a paper of no size that
///         can be written; InvalidCall: a font cannot be put into a file that is to be tagged or an
///         archive's
PELLORIC_EXPORT void exportPdf(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT void exportPdf(const Sorvane& canvas, const ExportRequest& request);
/// Lays a live view out as the request's options and settings say, and writes its pages.
/// @param grid  see grids.h; borrowed for the call
/// @throws RunTimeError as of pages that are laid out, and as `Report::build`
PELLORIC_EXPORT ExportResult exportPdf(QObject& grid, const ExportRequest& request);

/// Writes an image on white for each page; a single page is written to the path itself.
/// @return  the files, in the order of the pages
/// @throws RunTimeError as `exportPdf`; Overflow: also an image that is too large
PELLORIC_EXPORT QStringList exportPng(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT QStringList exportPng(const Sorvane& canvas, const ExportRequest& request);
/// The same of a live view, laid out as the request's options and settings say.
/// @throws RunTimeError see `exportPdf`
PELLORIC_EXPORT ExportResult exportPng(QObject& grid, const ExportRequest& request);

/// Writes a drawing for each page, named as the images are.
/// @return  the files, in the order of the pages
/// @throws RunTimeError as `exportPdf`
PELLORIC_EXPORT QStringList exportSvg(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT QStringList exportSvg(const Sorvane& canvas, const ExportRequest& request);
/// The same of a live view, laid out as the request's options and settings say.
/// @throws RunTimeError see `exportPdf`
PELLORIC_EXPORT ExportResult exportSvg(QObject& grid, const ExportRequest& request);

/// Writes the document file, which holds 131 pages at most and all of them: of the request only
/// path and progress are looked at.
/// @return  what the file does not hold of the pages
/// @throws RunTimeError as `exportPdf`
PELLORIC_EXPORT OstlLosses exportOstl(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT OstlLosses exportOstl(const Sorvane& canvas, const ExportRequest& request);
/// The same of a live view, laid out as the request's options and settings say.
/// @throws RunTimeError see `exportPdf`
PELLORIC_EXPORT ExportResult exportOstl(QObject& grid, const ExportRequest& request);

} // namespace pelloric::qt
