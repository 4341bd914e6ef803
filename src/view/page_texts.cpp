// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_texts.h"

#include "document/page_document.h"
#include "document/text_search.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "platform/text_metrics.h"

#include <algorithm>
#include <limits>

namespace pelloric {

namespace {

/// The face, size and page count that a text is shown with.
struct ShownText {
    Text text;
    FaceMetrics& face;
    float size;
};

ShownText shown(const PageDocument& document, const TextRecord& record, TextMetrics& metrics)
{
    const Font& font = document.style(record.style).font;
    Text buffer;
    return { Text(withPageCount(record.text(), document.Totalpages, buffer)),
        metrics.face(font.name, font.bold, font.italic), font.size };
}

/// A place past the largest is the largest: files hold texts anywhere.
Twips moved(Twips place, Twips by)
{
    using Limits = std::numeric_limits<Twips>;
    return static_cast<Twips>(
        std::clamp<std::int64_t>(std::int64_t { place } + by, Limits::min(), Limits::max()));
}

PageRect partOf(const ShownText& shown, Tpoint at, std::size_t begin, std::size_t length)
{
    const TextView text = shown.text;
    const Twips left = textWidth(shown.face.advanceOf(text.substr(0, begin)), shown.size);
    const Twips right = textWidth(shown.face.advanceOf(text.substr(0, begin + length)), shown.size);
    return { moved(at.x, left), at.y, moved(at.x, right),
        moved(at.y, textHeight(shown.face, shown.size)) };
}

Twips middle(const PageRect& area) { return area.top + (area.bottom - area.top) / 2; }

/// A text belongs to a row while its middle lies within the row's first text.
bool isSameRow(const PageRect& first, const PageRect& next)
{
    return middle(next) >= first.top && middle(next) <= first.bottom;
}

/// A cell of a table whose cells end with tabs.
Text plainCell(TextView text) { return replaceAll(onOneLine(text), u"\t", u" "); }

} // namespace

std::vector<PlacedText> placedTexts(const PageDocument& document, int page, TextMetrics& metrics)
{
    std::vector<PlacedText> placed;
    if (!document.hasPage(page))
        return placed;
    const auto records = document.texts(page);
    placed.reserve(records.size());
    for (std::size_t index = 0; index < records.size(); ++index) {
        ShownText text = shown(document, records[index], metrics);
        const PageRect area = partOf(text, records[index].pt, 0, text.text.size());
        placed.push_back({ index, area, std::move(text.text) });
    }
    return placed;
}

PageRect areaOf(
    const PageDocument& document, int page, const TextMatch& match, TextMetrics& metrics)
{
    const auto records = document.texts(page);
    if (match.text >= records.size())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"on page %1 text", { decimal(page + 1) }),
                static_cast<std::int64_t>(match.text) + 1,
                static_cast<std::int64_t>(records.size())));
    const TextRecord& record = records[match.text];
    const ShownText text = shown(document, record, metrics);
    const std::size_t begin = std::min(match.begin, text.text.size());
    return partOf(text, record.pt, begin, std::min(match.length, text.text.size() - begin));
}

bool overlap(const PageRect& one, const PageRect& other)
{
    return one.left <= other.right && other.left <= one.right && one.top <= other.bottom
        && other.top <= one.bottom;
}

Text asTable(std::vector<PlacedText> texts)
{
    std::ranges::stable_sort(texts, {}, [](const PlacedText& text) { return middle(text.area); });
    Text table;
    for (auto row = texts.begin(); row != texts.end();) {
        const PageRect first = row->area;
        const auto end = std::find_if(
            row, texts.end(), [&](const PlacedText& text) { return !isSameRow(first, text.area); });
        std::stable_sort(row, end,
            [](const PlacedText& a, const PlacedText& b) { return a.area.left < b.area.left; });
        if (!table.empty() || row != texts.begin())
            table += u'\n';
        for (auto text = row; text != end; ++text) {
            if (text != row)
                table += u'\t';
            table += plainCell(text->text);
        }
        row = end;
    }
    return table;
}

} // namespace pelloric
