// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"

namespace pelloric {

/// Appends a line to the current page.
inline void addLine(PageDocument& document, Tpoint from, Tpoint to, const LinePen& pen = {})
{
    document.append(LineRecord { from, to, document.penNumber(pen) });
}

/// Appends a text to the current page.
inline void addText(
    PageDocument& document, Tpoint point, TextView text, const TextStyle& style = {})
{
    const TextView kept = document.store().add(text);
    document.append(TextRecord {
        point, kept.data(), static_cast<std::uint32_t>(kept.size()), document.styleNumber(style) });
}

/// Adds empty pages behind the present ones.
inline void addPages(PageDocument& document, int count)
{
    for (int page = 0; page < count; ++page)
        document.newPage();
}

/// A plain red line, a filled grey rectangle and a bold blue text that holds the page count token.
inline void addSampleRecords(PageDocument& document)
{
    addLine(document, { 0, 0 }, { 500, 0 }, { .LineColor = 255, .FillColor = 0 });
    addLine(document, { 500, 0 }, { 700, 300 },
        { .LineStyle = 1, .LineWidth = 2, .FillStyle = SolidFill, .FillColor = 14737632 });
    addText(document, { 500, 300 }, u"Page 2 of [Pages], [Pages]",
        { { .name = u"Arial", .size = 10.5F, .bold = true }, 16711680 });
}

} // namespace pelloric
