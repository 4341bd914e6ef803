// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "support/qt/beside.h"
#include "ui/qt/preview_world.h"

#include <QElapsedTimer>
#include <QLabel>
#include <QScrollBar>

namespace pelloric::qt {

namespace {

// What an optimised build needs on a machine that does nothing else stands beside each limit.
constexpr qint64 LongestPause = 1500; ///< 300: milliseconds
constexpr qint64 LongestSearch = 6000; ///< 1000: milliseconds

using MillionRowsTest = PreviewWorld;

TEST_F(MillionRowsTest, LeaveTheWindowAnsweringAndAreSearchedAtOnce)
{
    show();
    auto grid = longGrid();
    qint64 longestOfBuild = 0;
    {
        const Beside watch;
        opener_.openPreview(std::move(grid));
        longestOfBuild = watch.longest();
    }
    ASSERT_GT(canvas().Totalpages(), 10'000);
    PreviewWindow& window = *opener_.window();
    QTest::keyClick(&window.canvas(), Qt::Key_F, Qt::ControlModifier);
    auto* const text = window.findChild<QLineEdit*>("txtFind");
    auto* const count = window.findChild<QLabel*>("FindCount");
    QElapsedTimer clock;
    qint64 longestOfSearch = 0;
    {
        const Beside watch;
        clock.start();
        text->setText(QStringLiteral("third"));
        const QString all = QLocale().toString(1'000'000);
        EXPECT_TRUE(
            QTest::qWaitFor([&] { return count->text().endsWith(QLatin1Char(' ') + all); }, 60'000))
            << count->text().toStdString();
        longestOfSearch = watch.longest();
    }
    const qint64 search = clock.elapsed();
    clock.start();
    QTest::keyClick(&window, Qt::Key_F3, Qt::ShiftModifier); // from the first place to the last
    const qint64 walk = clock.elapsed();
    EXPECT_EQ(canvas().Currentpage(), canvas().Totalpages());
    RecordProperty("longest_pause_of_build_ms", static_cast<int>(longestOfBuild));
    RecordProperty("longest_pause_of_search_ms", static_cast<int>(longestOfSearch));
    RecordProperty("search_ms", static_cast<int>(search));
    RecordProperty("walk_ms", static_cast<int>(walk));
    EXPECT_LT(longestOfBuild, LongestPause);
    EXPECT_LT(longestOfSearch, LongestPause);
    EXPECT_LT(search, LongestSearch);
    EXPECT_LT(walk, LongestPause);
}

} // namespace

} // namespace pelloric::qt
