// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/cff_charset.h"

namespace pelloric::pdf {

namespace {

/// Operators of a top dictionary; those of two bytes begin with 12.
constexpr unsigned Charset = 15;
constexpr unsigned CharStrings = 17;
constexpr unsigned Escape = 12;
constexpr unsigned KeyedByCid = 30;

/// Reads numbers and stops at the end of the bytes, from where on all are 0.
class Reader {
public:
    explicit Reader(std::string_view bytes, std::size_t at = 0)
        : bytes_(bytes)
        , at_(at)
    {
    }

    std::size_t at() const { return at_; }
    bool isAtEnd() const { return at_ >= bytes_.size(); }

    unsigned number(int size)
    {
        unsigned number = 0;
        for (; size > 0; --size) {
            number = (number << 8U) | (isAtEnd() ? 0U : static_cast<unsigned char>(bytes_[at_]));
            ++at_;
        }
        return number;
    }

    void skipTo(std::size_t at) { at_ = at; }

private:
    std::string_view bytes_;
    std::size_t at_;
};

/// An index of a CFF table: a list of byte strings.
struct Index {
    unsigned count = 0;
    std::string_view first {};
    std::size_t end = 0; ///< where what follows begins
};

Index indexAt(std::string_view table, std::size_t at)
{
    Reader reader(table, at);
    Index index { .count = reader.number(2) };
    index.end = reader.at();
    if (index.count == 0)
        return index;
    const int size = static_cast<int>(reader.number(1));
    if (size < 1 || size > 4)
        return {};
    const std::size_t offsets = reader.at();
    const std::size_t data
        = offsets + (std::size_t { index.count } + 1) * static_cast<std::size_t>(size) - 1;
    const std::size_t begin = data + reader.number(size);
    const std::size_t end = data + reader.number(size);
    if (begin > end || end > table.size())
        return {};
    index.first = table.substr(begin, end - begin);
    reader.skipTo(offsets + std::size_t { index.count } * static_cast<std::size_t>(size));
    index.end = data + reader.number(size);
    return index;
}

/// What a top dictionary says that matters here.
struct TopDictionary {
    unsigned charset = 0;
    unsigned charStrings = 0;
    bool isKeyedByCid = false;
};

/// Skips the half bytes of a decimal number.
void skipDecimal(Reader& reader)
{
    constexpr unsigned End = 0xF;
    while (!reader.isAtEnd()) {
        const unsigned halves = reader.number(1);
        if (halves >> 4U == End || (halves & End) == End)
            return;
    }
}

/// The operand that a first byte begins; negative ones do not matter here and are 0.
unsigned operand(unsigned first, Reader& reader)
{
    if (first == 28)
        return reader.number(2);
    if (first == 29)
        return reader.number(4);
    if (first == 30) {
        skipDecimal(reader);
        return 0;
    }
    if (first >= 247 && first <= 250)
        return (first - 247) * 256 + reader.number(1) + 108;
    if (first >= 251 && first <= 254) {
        reader.number(1);
        return 0;
    }
    return first >= 139 ? first - 139 : 0;
}

TopDictionary topDictionary(std::string_view bytes)
{
    TopDictionary top;
    Reader reader(bytes);
    unsigned last = 0;
    while (!reader.isAtEnd()) {
        const unsigned first = reader.number(1);
        if (first > 21) {
            last = operand(first, reader);
        } else if (first == Escape) {
            top.isKeyedByCid = reader.number(1) == KeyedByCid || top.isKeyedByCid;
        } else if (first == Charset) {
            top.charset = last;
        } else if (first == CharStrings) {
            top.charStrings = last;
        }
    }
    return top;
}

} // namespace

std::vector<std::uint16_t> cidsOfCff(std::string_view table)
{
    constexpr std::size_t HeadSizeAt = 2;
    Reader head(table, HeadSizeAt);
    const Index names = indexAt(table, head.number(1));
    const TopDictionary top = topDictionary(indexAt(table, names.end).first);
    if (!top.isKeyedByCid || top.charset == 0 || top.charset >= table.size())
        return {};
    const unsigned glyphs = indexAt(table, top.charStrings).count;
    Reader reader(table, top.charset);
    const unsigned format = reader.number(1);
    std::vector<std::uint16_t> cids { 0 };
    while (cids.size() < glyphs && !reader.isAtEnd()) {
        unsigned cid = reader.number(2);
        unsigned more = format == 0 ? 0 : reader.number(format == 1 ? 1 : 2);
        for (++more; more > 0 && cids.size() < glyphs; --more)
            cids.push_back(static_cast<std::uint16_t>(cid++));
    }
    return cids;
}

} // namespace pelloric::pdf
