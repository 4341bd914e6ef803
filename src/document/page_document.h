// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_records.h"
#include "document/page_structure.h"
#include "document/records.h"
#include "document/text_store.h"

#include <memory>
#include <optional>
#include <span>
#include <unordered_map>
#include <vector>

namespace pelloric {

/// Paper and margins.
struct PageSetup {
    std::int16_t intTop = 2 * TwipsPerCm; ///< twips
    std::int16_t intButtom = 2 * TwipsPerCm; ///< twips
    std::int16_t intLeft = 2 * TwipsPerCm; ///< twips
    std::int16_t intRight = 2 * TwipsPerCm; ///< twips
    Twips myHeight = 16840; ///< A4 portrait
    Twips myWidth = 21 * TwipsPerCm;

    bool operator==(const PageSetup&) const = default;
};

/// Where a picture lies among what a page shows.
enum class PictureLayer : std::uint8_t {
    Behind, ///< everything
    Cells, ///< above lines and boxes, behind texts
    Above ///< everything
};

/// A picture that a report draws on a page, as the page keeps it.
struct PictureRecord {
    PictureLayer layer = PictureLayer::Cells;
    Tpoint pt; ///< top-left corner
    Tpoint size; ///< twips
    TextView file; ///< lives in a text store of the document
};

/// A margin given in whole centimetres, as twips, for hosts that set margins so; settings and
/// dialogs hold millimetres.
/// @throws RunTimeError Overflow: above 57 or below -57
std::int16_t marginOfCentimetres(std::int16_t centimetres);

/// The laid-out pages: for each a list of lines, a list of texts and at most one placed picture.
///
/// A page is never a picture of itself; screen, printer and files replay its records, every line
/// and then every text, in the order recorded. Reports that ask for more than the plain page also
/// have pictures of their own: watermarks, logos, icons. Pages count from 0 here.
class PageDocument {
public:
    PageDocument();

    /// The number of pages as hosts see and may write it; real pages are `pageCount()`.
    std::int16_t Totalpages = 1;

    /// The page that is recorded on; may point past the real pages when a host said so.
    std::int16_t currentPage = 0;

    /// What the texts of the pages are, as far as it is known.
    PageStructure structure;

    /// The number of pages that exist.
    int pageCount() const { return static_cast<int>(pages_.size()); }

    /// Adds an empty page behind `Totalpages` and makes it the current one.
    /// @throws RunTimeError Overflow: there would be more than 32767; nothing has changed
    void newPage();

    /// Back to one empty page; the picture of a page stays until pages are added.
    void clear() { *this = cleared(); }

    /// What `clear` would leave of this document.
    PageDocument cleared() const;

    /// Whether there is such a page.
    /// Whether anything is drawn on any page.
    bool hasRecords() const;

    bool hasPage(int page) const { return page >= 0 && page < pageCount(); }

    /// @throws RunTimeError SubscriptOutOfRange: no such page
    LineRange lines(int page) const { return { pageAt(page).lines, patterns_ }; }
    /// @throws RunTimeError SubscriptOutOfRange: no such page
    TextRange texts(int page) const { return TextRange(pageAt(page).texts); }

    /// The pen of a `LineRecord`.
    const LinePen& pen(std::uint32_t number) const { return pens_[number]; }
    /// The style of a `TextRecord`.
    const TextStyle& style(std::uint32_t number) const { return styles_[number]; }

    /// A line as it is published. @throws RunTimeError SubscriptOutOfRange
    Lineobj line(int page, std::size_t index) const;
    /// A text as it is published. @throws RunTimeError SubscriptOutOfRange
    Textobj text(int page, std::size_t index) const;

    /// The picture that the page carries, or null.
    const MapLocation* picture(int page) const;
    /// Gives a page its picture. @throws RunTimeError SubscriptOutOfRange
    void placePicture(int page, const MapLocation& picture);
    /// Takes the page's picture away, for the host that placed it. @throws RunTimeError
    /// SubscriptOutOfRange
    void removePicture(int page);

    /// The number of a pen in this document.
    std::uint32_t penNumber(const LinePen& pen);
    /// The number of a style in this document; strike-through and underline are dropped.
    std::uint32_t styleNumber(const TextStyle& style);

    /// Appends to the current page. @throws RunTimeError SubscriptOutOfRange
    void append(const LineRecord& line) { current().lines.append(line); }
    /// Appends to the current page; the text stays where it is.
    /// @throws RunTimeError SubscriptOutOfRange
    void append(const TextRecord& text) { current().texts.append(text); }

    /// Keeps the lines of rows that differ in nothing but top and bottom.
    /// @param lines  in the order in which they are drawn
    /// @return       the number of the pattern in this document
    std::uint32_t addLinePattern(std::span<const PatternLine> lines)
    {
        return patterns_.add(lines);
    }
    /// The lines of a pattern.
    std::span<const PatternLine> linePattern(std::uint32_t number) const
    {
        return patterns_[number];
    }
    /// Appends all lines of a pattern to the current page.
    /// @throws RunTimeError SubscriptOutOfRange
    void appendRow(Twips top, Twips bottom, std::uint32_t pattern)
    {
        const std::size_t lines = patterns_[pattern].size();
        if (lines > 0)
            current().lines.appendRow(top, bottom, pattern, lines);
    }

    /// Adds a picture to a page of a report.
    /// @throws RunTimeError SubscriptOutOfRange: no such page
    void addPicture(int page, const PictureRecord& picture);
    /// The pictures that a report draws on a page. @throws RunTimeError SubscriptOutOfRange
    std::span<const PictureRecord> reportPictures(int page) const { return pageAt(page).pictures; }

    /// Where new texts are kept.
    TextStore& store() { return *store_; }
    /// Takes over a store that a row set shares; texts recorded before stay valid.
    void shareStore(std::shared_ptr<TextStore> store);

    /// Keeps texts of another store that are recorded.
    /// @param texts  null: there are none
    void keepTexts(std::shared_ptr<const TextStore> texts);

    /// Bytes that pages, records and text stores hold.
    std::size_t memoryBytes() const;

private:
    struct Page {
        LineList lines;
        TextList texts;
        std::vector<PictureRecord> pictures;
    };

    struct PenHash {
        std::size_t operator()(const LinePen& pen) const;
    };

    struct StyleHash {
        std::size_t operator()(const TextStyle& style) const;
    };

    Page& current();
    const Page& pageAt(int page) const;

    std::vector<Page> pages_;
    std::vector<std::optional<MapLocation>> pictures_;
    LinePatterns patterns_;
    std::vector<LinePen> pens_;
    std::vector<TextStyle> styles_;
    std::unordered_map<LinePen, std::uint32_t, PenHash> penNumbers_;
    std::unordered_map<TextStyle, std::uint32_t, StyleHash> styleNumbers_;
    std::shared_ptr<TextStore> store_;
    std::vector<std::shared_ptr<const TextStore>> furtherStores_;
};

/// A text as it is put out: every `PageCountToken` replaced by the number of pages.
///
/// @param buffer  holds the result when something was replaced
/// @return        the text itself where it holds no token, else a view into the buffer
TextView withPageCount(TextView text, std::int16_t pages, Text& buffer);

} // namespace pelloric
