// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/cell_lines.h"
#include "document/page_document.h"

namespace pelloric {

class DrawingSurface;
class RowSet;
class TextMetrics;

/// What a recorder draws with and where: an operation that fails gives it back.
struct RecorderState {
    LinePen pen;
    TextStyle style;
    Tpoint point; ///< twips
};

/// Font and colour as a document knows them, to be taken again without being looked up.
struct KnownStyle {
    TextStyle style;
    std::uint32_t number = 0; ///< of the document
    MeasuredFont measured;
};

/// Draws on the page that is being built: every operation appends a record to the current page
/// and moves the current point, which holds whole twips.
///
/// While the base surface is hidden nothing is drawn; a surface that is shown is drawn on too.
class Recorder {
public:
    /// @param document  borrowed, outlives the recorder
    /// @param metrics   borrowed, outlives the recorder
    Recorder(PageDocument& document, TextMetrics& metrics);

    /// @param surface  the base surface when it is visible, or null; borrowed
    /// @param divisor  page twips per screen twip; divides the font sizes of the surface
    void drawOn(DrawingSurface* surface, float divisor);

    /// Empties the document and puts the current point at (0, 0).
    void clear();

    /// To be called when the document was replaced as a whole.
    void documentReplaced();

    /// Pen, font, colour and current point.
    RecorderState state() const { return { pen_, style_, point_ }; }
    /// Takes them back, also after the document was replaced as a whole.
    void restore(const RecorderState& state);

    /// Adds a page; the current point goes to (0, 0).
    /// @throws RunTimeError Overflow: more than 32767 pages
    void newPage();

    void setLineAttributes(const LinePen& pen);
    /// @throws RunTimeError Overflow: a line of that size is higher than 32 bits of twips; nothing
    ///         has changed
    void setTextFont(const Font& font, Color color);
    /// Font and colour that are set.
    KnownStyle textStyle() const { return { style_, styleNumber_, measured_ }; }
    /// Sets what `textStyle` answered since the document was replaced as a whole.
    void setTextStyle(const KnownStyle& known);
    const Font& textFont() const { return style_.font; }
    Color textColor() const { return style_.color; }

    Tpoint point() const { return point_; }
    void moveTo(Tpoint point);
    Twips currentX() const { return point_.x; }
    Twips currentY() const { return point_.y; }
    void setCurrentX(Twips x) { moveTo({ x, point_.y }); }
    void setCurrentY(Twips y) { moveTo({ point_.x, y }); }

    /// Records a line from the current point, which moves to its end.
    /// @throws RunTimeError SubscriptOutOfRange: the current page does not exist
    void lineTo(Tpoint end);

    /// Records the lines of a row of a table; the current point moves to the end of the last.
    /// @param pattern  of the document
    /// @throws RunTimeError SubscriptOutOfRange: the current page does not exist
    void rowLines(Twips top, Twips bottom, std::uint32_t pattern);

    /// The number that the document knows the line attributes by.
    std::uint32_t penNumber() const { return penNumber_; }

    /// Records a text at the current point; one that holds line feeds is drawn on as many lines,
    /// each of which begins at the text's x.
    ///
    /// @param newLine  true: the point goes to the start (x 0) of the next line; false: it stays
    ///                 at the end of the text's last line
    /// @throws RunTimeError SubscriptOutOfRange: the current page does not exist; Overflow
    void printText(TextView text, bool newLine);

    /// Records a text centred in a width, with a line break.
    ///
    /// @param x      left edge of the width: twips; may have a fraction, the result is rounded once
    /// @param width  twips; may have a fraction
    void printCentred(TextView text, double x, double width, Twips y);

    /// Prints a text that is too wide for its cell in pieces under each other, all beginning at
    /// the current x.
    ///
    /// For hosts that record pages of their own: a build wraps by `cellText`, which also takes
    /// texts that fit.
    /// @param cellWidth  twips, 144 of them stay free
    void wrappingPrint(TextView text, double cellWidth);

    /// Prints the lines of a cell: each centred when it fits, else wrapped from the current x.
    ///
    /// @param cellWidth  twips, 144 of them stay free
    /// @param left       twips; where the current x is put back to after every line
    void cellText(TextView text, double cellWidth, double left, Twips top);

    /// Prints lines that have been measured before, from the current y downwards.
    ///
    /// @param lines   their texts live in the document's store
    /// @param left    twips; left edge of the lines, and of the width in which those that fit are
    ///                centred
    /// @param width   twips
    void printLines(std::span<const CellLine> lines, double left, double width);

    /// Prints one line whose text lives in the document's store.
    void printStored(const CellLine& line, Tpoint point);

    /// Width of a text, of its longest line, in the current font: twips.
    Twips textWidth(TextView text) const;
    /// Height of any text in the current font: twips.
    Twips textHeight() const { return measured_.lineHeight; }
    /// The current font, ready to measure with.
    const MeasuredFont& measured() const { return measured_; }

    /// The height that the tallest cell of the current record, or of the titles, needs: twips.
    ///
    /// A column of 144 twips or less is not measured.
    /// @param widths     twips; one per printed column, from the first field on
    /// @param useValues  false: the field names are measured
    double rowTextHeight(
        RowSet& rows, std::span<const double> widths, bool useValues, char16_t decimalSeparator);

private:
    void record(TextView stored);
    void applyLineAttributes();
    void applyTextFont();

    PageDocument& document_;
    TextMetrics& metrics_;
    DrawingSurface* surface_ = nullptr;
    float divisor_ = 1;
    LinePen pen_;
    TextStyle style_;
    std::uint32_t penNumber_ = 0;
    std::uint32_t styleNumber_ = 0;
    MeasuredFont measured_;
    Tpoint point_;
    std::vector<CellLine> lines_;
};

/// The height of a cell's text: the lines it takes, one under the other.
///
/// @param text   trimmed; a typed separator counts as a line break
/// @param width  of the column: twips
double cellTextHeight(TextView text, double width, const MeasuredFont& font);

} // namespace pelloric
