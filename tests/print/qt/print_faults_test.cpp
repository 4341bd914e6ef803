// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/run_time_error.h"
#include "print/paper_names.h"
#include "print/print_job.h"
#include "print/qt/print_test.h"

#include <functional>
#include <random>

namespace pelloric::qt {

namespace {

PageDocument threePages()
{
    PageDocument document;
    addText(document, { 100, 100 }, u"one");
    addPages(document, 2);
    return document;
}

/// A page whose document takes more room than a small spool has.
PageDocument fullPage()
{
    PageDocument document;
    std::minstd_rand random(1);
    const auto place = [&random] { return static_cast<Twips>(random() % 11000); };
    for (int i = 0; i < 6000; ++i) {
        const Tpoint from { place(), place() };
        addLine(document, from, { place(), place() });
    }
    return document;
}

/// The text of the error that printing ends with; empty when it ends well.
/// @param afterFirst  done when the first page has been sent
std::string failureOf(
    const PageDocument& document, Printer& printer, std::function<void()> afterFirst = {})
{
    PrintJob job;
    job.paperSize = 8;
    job.orientation = 2;
    job.progress = [&](std::int64_t sent, std::int64_t) {
        if (sent == 1 && afterFirst)
            afterFirst();
        return true;
    };
    try {
        doPrint(document, job, Font {}, printer);
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::InvalidCall);
        return error.what();
    }
    return {};
}

/// A scheduler without printers.
class NoPrinterTest : public testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(cups.failure(), ""); }

    PrivateCups cups;
    QtPlatform platform;
    QtPrinting printing { platform };
};

class PrintFaultTest : public PrintTest {
protected:
    /// Prints three pages and runs a command when the first is out.
    std::string failureAfter(const QString& program, const QStringList& arguments)
    {
        return failureOf(threePages(), printing.printer(),
            [&] { EXPECT_TRUE(cups.command(program, arguments)); });
    }

    std::string failureWithTemporaryFolder(const QByteArray& temporary)
    {
        const QByteArray folder = qgetenv("TMPDIR");
        qputenv("TMPDIR", temporary);
        const std::string failure = failureOf(threePages(), printing.printer());
        folder.isEmpty() ? qunsetenv("TMPDIR") : qputenv("TMPDIR", folder);
        return failure;
    }

    void expectSettingsRestored()
    {
        EXPECT_EQ(printing.printer().paperSize(), 9);
        EXPECT_EQ(printing.printer().orientation(), 1);
    }
};

/// A spool that holds small documents only.
class SmallSpoolTest : public PrintTest {
protected:
    SmallSpoolTest()
        : PrintTest(32)
    {
    }
};

const QString T1 = QStringLiteral("T1");
const std::string Refused = "Invalid procedure call or argument: ";

} // namespace

TEST_F(NoPrinterTest, IsSaidClearly)
{
    EXPECT_EQ(failureOf(threePages(), printing.printer()),
        Refused + "there is no printer, after 0 of 3 pages");
    EXPECT_EQ(printing.system().currentPrinter(), u"");
    EXPECT_TRUE(printing.system().printerNames().empty());
    EXPECT_EQ(printing.system().forms(), standardPaperForms());
    EXPECT_FALSE(printing.system().opens(u""));
    EXPECT_FALSE(printing.system().opens(u"T1"));
}

TEST_F(NoPrinterTest, IsSaidOfAServerThatIsGone)
{
    cups.stop();
    const std::string failure = failureOf(threePages(), printing.printer());
    EXPECT_TRUE(failure.starts_with(Refused + "the print system does not answer (")) << failure;
    EXPECT_TRUE(failure.ends_with("), after 0 of 3 pages")) << failure;
}

TEST_F(PrintFaultTest, NamesAPrinterThatVanishesBetweenPages)
{
    EXPECT_EQ(failureAfter(QStringLiteral("lpadmin"), { QStringLiteral("-x"), T1 }),
        Refused + "T1: there is no such printer, after 1 of 3 pages");
    EXPECT_FALSE(printing.system().opens(u"T1"));
    EXPECT_EQ(printing.printer().orientation(), 1);
}

TEST_F(PrintFaultTest, NamesAPrinterThatStopsBetweenPages)
{
    EXPECT_EQ(failureAfter(QStringLiteral("cupsdisable"), { T1 }),
        Refused + "T1: the printer is stopped, after 1 of 3 pages");
    EXPECT_FALSE(printing.system().opens(u"T1"));
    expectSettingsRestored();
    ASSERT_TRUE(cups.command(QStringLiteral("cupsenable"), { T1 }));
    EXPECT_TRUE(printing.system().opens(u"T1"));
    EXPECT_EQ(failureOf(threePages(), printing.printer()), "");
    EXPECT_EQ(cups.jobs().size(), 4U);
}

TEST_F(PrintFaultTest, NamesAPrinterThatRejectsJobs)
{
    EXPECT_EQ(failureAfter(QStringLiteral("cupsreject"), { T1 }),
        Refused + "T1: the printer rejects jobs, after 1 of 3 pages");
    EXPECT_FALSE(printing.system().opens(u"T1"));
    expectSettingsRestored();
    EXPECT_EQ(cups.jobs().size(), 1U);
}

TEST_F(PrintFaultTest, NamesAPrinterWhoseSchedulerDies)
{
    const std::string failure
        = failureOf(threePages(), printing.printer(), [this] { cups.stop(); });
    EXPECT_TRUE(failure.starts_with(Refused + "T1: the print system does not answer (")) << failure;
    EXPECT_TRUE(failure.ends_with("), after 1 of 3 pages")) << failure;
}

TEST_F(PrintFaultTest, SaysThatADocumentWasRefusedWhenItWasHandedOver)
{
    Printer& printer = printing.printer();
    printer.setFontName(u"宋体");
    printer.setFontSize(10);
    printer.print(u"begun before the printer rejects jobs");
    ASSERT_TRUE(cups.command(QStringLiteral("cupsreject"), { T1 }));
    try {
        printer.endDoc();
        FAIL() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::InvalidCall);
        EXPECT_NE(std::string(error.what()).find("did not take the document"), std::string::npos)
            << error.what();
    }
    printer.endDoc();
    EXPECT_TRUE(cups.jobs().empty());
}

TEST_F(PrintFaultTest, BeginsNoDocumentWhenTheFolderOfTemporaryFilesIsMissing)
{
    EXPECT_EQ(failureWithTemporaryFolder((cups.folder() + QStringLiteral("/missing")).toUtf8()),
        Refused + "T1: the document could not be begun, after 0 of 3 pages");
}

TEST_F(PrintFaultTest, BeginsNoDocumentWhenTheFolderOfTemporaryFilesIsFull)
{
    EXPECT_EQ(failureWithTemporaryFolder("/proc"),
        Refused + "T1: no room for the document in /proc, after 0 of 3 pages");
}

TEST_F(SmallSpoolTest, SaysThatTheSpoolerTookNoDocumentForWantOfRoom)
{
    EXPECT_EQ(failureOf(threePages(), printing.printer()), "");
    const std::string failure = failureOf(fullPage(), printing.printer());
    EXPECT_TRUE(failure.starts_with(Refused + "T1: the print system did not take the document ("))
        << failure;
    EXPECT_TRUE(failure.ends_with("), after 0 of 1 pages")) << failure;
    EXPECT_EQ(cups.jobs().size(), 3U);
}

} // namespace pelloric::qt
