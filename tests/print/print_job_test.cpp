// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/print_job.h"

#include "fakes/fake_printer.h"
#include "print/page_list.h"
#include "support/errors.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

const Font DefaultFont { .name = u"Arial", .size = 10.5F };

/// Keeps what tells the jobs apart and can fail while it prints.
class JobPrinter : public FakePrinter {
public:
    void applyPaperSize(std::int16_t code) override
    {
        paper = code;
        jobs += "paper " + std::to_string(code) + "; ";
    }

    void applyOrientation(std::int16_t code) override
    {
        direction = code;
        jobs += "orientation " + std::to_string(code) + "; ";
    }

    void setDocumentTitle(TextView title) override { jobs += toUtf8(title) + "; "; }
    void newPage() override { jobs += "new page; "; }

    void endDoc() override
    {
        if (++ended == failAt)
            throw RunTimeError(ErrorNumber::InvalidCall);
        jobs += "end; ";
    }

    std::string jobs;
    int ended = 0;
    int failAt = 0; ///< the end of a document that fails; 0: none
};

PrintJob jobOf(TextView list, std::int16_t copies = 1)
{
    return { .allPages = list.empty(),
        .pages = pageNumbersOf(list),
        .copies = copies,
        .paperSize = 8,
        .orientation = 2 };
}

std::string printed(const PageDocument& document, const PrintJob& job)
{
    JobPrinter printer;
    const std::int64_t sent = doPrint(document, job, DefaultFont, printer);
    EXPECT_EQ(sent, pagesToSend(document, job));
    return printer.jobs;
}

const std::string Before = "paper 8; orientation 2; end; ";
const std::string After = "paper 9; orientation 1; ";

} // namespace

TEST(PrintPage, SendsTheRecordsWhereTheyStand)
{
    PageDocument document;
    addSampleRecords(document);
    addPages(document, 4);
    FakePrinter printer;
    printPage(document, 0, DefaultFont, printer);
    EXPECT_EQ(printer.log(),
        "font name Arial\nfont size 10.5\n"
        "draw width 1\ndraw style 0\nfore colour 255\nfill style 1\nline 0,0 500,0\n"
        "draw width 2\ndraw style 1\nfore colour 0\nfill colour 14737632\nfill style 0\n"
        "box 500,0 700,300 14737632\n"
        "fill style 1\n"
        "transparent 1\nbold 1\nitalic 0\nfont name Arial\nfont size 10.5\n"
        "fore colour 16711680\nx 500\ny 300\nprint Page 2 of 5, 5\n"
        "end doc\n");
}

TEST(PrintPage, SendsAnEmptyPageToo)
{
    const PageDocument document;
    FakePrinter printer;
    printPage(document, 0, DefaultFont, printer);
    EXPECT_EQ(printer.log(), "font name Arial\nfont size 10.5\nfill style 1\nend doc\n");
}

TEST(PrintPage, LeavesPicturesOut)
{
    PageDocument document;
    document.placePicture(0, { 1, 2, 30, 40, u"id", u"map.png" });
    FakePrinter printer;
    printPage(document, 0, DefaultFont, printer);
    EXPECT_EQ(printer.log().find("picture"), std::string::npos);
}

TEST(PrintPage, SendsNothingForAPageThatDoesNotExist)
{
    const PageDocument document;
    FakePrinter printer;
    for (const int page : { -1, 1 }) {
        EXPECT_EQ(errorOf([&] { printPage(document, page, DefaultFont, printer); }),
            ErrorNumber::SubscriptOutOfRange);
    }
    EXPECT_EQ(printer.log(), "");
}

TEST(DoPrint, PrintsCopyAfterCopyEachPageADocumentOfItsOwn)
{
    PageDocument document;
    addPages(document, 1);
    const std::string copy = "page 1; end; page 2; end; ";
    EXPECT_EQ(printed(document, jobOf(u"", 3)), Before + copy + copy + copy + After);
}

TEST(DoPrint, PrintsThePagesOfAList)
{
    PageDocument document;
    addPages(document, 4);
    EXPECT_EQ(printed(document, jobOf(u"2,9,x,3")), Before + "page 2; end; page 3; end; " + After);
    EXPECT_EQ(
        printed(document, jobOf(u"0,-1,,5,5")), Before + "page 5; end; page 5; end; " + After);
}

TEST(DoPrint, AppliesAndRestoresTheSettingsWithoutCopies)
{
    const PageDocument document;
    EXPECT_EQ(printed(document, jobOf(u"", 0)), Before + After);
    EXPECT_EQ(printed(document, jobOf(u"", -3)), Before + After);
}

TEST(DoPrint, NamesEachDocumentAfterItsPage)
{
    PageDocument document;
    addPages(document, 2);
    PrintJob job = jobOf(u"3");
    job.documentName = u"Orders";
    EXPECT_EQ(printed(document, job), Before + "Orders – page 3; end; " + After);
}

TEST(DoPrint, SkipsPagesThatAHostOnlyClaims)
{
    PageDocument document;
    document.Totalpages = 3;
    EXPECT_EQ(printed(document, jobOf(u"")), Before + "page 1; end; " + After);
    EXPECT_EQ(printed(document, jobOf(u"2,1")), Before + "page 1; end; " + After);
    document.Totalpages = 0;
    EXPECT_EQ(printed(document, jobOf(u"1")), Before + After);
}

TEST(DoPrint, EndsWithThePrintersErrorAndPutsItsSettingsBack)
{
    PageDocument document;
    addPages(document, 2);
    JobPrinter printer;
    printer.failAt = 3;
    std::int64_t sent = 0;
    PrintJob job = jobOf(u"");
    job.progress = [&](std::int64_t pages, std::int64_t) {
        sent = pages;
        return true;
    };
    EXPECT_EQ(
        errorOf([&] { doPrint(document, job, DefaultFont, printer); }), ErrorNumber::InvalidCall);
    EXPECT_EQ(printer.jobs, Before + "page 1; end; page 2; " + After);
    EXPECT_EQ(sent, 1);
}

TEST(DoPrint, SaysHowManyPagesWentOutBeforeThePrintersError)
{
    PageDocument document;
    addPages(document, 2);
    JobPrinter printer;
    printer.failAt = 3;
    try {
        doPrint(document, jobOf(u"", 2), DefaultFont, printer);
        FAIL() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_TRUE(error.text().ends_with(u"after 1 of 6 pages")) << error.what();
    }
}

TEST(DoPrint, ReportsEveryPageSentAndStopsWhenAsked)
{
    PageDocument document;
    addPages(document, 2);
    JobPrinter printer;
    std::vector<std::int64_t> steps;
    PrintJob job = jobOf(u"", 2);
    job.progress = [&](std::int64_t pages, std::int64_t wanted) {
        EXPECT_EQ(wanted, 6);
        steps.push_back(pages);
        return pages < 4;
    };
    EXPECT_EQ(
        errorOf([&] { doPrint(document, job, DefaultFont, printer); }), ErrorNumber::Cancelled);
    EXPECT_EQ(steps, (std::vector<std::int64_t> { 1, 2, 3, 4 }));
    EXPECT_EQ(printer.paper, 9);
    EXPECT_EQ(printer.direction, 1);
}

TEST(DoPrint, CountsItsPagesBeforehand)
{
    PageDocument document;
    addPages(document, 4);
    EXPECT_EQ(pagesToSend(document, jobOf(u"", 32767)), 5 * 32767);
    EXPECT_EQ(pagesToSend(document, jobOf(u"1,9,2", 2)), 4);
    EXPECT_EQ(pagesToSend(document, jobOf(u"", -1)), 0);
}

} // namespace pelloric
