// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace pelloric {

/// A table file with a longer value is refused as soon as that is seen: bytes.
inline constexpr std::size_t MostValueBytes = 1U << 26U;

/// How the values of a file are told apart.
struct ValuesDialect {
    char delimiter = ','; ///< an ASCII character
    bool hasQuotes = true; ///< false: a quote is a character like any other

    bool operator==(const ValuesDialect&) const = default;
};

/// Walks over the rows of a text of separated values, in UTF-8.
///
/// A value is quoted only when its closing quote is followed by a delimiter, a line end or the end;
/// it may hold delimiters, line breaks and doubled quotes. In any other value every quote is text.
/// Blanks around a value that is not quoted, and before one that is, do not belong to it. A line
/// ends at CR LF, at LF alone or at CR alone. Empty lines are passed over.
class SeparatedValues {
public:
    /// @param text  borrowed, outlives the object
    SeparatedValues(std::string_view text, ValuesDialect dialect);

    /// Goes to the next row. @return  false: there is none
    bool nextRow();

    std::size_t valueCount() const { return valueCount_; }
    /// A value of the row, from 0; borrowed until the next row.
    std::string_view value(std::size_t index) const
    {
        const Piece& piece = values_[index];
        return { (piece.isScratch ? scratch_.data() : text_.data()) + piece.begin, piece.length };
    }

    /// The line on which the row begins, from 1.
    std::int64_t line() const { return rowLine_; }
    /// Whether a value of the row holds a line break.
    bool hasLineBreak() const { return hasLineBreak_; }
    /// Whether a value of the row that is not quoted holds a quote.
    bool hasStrayQuote() const { return hasStrayQuote_; }
    /// How much of the text has been read: bytes.
    std::size_t position() const { return position_; }

private:
    /// A value of the row, in the text, or in the scratch space where doubled quotes were undone.
    struct Piece {
        std::size_t begin = 0;
        std::size_t length = 0;
        bool isScratch = false;
    };

    bool isLineEnd(std::size_t at) const { return text_[at] == '\n' || text_[at] == '\r'; }
    /// What a byte may mean: bits.
    enum ByteKind : std::uint8_t { Plain = 0, EndsValue = 1, IsQuote = 2 };

    std::uint8_t kindAt(std::size_t at) const
    {
        return kinds_[static_cast<unsigned char>(text_[at])];
    }
    bool endsValue(std::size_t at) const
    {
        return at == text_.size() || (kindAt(at) & EndsValue) != 0;
    }
    void skipLineEnds();
    void readRow();
    bool readQuoted(std::size_t quote);
    void readPlain();
    void addUnquoted(std::string_view inner);
    void add(const Piece& piece)
    {
        if (valueCount_ == values_.size())
            values_.resize(2 * valueCount_ + 16);
        values_[valueCount_++] = piece;
    }

    std::string_view text_;
    ValuesDialect dialect_;
    std::array<std::uint8_t, 256> kinds_ {}; ///< by byte
    std::size_t position_ = 0;
    std::int64_t line_ = 1;
    std::int64_t rowLine_ = 1;
    bool hasLineBreak_ = false;
    bool hasStrayQuote_ = false;
    std::vector<Piece> values_; ///< of the row, and room
    std::size_t valueCount_ = 0;
    std::string scratch_;
};

/// Finds out what separates the values: the one of comma, tab, semicolon and vertical bar by which
/// most rows have as many values as the titles and no quote inside of a value; of equals the one
/// that makes most values.
///
/// @param start  the first rows of a text, in UTF-8; the last of them may be cut off
/// @return       a comma where nothing tells
char findDelimiter(std::string_view start);

/// The line with which spreadsheets say at the top of a file what separates its values: "sep=;".
/// It is no row.
struct DelimiterLine {
    char delimiter = ',';
    std::size_t length = 0; ///< bytes, without the line end; 0: the text begins with no such line
};

/// @param text  in UTF-8, without a byte-order mark
DelimiterLine delimiterLineOf(std::string_view text);

} // namespace pelloric
