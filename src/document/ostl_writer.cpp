// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_writer.h"

#include "document/ostl_format.h"
#include "document/page_document.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"

#include <algorithm>
#include <charconv>
#include <fstream>
#include <optional>
#include <sstream>

namespace pelloric {

namespace {

constexpr std::size_t BufferBytes = 1U << 20U;
constexpr std::string_view LineEnd = "\r\n";

/// Gathers lines and hands them on in large pieces.
class LineWriter {
public:
    LineWriter(const OstlEncoding& encoding, std::ostream& stream)
        : encoding_(encoding)
        , stream_(stream)
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
        stream_.write(buffer_.data(), static_cast<std::streamsize>(buffer_.size()));
        buffer_.clear();
    }

private:
    const OstlEncoding& encoding_;
    std::ostream& stream_;
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

/// A file beside another one, removed unless it has taken that one's place.
class PendingFile {
public:
    explicit PendingFile(const std::filesystem::path& target)
        : target_(target)
        , path_(unusedName(target))
        , stream_(path_, std::ios::binary | std::ios::trunc)
        , isOurs_(stream_.is_open())
    {
    }

    ~PendingFile()
    {
        stream_.close();
        std::error_code ignored;
        if (isOurs_)
            std::filesystem::remove(path_, ignored);
    }

    PendingFile(const PendingFile&) = delete;
    PendingFile& operator=(const PendingFile&) = delete;

    bool isOpen() const { return isOurs_; }

    std::ostream& stream() { return stream_; }

    const std::filesystem::path& path() const { return path_; }

    /// Whether all that was written has reached the file.
    bool close()
    {
        stream_.close();
        return static_cast<bool>(stream_);
    }

    /// Whether the file has taken the target's place, with the rights that the target had.
    bool replaceTarget()
    {
        std::error_code error;
        const auto status = std::filesystem::status(target_, error);
        if (std::filesystem::exists(status))
            std::filesystem::permissions(path_, status.permissions(), error);
        std::filesystem::rename(path_, target_, error);
        isOurs_ = static_cast<bool>(error);
        return !error;
    }

private:
    static std::filesystem::path unusedName(const std::filesystem::path& target)
    {
        std::filesystem::path path;
        std::error_code ignored;
        for (int number = 0; number < 1000; ++number) {
            path = target;
            path += ".saving" + std::to_string(number);
            if (!std::filesystem::exists(std::filesystem::symlink_status(path, ignored)))
                break;
        }
        return path;
    }

    const std::filesystem::path& target_;
    std::filesystem::path path_;
    std::ofstream stream_;
    bool isOurs_;
};

/// What stands where a document is to be saved.
struct Target {
    std::filesystem::path path; ///< links followed
    bool exists = false;
    bool isPlainFile = true; ///< or nothing yet; else a device that is written to directly
};

Target targetOf(const std::filesystem::path& path)
{
    std::error_code error;
    Target target { std::filesystem::canonical(path, error), false, true };
    if (error)
        target.path = path;
    const auto status = std::filesystem::status(path, error);
    target.exists = std::filesystem::exists(status);
    target.isPlainFile = !target.exists || std::filesystem::is_regular_file(status);
    return target;
}

/// Whether the target may be written; a file that is read-only is not replaced.
bool isWritable(const Target& target)
{
    return !target.exists || std::ofstream(target.path, std::ios::binary | std::ios::app).is_open();
}

bool writeInPlace(const Target& target, std::string_view bytes)
{
    if (!target.exists)
        return createFile(target.path, bytes);
    try {
        return rewriteFile(target.path, bytes, readFileBytes(target.path));
    } catch (const RunTimeError&) {
        return false; // what could not be read could not be put back either
    }
}

using Composer = std::function<void(std::ostream&)>;

bool saveTo(const Target& target, const Composer& compose)
{
    if (!target.isPlainFile) {
        std::ofstream stream(target.path, std::ios::binary);
        if (!stream)
            return false;
        compose(stream);
        stream.close();
        return static_cast<bool>(stream);
    }
    if (!isWritable(target))
        return false;
    PendingFile pending(target.path);
    if (!pending.isOpen()) {
        std::ostringstream memory;
        compose(memory);
        return writeInPlace(target, memory.view());
    }
    compose(pending.stream());
    if (!pending.close())
        return false;
    return pending.replaceTarget() || writeInPlace(target, readFileBytes(pending.path()));
}

} // namespace

void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const OstlProgress& progress, std::ostream& stream)
{
    const int last = lastPageOf(document);
    LineWriter writer(encoding, stream);
    writer.line(ostl::Quote);
    writer.line(ostl::Tag);
    writer.add(ostl::PageWidth).add(std::int64_t { setup.myWidth }).endLine();
    writer.add(ostl::PageHeight).add(std::int64_t { setup.myHeight }).endLine();
    for (int page = 0; page <= last; ++page) {
        if (progress)
            progress(page, last);
        if (document.hasPage(page))
            writePage(document, page, writer);
    }
    writer.line(ostl::Quote);
    writer.flush();
}

void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const OstlProgress& progress, const std::filesystem::path& path)
{
    const auto compose
        = [&](std::ostream& stream) { writeOstl(document, setup, encoding, progress, stream); };
    if (!saveTo(targetOf(path), compose))
        throw RunTimeError(ErrorNumber::WriteFailed, pathText(path));
}

} // namespace pelloric
