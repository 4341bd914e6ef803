// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/settings_file.h"

#include "fakes/fake_platform.h"
#include "support/errors.h"
#include "support/file_size_limit.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

constexpr const char* FileName = "OstlConfig.ini";

/// A platform whose settings file holds the given bytes.
struct SettingsWorld : FakePlatform {
    explicit SettingsWorld(std::string_view bytes) { folder.write(FileName, bytes); }

    Text read(TextView key) { return readSetting(services(), key); }

    SaveOutcome write(TextView key, TextView value) { return writeSetting(services(), key, value); }

    std::string bytes() const { return folder.read(FileName); }
};

/// A code page in which 0x81 and the byte behind it, an ASCII letter's too, are one character.
class TwoByteCodec : public Utf8Codec {
public:
    Text decode(std::string_view bytes) const override
    {
        Text text;
        for (std::size_t at = 0; at < bytes.size(); ++at) {
            const bool pair = bytes[at] == '\x81';
            at += pair ? 1 : 0;
            text.push_back(pair ? u'乀' : static_cast<char16_t>(bytes[at]));
        }
        return text;
    }
};

} // namespace

TEST(SettingsFile, StandsInTheSystemDirectoryThatIsAskedForAtEveryCall)
{
    FakePlatform platform;
    EXPECT_EQ(settingsPath(platform.services()), platform.folder.file(FileName));
    platform.folders.directory = platform.folder.file("other");
    EXPECT_EQ(settingsPath(platform.services()), platform.folder.file("other") / FileName);
}

TEST(ReadSetting, TakesWhatFollowsTheFirstEqualsSignWithoutBlanksAtItsEnds)
{
    struct Row {
        const char* line;
        TextView value;
    };
    const Row rows[] = {
        { "Top= 12.5", u"12.5" },
        { "Top=   12.5  ", u"12.5" },
        { "Top=12.5", u"12.5" },
        { "Top = 12.5", u"12.5" },
        { "Top= a=b", u"a=b" },
        { "Top=", u"" },
        { "Top= \t1\t ", u"\t1\t" },
        { "  Top 7 ", u"Top 7" },
        { "the Top of= 3", u"3" },
        { "x=Top", u"Top" },
    };
    for (const Row& row : rows) {
        SettingsWorld world(std::string(row.line) + "\r\nLeft= 1\r\n");
        EXPECT_EQ(world.read(u"Top"), row.value) << row.line;
    }
}

TEST(ReadSetting, TakesTheFirstLineThatHoldsTheKeyAnywhere)
{
    SettingsWorld world("HeaderLeft= text\r\nLeft= 10\r\nPagerSizeValue= 9\r\nPagerSize= A4\r\n"
                        "HeaderFontName= 黑体\r\nFontName= 宋体\r\nFooterLeft= the Top\r\n"
                        "Top= 5\r\n");
    EXPECT_EQ(world.read(u"Left"), u"text");
    EXPECT_EQ(world.read(u"PagerSize"), u"9");
    EXPECT_EQ(world.read(u"FontName"), u"黑体");
    EXPECT_EQ(world.read(u"Top"), u"the Top");
}

TEST(ReadSetting, AnswersTheLastLineWhenNoneHoldsTheKey)
{
    EXPECT_EQ(SettingsWorld("Top= 5\r\nLeft= 6 \r\n").read(u"top"), u"Left= 6");
    EXPECT_EQ(SettingsWorld("\"\r\nTop= 5\r\n\"\r\n").read(u"Gone"), u"\"");
    EXPECT_EQ(SettingsWorld("Top= 5\r\n\r\n").read(u"Gone"), u"");
    EXPECT_EQ(SettingsWorld("").read(u"Top"), u"");
}

TEST(ReadSetting, EndsLinesAtCrLfAtLfAndAtCr)
{
    SettingsWorld world("A= 1\nB= 2\rC= 3\r\nE= 4");
    EXPECT_EQ(world.read(u"A"), u"1");
    EXPECT_EQ(world.read(u"B"), u"2");
    EXPECT_EQ(world.read(u"C"), u"3");
    EXPECT_EQ(world.read(u"E"), u"4");
}

TEST(ReadSetting, SearchesTheDecodedTextAndNotItsBytes)
{
    SettingsWorld world("HeaderLeft= \x81Top\r\nTop= 7\r\n");
    TwoByteCodec codec;
    const Platform& other = world.services();
    const Platform platform { other.metrics, codec, other.messages, other.loop, other.clock,
        other.folders, other.files, other.printer, other.printers, other.library };
    EXPECT_EQ(readSetting(platform, u"Top"), u"7");
    EXPECT_EQ(readSetting(platform, u"HeaderLeft"), u"乀op");
}

TEST(ReadSetting, FailsWithoutAFileAndNamesIt)
{
    FakePlatform platform;
    try {
        readSetting(platform.services(), u"Top");
        FAIL() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::FileNotFound);
        EXPECT_TRUE(contains(error.text(), u"OstlConfig.ini"));
    }
    EXPECT_EQ(platform.folder.names().size(), 0U);
}

TEST(ReadSetting, FailsWhereAFolderStandsInTheFilesPlace)
{
    FakePlatform platform;
    std::filesystem::create_directory(platform.folder.file(FileName));
    EXPECT_EQ(
        errorOf([&] { readSetting(platform.services(), u"Top"); }), ErrorNumber::FileNotFound);
}

TEST(ReadSetting, ReadsTheFileAfreshAtEveryCall)
{
    SettingsWorld world("Top= 1\r\n");
    EXPECT_EQ(world.read(u"Top"), u"1");
    world.folder.write(FileName, "Top= 2\r\n");
    EXPECT_EQ(world.read(u"Top"), u"2");
}

TEST(SettingsSnapshot, AnswersLikeReadSettingFromTheFileAsItWas)
{
    SettingsWorld world("HeaderLeft= a=b\r\nLeft= 2\r\n\"\r\n");
    const SettingsSnapshot snapshot(world.services());
    for (const TextView key : { u"Left", u"HeaderLeft", u"Gone" })
        EXPECT_EQ(snapshot.value(key), world.read(key));
    std::filesystem::remove(world.folder.file(FileName));
    EXPECT_EQ(snapshot.value(u"Left"), u"a=b");
    EXPECT_EQ(errorOf([&] { SettingsSnapshot(world.services()); }), ErrorNumber::FileNotFound);
}

TEST(ReadSettingsText, BeginsWithALineEndAndDropsEmptyAndQuotedLines)
{
    SettingsWorld world("\"\r\nTop= 1\n\n\"Left= 2\rRight= \"3\"\r\n \r\nlast");
    EXPECT_EQ(readSettingsText(world.services()), u"\r\nTop= 1\r\nRight= \"3\"\r\n \r\nlast\r\n");
    EXPECT_EQ(readSettingsText(SettingsWorld("").services()), u"\r\n");
    FakePlatform empty;
    EXPECT_EQ(errorOf([&] { readSettingsText(empty.services()); }), ErrorNumber::FileNotFound);
}

TEST(FindSettingLine, ReachesFromTheFirstOccurrenceToTheCr)
{
    EXPECT_EQ(findSettingLine(u"Top", u"\r\nTop= 10\r\nLeft= 5\r\n"), u"Top= 10");
    EXPECT_EQ(findSettingLine(u"Left", u"\r\nHeaderLeft= x\r\n"), u"Left= x");
    EXPECT_EQ(findSettingLine(u"Top", u"Top\r"), u"Top");
    EXPECT_EQ(findSettingLine(u"Top", u"Top= 1\nLeft= 2\r\n"), u"Top= 1\nLeft= 2");
}

TEST(FindSettingLine, FailsForAMissingKeyAndForATextWithoutCrBehindIt)
{
    for (const TextView text : { u"\r\nLeft= 10\r\n", u"", u"\r\n", u"Top= 10", u"\r\nTop= 10\n" })
        EXPECT_EQ(errorOf([&] { findSettingLine(u"Top", text); }), ErrorNumber::InvalidCall);
}

TEST(WriteSetting, RewritesOneLineAndQuotesTheWholeText)
{
    SettingsWorld world("Top=10\r\nLeft =5\r\n");
    EXPECT_EQ(world.write(u"Top", u"12.5"), SaveOutcome::Written);
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 12.5\r\nLeft =5\r\n\"\r\n");
    EXPECT_EQ(world.write(u"Left", u"宋体"), SaveOutcome::Written);
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 12.5\r\nLeft= 宋体\r\n\"\r\n");
    EXPECT_EQ(world.read(u"Left"), u"宋体");
}

TEST(WriteSetting, KeepsOnePairOfQuoteLinesHoweverOftenItSaves)
{
    SettingsWorld world("\"\r\nTop= 1\r\n\"\r\n");
    for (int times = 0; times < 3; ++times)
        world.write(u"Top", u"1");
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 1\r\n\"\r\n");
}

TEST(WriteSetting, LosesALineThatBeginsWithAQuote)
{
    SettingsWorld world("\"Left= 1\r\nTop= 2\r\n");
    world.write(u"Top", u"3");
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 3\r\n\"\r\n");
}

TEST(WriteSetting, ChangesTheOldLineWhereverItOccurs)
{
    SettingsWorld world("Left= 10\r\nHeaderLeft= 10\r\nx Left= 10 y\r\nFooterLeft= 100\r\n");
    world.write(u"Left", u"7");
    EXPECT_EQ(
        world.bytes(), "\"\r\nLeft= 7\r\nHeaderLeft= 7\r\nx Left= 7 y\r\nFooterLeft= 70\r\n\"\r\n");
}

TEST(WriteSetting, TakesAValueThatHoldsTheOldLine)
{
    SettingsWorld world("Top= 1\r\n");
    world.write(u"Top", u"Top= 1 Top= 1");
    EXPECT_EQ(world.bytes(), "\"\r\nTop= Top= 1 Top= 1\r\n\"\r\n");
}

TEST(WriteSetting, NeverAddsAKey)
{
    SettingsWorld world("Top= 1\r\n");
    EXPECT_EQ(world.write(u"Gone", u"5"), SaveOutcome::Written);
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 1\r\n\"\r\n");
}

TEST(WriteSetting, WritesAnEmptyFileAsItsQuotesAndLineEnd)
{
    SettingsWorld world("");
    world.write(u"Top", u"5");
    EXPECT_EQ(world.bytes(), "\"\r\n\"\r\n");
}

TEST(WriteSetting, MakesOfAMissingFileOneOfTwoQuotes)
{
    FakePlatform platform;
    EXPECT_EQ(writeSetting(platform.services(), u"Top", u"5"), SaveOutcome::Written);
    EXPECT_EQ(platform.folder.read(FileName), "\"\"\r\n");
}

TEST(WriteSetting, WritesAQuestionMarkForACharacterThatTheCodePageLacks)
{
    SettingsWorld world("Top= 1\r\n");
    world.codec.missing = u"€";
    world.write(u"Top", u"5 €");
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 5 ?\r\n\"\r\n");
}

TEST(WriteSetting, ShortensTheFileWhenTheTextGetsShorter)
{
    SettingsWorld world("\"\r\nTop= " + std::string(1000, 'x') + "\r\n\"\r\n");
    world.write(u"Top", u"1");
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 1\r\n\"\r\n");
    EXPECT_EQ(world.folder.names().size(), 1U);
}

TEST(WriteSetting, TellsThatItCannotWriteAndNeverThrows)
{
    FakePlatform platform;
    platform.folders.directory = platform.folder.file("gone");
    EXPECT_EQ(writeSetting(platform.services(), u"Top", u"5"), SaveOutcome::WriteFailed);
    EXPECT_EQ(platform.folder.names().size(), 0U);
}

TEST(WriteSetting, LeavesWhatItCannotReadAlone)
{
    FakePlatform platform;
    std::filesystem::create_directory(platform.folder.file(FileName));
    EXPECT_EQ(writeSetting(platform.services(), u"Top", u"5"), SaveOutcome::WriteFailed);
    EXPECT_TRUE(std::filesystem::is_directory(platform.folder.file(FileName)));
}

#if defined(__unix__)
TEST(WriteSetting, PutsTheOldTextBackWhenTheDiskIsFull)
{
    const std::string old = "\"\r\nTop= 1\r\nLeft= " + std::string(60, 'x') + "\r\n\"\r\n";
    SettingsWorld world(old);
    const Text longValue(500, u'y');
    SaveOutcome outcome = SaveOutcome::Written;
    {
        const FileSizeLimit limit(200);
        outcome = world.write(u"Top", longValue);
    }
    EXPECT_EQ(outcome, SaveOutcome::WriteFailed);
    EXPECT_EQ(world.bytes(), old);
}

TEST(WriteSetting, LeavesNoHalfFileWhenTheDiskIsFull)
{
    FakePlatform platform;
    SaveOutcome outcome = SaveOutcome::Written;
    {
        const FileSizeLimit limit(2);
        outcome = writeSetting(platform.services(), u"Top", u"1");
    }
    EXPECT_EQ(outcome, SaveOutcome::WriteFailed);
    EXPECT_EQ(platform.folder.names().size(), 0U);
}
#endif

TEST(BatchWrite, SkipsAMissingKeyOrWritesNothingAsThePolicySays)
{
    const SettingChange changes[] = { { u"Top", u"10" }, { u"Gone", u"5" }, { u"Left", u"20" } };
    SettingsWorld world("Top= 1\r\nLeft= 2\r\n");
    EXPECT_EQ(batchWrite(world.services(), changes, FailurePolicy::StopAtFirst),
        SaveOutcome::NothingWritten);
    EXPECT_EQ(world.bytes(), "Top= 1\r\nLeft= 2\r\n");
    EXPECT_EQ(batchWrite(world.services(), changes, FailurePolicy::SkipStep), SaveOutcome::Written);
    EXPECT_EQ(world.bytes(), "\"\r\nTop= 10\r\nLeft= 20\r\n\"\r\n");
}

TEST(BatchWrite, ReplacesOneKeyAfterTheOtherInOneText)
{
    const SettingChange changes[]
        = { { u"Left", u"a" }, { u"Top", u"Left= a" }, { u"Left", u"b" } };
    SettingsWorld world("Left= 1\r\nTop= 2\r\n");
    EXPECT_EQ(
        batchWrite(world.services(), changes, FailurePolicy::StopAtFirst), SaveOutcome::Written);
    EXPECT_EQ(world.bytes(), "\"\r\nLeft= b\r\nTop= Left= b\r\n\"\r\n");
}

TEST(BatchWrite, OfAMissingFileStopsOrMakesOneOfTwoQuotes)
{
    const SettingChange changes[] = { { u"Top", u"10" } };
    FakePlatform platform;
    EXPECT_EQ(batchWrite(platform.services(), changes, FailurePolicy::StopAtFirst),
        SaveOutcome::NothingWritten);
    EXPECT_EQ(platform.folder.names().size(), 0U);
    EXPECT_EQ(
        batchWrite(platform.services(), changes, FailurePolicy::SkipStep), SaveOutcome::Written);
    EXPECT_EQ(platform.folder.read(FileName), "\"\"\r\n");
}

#if defined(__unix__) // elsewhere no device stands among the files, so none is as long as one reads
TEST(SettingsFile, IsRefusedEarlyWhenItHasNoEnd)
{
    FakePlatform platform;
    std::filesystem::create_symlink("/dev/zero", platform.folder.file(FileName));
    EXPECT_EQ(errorOf([&] { readSetting(platform.services(), u"Top"); }), ErrorNumber::Overflow);
    EXPECT_NE(writeSetting(platform.services(), u"Top", u"1"), SaveOutcome::Written);
}
#endif

TEST(SettingsFile, LargerThanItMayBeIsNeitherReadNorReplaced)
{
    const std::string large = "Top= 1\r\n" + std::string(MostSettingsBytes, 'x');
    SettingsWorld world(large);
    EXPECT_EQ(errorOf([&] { world.read(u"Top"); }), ErrorNumber::Overflow);
    EXPECT_NE(world.write(u"Top", u"2"), SaveOutcome::Written);
    EXPECT_EQ(world.bytes().size(), large.size());
}

} // namespace pelloric
