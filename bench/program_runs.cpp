// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures the whole program, from a CSV file to a PDF file, beside the floor of the same run; then
// pictures of pages, and the way to the first page of a preview:
//   pelloric_bench_program [ROWS]    up to ROWS rows, 1,000,000 unless given
// Times are processor seconds, so that other work on the machine counts little, except where they
// are said to be seconds of the clock.

#include "sample_table.h"
#include "stream_floor.h"

#include "controls/canvas.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "ui/qt/preview_opener.h"

#include <QApplication>
#include <QTemporaryDir>

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace {

using namespace pelloric;
namespace fs = std::filesystem;

constexpr std::int64_t JudgedRows = 100'000;
constexpr std::int64_t LargeRows = 1'000'000;
constexpr double MostSeconds = 0.6;
constexpr double MostFloors = 2.0;
constexpr double MostKilobytes = 6.4;
constexpr double MostMegabytes = 400;

constexpr std::int64_t PictureRows = 10'000;
constexpr int Pictures = 120;
constexpr double LeastPictures = 40; ///< a second on two processors

constexpr std::int64_t PreviewRows = 1000;
constexpr char FirstPage[] = "--first-page";

struct Cost {
    double seconds = 0; ///< of the processor
    double clock = 0; ///< seconds
    double megabytes = 0; ///< at the peak
};

/// A size of the table, and what the program took for it.
struct Run {
    std::int64_t rows = 0;
    Cost cost {};
    double kilobytes = 0; ///< of the PDF file
};

double secondsOf(const timeval& time)
{
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

/// Waits for a process.
Cost costOf(pid_t child, const char* what)
{
    const auto begin = std::chrono::steady_clock::now();
    int status = 0;
    rusage usage {};
    if (child < 0 || wait4(child, &status, 0, &usage) < 0 || status != 0) {
        std::fprintf(stderr, "%s: failed\n", what);
        std::exit(1);
    }
    const std::chrono::duration<double> clock = std::chrono::steady_clock::now() - begin;
    return { secondsOf(usage.ru_utime) + secondsOf(usage.ru_stime), clock.count(),
        static_cast<double>(usage.ru_maxrss) / 1024 };
}

/// Runs a program to its end. What this process holds counts for the peak of that one: hold little.
Cost costOf(const char* program, std::vector<std::string> arguments)
{
    arguments.insert(arguments.begin(), program);
    std::vector<char*> all;
    for (std::string& argument : arguments)
        all.push_back(argument.data());
    all.push_back(nullptr);
    const pid_t child = fork();
    if (child == 0) {
        execv(program, all.data());
        _exit(127);
    }
    return costOf(child, program);
}

/// In a process of its own, so that this one stays small.
void writeTable(std::int64_t rows, const fs::path& path)
{
    const pid_t child = fork();
    if (child == 0) {
        bench::writeCsv(bench::sampleTable(rows), path);
        _exit(0);
    }
    costOf(child, "table");
}

const char* verdict(bool isMet) { return isMet ? "met" : "MISSED"; }

Run runOf(std::int64_t rows, const fs::path& folder)
{
    const fs::path table = folder / "table.csv";
    const fs::path pdf = folder / "table.pdf";
    writeTable(rows, table);
    Run run { .rows = rows, .cost = { .seconds = 1e9 } };
    for (int repeat = 0; repeat < (rows > JudgedRows ? 1 : 3); ++repeat) {
        const Cost cost = costOf(PELLORIC_PROGRAM, { "export", table, "-o", pdf });
        run.cost.megabytes = std::max(run.cost.megabytes, cost.megabytes);
        run.cost.seconds = std::min(run.cost.seconds, cost.seconds);
    }
    run.kilobytes = static_cast<double>(fs::file_size(pdf)) / 1024;
    fs::remove(table);
    fs::remove(pdf);
    return run;
}

/// Prints what the program took beside what its streams alone take.
void report(const Run& run, const fs::path& folder, qt::QtPlatform& platform)
{
    TableGrid table = bench::sampleTable(run.rows);
    Platform record = platform.record();
    Canvas canvas(record);
    canvas.doPreview(table);
    double floor = 1e9;
    for (int repeat = 0; repeat < 3; ++repeat)
        floor = std::min(floor, bench::streamFloorSeconds(canvas.document(), folder / "floor.bin"));
    const int pages = canvas.document().pageCount();
    std::printf("%9lld rows %6d pages %8.3f s %8.1f MB %6.2f KB a page   floor %7.3f s   "
                "%5.2f floors\n",
        static_cast<long long>(run.rows), pages, run.cost.seconds, run.cost.megabytes,
        run.kilobytes / pages, floor, run.cost.seconds / floor);
    if (run.rows == JudgedRows)
        std::printf("    at most %.1f s: %s; at most %.1f floors: %s; at most %.1f KB a page: %s\n",
            MostSeconds, verdict(run.cost.seconds <= MostSeconds), MostFloors,
            verdict(run.cost.seconds <= MostFloors * floor), MostKilobytes,
            verdict(run.kilobytes / pages <= MostKilobytes));
    if (run.rows == LargeRows)
        std::printf("    at most %.0f MB: %s\n", MostMegabytes,
            verdict(run.cost.megabytes <= MostMegabytes));
    std::fflush(stdout);
}

void runPictures(const fs::path& folder)
{
    const fs::path table = folder / "table.csv";
    writeTable(PictureRows, table);
    const fs::path picture = folder / "page.png";
    const auto run = [&](const std::string& pages, const std::string& jobs) {
        return costOf(PELLORIC_PROGRAM,
            { "export", table, "-o", picture, "--dpi", "150", "--pages", pages, "--jobs", jobs });
    };
    const Cost one = run("1", "1"); // what all pages share
    const Cost alone = run("1-" + std::to_string(Pictures), "1");
    const Cost both = run("1-" + std::to_string(Pictures), "2");
    const double each = (alone.seconds - one.seconds) / (Pictures - 1);
    std::printf("\nPNG, A4 at 150 dpi, %d pages: %.1f ms of the processor a page, %.1f pages a "
                "second on two processors\n",
        Pictures, each * 1000, 2 / each);
    std::printf("    at least %.0f: %s; by the clock %.1f pages a second with --jobs 1, %.1f with "
                "--jobs 2\n",
        LeastPictures, verdict(2 / each >= LeastPictures), Pictures / alone.clock,
        Pictures / both.clock);
    std::fflush(stdout);
}

/// What a host does until a person sees the first page.
int showFirstPage(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(count, arguments);
    const QTemporaryDir folder;
    qt::QtPlatform platform;
    platform.folders().setSystemDirectory(folder.path().toStdString());
    deployDefaultSettings(platform.record());
    qt::installPreviewWindow(platform).openPreview(
        std::make_unique<TableGrid>(bench::sampleTable(PreviewRows)));
    QApplication::processEvents();
    return 0;
}

void runFirstPage(const char* self)
{
    Cost least { 1e9, 1e9, 0 };
    for (int repeat = 0; repeat < 5; ++repeat) {
        const Cost cost = costOf(self, { FirstPage });
        least.seconds = std::min(least.seconds, cost.seconds);
        least.clock = std::min(least.clock, cost.clock);
    }
    std::printf(
        "\nFrom the start of a program to the first page of a preview, %lld rows: %.3f s of "
        "the processor, %.3f s of the clock\n",
        static_cast<long long>(PreviewRows), least.seconds, least.clock);
    std::fflush(stdout);
}

} // namespace

int main(int count, char** arguments)
{
    if (count > 1 && std::strcmp(arguments[1], FirstPage) == 0)
        return showFirstPage(count, arguments);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const std::int64_t most = count > 1 ? std::atoll(arguments[1]) : LargeRows;
    const QTemporaryDir temporary;
    const fs::path folder(temporary.path().toStdString());
    std::vector<Run> runs;
    for (std::int64_t rows = 1000; rows <= most; rows *= 10)
        runs.push_back(runOf(rows, folder));
    std::printf("\nThe whole program, CSV to PDF, 8 columns; the floor: streams written by hand, "
                "without fonts\n");
    {
        const QGuiApplication application(count, arguments);
        qt::QtPlatform platform;
        platform.folders().setSystemDirectory(temporary.path().toStdString());
        deployDefaultSettings(platform.record());
        for (const Run& run : runs)
            report(run, folder, platform);
    }
    runPictures(folder);
    runFirstPage(arguments[0]);
    return 0;
}
