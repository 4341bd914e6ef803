// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures the whole program, from a CSV file to a PDF file, beside the floor of the same run:
//   pelloric_bench_program [ROWS]    up to ROWS rows, 1,000,000 unless given
// Times are processor seconds, so that other work on the machine counts little.

#include "sample_table.h"
#include "stream_floor.h"

#include "controls/canvas.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"

#include <QGuiApplication>
#include <QTemporaryDir>

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace {

using namespace pelloric;
namespace fs = std::filesystem;

constexpr std::int64_t JudgedRows = 100'000;
constexpr double MostSeconds = 0.6;
constexpr double MostFloors = 2.0;
constexpr double MostKilobytes = 6.4;

struct Cost {
    double seconds = 0; ///< of the processor
    double megabytes = 0; ///< at the peak
};

double secondsOf(const timeval& time)
{
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

/// Runs the program to its end.
Cost costOf(const std::string& input, const std::string& output)
{
    const pid_t child = fork();
    if (child == 0) {
        execl(PELLORIC_PROGRAM, PELLORIC_PROGRAM, "export", input.c_str(), "-o", output.c_str(),
            static_cast<char*>(nullptr));
        _exit(127);
    }
    int status = 0;
    rusage usage {};
    if (child < 0 || wait4(child, &status, 0, &usage) < 0 || status != 0) {
        std::fprintf(stderr, "%s: the export failed\n", PELLORIC_PROGRAM);
        std::exit(1);
    }
    return { secondsOf(usage.ru_utime) + secondsOf(usage.ru_stime),
        static_cast<double>(usage.ru_maxrss) / 1024 };
}

void writeCsv(const TableGrid& table, const fs::path& path)
{
    std::ofstream stream(path, std::ios::binary);
    for (int column = 0; column < table.columnCount(); ++column)
        stream << (column > 0 ? "," : "") << toUtf8(table.column(column).title);
    stream << '\n';
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            stream << (column > 0 ? "," : "") << toUtf8(table.cell(row, column));
        stream << '\n';
    }
}

const char* verdict(bool isMet) { return isMet ? "met" : "MISSED"; }

class ProgramRuns {
public:
    ProgramRuns()
    {
        platform_.folders().setSystemDirectory(folder_.path().toStdString());
        deployDefaultSettings(platform_.record());
    }

    void measure(std::int64_t rows)
    {
        TableGrid table = bench::sampleTable(rows);
        const fs::path folder(folder_.path().toStdString());
        writeCsv(table, folder / "table.csv");
        Platform record = platform_.record();
        Canvas canvas(record);
        canvas.doPreview(table);
        Cost program { .seconds = 1e9 };
        double floor = 1e9;
        for (int repeat = 0; repeat < (rows > JudgedRows ? 1 : 3); ++repeat) {
            const Cost cost = costOf(folder / "table.csv", folder / "table.pdf");
            program.seconds = std::min(program.seconds, cost.seconds);
            program.megabytes = std::max(program.megabytes, cost.megabytes);
            floor = std::min(
                floor, bench::streamFloorSeconds(canvas.document(), folder / "floor.bin"));
        }
        const int pages = canvas.document().pageCount();
        report(rows, pages, program, floor,
            static_cast<double>(fs::file_size(folder / "table.pdf")) / 1024);
    }

private:
    static void report(
        std::int64_t rows, int pages, const Cost& program, double floor, double kilobytes)
    {
        std::printf("%9lld rows %6d pages %8.3f s %8.1f MB %6.2f KB a page   floor %7.3f s   "
                    "%5.2f floors\n",
            static_cast<long long>(rows), pages, program.seconds, program.megabytes,
            kilobytes / pages, floor, program.seconds / floor);
        if (rows != JudgedRows)
            return;
        std::printf("    at most %.1f s: %s; at most %.1f floors: %s; at most %.1f KB a page: %s\n",
            MostSeconds, verdict(program.seconds <= MostSeconds), MostFloors,
            verdict(program.seconds <= MostFloors * floor), MostKilobytes,
            verdict(kilobytes / pages <= MostKilobytes));
        std::fflush(stdout);
    }

    QTemporaryDir folder_;
    qt::QtPlatform platform_;
};

} // namespace

int main(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(count, arguments);
    const std::int64_t most = count > 1 ? std::atoll(arguments[1]) : 1'000'000;
    std::printf("The whole program, CSV to PDF, 8 columns; the floor: streams written by hand, "
                "without fonts\n");
    ProgramRuns runs;
    for (std::int64_t rows = 1000; rows <= most; rows *= 10)
        runs.measure(rows);
    return 0;
}
