// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "platform/qt/qt_platform.h"
#include "sample_table.h"
#include "settings/default_settings.h"
#include <pelloric/sorvane.h>

#include <QCoreApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <algorithm>

namespace pelloric::bench {

namespace {

constexpr std::int64_t RowsOfTenThousandPages = 440'000;

/// A canvas of the size of a usual window that shows a document of ten thousand pages.
class LongReport {
public:
    LongReport()
        : sorvane(platform)
        , canvas(sorvane.canvas())
    {
        platform.folders().setSystemDirectory(folder.path().toStdString());
        deployDefaultSettings(platform.record());
        sorvane.resize(1200, 900);
        sorvane.show();
        canvas.strSCliectRect = u"full";
        TableGrid grid = sampleTable(RowsOfTenThousandPages);
        sorvane.doPreview(static_cast<AutomationObject&>(grid));
        paint();
    }

    /// Paints what has changed, as the event loop does.
    static void paint() { QCoreApplication::processEvents(); }

    /// Time for each page that was painted, and how many there were.
    void tell(benchmark::State& state) const
    {
        const auto pages
            = static_cast<double>(surfacesInView(canvas.view(), canvas.facts()).size());
        state.counters["pages"] = pages;
        state.counters["time_per_page"] = benchmark::Counter(
            pages, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
        state.counters["document"] = canvas.Totalpages();
    }

    QTemporaryDir folder;
    qt::QtPlatform platform;
    qt::Sorvane sorvane;
    Canvas& canvas;
};

LongReport& report()
{
    static LongReport* const instance = new LongReport; // as long as the program
    return *instance;
}

void turnPage(benchmark::State& state)
{
    LongReport& shown = report();
    shown.canvas.setDispScale(1);
    shown.canvas.showPage();
    std::int16_t page = 1;
    for (auto step : state) {
        page = static_cast<std::int16_t>(page % shown.canvas.Totalpages() + 1);
        shown.canvas.setCurrentpage(page);
        shown.canvas.showPage();
        LongReport::paint();
    }
    shown.tell(state);
}

void zoom(benchmark::State& state)
{
    LongReport& shown = report();
    shown.canvas.setDispScale(1);
    shown.canvas.showPage();
    bool larger = true;
    for (auto step : state) {
        larger ? shown.canvas.zoomOut() : shown.canvas.zoomIn();
        larger = !larger;
        LongReport::paint();
    }
    shown.tell(state);
}

void showSixPages(benchmark::State& state)
{
    LongReport& shown = report();
    std::int16_t first = 0;
    for (auto step : state) {
        first = static_cast<std::int16_t>((first + 6) % (shown.canvas.Totalpages() - 6));
        shown.canvas.SetShowStyle(6, first, static_cast<std::int16_t>(first + 5));
        shown.canvas.showMuliPage(6);
        LongReport::paint();
    }
    shown.tell(state);
    shown.canvas.SetShowStyle(0, 0, 0);
}

/// All pages, as small as the scroll range of the bars makes them.
void showAll(benchmark::State& state)
{
    LongReport& shown = report();
    for (auto step : state) {
        shown.canvas.setDispScale(1.0F / 48);
        shown.canvas.showAllPage();
        LongReport::paint();
    }
    shown.tell(state);
}

/// Among all pages, one step of the scroll bar.
void scrollAll(benchmark::State& state)
{
    LongReport& shown = report();
    shown.canvas.setDispScale(1.0F / 48);
    shown.canvas.showAllPage();
    LongReport::paint();
    const int lowest = std::max<int>(1, shown.canvas.view().Vbar.maximum);
    int value = 0;
    for (auto step : state) {
        value = (value + 37) % lowest;
        shown.canvas.setVbar(value);
        LongReport::paint();
    }
    shown.tell(state);
}

} // namespace

BENCHMARK(turnPage)->Unit(benchmark::kMillisecond);
BENCHMARK(zoom)->Unit(benchmark::kMillisecond);
BENCHMARK(showSixPages)->Unit(benchmark::kMillisecond);
BENCHMARK(showAll)->Unit(benchmark::kMillisecond);
BENCHMARK(scrollAll)->Unit(benchmark::kMillisecond);

} // namespace pelloric::bench
