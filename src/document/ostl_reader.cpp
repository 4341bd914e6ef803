// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_reader.h"

#include "document/line_reader.h"
#include "document/ostl_format.h"
#include "document/page_document.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"

#include <algorithm>
#include <charconv>
#include <fstream>

namespace pelloric {

namespace {

bool holds(std::string_view line, std::string_view marker)
{
    return line.find(marker) != std::string_view::npos;
}

/// A plain whole number, as nearly all lines are, takes the short way.
double numberIn(std::string_view line)
{
    std::int32_t whole = 0;
    const char* end = line.data() + line.size();
    const auto result = std::from_chars(line.data(), end, whole);
    if (result.ec == std::errc() && result.ptr == end)
        return whole;
    return leadingNumber(line);
}

std::string_view trimmedBytes(std::string_view line)
{
    while (line.starts_with(' '))
        line.remove_prefix(1);
    while (line.ends_with(' '))
        line.remove_suffix(1);
    return line;
}

/// Reads one file, line by line.
class Reader {
public:
    Reader(const TextCodec& codec, std::istream& stream, PageDocument& document,
        const LineLimits& limits)
        : codec_(codec)
        , lines_(stream, limits)
        , document_(document)
    {
    }

    bool readHeader(PageSetup& setup)
    {
        Twips width = 0;
        Twips height = 0;
        do {
            if (!lines_.next(line_))
                return false;
        } while (line_ != ostl::Tag);
        if (!readSize(ostl::PageWidth, width) || !readSize(ostl::PageHeight, height))
            return false;
        setup.myWidth = width;
        setup.myHeight = height;
        return true;
    }

    void readPages()
    {
        while (skipTo(ostl::Page)) {
            if (numberBehind(u'[') > 0)
                document_.newPage();
            if (!skipTo(ostl::LinesBegin))
                return;
            while (lines_.next(line_) && line_ != ostl::LinesEnd)
                readLineRecord();
            if (!skipTo(ostl::TextsBegin))
                return;
            while (lines_.next(line_) && line_ != ostl::TextsEnd)
                readTextRecord();
        }
    }

private:
    bool readSize(std::string_view marker, Twips& size)
    {
        if (!lines_.next(line_) || !holds(line_, marker))
            return false;
        size = roundToInt32(numberBehind(u'='));
        return true;
    }

    bool skipTo(std::string_view marker)
    {
        while (lines_.next(line_)) {
            if (holds(line_, marker))
                return true;
        }
        return false;
    }

    /// The number behind the first such character of the line, which is known to hold one; it is
    /// looked for in the decoded line, for its byte may be part of another character.
    double numberBehind(char16_t character) const
    {
        const Text text = codec_.decode(line_);
        const std::size_t found = text.find(character);
        return found == Text::npos ? 0 : leadingNumber(TextView(text).substr(found + 1));
    }

    /// The number of the line that follows.
    bool nextNumber(double& value)
    {
        if (!lines_.next(line_))
            return false;
        value = numberIn(line_);
        return true;
    }

    bool next(std::int16_t& value)
    {
        double number = 0;
        const bool found = nextNumber(number);
        value = roundToInt16(number);
        return found;
    }

    bool next(std::int32_t& value)
    {
        double number = 0;
        const bool found = nextNumber(number);
        value = roundToInt32(number);
        return found;
    }

    /// Reads the record whose first line is the current one; one that is cut off is dropped.
    void readLineRecord()
    {
        LinePen pen;
        LineRecord record;
        pen.LineWidth = roundToInt16(numberIn(line_));
        const bool whole = next(pen.LineStyle) && next(pen.LineColor) && next(pen.FillStyle)
            && next(pen.FillColor) && next(record.pt1.x) && next(record.pt1.y) && next(record.pt2.x)
            && next(record.pt2.y);
        if (!whole)
            return;
        record.pen = document_.penNumber(pen);
        document_.append(record);
    }

    void readTextRecord()
    {
        TextRecord record;
        double italic = 0;
        double size = 0;
        style_.font.bold = numberIn(line_) != 0;
        if (!nextNumber(italic) || !lines_.next(line_))
            return;
        style_.font.italic = italic != 0;
        style_.font.name = formatNumber(numberIn(line_));
        if (!nextNumber(size))
            return;
        style_.font.size = toSingle(size);
        const bool whole
            = next(style_.color) && next(record.pt.x) && next(record.pt.y) && lines_.next(line_);
        if (!whole)
            return;
        record.style = document_.styleNumber(style_);
        const TextView text = document_.store().add(decoded(trimmedBytes(line_)));
        record.units = text.data();
        record.length = static_cast<std::uint32_t>(text.size());
        document_.append(record);
    }

    /// @return  borrowed until the next call
    TextView decoded(std::string_view bytes)
    {
        const bool isAscii
            = std::all_of(bytes.begin(), bytes.end(), [](char byte) { return (byte & 0x80) == 0; });
        if (isAscii)
            text_.assign(bytes.begin(), bytes.end());
        else
            text_ = codec_.decode(bytes);
        return text_;
    }

    const TextCodec& codec_;
    LineReader lines_;
    PageDocument& document_;
    std::string_view line_; ///< the current one
    TextStyle style_;
    Text text_;
};

} // namespace

namespace {

OstlResult readLimited(const TextCodec& codec, std::istream& stream, PageDocument& document,
    PageSetup& setup, const LineLimits& limits)
{
    Reader reader(codec, stream, document, limits);
    if (!reader.readHeader(setup))
        return OstlResult::BadHeader;
    reader.readPages();
    return OstlResult::Opened;
}

/// A pipe or a device may go on for ever.
LineLimits limitsOf(const std::filesystem::path& path)
{
    std::error_code ignored;
    if (std::filesystem::is_regular_file(path, ignored))
        return {};
    return { .all = MostPipedOstlBytes };
}

/// An error of what the file holds names the file.
OstlResult readNamed(const TextCodec& codec, std::istream& stream, PageDocument& document,
    PageSetup& setup, const std::filesystem::path& path)
{
    try {
        return readLimited(codec, stream, document, setup, limitsOf(path));
    } catch (const RunTimeError& error) {
        throw RunTimeError(
            error.number(), phrase(u"%1 is damaged: %2", { pathText(path), error.detail() }));
    }
}

} // namespace

OstlResult readOstl(
    const TextCodec& codec, std::istream& stream, PageDocument& document, PageSetup& setup)
{
    return readLimited(codec, stream, document, setup, {});
}

OstlResult readOstl(const TextCodec& codec, const std::filesystem::path& path,
    PageDocument& document, PageSetup& setup)
{
    std::ifstream stream(path, std::ios::binary);
    const OstlResult result = readNamed(codec, stream, document, setup, path);
    if (!stream.is_open() || stream.bad())
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(path));
    return result;
}

} // namespace pelloric
