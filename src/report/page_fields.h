// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>

namespace pelloric {

class Clock;
class Recorder;
struct PageSetup;
struct ReportStyle;

/// Whether a header or footer text holds one of the fields that are expanded.
///
/// The fields are "[Date Printed]", "[Time Printed]", "[Date & Time Printed]",
/// "[Page # of Pages #]", "[Total Pages]" and "[Page #]"; letter case counts.
bool hasPageField(TextView text);

/// The text with its field expanded: the first of the fields, in the order above, that occurs, and
/// that one once. The number of pages becomes a token that is filled in when the page is put out.
///
/// @param page  number of the page, from 1
/// @return      "No." and the page number when the text holds no field
Text expandPageField(TextView text, std::int64_t page, const Clock& clock);

/// Draws the header and footer lines of pages: three texts each, left, centred on the paper, and
/// from nine tenths of the printable width on.
class PageLines {
public:
    /// All are borrowed and outlive it.
    PageLines(
        const ReportStyle& style, const PageSetup& setup, const Clock& clock, Recorder& recorder);

    /// Draws the header of the current page and selects the body font; the current y is below the
    /// line, or at the top margin when all three texts are empty.
    /// @param page  number of the page, from 1
    void drawPageHeader(std::int64_t page);

    /// Draws the footer and selects the body font.
    /// @param page  number of the page, from 1
    /// @param y     top of the line: twips, rounded
    void drawPageFooter(std::int64_t page, double y);

private:
    const ReportStyle& style_;
    const PageSetup& setup_;
    const Clock& clock_;
    Recorder& recorder_;
};

} // namespace pelloric
