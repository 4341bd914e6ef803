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

#include <pelloric/version.h>

#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

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
    std::function<bool(int done, int total)> progress {};
};

/// Writes one PDF file whose pages have exactly the paper's size; its texts can be searched.
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path; Cancelled: the
///         progress said so; SubscriptOutOfRange: no such page; Overflow: a paper of no size that
///         can be written; InvalidCall: a font cannot be put into a file that is to be tagged or an
///         archive's
PELLORIC_EXPORT void exportPdf(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT void exportPdf(const Sorvane& canvas, const ExportRequest& request);

/// Writes an image on white for each page; a single page is written to the path itself.
/// @return  the files, in the order of the pages
/// @throws RunTimeError as `exportPdf`; Overflow: also an image that is too large
PELLORIC_EXPORT QStringList exportPng(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT QStringList exportPng(const Sorvane& canvas, const ExportRequest& request);

/// Writes a drawing for each page, named as the images are.
/// @return  the files, in the order of the pages
/// @throws RunTimeError as `exportPdf`
PELLORIC_EXPORT QStringList exportSvg(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT QStringList exportSvg(const Sorvane& canvas, const ExportRequest& request);

/// Writes the document file, which holds 131 pages at most and all of them: of the request only
/// path and progress are looked at.
/// @throws RunTimeError as `exportPdf`
PELLORIC_EXPORT void exportOstl(const Report& report, const ExportRequest& request);
/// The same of the pages that a control shows.
PELLORIC_EXPORT void exportOstl(const Sorvane& canvas, const ExportRequest& request);

} // namespace pelloric::qt
