// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_document.h"

#include "document/limits.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <functional>
#include <initializer_list>
#include <utility>

namespace pelloric {

namespace {

std::size_t mixed(std::initializer_list<std::size_t> parts)
{
    std::size_t hash = 0;
    for (const std::size_t part : parts)
        hash = (hash ^ part) * 0x9E3779B97F4A7C15ULL + (hash >> 29U);
    return hash;
}

std::size_t bits(std::int32_t value) { return static_cast<std::uint32_t>(value); }

} // namespace

namespace {

/// @param page  from 0
RunTimeError noSuchPage(int page, int count)
{
    return RunTimeError(ErrorNumber::SubscriptOutOfRange,
        noSuchItem(phrase(u"page"), std::int64_t { page } + 1, count));
}

/// @param what   the phrase of the record with its page, counted from 1
/// @param page   from 0
/// @param index  from 0
RunTimeError noSuchRecord(TextView what, std::size_t index, std::size_t count, int page)
{
    const Text place = phrase(what, { decimal(std::int64_t { page } + 1) });
    return RunTimeError(ErrorNumber::SubscriptOutOfRange,
        noSuchItem(place, static_cast<std::int64_t>(index) + 1, static_cast<std::int64_t>(count)));
}

} // namespace

std::int16_t marginOfCentimetres(std::int16_t centimetres)
{
    return narrowToInt16(std::int64_t { centimetres } * TwipsPerCm);
}

PageDocument::PageDocument()
    : pages_(1)
    , pictures_(1)
    , store_(std::make_shared<TextStore>())
{
}

bool PageDocument::hasRecords() const
{
    return std::ranges::any_of(
        pages_, [](const Page& page) { return page.lines.size() > 0 || page.texts.size() > 0; });
}

void PageDocument::newPage()
{
    if (Totalpages == MostPages)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"a document holds at most %1 pages", { decimal(MostPages) }));
    Totalpages = narrowToInt16(std::int64_t { Totalpages } + 1);
    Page next;
    if (!pages_.empty()) {
        next.lines.reserveLike(pages_.back().lines); // the pages of a report are alike
        next.texts.reserveLike(pages_.back().texts);
        pages_.back().lines.shrinkToFit();
        pages_.back().texts.shrinkToFit();
    }
    const auto count = static_cast<std::size_t>(std::max<std::int16_t>(Totalpages, 0));
    pages_.resize(count);
    pictures_.resize(count);
    currentPage = static_cast<std::int16_t>(Totalpages - 1);
    if (count == 0)
        return;
    pages_.back() = std::move(next);
    pictures_.back().reset();
}

PageDocument PageDocument::cleared() const
{
    PageDocument document;
    document.pictures_ = pictures_;
    return document;
}

Lineobj PageDocument::line(int page, std::size_t index) const
{
    const auto records = lines(page);
    if (index >= records.size())
        throw noSuchRecord(phraseText(u"on page %1 line"), index, records.size(), page);
    const LineRecord record = records[index];
    const LinePen& lines = pen(record.pen);
    return { record.pt1, record.pt2, lines.LineStyle, lines.LineColor, lines.LineWidth,
        lines.FillStyle, lines.FillColor };
}

Textobj PageDocument::text(int page, std::size_t index) const
{
    const auto records = texts(page);
    if (index >= records.size())
        throw noSuchRecord(phraseText(u"on page %1 text"), index, records.size(), page);
    const TextRecord record = records[index];
    const TextStyle& look = style(record.style);
    return { record.pt, Text(record.text()), look.font, look.color };
}

const MapLocation* PageDocument::picture(int page) const
{
    if (page < 0 || static_cast<std::size_t>(page) >= pictures_.size())
        return nullptr;
    const auto& picture = pictures_[static_cast<std::size_t>(page)];
    return picture ? &*picture : nullptr;
}

void PageDocument::placePicture(int page, const MapLocation& picture)
{
    pageAt(page);
    if (pictures_.size() < pages_.size())
        pictures_.resize(pages_.size());
    pictures_[static_cast<std::size_t>(page)] = picture;
}

void PageDocument::removePicture(int page)
{
    pageAt(page);
    if (static_cast<std::size_t>(page) < pictures_.size())
        pictures_[static_cast<std::size_t>(page)].reset();
}

void PageDocument::addPicture(int page, const PictureRecord& picture)
{
    pageAt(page);
    pages_[static_cast<std::size_t>(page)].pictures.push_back(picture);
}

std::uint32_t PageDocument::penNumber(const LinePen& pen)
{
    const auto [place, isNew]
        = penNumbers_.try_emplace(pen, static_cast<std::uint32_t>(pens_.size()));
    if (isNew)
        pens_.push_back(pen);
    return place->second;
}

std::uint32_t PageDocument::styleNumber(const TextStyle& style)
{
    TextStyle kept = style;
    kept.font.strikethrough = false;
    kept.font.underline = false;
    const auto [place, isNew]
        = styleNumbers_.try_emplace(kept, static_cast<std::uint32_t>(styles_.size()));
    if (isNew)
        styles_.push_back(std::move(kept));
    return place->second;
}

void PageDocument::shareStore(std::shared_ptr<TextStore> store)
{
    furtherStores_.push_back(std::exchange(store_, std::move(store)));
}

void PageDocument::keepTexts(std::shared_ptr<const TextStore> texts)
{
    if (texts)
        furtherStores_.push_back(std::move(texts));
}

std::size_t PageDocument::memoryBytes() const
{
    std::size_t bytes = pages_.capacity() * sizeof(Page) + patterns_.memoryBytes()
        + store_->capacityBytes() + structure.memoryBytes();
    for (const auto& store : furtherStores_)
        bytes += store->capacityBytes();
    for (const Page& page : pages_)
        bytes += page.lines.memoryBytes() + page.texts.memoryBytes()
            + page.pictures.capacity() * sizeof(PictureRecord);
    return bytes;
}

std::size_t PageDocument::PenHash::operator()(const LinePen& pen) const
{
    return mixed({ bits(pen.LineStyle), bits(pen.LineColor), bits(pen.LineWidth),
        bits(pen.FillStyle), bits(pen.FillColor) });
}

std::size_t PageDocument::StyleHash::operator()(const TextStyle& style) const
{
    const Font& font = style.font;
    return mixed({ std::hash<Text>()(font.name), std::hash<float>()(font.size), font.bold ? 1U : 0U,
        font.italic ? 1U : 0U, bits(style.color) });
}

PageDocument::Page& PageDocument::current()
{
    if (!hasPage(currentPage))
        throw noSuchPage(currentPage, pageCount());
    return pages_[static_cast<std::size_t>(currentPage)];
}

const PageDocument::Page& PageDocument::pageAt(int page) const
{
    if (!hasPage(page))
        throw noSuchPage(page, pageCount());
    return pages_[static_cast<std::size_t>(page)];
}

TextView withPageCount(TextView text, std::int16_t pages, Text& buffer)
{
    if (!contains(text, PageCountToken))
        return text;
    buffer = replaceAll(text, PageCountToken, decimal(pages));
    return buffer;
}

} // namespace pelloric
