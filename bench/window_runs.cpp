// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures what the preview window costs on a report of ten thousand pages, and how long it is
// silent at most:
//   pelloric_bench_window [ROWS]    440,000 rows unless given

#include "judgement.h"
#include "sample_table.h"

#include "controls/canvas.h"
#include "fakes/fake_printer.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "support/qt/beside.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"

#include <pelloric/sorvane.h>

#include <QApplication>
#include <QDockWidget>
#include <QElapsedTimer>
#include <QListView>
#include <QScrollBar>
#include <QTemporaryDir>

#include <malloc.h>

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>
#include <memory>

namespace {

using namespace pelloric;

constexpr std::int64_t RowsOfTenThousandPages = 440'000;
constexpr double LongestSilence = 250; ///< milliseconds
constexpr double MostStripMegabytes = 10;
constexpr int Steps = 200;
constexpr int StepsAtOnce = 20;

double megabytesInUse()
{
    const struct mallinfo2 heap = mallinfo2();
    return static_cast<double>(heap.uordblks + heap.hblkhd) / 1e6;
}

/// Takes every page and keeps none.
class PaperBin final : public FakePrinter {
public:
    PaperBin() { name = u"bin"; }

    void setDocumentTitle(TextView) override { ++pages; }
    void endDoc() override { forget(); }

    int pages = 0;
};

class Runs {
public:
    explicit Runs(std::int64_t rows)
        : rows_(rows)
    {
        platform_.folders().setSystemDirectory(folder_.path().toStdString());
        platform_.useMessages(messages_);
        printers_.names = { u"bin" };
        printers_.current = u"bin";
        platform_.usePrinter(printer_, printers_);
        deployDefaultSettings(platform_.record());
        qt::PreviewPrompts prompts = qt::standardPrompts();
        prompts.chooseFile
            = [this](QWidget&, const qt::FileQuestion&) { return folder_.filePath("report.pdf"); };
        opener_.setPrompts(std::move(prompts));
    }

    void all()
    {
        auto table = std::make_unique<TableGrid>(bench::sampleTable(rows_));
        measure("preview is built", [&] { opener_.openPreview(std::move(table)); });
        QApplication::processEvents();
        std::printf("    %d pages\n", static_cast<int>(canvas().document().pageCount()));
        showStrip();
        walkStrip();
        measure("saved as PDF", [&] { opener_.window()->savePages(); });
        measure("printed to a printer that takes all at once",
            [&] { opener_.window()->print(true, {}, 1); });
        std::printf("    %d pages were taken, each a document\n", printer_.pages);
    }

private:
    Canvas& canvas() { return opener_.window()->canvas().canvas(); }

    void measure(const char* what, const std::function<void()>& run)
    {
        const std::clock_t begin = std::clock();
        QElapsedTimer watch;
        watch.start();
        qint64 longest = 0;
        qint64 longestWork = 0;
        {
            const qt::Beside beside;
            run();
            longest = beside.longest();
            longestWork = beside.longestWork();
        }
        std::printf("%-44s %8.3f s of the processor, %8.3f s of the clock\n", what,
            static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC,
            static_cast<double>(watch.elapsed()) / 1000);
        std::printf("    longest silence by the clock %lld ms\n", static_cast<long long>(longest));
        bench::judge("longest silence, ms of the processor", static_cast<double>(longestWork),
            LongestSilence, true);
    }

    void showStrip()
    {
        auto* const dock
            = opener_.window()->findChild<QDockWidget*>(QStringLiteral("PageStripDock"));
        const double before = megabytesInUse();
        measure("strip of pictures comes up", [&] {
            dock->show();
            QApplication::processEvents();
        });
        bench::judge(
            "memory of the strip, MB", megabytesInUse() - before, MostStripMegabytes, true);
    }

    void walkStrip()
    {
        auto* const strip = opener_.window()->findChild<QListView*>(QStringLiteral("PageStrip"));
        const double before = megabytesInUse();
        QScrollBar* const bar = strip->verticalScrollBar();
        measure("200 steps through the whole strip", [&] {
            for (int step = 1; step <= Steps; ++step) {
                bar->setValue(static_cast<int>(std::int64_t { bar->maximum() } * step / Steps));
                QApplication::processEvents();
            }
        });
        measure("20 pictures are gone to, page and all", [&] {
            for (int step = 1; step <= StepsAtOnce; ++step) {
                const int page = (strip->model()->rowCount() - 1) * step / StepsAtOnce;
                strip->setCurrentIndex(strip->model()->index(page, 0));
                QApplication::processEvents();
            }
        });
        bench::judge(
            "memory after the walk, MB more", megabytesInUse() - before, MostStripMegabytes, true);
    }

    std::int64_t rows_;
    QTemporaryDir folder_;
    qt::StreamMessages messages_;
    PaperBin printer_;
    FakePrinterSystem printers_;
    qt::QtPlatform platform_;
    qt::QtPreviewOpener opener_ { platform_ };
};

} // namespace

int main(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(count, arguments);
    const std::int64_t rows = count > 1 ? std::atoll(arguments[1]) : RowsOfTenThousandPages;
    std::printf("\nThe preview window, %lld rows of 8 columns\n", static_cast<long long>(rows));
    Runs(rows).all();
    return 0;
}
