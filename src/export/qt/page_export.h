// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "platform/text.h"

#include <filesystem>
#include <vector>

namespace pelloric {
class PageDocument;
struct OstlEncoding;
struct PageSetup;
}

namespace pelloric::qt {

class QtFonts;

/// What an export takes of a document, and how.
struct ExportOptions {
    /// Zero-based pages in the order in which they are put out; empty: all of them.
    std::vector<int> pages {};
    int dpi = 150; ///< of images: pixels per inch, 1 or more
    int jobs = 0; ///< threads that make images; 0: as many as the machine runs at once
    Text title {}; ///< of a PDF or SVG file
    Text language {}; ///< of a PDF file's texts, as "zh-CN"; empty: the locale's
    /// A PDF file says what the parts of its pages are, for readers who do not see them: tables of
    /// rows of cells where the document was built from a grid, else paragraphs. It has an outline.
    bool isTagged = false;
    bool isArchive = false; ///< a PDF file is PDF/A-2b, which can be read for good
    Progress progress {}; ///< told before each page how many are done
};

/// How a PDF file came about.
struct PdfExport {
    /// Why the toolkit wrote the file, in plain English: a text needs a font that files must not or
    /// cannot hold. Empty: nothing stood in the way.
    Text byToolkitBecause {};
};

/// Writes one PDF file: every page has exactly the paper's size, texts can be searched and copied,
/// and of each font only the characters that are used are embedded.
///
/// Pages go out as they are drawn, so that memory does not grow with their number. A font that
/// must not be embedded, is variable, or has no outlines cannot be put into a file; the toolkit
/// then writes the file, slower, and draws that font's characters as shapes.
///
/// Every `PageCountToken` is filled in, here and in the other exports. A file is written under
/// another name beside its place and put there when all is whole, so that a failure leaves what
/// there was.
/// @throws RunTimeError WriteFailed, with the path; Cancelled: the progress said so;
///         SubscriptOutOfRange: no such page; Overflow: a paper that is no size to write;
///         InvalidCall: a font cannot be put into a file that is to be tagged or an archive's
PdfExport exportPdf(const PageDocument& document, const PageSetup& setup, QtFonts& fonts,
    const ExportOptions& options, const std::filesystem::path& path);

/// The same by the toolkit's own means, which can draw with every font; the sizes of its pages are
/// rounded up to whole points.
/// @throws RunTimeError as `exportPdf`
void exportPdfByToolkit(const PageDocument& document, const PageSetup& setup, QtFonts& fonts,
    const ExportOptions& options, const std::filesystem::path& path);

/// The files that exports of one file a page write, in the order of the pages: "name-001.png" for
/// page 1 at "name.png", or the path itself for a single page. A page that is asked for twice has
/// one file.
/// @throws RunTimeError SubscriptOutOfRange: no such page
std::vector<std::filesystem::path> pageFilePaths(
    const PageDocument& document, const ExportOptions& options, const std::filesystem::path& path);

/// Writes one PNG image on white for each page, named as `pageFilePaths` says.
///
/// @return  the files in the order of the pages
/// @throws RunTimeError as `exportPdf`; Overflow: also an image of more pixels than can be held
std::vector<std::filesystem::path> exportPngs(const PageDocument& document, const PageSetup& setup,
    const ExportOptions& options, const std::filesystem::path& path);

/// Writes one SVG file for each page, named as the images are.
///
/// Glyphs are outlines, so that a page looks the same in every viewer, whatever fonts it has; over
/// them lie the texts unseen, so that they can be found, marked and copied.
/// @return  the files in the order of the pages
/// @throws RunTimeError as `exportPdf`
std::vector<std::filesystem::path> exportSvg(const PageDocument& document, const PageSetup& setup,
    QtFonts& fonts, const ExportOptions& options, const std::filesystem::path& path);

/// Writes a document file, which holds pages from the first on, 131 at most.
///
/// @param options  only the progress is looked at
/// @throws RunTimeError WriteFailed, with the path; Cancelled
void exportOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const ExportOptions& options, const std::filesystem::path& path);

} // namespace pelloric::qt
