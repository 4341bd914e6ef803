// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"
#include "platform/numbers.h"

#include <string>

namespace pelloric {

/// A text on one line: line ends as \r and \n.
inline std::string showText(TextView text)
{
    return toUtf8(replaceAll(replaceAll(text, u"\r", u"\\r"), u"\n", u"\\n"));
}

inline std::string showPoint(Tpoint point)
{
    return std::to_string(point.x) + "," + std::to_string(point.y);
}

/// A page, one record per line: every line and then every text, as they were recorded.
inline std::string showPage(const PageDocument& document, int page)
{
    std::string shown = "page " + std::to_string(page + 1) + "\n";
    for (std::size_t index = 0; index < document.lines(page).size(); ++index) {
        const Lineobj line = document.line(page, index);
        shown += "line " + showPoint(line.pt1) + " " + showPoint(line.pt2) + " style "
            + std::to_string(line.LineStyle) + " width " + std::to_string(line.LineWidth)
            + " colour " + std::to_string(line.LineColor) + " fill "
            + std::to_string(line.FillStyle) + " " + std::to_string(line.FillColor) + "\n";
    }
    for (std::size_t index = 0; index < document.texts(page).size(); ++index) {
        const Textobj text = document.text(page, index);
        shown += "text " + showPoint(text.pt) + " " + toUtf8(text.prnFont.name) + " "
            + toUtf8(formatSingle(text.prnFont.size)) + (text.prnFont.bold ? " bold" : "")
            + (text.prnFont.italic ? " italic" : "") + " colour " + std::to_string(text.ForeColor)
            + " \"" + showText(text.Str) + "\"\n";
    }
    return shown;
}

/// All pages.
inline std::string showDocument(const PageDocument& document)
{
    std::string shown;
    for (int page = 0; page < document.pageCount(); ++page)
        shown += showPage(document, page);
    return shown;
}

/// The texts of a page, in the order recorded, with "|" between them.
inline std::string textsOf(const PageDocument& document, int page)
{
    std::string shown;
    for (const TextRecord text : document.texts(page))
        shown += (shown.empty() ? "" : "|") + showText(text.text());
    return shown;
}

} // namespace pelloric
