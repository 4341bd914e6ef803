// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_fonts.h"
#include "platform/units.h"

namespace pelloric::pdf {

/// A point of a content stream: hundredths of a twip from the page's bottom left corner.
struct ContentPoint {
    std::int64_t x = 0;
    std::int64_t y = 0;

    bool operator==(const ContentPoint&) const = default;
};

/// A pen as content streams set it: lengths in twips.
struct ContentPen {
    Color color = 0;
    double width = 0;
    std::span<const std::uint8_t> dashes {}; ///< in widths: drawn, left out, …; empty: solid

    bool operator==(const ContentPen& other) const
    {
        return color == other.color && width == other.width && dashes.data() == other.dashes.data();
    }
};

/// How a run of glyphs stands.
struct TextState {
    double em = 0; ///< twips
    double stretch = 1; ///< of the widths
    Color color = 0;
};

/// The operators of one page: says what changes, and joins what goes on.
///
/// Lines of one pen become one path, texts one text object.
class PdfContent {
public:
    /// @param fonts  borrowed
    explicit PdfContent(const PdfFonts& fonts);

    /// Begins a page.
    void begin();

    /// Ends the page. @return its operators; valid until the next page begins
    const std::string& end();

    void line(ContentPoint from, ContentPoint to, const ContentPen& pen);

    /// A filled rectangle with an outline.
    /// @param pattern  name of what fills it in the fill colour; empty: the colour alone
    /// @param pen      null: no outline
    void box(ContentPoint corner, ContentPoint opposite, Color fill, std::string_view pattern,
        const ContentPen* pen);

    /// Only the outline of a rectangle.
    void frame(ContentPoint corner, ContentPoint opposite, const ContentPen& pen);

    /// What lies between a rectangle and another one within it, filled.
    /// @param thickness  between their edges: hundredths of a twip
    void ring(ContentPoint corner, ContentPoint opposite, std::int64_t thickness, Color fill);

    /// An external object, such as a picture, in a rectangle.
    void object(std::string_view name, ContentPoint corner, ContentPoint size);

    /// Moves to where the next glyphs begin, on their baseline.
    void moveTo(ContentPoint point)
    {
        target_ = point;
        isMoved_ = true;
    }

    /// Appends a glyph behind the one before, or at the point moved to.
    void glyph(GlyphCode glyph, const TextState& state)
    {
        if (glyph.use != shownUse_ || isMoved_ || !isStringOpen_)
            beginString(glyph.use, state);
        if (isLongCode(glyph.code))
            stream_ += static_cast<char>(glyph.code >> 8U);
        stream_ += static_cast<char>(glyph.code & 0xFFU);
    }

    /// Shows glyphs of one font at the point moved to, and ends their run.
    /// @param codes  as bytes, none of which needs escaping
    void glyphs(std::uint16_t use, std::string_view codes, const TextState& state)
    {
        beginString(use, state);
        stream_ += codes;
        endString();
    }

    /// Ends a run of glyphs that share their state.
    void endText() { endString(); }

    /// Whether any page so far has a rectangle filled with a pattern.
    bool hasHatches() const { return hasHatches_; }

    /// Marks what is drawn until `endMark`, which is either texts or anything but texts.
    /// @param properties  a dictionary
    void beginMark(std::string_view tag, std::string_view properties, bool isText);
    void endMark();

private:
    void endPath();
    void endString();
    void beginTextObject();
    void endTextObject();
    void leaveText();
    void beginString(std::uint16_t number, const TextState& state);
    void setFont(const FontUse& use, const TextState& state);
    void setBold(const FontUse& use, const TextState& state);
    void place(bool isSkewed);
    void setFill(Color color);
    void setPen(const ContentPen& pen, bool isRound = false);
    void appendRectangle(ContentPoint corner, ContentPoint opposite, bool isDashed);
    void appendPoint(ContentPoint point);
    void appendLength(std::int64_t hundredths);

    const PdfFonts& fonts_;
    std::string stream_;

    // What the stream has set.
    Color fill_ = 0;
    bool isPatternFill_ = false;
    ContentPen pen_;
    bool isJoinRound_ = false;
    std::size_t font_ = 0; ///< number; 0: none
    double em_ = 0;
    double stretch_ = 1;
    bool isBold_ = false;
    bool isSkewed_ = false;

    bool hasHatches_ = false;
    bool isPathOpen_ = false;
    bool isTextOpen_ = false;
    bool isStringOpen_ = false;
    bool isMoved_ = false;
    std::uint16_t shownUse_ = 0;
    ContentPoint target_;
    ContentPoint textLine_; ///< from where the next move counts
};

} // namespace pelloric::pdf
