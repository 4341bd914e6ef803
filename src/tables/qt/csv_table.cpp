// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/csv_table.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QBuffer>
#include <QByteArray>
#include <QFile>
#include <QStringDecoder>

#include <csv.h>

#include <algorithm>
#include <array>
#include <exception>
#include <limits>
#include <memory>
#include <optional>
#include <utility>

namespace pelloric::qt {

namespace {

constexpr qint64 ChunkBytes = 1 << 18;
constexpr qint64 SniffedBytes = 1 << 16;
constexpr std::size_t MostColumns = std::numeric_limits<std::int16_t>::max();

constexpr char Utf8[] = "UTF-8";
constexpr char Gb18030[] = "GB18030";
constexpr char Tab = '\t';

/// In the order in which an equal number of them is settled.
constexpr auto Delimiters = std::to_array({ ',', Tab, ';', '|' });

/// Stands for the quotation mark where there is none.
constexpr unsigned char NoByteOfUtf8 = 0xFF;

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

Text atLine(std::int64_t line, TextView what)
{
    return (u"line " + decimal(line) + u": ").append(what);
}

Text named(const QByteArray& encoding) { return toText(QString::fromLatin1(encoding)); }

/// A file that can be read more than once, whatever it is.
std::unique_ptr<QIODevice> openFile(const std::filesystem::path& path)
{
    auto file = std::make_unique<QFile>(path);
    std::error_code ignored;
    if (std::filesystem::is_directory(path, ignored) || !file->open(QIODevice::ReadOnly))
        throw RunTimeError(ErrorNumber::FileNotFound, toText(file->fileName()));
    if (!file->isSequential())
        return file;
    auto buffer = std::make_unique<QBuffer>();
    buffer->setData(file->readAll());
    buffer->open(QIODevice::ReadOnly);
    return buffer;
}

/// Whether all bytes are text of an encoding; puts the file back to its start.
bool isAll(QIODevice& file, const QByteArray& encoding)
{
    QStringDecoder decoder(encoding.constData());
    bool isText = true;
    for (QByteArray bytes = file.read(ChunkBytes); isText && !bytes.isEmpty();
         bytes = file.read(ChunkBytes)) {
        const QString ignored = decoder(bytes);
        isText = !decoder.hasError();
    }
    // A character that the file's end cuts off is an error only once something follows it.
    const QString ignored = decoder(QByteArrayView("\n", 1));
    file.seek(0);
    return isText && !decoder.hasError();
}

/// The first line with bytes that are no text; 0 when the lines tell nothing.
std::int64_t badLine(QIODevice& file, const QByteArray& encoding)
{
    file.seek(0);
    std::int64_t line = 0;
    for (QByteArray bytes = file.readLine(); !bytes.isEmpty(); bytes = file.readLine()) {
        ++line;
        QStringDecoder decoder(encoding.constData());
        const QString ignored = decoder(bytes);
        const QString end = decoder(QByteArrayView("\n", 1));
        if (decoder.hasError())
            return line;
    }
    return 0;
}

/// @param line  where the bytes are; 0 when no line tells
[[noreturn]] void refuseBytes(std::int64_t line, TextView what)
{
    refuse(line > 0 ? atLine(line, what) : Text(what));
}

QByteArray encodingOfMark(const QByteArray& start)
{
    const auto encoding = QStringConverter::encodingForData(start);
    return encoding ? QByteArray(QStringConverter::nameForEncoding(*encoding)) : QByteArray();
}

/// The encoding that the file's bytes have.
/// @throws RunTimeError TypeMismatch: the one asked for is unknown or does not fit; none fits
QByteArray encodingOf(QIODevice& file, const QString& asked)
{
    if (!asked.isEmpty()) {
        QByteArray encoding = asked.toLatin1();
        if (!QStringDecoder(encoding.constData()).isValid())
            refuse(u"unknown encoding " + toText(asked)
                + u"; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, among others");
        if (!isAll(file, encoding))
            refuseBytes(badLine(file, encoding), u"bytes that are no " + named(encoding));
        return encoding;
    }
    QByteArray marked = encodingOfMark(file.peek(4));
    if (!marked.isEmpty())
        return marked;
    if (isAll(file, Utf8))
        return Utf8;
    if (!isAll(file, Gb18030))
        // The encoding that fits longer is the likelier one.
        refuseBytes(std::max(badLine(file, Utf8), badLine(file, Gb18030)),
            u"bytes that are neither UTF-8 nor GB18030 text; name the encoding");
    return Gb18030;
}

/// Hands out a file's bytes as UTF-8, piece by piece.
class Utf8Pieces {
public:
    Utf8Pieces(QIODevice& file, const QByteArray& encoding)
        : file_(file)
        , decoder_(encoding.constData())
        , isUtf8_(encoding == Utf8)
    {
        file_.seek(0);
    }

    /// The next piece; empty at the end. @throws RunTimeError FileNotFound: a read failed
    QByteArray next()
    {
        QByteArray bytes(ChunkBytes, Qt::Uninitialized);
        const qint64 length = file_.read(bytes.data(), bytes.size());
        if (length < 0)
            throw RunTimeError(ErrorNumber::FileNotFound, toText(file_.errorString()));
        bytes.truncate(length);
        const bool isFirst = std::exchange(isFirst_, false);
        if (isUtf8_)
            return isFirst && bytes.startsWith("\xEF\xBB\xBF") ? bytes.mid(3) : bytes;
        const QString text = decoder_(bytes);
        // A piece that only begins a character is no end.
        return length > 0 && text.isEmpty() ? next() : text.toUtf8();
    }

    double partRead() const
    {
        return file_.size() > 0
            ? static_cast<double>(file_.pos()) / static_cast<double>(file_.size())
            : 1;
    }

private:
    QIODevice& file_;
    QStringDecoder decoder_;
    bool isUtf8_;
    bool isFirst_ = true;
};

char delimiterOf(const std::filesystem::path& path, QByteArrayView start, bool hasQuotes)
{
    const QString extension = QString::fromStdU16String(path.extension().u16string()).toLower();
    if (extension == QLatin1String(".tsv") || extension == QLatin1String(".tab"))
        return Tab;
    std::array<int, Delimiters.size()> counts {};
    bool isQuoted = false;
    for (const char byte : start) {
        isQuoted = isQuoted != (hasQuotes && byte == '"');
        if (isQuoted)
            continue;
        if (byte == '\n' || byte == '\r')
            break;
        const auto found = std::ranges::find(Delimiters, byte);
        if (found != Delimiters.end())
            ++counts[static_cast<std::size_t>(found - Delimiters.begin())];
    }
    const auto most = std::ranges::max_element(counts);
    return Delimiters[static_cast<std::size_t>(most - counts.begin())];
}

/// What a file of separated values is read into.
class CsvReceiver {
public:
    virtual ~CsvReceiver() = default;
    virtual void cell(std::string_view bytes) = 0;
    virtual void endRow(std::int64_t line) = 0;
};

/// Runs the parser over all pieces and keeps count of the lines.
class CsvParser {
public:
    CsvParser(CsvReceiver& receiver, char delimiter, bool isQuoted)
        : receiver_(receiver)
    {
        if (csv_init(&parser_, CSV_REPALL_NL) != 0)
            throw RunTimeError(ErrorNumber::InvalidCall, u"the CSV reader cannot be set up");
        csv_set_delim(&parser_, static_cast<unsigned char>(delimiter));
        if (!isQuoted)
            csv_set_quote(&parser_, NoByteOfUtf8);
    }

    ~CsvParser() { csv_free(&parser_); }
    CsvParser(const CsvParser&) = delete;
    CsvParser& operator=(const CsvParser&) = delete;

    void take(const QByteArray& bytes)
    {
        const auto size = static_cast<std::size_t>(bytes.size());
        if (csv_parse(
                &parser_, bytes.constData(), size, &CsvParser::onCell, &CsvParser::onLine, this)
            != size)
            refuse(atLine(line_, u"a value that is too long"));
        throwFailure();
    }

    void finish()
    {
        csv_set_opts(&parser_, CSV_STRICT | CSV_STRICT_FINI);
        if (csv_fini(&parser_, &CsvParser::onCell, &CsvParser::onLine, this) != 0)
            refuse(atLine(rowLine_, u"a quoted value that never ends"));
        throwFailure();
    }

private:
    // No exception passes through the parser's own code.

    static void onCell(void* bytes, std::size_t length, void* self)
    {
        auto& parser = *static_cast<CsvParser*>(self);
        try {
            if (!parser.failure_)
                parser.cell({ static_cast<const char*>(bytes), length });
        } catch (...) {
            parser.failure_ = std::current_exception();
        }
    }

    static void onLine(int character, void* self)
    {
        auto& parser = *static_cast<CsvParser*>(self);
        try {
            if (!parser.failure_)
                parser.line(character);
        } catch (...) {
            parser.failure_ = std::current_exception();
        }
    }

    void cell(std::string_view bytes)
    {
        hasCells_ = true;
        line_ += std::count(bytes.begin(), bytes.end(), '\n');
        receiver_.cell(bytes);
    }

    /// Called at each CR and LF outside quotes, and at the end with another character.
    void line(int character)
    {
        const bool isSecondHalf = character == CSV_LF && lastEnd_ == CSV_CR && !hasCells_;
        if (hasCells_)
            receiver_.endRow(rowLine_);
        hasCells_ = false;
        lastEnd_ = isSecondHalf ? 0 : character;
        line_ += isSecondHalf ? 0 : 1;
        rowLine_ = line_;
    }

    void throwFailure() const
    {
        if (failure_)
            std::rethrow_exception(failure_);
    }

    CsvReceiver& receiver_;
    csv_parser parser_ {};
    std::int64_t line_ = 1;
    std::int64_t rowLine_ = 1; ///< where the row begins that is being read
    int lastEnd_ = 0;
    bool hasCells_ = false;
    std::exception_ptr failure_;
};

/// Counts what a table has to hold.
class SizeCounter final : public CsvReceiver {
public:
    std::size_t columns = 0;
    std::size_t rows = 0; ///< the titles' among them
    std::size_t bytes = 0; ///< of all cells; there are never more code units

    void cell(std::string_view text) override
    {
        ++cells_;
        bytes += text.size();
        hasZero_ = hasZero_ || text.find('\0') != std::string_view::npos;
    }

    void endRow(std::int64_t line) override
    {
        if (hasZero_)
            refuse(atLine(line, u"a zero byte; this is no text file"));
        if (cells_ > MostColumns)
            throw RunTimeError(
                ErrorNumber::Overflow, atLine(line, u"more than 32767 values in a row"));
        columns = std::max(columns, cells_);
        cells_ = 0;
        ++rows;
    }

private:
    std::size_t cells_ = 0;
    bool hasZero_ = false;
};

/// Puts UTF-8 behind a text.
void appendUtf8(std::string_view bytes, Text& text)
{
    const auto isAscii = [](char byte) { return static_cast<unsigned char>(byte) < 0x80; };
    if (std::ranges::all_of(bytes, isAscii))
        text.append(bytes.begin(), bytes.end());
    else
        text.append(fromUtf8(bytes));
}

/// Makes the table.
class TableMaker final : public CsvReceiver {
public:
    explicit TableMaker(const SizeCounter& sizes)
        : sizes_(sizes)
    {
    }

    void cell(std::string_view bytes) override
    {
        appendUtf8(bytes, units_);
        ends_.push_back(units_.size());
    }

    void endRow(std::int64_t) override
    {
        cells_.clear();
        std::size_t begin = 0;
        for (const std::size_t end : ends_) {
            cells_.push_back(TextView(units_).substr(begin, end - begin));
            begin = end;
        }
        if (grid_)
            grid_->addRow(cells_);
        else
            makeGrid();
        units_.clear();
        ends_.clear();
    }

    TableGrid take() { return std::move(*grid_); }

private:
    void makeGrid()
    {
        std::vector<TableColumn> columns(sizes_.columns, TableColumn { .title = {}, .width = -1 });
        for (std::size_t at = 0; at < cells_.size(); ++at)
            columns[at].title = cells_[at];
        grid_.emplace(std::move(columns));
        grid_->reserve(sizes_.rows - 1, sizes_.bytes);
    }

    const SizeCounter& sizes_;
    std::optional<TableGrid> grid_;
    Text units_; ///< the cells of the row, one behind the other
    std::vector<std::size_t> ends_;
    std::vector<TextView> cells_;
};

/// A pass over the whole file.
struct Pass {
    QIODevice& file;
    QByteArray encoding;
    char delimiter;
    const CsvOptions& options;
    double begin = 0; ///< part of the whole work that is done when the pass begins
};

void run(const Pass& pass, CsvReceiver& receiver)
{
    Utf8Pieces pieces(pass.file, pass.encoding);
    CsvParser parser(receiver, pass.delimiter, pass.options.isQuoted);
    for (QByteArray bytes = pieces.next(); !bytes.isEmpty(); bytes = pieces.next()) {
        parser.take(bytes);
        const double part = pass.begin + pieces.partRead() / 2;
        if (pass.options.progress && !pass.options.progress(part))
            throw RunTimeError(ErrorNumber::Cancelled);
    }
    parser.finish();
}

} // namespace

TableGrid readCsv(const std::filesystem::path& path, const CsvOptions& options)
{
    const std::unique_ptr<QIODevice> file = openFile(path);
    const QByteArray encoding = encodingOf(*file, options.encoding);
    const QByteArray start = Utf8Pieces(*file, encoding).next().left(SniffedBytes);
    const char delimiter
        = options.delimiter != 0 ? options.delimiter : delimiterOf(path, start, options.isQuoted);
    Pass pass { *file, encoding, delimiter, options };
    SizeCounter sizes;
    run(pass, sizes);
    if (sizes.rows == 0)
        refuse(u"the file is empty");
    TableMaker maker(sizes);
    pass.begin = 0.5;
    run(pass, maker);
    return maker.take();
}

} // namespace pelloric::qt
