// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_reader.h"

#include "document/ostl_writer.h"
#include "document/page_document.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "platform/safe_file.h"
#include "platform/std_files.h"
#include "support/errors.h"

#include <gtest/gtest.h>

#include <sstream>

namespace pelloric {

namespace {

const std::string Head = "\"\r\n##Release2004-10-23\r\n"
                         "##Release2004-10-23PageWidth=5000\r\n"
                         "##Release2004-10-23PageHeight=6000\r\n";
const std::string LineValues = "1\r\n0\r\n0\r\n1\r\n14737632\r\n10\r\n20\r\n30\r\n40\r\n";

std::string textValues(const std::string& text)
{
    return "0\r\n0\r\n宋体\r\n11\r\n0\r\n1200\r\n1180\r\n" + text + "\r\n";
}

std::string pageBlock(const std::string& number, const std::string& lines, const std::string& texts)
{
    return "##Release2004-10-23[" + number + "]\r\n##Release2004-10-23 PLine Begin\r\n" + lines
        + "##Release2004-10-23 PLine End\r\n##Release2004-10-23 Text Begin\r\n" + texts
        + "##Release2004-10-23 Text End\r\n";
}

/// What came of reading some bytes.
struct OpenedWorld {
    explicit OpenedWorld(const std::string& bytes)
    {
        std::istringstream stream(bytes);
        error = errorOf([&] { result = readOstl(codec, stream, document, setup); });
    }

    /// The texts of a page, each followed by "|".
    Text texts(int page) const
    {
        Text all;
        for (const TextRecord record : document.texts(page))
            all.append(record.text()).append(u"|");
        return all;
    }

    std::optional<OstlResult> result;
    std::optional<ErrorNumber> error;
    PageDocument document;
    PageSetup setup;
    Utf8Codec codec;
};

void expectUnchanged(const OpenedWorld& world)
{
    EXPECT_EQ(world.setup, PageSetup());
    EXPECT_EQ(world.document.pageCount(), 1);
    EXPECT_EQ(world.document.lines(0).size() + world.document.texts(0).size(), 0U);
}

} // namespace

TEST(OstlReader, ReadsLinesAndTexts)
{
    const OpenedWorld world(
        Head + pageBlock("0", LineValues, textValues("Page 1 of 1")) + "\"\r\n");
    EXPECT_EQ(world.result, OstlResult::Opened);
    EXPECT_EQ(world.setup.myWidth, 5000);
    EXPECT_EQ(world.setup.myHeight, 6000);
    ASSERT_EQ(world.document.lines(0).size(), 1U);
    EXPECT_EQ(
        world.document.line(0, 0), (Lineobj { { 10, 20 }, { 30, 40 }, 0, 0, 1, 1, 14737632 }));
    ASSERT_EQ(world.document.texts(0).size(), 1U);
    EXPECT_EQ(world.document.text(0, 0),
        (Textobj { { 1200, 1180 }, u"Page 1 of 1", { .name = u"0", .size = 11 }, 0 }));
}

TEST(OstlReader, TakesNumericPrefixesAndRoundsHalfToEven)
{
    const OpenedWorld world("##Release2004-10-23\n"
                            "##Release2004-10-23PageWidth=  7000abc\n"
                            "##Release2004-10-23PageHeight=8000.5\n"
        + pageBlock("0", "2.5\r\nx\r\n-1\r\n  1\r\n\r\n1.5\r\n-2.5\r\n12,9\r\n3 4\r\n",
            "2\r\n-0.5\r\nn\r\n10.25pt\r\n7x\r\n0.5\r\n-1.5\r\n  t  \r\n"));
    EXPECT_EQ(world.setup.myWidth, 7000);
    EXPECT_EQ(world.setup.myHeight, 8000);
    EXPECT_EQ(world.document.line(0, 0), (Lineobj { { 2, -2 }, { 12, 3 }, 0, -1, 2, 1, 0 }));
    EXPECT_EQ(
        world.document.text(0, 0), (Textobj { { 0, -2 }, u"t", { u"0", 10.25F, true, true }, 7 }));
}

TEST(OstlReader, TurnsTheNumberOfTheFontsLineBackIntoText)
{
    struct Row {
        const char* line;
        TextView name;
    };
    const Row rows[] = { { "宋体", u"0" }, { "Arial", u"0" }, { "", u"0" }, { "12Font", u"12" },
        { " 7.50 x", u"7.5" }, { "-3", u"-3" }, { "007", u"7" } };
    for (const Row& row : rows) {
        const OpenedWorld world(Head
            + pageBlock(
                "0", "", "0\r\n0\r\n" + std::string(row.line) + "\r\n9\r\n0\r\n1\r\n2\r\nx\r\n"));
        EXPECT_EQ(world.document.text(0, 0).prnFont.name, row.name) << row.line;
    }
}

TEST(OstlReader, TrimsBlanksOnlyFromTexts)
{
    const OpenedWorld world(Head
        + pageBlock("0", "",
            textValues("  a b ") + textValues("\t宋 ") + textValues("   ") + textValues("")
                + textValues("　x")));
    EXPECT_EQ(world.texts(0), u"a b|\t宋|||　x|");
}

TEST(OstlReader, AddsAPageForEveryNumberAboveZero)
{
    std::string bytes = Head;
    for (const char* number : { "0", "5", "2", "2", "0.4", "x", "-3", "0", " 1 ", "7" })
        bytes += pageBlock(number, "", textValues(number));
    const OpenedWorld world(bytes);
    EXPECT_EQ(world.document.pageCount(), 7);
    EXPECT_EQ(world.document.Totalpages, 7);
    EXPECT_EQ(world.texts(0), u"0|");
    EXPECT_EQ(world.texts(3), u"2|");
    EXPECT_EQ(world.texts(4), u"0.4|x|-3|0|");
    EXPECT_EQ(world.texts(6), u"7|");
}

TEST(OstlReader, OpensAFileOfOnlyAHeaderAsOneEmptyPage)
{
    for (const std::string& bytes : { Head, Head + "\"\r\n", Head.substr(0, Head.size() - 2) }) {
        const OpenedWorld world(bytes);
        EXPECT_EQ(world.result, OstlResult::Opened);
        EXPECT_EQ(world.setup.myHeight, 6000);
        EXPECT_EQ(world.document.pageCount(), 1);
    }
}

TEST(OstlReader, RefusesABadHeaderAndChangesNothing)
{
    const std::string tag = "##Release2004-10-23\r\n";
    const std::string width = "##Release2004-10-23PageWidth=5000\r\n";
    const std::string height = "##Release2004-10-23PageHeight=6000\r\n";
    const std::string page = pageBlock("1", LineValues, textValues("x"));
    const std::string files[]
        = { "", "\"\r\n", width + height + page, "##Release2004-10-23 \r\n" + width + height + page,
              tag, tag + width, tag + height + width + page, tag + "\r\n" + width + height + page,
              tag + width + page, tag + width + "##Release2004-10-23pageheight=1\r\n" + page };
    for (const std::string& bytes : files) {
        const OpenedWorld world(bytes);
        EXPECT_EQ(world.result, OstlResult::BadHeader) << bytes;
        expectUnchanged(world);
    }
}

TEST(OstlReader, TakesMarkersAnywhereInTheirLinesAndValuesBehindTheFirstSign)
{
    const OpenedWorld world("junk\r\n##Release2004-10-23\r\n"
                            "x##Release2004-10-23PageWidth=70=80\r\n"
                            "a=9b##Release2004-10-23PageHeight=60\r\n"
                            "between\r\n"
                            "[0]##Release2004-10-23[1]\r\n" // the first "[" counts: page 0
                            "junk\r\n x##Release2004-10-23 PLine Beginx\r\n"
                            "##Release2004-10-23 PLine End\r\n"
                            "junk\r\n x##Release2004-10-23 Text Beginx\r\n"
        + textValues("t") + "##Release2004-10-23 Text End\r\n");
    EXPECT_EQ(world.result, OstlResult::Opened);
    EXPECT_EQ(world.setup.myWidth, 70);
    EXPECT_EQ(world.setup.myHeight, 9);
    EXPECT_EQ(world.document.pageCount(), 1);
    EXPECT_EQ(world.texts(0), u"t|");
}

TEST(OstlReader, DropsARecordThatIsCutOffAndKeepsWhatCameBefore)
{
    const std::string lines
        = Head + "##Release2004-10-23[0]\r\n##Release2004-10-23 PLine Begin\r\n";
    const std::string texts = lines + LineValues
        + "##Release2004-10-23 PLine End\r\n##Release2004-10-23 Text Begin\r\n";
    std::string cut = lines + LineValues;
    for (int value = 0; value < 8; ++value) {
        cut += "7\r\n";
        const OpenedWorld world(cut);
        EXPECT_EQ(world.result, OstlResult::Opened);
        EXPECT_EQ(world.document.lines(0).size(), 1U);
    }
    EXPECT_EQ(OpenedWorld(cut + "7").document.lines(0).size(), 2U);
    cut = texts + textValues("whole");
    for (int value = 0; value < 7; ++value) {
        cut += "7\r\n";
        const OpenedWorld world(cut);
        EXPECT_EQ(world.result, OstlResult::Opened);
        EXPECT_EQ(world.texts(0), u"whole|");
    }
    EXPECT_EQ(OpenedWorld(cut + "last").texts(0), u"whole|last|");
}

TEST(OstlReader, EndsQuietlyWhereverTheFileIsCutOff)
{
    const std::string bytes = Head + pageBlock("0", LineValues, textValues("a"))
        + pageBlock("1", LineValues, "") + "\"";
    for (std::size_t size = 0; size < bytes.size(); ++size) {
        const OpenedWorld world(bytes.substr(0, size));
        EXPECT_EQ(world.error, std::nullopt) << size;
        EXPECT_LE(world.document.pageCount(), 2);
    }
}

TEST(OstlReader, FailsAtANumberThatIsTooLargeAndKeepsWhatCameBefore)
{
    const std::string line = "1\r\n0\r\n0\r\n1\r\n0\r\n";
    const std::string text = "0\r\n0\r\nA\r\n";
    const std::string files[] = {
        pageBlock("0", "32768\r\n", ""),
        pageBlock("0", "1\r\n-32769\r\n", ""),
        pageBlock("0", line + "2147483648\r\n", ""),
        pageBlock("0", line + "1e999\r\n", ""),
        pageBlock("0", "", text + "1e39\r\n"),
        pageBlock("0", "", text + "9\r\n-2147483649\r\n"),
    };
    for (const std::string& page : files) {
        const OpenedWorld world(Head + pageBlock("0", LineValues, textValues("before")) + page);
        EXPECT_EQ(world.error, ErrorNumber::Overflow) << page;
        EXPECT_EQ(world.setup.myWidth, 5000);
        EXPECT_EQ(world.document.lines(0).size(), 1U);
        EXPECT_EQ(world.texts(0), u"before|");
    }
}

TEST(OstlReader, FailsAtAPaperThatIsTooLargeBeforeAnythingChanges)
{
    const OpenedWorld world("##Release2004-10-23\r\n##Release2004-10-23PageWidth=5\r\n"
                            "##Release2004-10-23PageHeight=1e10\r\n");
    EXPECT_EQ(world.error, ErrorNumber::Overflow);
    expectUnchanged(world);
}

TEST(OstlReader, FailsAtThePageAfterNumber32767)
{
    const std::string page = "##Release2004-10-23[1]\r\n##Release2004-10-23 PLine Begin\r\n"
                             "##Release2004-10-23 PLine End\r\n##Release2004-10-23 Text Begin\r\n"
                             "##Release2004-10-23 Text End\r\n";
    std::string bytes = Head;
    for (int number = 1; number <= 32766; ++number)
        bytes += page;
    const OpenedWorld most(bytes);
    EXPECT_EQ(most.error, std::nullopt);
    EXPECT_EQ(most.document.Totalpages, 32767);
    const OpenedWorld tooMany(bytes + page);
    EXPECT_EQ(tooMany.error, ErrorNumber::Overflow);
    EXPECT_EQ(tooMany.document.Totalpages, 32767);
}

TEST(OstlReader, TakesTextsAndJunkOfAnyLength)
{
    const std::string text(2'000'000, 'x');
    const OpenedWorld world(
        std::string(1'000'000, '#') + "\r" + Head + pageBlock("0", "", textValues(text)));
    EXPECT_EQ(world.result, OstlResult::Opened);
    EXPECT_EQ(world.document.texts(0)[0].length, text.size());
}

TEST(OstlReader, BringsBackWhatWasSavedButTheFontNames)
{
    const TempFolder folder;
    const Utf8Codec codec;
    const std::string bytes = "\"\r\n" + Head.substr(3)
        + pageBlock("0", LineValues, "1\r\n0\r\n0\r\n7.29\r\n255\r\n-5\r\n70000\r\n字 x\r\n")
        + pageBlock("1", "", "0\r\n1\r\n0\r\n10.5\r\n0\r\n1\r\n2\r\n\r\n") + "\"\r\n";
    folder.write("a.ostl", bytes);
    PageDocument document;
    PageSetup setup;
    EXPECT_EQ(readOstl(codec, folder.file("a.ostl"), document, setup), OstlResult::Opened);
    StdFiles files;
    writeOstl(document, setup, { codec }, {}, SafeFile(files, folder.file("b.ostl")));
    EXPECT_EQ(folder.read("b.ostl"), bytes);
}

TEST(OstlReader, FailsForAFileThatIsMissingOrNoFile)
{
    const TempFolder folder;
    const Utf8Codec codec;
    for (const auto& path : { folder.file("gone.ostl"), folder.path() }) {
        PageDocument document;
        PageSetup setup;
        EXPECT_EQ(
            errorOf([&] { readOstl(codec, path, document, setup); }), ErrorNumber::FileNotFound);
        EXPECT_EQ(setup, PageSetup());
    }
}

#if defined(__linux__)
TEST(OstlReader, RefusesADeviceThatNeverEnds)
{
    const Utf8Codec codec;
    PageDocument document;
    PageSetup setup;
    try {
        readOstl(codec, std::filesystem::path("/dev/zero"), document, setup);
        FAIL() << "it has an end";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::Overflow);
        EXPECT_EQ(
            toUtf8(error.detail()), "/dev/zero is damaged: a line holds more than 268435456 bytes");
    }
    EXPECT_EQ(setup, PageSetup());
}
#endif

} // namespace pelloric
