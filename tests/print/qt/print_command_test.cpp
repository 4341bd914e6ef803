// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/print_test.h"
#include "support/test_paths.h"

namespace pelloric::qt {

namespace {

ProgramResult pelloric(const QStringList& arguments)
{
    return runProgram(QStringLiteral(PELLORIC_PROGRAM), arguments);
}

QString wine() { return QStringLiteral(PELLORIC_TESTS_DIR "/../samples/wine.csv"); }

using PrintCommand = PrintTest;

} // namespace

TEST_F(PrintCommand, PrintsThePagesOfARangeInCopies)
{
    const ProgramResult result = pelloric({ QStringLiteral("print"), wine(),
        QStringLiteral("--pages"), QStringLiteral(" 2-3,x"), QStringLiteral("--copies"),
        QStringLiteral("2"), QStringLiteral("--title"), QStringLiteral("葡萄酒") });
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, QStringLiteral("T1: 4 pages sent\n"));
    EXPECT_EQ(result.errors, QString());
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 4U);
    for (std::size_t i = 0; i < jobs.size(); ++i)
        EXPECT_EQ(jobs[i].title, QStringLiteral("葡萄酒 – page %1").arg(i % 2 + 2));
}

TEST_F(PrintCommand, PrintsASavedDocumentOnThePaperItWasLaidOutFor)
{
    const QString file = cups.folder() + QStringLiteral("/wine.ostl");
    ASSERT_EQ(pelloric({ QStringLiteral("export"), wine(), QStringLiteral("-o"), file,
                           QStringLiteral("--paper"), QStringLiteral("16k") })
                  .status,
        0);
    const ProgramResult result = pelloric(
        { QStringLiteral("print"), file, QStringLiteral("--pages"), QStringLiteral("1") });
    EXPECT_EQ(result.output, QStringLiteral("T1: 1 page sent\n"));
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 1U);
    EXPECT_EQ(jobs[0].media, QStringLiteral("K16"));
}

TEST_F(PrintCommand, WarnsOfASheetOnWhichThePagesDoNotFit)
{
    const ProgramResult result
        = pelloric({ QStringLiteral("print"), wine(), QStringLiteral("--paper"),
            QStringLiteral("8k"), QStringLiteral("--pages"), QStringLiteral("1") });
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors,
        QStringLiteral("pelloric: The pages are 270 x 390 mm, the printer's sheet is A4 "
                       "(210 x 297 mm): what does not fit on it is lost.\n"));
    EXPECT_EQ(result.output, QStringLiteral("T1: 1 page sent\n"));
}

TEST_F(PrintCommand, SaysInOneLineWhatIsWrong)
{
    struct Case {
        QStringList options;
        QString error;
        int status;
    };
    ASSERT_TRUE(cups.addPrinter(QStringLiteral("A0")));
    ASSERT_TRUE(cups.command(QStringLiteral("cupsreject"), { QStringLiteral("A0") }));
    const Case cases[] = {
        { { QStringLiteral("--printer"), QStringLiteral("A0"), QStringLiteral("--pages"),
              QStringLiteral("1-1000000"), QStringLiteral("--widths"), QStringLiteral("500") },
            QStringLiteral("pelloric: A0: the printer rejects jobs, after 0 of "), 1 },
        { { QStringLiteral("--printer"), QStringLiteral("nobody") },
            QStringLiteral("pelloric: no printer \"nobody\"; see \"pelloric printers\""), 1 },
        { { QStringLiteral("--pages"), QStringLiteral("some") },
            QStringLiteral("pelloric: --pages some names no page; the document has "), 1 },
        { { QStringLiteral("--copies"), QStringLiteral("40000") },
            QStringLiteral("pelloric: --copies takes a whole number from 1 to 32767"), 2 },
    };
    for (const Case& wrong : cases) {
        const ProgramResult result
            = pelloric(QStringList { QStringLiteral("print"), wine() } + wrong.options);
        EXPECT_EQ(result.status, wrong.status);
        EXPECT_TRUE(result.errors.startsWith(wrong.error)) << result.errors.toStdString();
        EXPECT_EQ(result.errors.count(u'\n'), 1);
        EXPECT_EQ(result.output, QString());
    }
    EXPECT_TRUE(cups.jobs().empty());
}

TEST_F(PrintCommand, ListsPrintersWithTheirStateAndPapers)
{
    ASSERT_TRUE(cups.addPrinter(QStringLiteral("A0")));
    ASSERT_TRUE(cups.command(QStringLiteral("cupsdisable"), { QStringLiteral("A0") }));
    EXPECT_EQ(pelloric({ QStringLiteral("printers") }).output,
        QStringLiteral("  A0: the printer is stopped\n* T1: ready\n"));
    const QString papers
        = pelloric({ QStringLiteral("printers"), QStringLiteral("--papers") }).output;
    EXPECT_TRUE(papers.contains(QStringLiteral("  9  A4  "))) << papers.toStdString();
    EXPECT_TRUE(papers.contains(QStringLiteral(" 48  16开 "))) << papers.toStdString();
}

TEST(PrintCommandAlone, SaysThatThereIsNoPrinter)
{
    PrivateCups cups;
    ASSERT_EQ(cups.failure(), "");
    for (const char* const command : { "print", "printers" }) {
        QStringList arguments { QString::fromLatin1(command) };
        if (arguments.front() == QStringLiteral("print"))
            arguments.append(wine());
        const ProgramResult result = pelloric(arguments);
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.errors, QStringLiteral("pelloric: there is no printer\n"));
    }
    cups.stop();
    const ProgramResult result = pelloric({ QStringLiteral("printers") });
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(
        result.errors.startsWith(QStringLiteral("pelloric: the print system does not answer (")))
        << result.errors.toStdString();
}

} // namespace pelloric::qt
