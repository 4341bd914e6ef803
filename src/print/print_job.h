// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "platform/text.h"
#include "platform/units.h"

#include <cstdint>
#include <vector>

namespace pelloric {

class PageDocument;
class Printer;
struct Font;

/// What is to be printed, and how.
struct PrintJob {
    bool allPages = true; ///< false: those of `pages`
    std::vector<std::int16_t> pages {}; ///< from 1, in the order in which they are sent
    std::int16_t copies = 1; ///< whole copies one after the other; none below 1
    std::int16_t paperSize = 9; ///< paper-size code of the report
    std::int16_t orientation = 1; ///< 1 portrait, 2 landscape
    Twips pageWidth = 0; ///< for a paper-size code that names no form; 0: unknown
    Twips pageHeight = 0; ///< for a paper-size code that names no form; 0: unknown
    Text documentName {}; ///< in the printer's queue; the page number is added
    Progress progress {}; ///< told after each page how many are sent
};

/// Sends one page to the printer, its records where they stand, and hands the document over.
///
/// @param page         zero-based index
/// @param defaultFont  font of the printer before the first record
/// @throws RunTimeError SubscriptOutOfRange: no such page, nothing has been sent; or the printer's
void printPage(const PageDocument& document, int page, const Font& defaultFont, Printer& printer);

/// The number of pages that a job sends, all its copies together.
std::int64_t pagesToSend(const PageDocument& document, const PrintJob& job);

/// Prints: every page is a document of its own, copies follow each other.
///
/// Where the paper-size code names no form, sheets of the pages' size are asked for.
/// The printer's paper size and orientation are put back in every case. A page number that names
/// no page makes no document.
/// @param defaultFont  as in `printPage`
/// @return             the number of pages sent
/// @throws RunTimeError the printer's own with ", after N of M pages" behind its text, or
/// Cancelled:
///         the progress said so; the job ends there
std::int64_t doPrint(
    const PageDocument& document, const PrintJob& job, const Font& defaultFont, Printer& printer);

} // namespace pelloric
