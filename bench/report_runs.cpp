// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures whole roads of a report, each budget beside what was measured:
//   pelloric_bench_runs [ROWS]    up to ROWS rows, 1,000,000 unless given

#include "judgement.h"
#include "sample_table.h"

#include "controls/canvas.h"
#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "export/qt/page_export.h"
#include "platform/qt/qt_platform.h"
#include "platform/safe_file.h"
#include "platform/services.h"
#include "report/layout_engine.h"
#include "settings/default_settings.h"

#include <QApplication>
#include <QPdfWriter>
#include <QTemporaryDir>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextTable>

#include <malloc.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <vector>

namespace {

using namespace pelloric;
using bench::judge;
using bench::print;
using bench::StopWatch;
namespace fs = std::filesystem;

constexpr std::int64_t UsualRoadRows = 1000; ///< the toolkit takes half a minute for 10,000
constexpr std::int64_t LongReportRows = 10'000; ///< from here on fonts take little of a file
constexpr int LastSavedPage = 130;
constexpr int WideRows = 1000;
constexpr int FewColumns = 1000;
constexpr int ManyColumns = 4000;
constexpr std::int64_t JudgedRows = 1'000'000; ///< smaller ones fit the processor's memory
constexpr std::int64_t PdfRows = 100'000; ///< of the PDF export, 2,400 pages

double heapBytes()
{
    const struct mallinfo2 heap = mallinfo2();
    return static_cast<double>(heap.uordblks) + static_cast<double>(heap.hblkhd);
}

/// Writes the page blocks of a document file several times, for files hold 131 pages but may have
/// any number of them.
void repeatPages(const fs::path& path, int times)
{
    std::ifstream input(path, std::ios::binary);
    std::string bytes { std::istreambuf_iterator<char>(input), {} };
    const std::size_t first = bytes.find("##Release2004-10-23[0]");
    const std::size_t last = bytes.rfind('"');
    std::ofstream output(path, std::ios::binary | std::ios::app);
    const std::string pages = bytes.substr(first, last - first);
    for (int time = 1; time < times; ++time)
        output << pages;
}

struct Counts {
    double texts = 0;
    double lines = 0;
};

Counts countsOf(const PageDocument& document)
{
    Counts counts;
    for (int page = 0; page < document.pageCount(); ++page) {
        counts.texts += static_cast<double>(document.texts(page).size());
        counts.lines += static_cast<double>(document.lines(page).size());
    }
    return counts;
}

/// What no layout can do without: copy each text once, add its cached advances, append as many
/// records to as many pages.
double floorSeconds(const TableGrid& table, TextMetrics& metrics, const Counts& counts, int pages)
{
    PageDocument document;
    FaceMetrics& face = metrics.face(u"宋体", false, false);
    const std::int64_t rowsOfPage = table.rowCount() / pages + 1;
    const std::vector<PatternLine> lines(
        static_cast<std::size_t>(counts.lines / static_cast<double>(table.rowCount()) + 0.5));
    const std::uint32_t pattern = document.addLinePattern(lines);
    double sum = 0;
    const StopWatch watch;
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        if (row > 0 && row % rowsOfPage == 0)
            document.newPage();
        const auto y = static_cast<Twips>(row % rowsOfPage * 360);
        for (int column = 0; column < table.columnCount(); ++column) {
            const TextView text = document.store().add(table.cell(row, column));
            const double width = face.advanceOf(text);
            sum += width;
            const auto x = static_cast<Twips>(width);
            const auto length = static_cast<std::uint32_t>(text.size());
            document.append(TextRecord { { x, y }, text.data(), length, 0 });
        }
        document.appendRow(y, y + 360, pattern);
    }
    const double seconds = watch.seconds();
    return sum > 0 ? seconds : 0;
}

/// The road most users have: a rich-text table that the toolkit lays out and prints.
double usualRoadSeconds(const TableGrid& table, const QString& file)
{
    const StopWatch watch;
    QTextDocument document;
    QTextCursor cursor(&document);
    QTextTable* rich
        = cursor.insertTable(static_cast<int>(table.rowCount()) + 1, table.columnCount());
    for (int column = 0; column < table.columnCount(); ++column)
        rich->cellAt(0, column).firstCursorPosition().insertText(
            QString::fromStdU16String(table.column(column).title));
    for (int row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column) {
            const TextView text = table.cell(row, column);
            rich->cellAt(row + 1, column)
                .firstCursorPosition()
                .insertText(QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size())));
        }
    }
    QPdfWriter writer(file);
    writer.setPageSize(QPageSize(QPageSize::A4));
    writer.setResolution(600);
    document.print(&writer);
    return watch.seconds();
}

class Runs {
public:
    explicit Runs(std::int64_t mostRows)
        : mostRows_(mostRows)
    {
        platform_.folders().setSystemDirectory(folder_.path().toStdString());
        record_ = std::make_unique<Platform>(platform_.record());
        deployDefaultSettings(*record_);
    }

    void all()
    {
        TableGrid warmUp = bench::sampleTable(100); // fonts are loaded and their advances known
        Canvas(*record_).doPreview(warmUp);
        for (std::int64_t rows = 1000; rows <= mostRows_; rows *= 10)
            report(rows);
        wide();
    }

private:
    /// Time must grow with rows x columns, not with the square of the columns.
    void wide()
    {
        std::printf("\n%d rows of many columns\n", WideRows);
        const double narrow = wideSeconds(FewColumns);
        const double wide = wideSeconds(ManyColumns);
        std::printf("    preview: %d columns %.3f s, %d columns %.3f s\n", FewColumns, narrow,
            ManyColumns, wide);
        judge("preview, 4,000 columns / 1,000 columns", wide / narrow, 5, true);
    }

    double wideSeconds(int columns)
    {
        TableGrid table = bench::wideTable(WideRows, columns);
        double best = 1e9;
        for (int repeat = 0; repeat < 3; ++repeat) {
            Canvas canvas(*record_);
            const StopWatch watch;
            canvas.doPreview(table);
            best = std::min(best, watch.seconds());
        }
        return best;
    }

    void report(std::int64_t rows)
    {
        std::printf("\n%lld rows x 8 columns\n", static_cast<long long>(rows));
        // The texts are the table's, too: what is left of it when it is gone belongs to the pages.
        const double before = heapBytes();
        auto gone = std::make_unique<TableGrid>(bench::sampleTable(rows));
        auto canvas = std::make_unique<Canvas>(*record_);
        const StopWatch watch;
        canvas->doPreview(*gone);
        print("preview: read, lay out, show", rows, watch.seconds(), "");
        gone.reset();
        const double bytes = heapBytes() - before;
        TableGrid table = bench::sampleTable(rows);
        memory(*canvas, table, bytes);
        layout(table, *canvas);
        files(*canvas, rows);
        pdf(table, *canvas);
    }

    void memory(const Canvas& canvas, const TableGrid& table, double bytes)
    {
        const Counts counts = countsOf(canvas.document());
        const auto texts = static_cast<double>(bench::textBytes(table));
        std::printf(
            "    %.0f pages, %.0f texts, %.0f lines, %.1f MB of cell texts, %.1f MB in all\n",
            static_cast<double>(canvas.document().pageCount()), counts.texts, counts.lines,
            texts / 1e6, bytes / 1e6);
        const auto rows = static_cast<double>(table.rowCount());
        std::printf("    %.1f bytes a row beside the cell texts\n", (bytes - texts) / rows);
        if (table.rowCount() >= JudgedRows)
            judge("memory of row set and document, MB a million rows", bytes / rows, 300, true);
    }

    void layout(TableGrid& table, Canvas& canvas)
    {
        const Counts counts = countsOf(canvas.document());
        double floor = 1e9;
        double laidOut = 1e9;
        for (int repeat = 0; repeat < 3; ++repeat) {
            floor = std::min(floor,
                floorSeconds(table, record_->metrics, counts, canvas.document().pageCount()));
            laidOut = std::min(laidOut, layoutSeconds(table, canvas));
        }
        print("floor: copy, measure, append", table.rowCount(), floor, "");
        print("layout: row set to document", table.rowCount(), laidOut, "");
        if (table.rowCount() >= JudgedRows)
            judge("layout / floor", laidOut / floor, 1.5, true);
    }

    double layoutSeconds(TableGrid& table, Canvas& canvas)
    {
        auto store = std::make_shared<TextStore>();
        const GridTable read = readGrid(table,
            { .kind = PrintObjKind::MSFlexGrid,
                .paperWidth = canvas.page.myWidth,
                .leftMargin = canvas.page.intLeft,
                .keptWidths = {},
                .store = store });
        PageDocument document;
        document.shareStore(store);
        Recorder recorder(document, record_->metrics);
        const StopWatch watch;
        LayoutEngine engine(
            { canvas.style(), canvas.page, *read.rows, read.ColumnWidths, read.ColumnBands },
            *record_, document, recorder);
        engine.build({});
        return watch.seconds();
    }

    void files(const Canvas& canvas, std::int64_t rows)
    {
        const fs::path path = fs::path(folder_.path().toStdString()) / "report.ostl";
        const OstlEncoding encoding { record_->codec, u'.' };
        const StopWatch writing;
        writeOstl(canvas.document(), canvas.page, encoding, {}, SafeFile(record_->files, path));
        const double written = writing.seconds();
        print("document file: write", rows, written, "(131 pages at most)");
        repeatPages(path, canvas.document().pageCount() / (LastSavedPage + 1));
        double read = 1e9;
        for (int repeat = 0; repeat < 5; ++repeat) {
            PageDocument document;
            PageSetup setup;
            const StopWatch reading;
            readOstl(record_->codec, path, document, setup);
            read = std::min(read, reading.seconds());
        }
        const double megabytes = static_cast<double>(fs::file_size(path)) / 1e6;
        print("document file: open", rows, read, "(as many pages as the report has)");
        judge("document file opened, MB/s", megabytes / read, 100, false);
    }

    void pdf(const TableGrid& table, const Canvas& canvas)
    {
        const std::int64_t rows = table.rowCount();
        if (rows > PdfRows)
            return;
        const fs::path path = fs::path(folder_.path().toStdString()) / "report.pdf";
        const StopWatch watch;
        qt::exportPdf(canvas.document(), canvas.page, platform_.fonts(), {}, path);
        const double seconds = watch.seconds();
        print("PDF export", rows, seconds, "");
        const double pages = canvas.document().pageCount();
        const double kilobytes = static_cast<double>(fs::file_size(path)) / 1024;
        if (rows >= LongReportRows)
            judge("PDF, KB a page", kilobytes / pages, 6.4, true);
        const double perRow = seconds / static_cast<double>(rows);
        if (rows <= UsualRoadRows) {
            usual_ = usualRoadSeconds(table, folder_.filePath("usual.pdf"));
            print("usual road: rich-text table to PDF", rows, usual_, "");
            usual_ /= static_cast<double>(rows);
        }
        judge("PDF export, times the rows/s of the usual road", usual_ / perRow, 10, false);
    }

    std::int64_t mostRows_;
    double usual_ = 0; ///< seconds a row of the usual road, of its largest run
    QTemporaryDir folder_;
    qt::QtPlatform platform_;
    std::unique_ptr<Platform> record_;
};

} // namespace

int main(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(count, arguments);
    const std::int64_t rows = count > 1 ? std::atoll(arguments[1]) : 1'000'000;
    Runs(rows).all();
    return 0;
}
