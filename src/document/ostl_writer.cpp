// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_writer.h"

#include "document/ostl_format.h"
#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/safe_file.h"
#include "platform/text_codec.h"

#include <algorithm>
#include <charconv>
#include <ostream>

namespace pelloric {

namespace {

constexpr std::size_t BufferBytes = 1U << 20U;
constexpr std::string_view LineEnd = "\r\n";

using ByteSink = std::function<void(std::string_view)>;

/// Gathers lines and hands them on in large pieces.
class LineWriter {
public:
    LineWriter(const OstlEncoding& encoding, const ByteSink& sink)
        : encoding_(encoding)
        , sink_(sink)
    {
    }

    LineWriter& add(std::string_view bytes)
    {
        buffer_.append(bytes);
        return *this;
    }

    LineWriter& add(std::int64_t number)
    {
        char digits[24];
        const auto end = std::to_chars(digits, digits + sizeof digits, number).ptr;
        return add(std::string_view(digits, end));
    }

    void endLine()
    {
        buffer_.append(LineEnd);
        if (buffer_.size() >= BufferBytes)
            flush();
    }

    void line(std::string_view bytes) { add(bytes).endLine(); }

    void line(std::int64_t number) { add(number).endLine(); }

    void line(TextView text)
    {
        encoding_.codec.encode(text, buffer_);
        endLine();
    }

    void line(float number) { line(formatSingle(number, encoding_.decimalSeparator)); }

    void flush()
    {
        sink_(buffer_);
        buffer_.clear();
    }

private:
    const OstlEncoding& encoding_;
    const ByteSink& sink_;
    std::string buffer_;
};

void writeLine(const PageDocument& document, const LineRecord& record, LineWriter& writer)
{
    const LinePen& pen = document.pen(record.pen);
    const std::int64_t values[] = { pen.LineWidth, pen.LineStyle, pen.LineColor, pen.FillStyle,
        pen.FillColor, record.pt1.x, record.pt1.y, record.pt2.x, record.pt2.y };
    for (const std::int64_t value : values)
        writer.line(value);
}

void writeText(
    const PageDocument& document, const TextRecord& record, LineWriter& writer, Text& buffer)
{
    const TextStyle& style = document.style(record.style);
    writer.line(std::int64_t { style.font.bold });
    writer.line(std::int64_t { style.font.italic });
    writer.line(TextView(style.font.name));
    writer.line(style.font.size);
    writer.line(std::int64_t { style.color });
    writer.line(std::int64_t { record.pt.x });
    writer.line(std::int64_t { record.pt.y });
    writer.line(withPageCount(record.text(), document.Totalpages, buffer));
}

void writePage(const PageDocument& document, int page, LineWriter& writer)
{
    writer.add(ostl::Page).add(std::int64_t { page }).add("]").endLine();
    writer.line(ostl::LinesBegin);
    for (const LineRecord record : document.lines(page))
        writeLine(document, record, writer);
    writer.line(ostl::LinesEnd);
    writer.line(ostl::TextsBegin);
    Text buffer;
    for (const TextRecord record : document.texts(page))
        writeText(document, record, writer, buffer);
    writer.line(ostl::TextsEnd);
}

/// The index of the last page that a file holds; -1 when there is none.
int lastPageOf(const PageDocument& document)
{
    return std::min(document.Totalpages - 1, ostl::LastPageIndex);
}

void compose(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const Progress& progress, const ByteSink& sink)
{
    const int last = lastPageOf(document);
    LineWriter writer(encoding, sink);
    writer.line(ostl::Quote);
    writer.line(ostl::Tag);
    writer.add(ostl::PageWidth).add(std::int64_t { setup.myWidth }).endLine();
    writer.add(ostl::PageHeight).add(std::int64_t { setup.myHeight }).endLine();
    for (int page = 0; page <= last; ++page) {
        tell(progress, page, std::int64_t { last } + 1);
        if (document.hasPage(page))
            writePage(document, page, writer);
    }
    writer.line(ostl::Quote);
    writer.flush();
}

} // namespace

void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const Progress& progress, std::ostream& stream)
{
    compose(document, setup, encoding, progress, [&](std::string_view bytes) {
        stream.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    });
}

void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const Progress& progress, SafeFile file)
{
    compose(
        document, setup, encoding, progress, [&](std::string_view bytes) { file.write(bytes); });
    file.putInPlace();
}

} // namespace pelloric
