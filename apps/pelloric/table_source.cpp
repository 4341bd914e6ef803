// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "table_source.h"

#include "interruption.h"
#include "outcome.h"
#include "platform/file_bytes.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "progress_line.h"
#include "table_selection.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/json_table.h"
#include "tables/qt/office_table.h"
#include "tables/qt/sqlite_table.h"
#include "tables/qt/text_file.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryFile>

#include <array>
#include <fstream>
#include <optional>
#include <vector>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "query", "SQL", phraseText(u"what to take of a database: a SELECT statement") },
    { "encoding", "NAME", phraseText(u"of a text file; else found out") },
    { "delimiter", "CHAR", phraseText(u"between the values of a CSV file, or tab; else found out"),
        true },
    { "no-quote", nullptr, phraseText(u"a quote in a CSV file is a character like any other") },
    { "hidden", nullptr, phraseText(u"hidden rows and columns of an office sheet, too") },
});

/// The name that stands for the standard input.
const QString StandardInput = QStringLiteral("-");
QString standardInputName() { return qt::phrased(u"standard input"); }

constexpr char DatabaseMark[] = "SQLite format 3";

/// A database file and one of its tables; no table when the name is all file. Both may hold colons:
/// the longest name of a file that there is counts.
struct DatabaseName {
    QString file;
    QString table;
};

DatabaseName splitName(const QString& name)
{
    std::error_code ignored;
    if (std::filesystem::exists(pathOf(name), ignored))
        return { name, {} };
    for (auto colon = name.lastIndexOf(QLatin1Char(':')); colon > 0;
         colon = name.lastIndexOf(QLatin1Char(':'), colon - 1)) {
        const QString file = name.left(colon);
        if (std::filesystem::is_regular_file(pathOf(file), ignored))
            return { file, name.mid(colon + 1) };
    }
    return { name, {} };
}

/// What a pipe hands over, in a file of the same kind that can be read twice; removed with the
/// object. The toolkit puts letters of its own in the place of the six X of the file's name, in
/// front of the ending that tells the kind.
class PipedInput {
public:
    /// @param name   of the pipe; "-" is the standard input
    /// @param shown  what it is called in errors
    PipedInput(const QString& name, QString shown)
        : shown_(std::move(shown))
        , file_(QDir::tempPath() + QStringLiteral("/pelloric-XXXXXX.") + QFileInfo(name).suffix())
    {
        QFile in(pathOf(name));
        const QIODevice::OpenMode mode = QIODevice::ReadOnly | QIODevice::Unbuffered;
        if (!(name == StandardInput ? in.open(stdin, mode) : in.open(mode)))
            refuseReading(in);
        if (!file_.open())
            throw CommandError(qt::phrased(u"%1 cannot be kept in %2: %3; name another folder in "
                                           u"TMPDIR, or save it to a file and name that")
                                   .arg(shown_, QDir::tempPath(), file_.errorString()));
        QByteArray bytes(1 << 20, Qt::Uninitialized);
        qint64 size = 0;
        while ((size = in.read(bytes.data(), bytes.size())) > 0)
            keep({ bytes.constData(), size });
        if (in.error() != QFileDevice::NoError)
            refuseReading(in);
        file_.close();
    }

    QString name() const { return file_.fileName(); }

private:
    [[noreturn]] void refuseReading(const QFile& in) const
    {
        throw CommandError(qt::phrased(u"%1 cannot be read: %2").arg(shown_, in.errorString()));
    }

    void keep(QByteArrayView bytes)
    {
        if (file_.size() > qt::MostPipeBytes - bytes.size())
            throw CommandError(qt::phrased(u"%1 goes on after %2 GB, which is the most that is "
                                           u"taken of a pipe; save it to a file and name that, or "
                                           u"hand over fewer rows")
                                   .arg(shown_)
                                   .arg(qt::MostPipeBytes >> 30));
        if (hasNoRoom() || file_.write(bytes.data(), bytes.size()) != bytes.size()
            || !file_.flush())
            throw CommandError(qt::phrased(u"%1 does not fit into %2, where it is kept while it is "
                                           u"read; make room there, or name another folder in "
                                           u"TMPDIR")
                                   .arg(shown_, QDir::tempPath()));
    }

    /// Whether no more than what other programs need is left.
    static bool hasNoRoom()
    {
        constexpr std::uintmax_t LeastLeft = 64U << 20U;
        std::error_code none;
        const auto space = std::filesystem::space(pathOf(QDir::tempPath()), none);
        return !none && space.available < LeastLeft;
    }

    QString shown_;
    QTemporaryFile file_;
};

TableGrid readDatabase(const DatabaseName& name, const CommandLine& line, ProgressLine& progress)
{
    if (line.has("encoding"))
        throw CommandError(
            qt::phrased(u"--encoding is for CSV and TSV files, not databases"), WrongUsage);
    if (line.has("query") && !name.table.isEmpty())
        throw CommandError(qt::phrased(u"take either a table or --query, not both"), WrongUsage);
    qt::SqliteSource source;
    source.path = pathOf(name.file);
    source.table = name.table;
    source.query = line.value("query");
    source.progress = progress.of(phraseText(u"Reading"));
    return qt::readSqlite(source);
}

/// @throws CommandError WrongUsage
std::optional<char> delimiterOf(const CommandLine& line)
{
    if (!line.has("delimiter"))
        return {};
    const QString text = line.value("delimiter");
    if (text.compare(QLatin1String("tab"), Qt::CaseInsensitive) == 0
        || text == QLatin1String("\\t"))
        return '\t';
    constexpr char16_t FirstPastAscii = 0x80;
    if (text.size() != 1 || text.front() >= QChar(FirstPastAscii) || text.front() == u'"')
        throw CommandError(
            qt::phrased(u"--delimiter takes one ASCII character, or \"tab\", not \"%1\"").arg(text),
            WrongUsage);
    return text.front().toLatin1();
}

bool isJson(const QString& name)
{
    const QString extension = QFileInfo(name).suffix().toLower();
    for (const char* const json : { "json", "jsonl", "ndjson" }) {
        if (extension == QLatin1String(json))
            return true;
    }
    if (extension == QLatin1String("csv") || extension == QLatin1String("tsv"))
        return false;
    constexpr std::size_t SniffedBytes = 4096;
    return qt::looksLikeJson(firstFileBytes(pathOf(name), SniffedBytes));
}

/// @param shown  what the file is called in warnings
TableGrid readValues(
    const QString& name, const QString& shown, const CommandLine& line, ProgressLine& progress)
{
    if (line.has("query"))
        throw CommandError(qt::phrased(u"--query is for databases; %1 is none").arg(name));
    const Progress step = progress.of(phraseText(u"Reading"));
    const std::optional<char> delimiter = delimiterOf(line);
    if (isJson(name))
        return qt::readJson(pathOf(name), { .encoding = line.value("encoding"), .progress = step });
    std::vector<Text> notes;
    TableGrid grid = qt::readCsv(pathOf(name),
        { .encoding = line.value("encoding"),
            .progress = step,
            .delimiter = delimiter,
            .hasQuotes = !line.has("no-quote"),
            .notes = &notes });
    for (const Text& text : notes)
        note(QStringLiteral("%1: %2").arg(shown, qt::toQString(text)));
    return grid;
}

QString rowsOf(std::int64_t count)
{
    return count == 1 ? qt::phrased(u"1 hidden row") : qt::phrased(u"%1 hidden rows").arg(count);
}

QString columnsOf(std::int64_t count)
{
    return count == 1 ? qt::phrased(u"1 hidden column")
                      : qt::phrased(u"%1 hidden columns").arg(count);
}

void tellLeftOut(const qt::HiddenCount& left, const QString& shown)
{
    if (left == qt::HiddenCount())
        return;
    const QString what = left.rows == 0 ? columnsOf(left.columns)
        : left.columns == 0
        ? rowsOf(left.rows)
        : qt::phrased(u"%1 and %2").arg(rowsOf(left.rows), columnsOf(left.columns));
    note(qt::phrased(u"%1: left out are %2; --hidden takes them, too").arg(shown, what));
}

/// @param shown  what the file is called in warnings
TableGrid readSheet(const DatabaseName& name, const QString& shown, const CommandLine& line)
{
    qt::HiddenCount left;
    TableGrid grid = qt::readOffice({ .path = pathOf(name.file),
        .sheet = name.table,
        .takesHidden = line.has("hidden"),
        .leftOut = &left });
    tellLeftOut(left, shown);
    return grid;
}

} // namespace

void checkReadable(const QString& name)
{
    std::error_code ignored;
    const auto type = std::filesystem::status(pathOf(name), ignored).type();
    if (type == std::filesystem::file_type::not_found || type == std::filesystem::file_type::none)
        throw CommandError(qt::phrased(u"%1: there is no such file").arg(name));
    if (type == std::filesystem::file_type::directory)
        throw CommandError(qt::phrased(u"%1 is a folder; name a file in it").arg(name));
    if (type == std::filesystem::file_type::character || type == std::filesystem::file_type::block)
        throw CommandError(qt::phrased(u"%1 is a device; name a file").arg(name));
    if (type == std::filesystem::file_type::socket)
        throw CommandError(qt::phrased(u"%1 is a socket; name a file").arg(name));
    if (type == std::filesystem::file_type::regular && !std::ifstream(pathOf(name)))
        throw CommandError(qt::phrased(u"%1: you may not read this file").arg(name));
}

OptionTable sourceOptions() { return Options; }

QString fileDetails()
{
    return qt::phrased(
        u"FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or\n"
        u".ods file (file.xlsx:Sheet), an SQLite database (db.sqlite:table, or db.sqlite with\n"
        u"--query), or a saved document (.ostl).\n"
        u"Pages look as the default settings and the options say; --settings takes others.\n");
}

bool isPipe(const QString& name)
{
    std::error_code ignored;
    return name == StandardInput || std::filesystem::is_fifo(pathOf(name), ignored);
}

bool isDatabase(const QString& name)
{
    return firstFileBytes(pathOf(name), sizeof DatabaseMark - 1) == DatabaseMark;
}

bool isDocumentName(const QString& name)
{
    return name.endsWith(QLatin1String(".ostl"), Qt::CaseInsensitive);
}

bool isSameFile(const QString& file, const QString& other)
{
    std::error_code error;
    return std::filesystem::equivalent(pathOf(splitName(file).file), pathOf(other), error);
}

QString plainName(const QString& name)
{
    if (name == StandardInput)
        return QStringLiteral("table");
    return QFileInfo(splitName(name).file).completeBaseName();
}

TableGrid readTable(const QString& file, const CommandLine& line, ProgressLine& progress)
{
    const Interruption::AtOnce atOnce;
    std::optional<PipedInput> piped;
    const QString shownPipe = file == StandardInput ? standardInputName() : file;
    if (isPipe(file))
        piped.emplace(file, shownPipe);
    const DatabaseName name = splitName(piped ? piped->name() : file);
    const QString shown = piped ? shownPipe : name.file;
    checkReadable(name.file);
    const bool isFromDatabase = isDatabase(name.file);
    const bool isOffice = qt::isOfficeFile(pathOf(name.file));
    if (!isFromDatabase && !isOffice && !name.table.isEmpty())
        throw CommandError(
            qt::phrased(u"%1 is no SQLite database and no office file, so it has no table \"%2\"",
                { shown, name.table }));
    try {
        if (isOffice)
            return selected(readSheet(name, shown, line), line);
        return selected(isFromDatabase ? readDatabase(name, line, progress)
                                       : readValues(name.file, shown, line, progress),
            line);
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::Cancelled)
            throw;
        throw CommandError(QStringLiteral("%1: %2").arg(shown, detailOf(error)));
    }
}

} // namespace pelloric::app
