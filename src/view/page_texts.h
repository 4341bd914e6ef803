// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "view/page_renderer.h"

#include <vector>

namespace pelloric {

class PageDocument;
class TextMetrics;
struct TextMatch;

/// A text of a page and the rectangle that it takes.
struct PlacedText {
    std::size_t index = 0; ///< on its page
    PageRect area;
    Text text; ///< as single pages show it: "[Pages]" is the page count
};

/// The texts of a page, in recorded order.
/// @return  empty where there is no such page
std::vector<PlacedText> placedTexts(const PageDocument& document, int page, TextMetrics& metrics);

/// The rectangle of a part of a text.
/// @throws RunTimeError SubscriptOutOfRange: no such page or text
PageRect areaOf(
    const PageDocument& document, int page, const TextMatch& match, TextMetrics& metrics);

/// Whether two rectangles have a point in common.
bool overlap(const PageRect& one, const PageRect& other);

/// Texts as rows of a table: those that stand side by side make a row, from left to right with tabs
/// between them, and rows follow each other from top to bottom, each with a line feed behind it but
/// the last. Tabs and line ends within a text become blanks.
Text asTable(std::vector<PlacedText> texts);

} // namespace pelloric
