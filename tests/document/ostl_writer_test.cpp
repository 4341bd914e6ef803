// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_writer.h"

#include "document/page_document.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "platform/safe_file.h"
#include "platform/std_files.h"
#include "support/errors.h"
#include "support/file_size_limit.h"

#include <gtest/gtest.h>

#include <sstream>

namespace pelloric {

namespace {

constexpr std::string_view Head = "\"\r\n"
                                  "##Release2004-10-23\r\n"
                                  "##Release2004-10-23PageWidth=11907\r\n"
                                  "##Release2004-10-23PageHeight=16840\r\n";

/// A document with what it takes to save it.
struct SavedWorld {
    void addLine(const LinePen& pen, Tpoint from, Tpoint to)
    {
        document.append(LineRecord { from, to, document.penNumber(pen) });
    }

    void addText(const TextStyle& style, Tpoint point, TextView text)
    {
        const TextView kept = document.store().add(text);
        document.append(TextRecord { point, kept.data(), static_cast<std::uint32_t>(kept.size()),
            document.styleNumber(style) });
    }

    std::string bytes(char16_t separator = u'.')
    {
        std::ostringstream stream;
        writeOstl(document, setup, { codec, separator }, {}, stream);
        return stream.str();
    }

    void save(const std::filesystem::path& path, const Progress& progress = {})
    {
        writeOstl(document, setup, { codec }, progress, SafeFile(files, path));
    }

    PageDocument document;
    PageSetup setup;
    Utf8Codec codec;
    StdFiles files;
};

std::string emptyPage(int index)
{
    return "##Release2004-10-23[" + std::to_string(index) + "]\r\n"
        + "##Release2004-10-23 PLine Begin\r\n##Release2004-10-23 PLine End\r\n"
          "##Release2004-10-23 Text Begin\r\n##Release2004-10-23 Text End\r\n";
}

} // namespace

TEST(OstlWriter, WritesOneLineAndOneTextAsLinesOfValues)
{
    SavedWorld world;
    world.addLine({}, { 1134, 1134 }, { 10773, 1134 });
    world.addText({}, { 1200, 1180 }, u"Page 1 of [Pages]");
    EXPECT_EQ(world.bytes(),
        std::string(Head)
            + "##Release2004-10-23[0]\r\n"
              "##Release2004-10-23 PLine Begin\r\n"
              "1\r\n0\r\n0\r\n1\r\n14737632\r\n1134\r\n1134\r\n10773\r\n1134\r\n"
              "##Release2004-10-23 PLine End\r\n"
              "##Release2004-10-23 Text Begin\r\n"
              "0\r\n0\r\n宋体\r\n11\r\n0\r\n1200\r\n1180\r\nPage 1 of 1\r\n"
              "##Release2004-10-23 Text End\r\n"
              "\"\r\n");
}

TEST(OstlWriter, WritesTheValuesOfARecordInTheirOrder)
{
    SavedWorld world;
    world.document.newPage();
    world.addLine({ .LineStyle = 2,
                      .LineColor = 16711680,
                      .LineWidth = 5,
                      .FillStyle = 0,
                      .FillColor = 16777215 },
        { -5, 0 }, { 70000, -1 });
    world.addText({ { u"Arial", 10.5F, true, true }, 255 }, { 70000, -1 }, u"[Pages][Pages]");
    world.addText({ { u"Arial", 7.29F, true, false }, -1 }, { 0, 2 }, u"");
    const std::string page = world.bytes().substr(Head.size() + emptyPage(0).size());
    EXPECT_EQ(page,
        "##Release2004-10-23[1]\r\n"
        "##Release2004-10-23 PLine Begin\r\n"
        "5\r\n2\r\n16711680\r\n0\r\n16777215\r\n-5\r\n0\r\n70000\r\n-1\r\n"
        "##Release2004-10-23 PLine End\r\n"
        "##Release2004-10-23 Text Begin\r\n"
        "1\r\n1\r\nArial\r\n10.5\r\n255\r\n70000\r\n-1\r\n22\r\n"
        "1\r\n0\r\nArial\r\n7.29\r\n-1\r\n0\r\n2\r\n\r\n"
        "##Release2004-10-23 Text End\r\n"
        "\"\r\n");
}

TEST(OstlWriter, WritesFontSizesWithTheSeparatorOfTheSystem)
{
    SavedWorld world;
    world.addText({ { u"宋体", 10.5F }, 0 }, {}, u"1.5");
    const std::string bytes = world.bytes(u',');
    EXPECT_NE(bytes.find("宋体\r\n10,5\r\n0\r\n0\r\n0\r\n1.5\r\n"), std::string::npos);
}

TEST(OstlWriter, WritesTextsAsTheyAreWithoutEscaping)
{
    SavedWorld world;
    world.addText({}, {}, u" \"a\r\nb\" ");
    EXPECT_NE(world.bytes().find("0\r\n \"a\r\nb\" \r\n##"), std::string::npos);
}

TEST(OstlWriter, StopsAfterPageIndex130WithTheTrueTotalInTheTexts)
{
    SavedWorld world;
    world.addText({}, {}, u"of [Pages]");
    for (int page = 1; page < 200; ++page)
        world.document.newPage();
    std::string expected;
    for (int page = 1; page <= 130; ++page)
        expected += emptyPage(page);
    const std::string bytes = world.bytes();
    EXPECT_NE(bytes.find("\r\nof 200\r\n"), std::string::npos);
    EXPECT_TRUE(bytes.ends_with("Text End\r\n" + expected + "\"\r\n"));
}

TEST(OstlWriter, TellsEveryPageBeforeItIsWritten)
{
    SavedWorld world;
    world.document.newPage();
    world.document.newPage();
    std::vector<std::pair<std::int64_t, std::int64_t>> steps;
    std::ostringstream stream;
    writeOstl(
        world.document, world.setup, { world.codec },
        [&](std::int64_t done, std::int64_t total) {
            steps.emplace_back(done, total);
            return true;
        },
        stream);
    EXPECT_EQ(steps,
        (std::vector<std::pair<std::int64_t, std::int64_t>> { { 0, 3 }, { 1, 3 }, { 2, 3 } }));
}

TEST(OstlWriter, WritesFewerOrNoPagesWhenTotalpagesSaysSo)
{
    SavedWorld world;
    world.document.newPage();
    world.document.Totalpages = 1;
    EXPECT_EQ(world.bytes(), std::string(Head) + emptyPage(0) + "\"\r\n");
    for (const std::int16_t none : { std::int16_t { 0 }, std::int16_t { -32768 } }) {
        world.document.Totalpages = none;
        EXPECT_EQ(world.bytes(), std::string(Head) + "\"\r\n");
    }
}

TEST(OstlWriter, PassesOverPagesThatDoNotExist)
{
    SavedWorld world;
    world.document.Totalpages = 2;
    EXPECT_EQ(world.bytes(), std::string(Head) + emptyPage(0) + "\"\r\n");
}

TEST(OstlWriter, ReplacesTheFileAndLeavesNoOther)
{
    const TempFolder folder;
    folder.write("a.ostl", std::string(100'000, 'x'));
    folder.write("a.ostl.saving0", "somebody's");
    SavedWorld world;
    world.save(folder.file("a.ostl"));
    EXPECT_EQ(folder.read("a.ostl"), world.bytes());
    EXPECT_EQ(folder.read("a.ostl.saving0"), "somebody's");
    EXPECT_EQ(folder.names().size(), 2U);
}

TEST(OstlWriter, WritesMoreThanItsBufferHolds)
{
    const TempFolder folder;
    SavedWorld world;
    for (int text = 0; text < 30'000; ++text)
        world.addText({}, { text, 0 }, u"a text that is recorded again and again");
    world.save(folder.file("a.ostl"));
    EXPECT_GT(world.bytes().size(), 2U << 20U);
    EXPECT_EQ(folder.read("a.ostl"), world.bytes());
}

TEST(OstlWriter, ChangesNothingWhenTheUserEndsTheSave)
{
    const TempFolder folder;
    folder.write("a.ostl", "old");
    SavedWorld world;
    const auto cancel = [](std::int64_t, std::int64_t) { return false; };
    EXPECT_EQ(errorOf([&] { world.save(folder.file("a.ostl"), cancel); }), ErrorNumber::Cancelled);
    EXPECT_EQ(folder.read("a.ostl"), "old");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(OstlWriter, TellsWhichFileItCannotWrite)
{
    const TempFolder folder;
    SavedWorld world;
    try {
        world.save(folder.file("gone") / "a.ostl");
        FAIL() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::WriteFailed);
        EXPECT_TRUE(contains(error.text(), u"a.ostl"));
    }
    EXPECT_EQ(errorOf([&] { world.save(folder.path()); }), ErrorNumber::WriteFailed);
    EXPECT_EQ(errorOf([&] { world.save({}); }), ErrorNumber::WriteFailed);
}

TEST(OstlWriter, SavesUnderANameThatLeavesNoRoomForAnother)
{
    const TempFolder folder;
    const std::string name(255, 'n');
    SavedWorld world;
    world.save(folder.file(name));
    EXPECT_EQ(folder.read(name), world.bytes());
    world.document.newPage();
    world.save(folder.file(name));
    EXPECT_EQ(folder.read(name), world.bytes());
}

#if defined(__unix__)
TEST(OstlWriter, ChangesNothingWhenTheDiskIsFull)
{
    const TempFolder folder;
    folder.write("a.ostl", "old");
    SavedWorld world;
    std::optional<ErrorNumber> error;
    {
        const FileSizeLimit limit(50);
        error = errorOf([&] { world.save(folder.file("a.ostl")); });
    }
    EXPECT_EQ(error, ErrorNumber::DiskFull);
    EXPECT_EQ(folder.read("a.ostl"), "old");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(OstlWriter, FollowsALinkAndKeepsTheRightsOfTheFile)
{
    namespace fs = std::filesystem;
    const TempFolder folder;
    folder.write("a.ostl", "old");
    constexpr fs::perms rights = fs::perms::owner_read | fs::perms::owner_write;
    fs::permissions(folder.file("a.ostl"), rights);
    fs::create_symlink(folder.file("a.ostl"), folder.file("link"));
    SavedWorld world;
    world.save(folder.file("link"));
    EXPECT_TRUE(fs::is_symlink(folder.file("link")));
    EXPECT_EQ(folder.read("a.ostl"), world.bytes());
    EXPECT_EQ(fs::status(folder.file("a.ostl")).permissions(), rights);
}

TEST(OstlWriter, WritesToADeviceDirectly)
{
    SavedWorld world;
    EXPECT_EQ(errorOf([&] { world.save("/dev/null"); }), std::nullopt);
    EXPECT_EQ(errorOf([&] { world.save("/dev/full"); }), ErrorNumber::DiskFull);
    EXPECT_TRUE(std::filesystem::is_character_file("/dev/null"));
}
#endif

} // namespace pelloric
