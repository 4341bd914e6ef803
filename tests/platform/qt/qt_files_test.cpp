// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_files.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "support/child_process.h"
#include "support/errors.h"
#include "support/file_size_limit.h"
#include "support/other_user.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <sys/stat.h>
#include <thread>

namespace pelloric::qt {

namespace {

namespace fs = std::filesystem;

void save(const fs::path& path, std::string_view bytes)
{
    QtFiles files;
    SafeFile file(files, path);
    file.write(bytes);
    file.putInPlace();
}

std::vector<fs::path> hiddenFiles(const TempFolder& folder)
{
    std::vector<fs::path> paths;
    for (const std::string& name : folder.names()) {
        if (name.starts_with(".pelloric-"))
            paths.push_back(folder.file(name));
    }
    return paths;
}

unsigned modeOf(const fs::path& path)
{
    struct stat status { };
    EXPECT_EQ(::stat(path.c_str(), &status), 0) << path;
    return status.st_mode & 07777U;
}

} // namespace

TEST(QtFiles, GiveANewFileTheRightsOfTheOldOneFromItsFirstByteOn)
{
    const TempFolder folder;
    for (const unsigned mode : { 0600U, 0640U, 0664U }) {
        folder.write("a", "old");
        ::chmod(folder.file("a").c_str(), mode);
        QtFiles files;
        SafeFile file(files, folder.file("a"));
        ASSERT_EQ(hiddenFiles(folder).size(), 1U);
        EXPECT_EQ(modeOf(hiddenFiles(folder).front()), mode);
        file.write("new");
        file.putInPlace();
        EXPECT_EQ(modeOf(folder.file("a")), mode);
        EXPECT_EQ(folder.read("a"), "new");
    }
}

TEST(QtFiles, GiveAFileThatIsNewTheRightsThatTheUserHasChosen)
{
    const TempFolder folder;
    const mode_t old = ::umask(027);
    save(folder.file("a"), "new");
    ::umask(old);
    EXPECT_EQ(modeOf(folder.file("a")), 0640U);
}

TEST(QtFiles, NeverWriteThroughALinkOfTheNameThatTheyMake)
{
    const TempFolder folder;
    folder.write("foreign", "foreign");
    const fs::path path = folder.file(".pelloric-0-0.saving");
    fs::create_symlink("foreign", path);
    QtFiles files;
    EXPECT_EQ(files.create(path, std::nullopt).fault, FileFault::Exists);
    EXPECT_EQ(files.create(path, std::nullopt).file, nullptr);
    EXPECT_EQ(folder.read("foreign"), "foreign");
}

TEST(QtFiles, TellAFullDiskFromMissingRights)
{
    const TempFolder folder;
    std::optional<ErrorNumber> error;
    {
        const FileSizeLimit limit(50);
        error = errorOf([&] { save(folder.file("a"), std::string(100, 'n')); });
    }
    EXPECT_EQ(error, ErrorNumber::DiskFull);
    EXPECT_EQ(errorOf([&] { save("/dev/full", "new"); }), ErrorNumber::DiskFull);
    folder.write("a", "old");
    ::chmod(folder.file("a").c_str(), 0444);
    ::chmod(folder.path().c_str(), 0777);
    {
        const OtherUser user;
        error = errorOf([&] { save(folder.file("a"), "new"); });
    }
    EXPECT_EQ(error, ErrorNumber::PermissionDenied);
    EXPECT_EQ(folder.read("a"), "old");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(QtFiles, RewriteAFileInAFolderThatTakesNoOther)
{
    const TempFolder folder;
    folder.write("a", "old content");
    ::chmod(folder.file("a").c_str(), 0666);
    ::chmod(folder.path().c_str(), 0555);
    std::optional<ErrorNumber> missing;
    {
        const OtherUser user;
        EXPECT_EQ(errorOf([&] { save(folder.file("a"), "new"); }), std::nullopt);
        missing = errorOf([&] { save(folder.file("b"), "new"); });
    }
    ::chmod(folder.path().c_str(), 0755);
    EXPECT_EQ(folder.read("a"), "new");
    EXPECT_EQ(missing, ErrorNumber::PermissionDenied);
}

TEST(QtFiles, SweepUpWhatAKilledProgramLeftAndNothingThatIsInUse)
{
    const TempFolder folder;
    const Child child([&] {
        QtFiles files;
        const SavingGroup group;
        SafeFile first(files, folder.file("a"), group);
        SafeFile second(files, folder.file("b"), group);
        first.write("half");
        second.close();
        folder.write("ready", "");
        for (;;)
            ::pause();
    });
    while (!fs::exists(folder.file("ready")))
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    EXPECT_EQ(hiddenFiles(folder).size(), 2U);
    save(folder.file("c"), "new");
    EXPECT_EQ(hiddenFiles(folder).size(), 2U);
    child.killAfter({});
    EXPECT_EQ(child.wait(), -1);
    save(folder.file("c"), "newer");
    EXPECT_EQ(hiddenFiles(folder).size(), 0U);
    EXPECT_EQ(folder.read("c"), "newer");
}

TEST(QtFiles, HoldTheOldOrTheNewContentWheneverAWriterIsKilled)
{
    const TempFolder folder;
    const std::string old(200'000, 'o');
    const std::string fresh(300'000, 'n');
    save(folder.file("a"), old);
    for (int round = 0; round < 100; ++round) {
        const Child child([&] {
            for (;;) {
                save(folder.file("a"), fresh);
                save(folder.file("a"), old);
            }
        });
        child.killAfter(std::chrono::microseconds(200 + 97 * round % 5000));
        ASSERT_EQ(child.wait(), -1);
        const std::string content = folder.read("a");
        ASSERT_TRUE(content == old || content == fresh) << content.size();
    }
    save(folder.file("a"), "end");
    EXPECT_EQ(folder.names(), std::vector<std::string> { "a" });
}

TEST(QtFiles, LetEightWritersOfOneFileEachWriteItWhole)
{
    const TempFolder folder;
    const auto content
        = [](int writer) { return std::string(500'000, static_cast<char>('a' + writer)); };
    std::vector<Child> children;
    for (int writer = 0; writer < 8; ++writer) {
        children.emplace_back([&, writer] {
            for (int round = 0; round < 50; ++round)
                save(folder.file("a"), content(writer));
        });
    }
    for (const Child& child : children)
        EXPECT_EQ(child.wait(), 0);
    const std::string end = folder.read("a");
    ASSERT_FALSE(end.empty());
    EXPECT_EQ(end, content(end.front() - 'a'));
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(QtFiles, ReplaceAFileWhoseNameIsNoText)
{
    const TempFolder folder;
    const fs::path path = folder.path() / "\xFF\xFE.txt";
    save(path, "first");
    save(path, "second");
    EXPECT_EQ(TempFolder::bytesOf(path), "second");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(QtFiles, LockAFolderAgainstOtherPrograms)
{
    const TempFolder folder;
    folder.write("count", "0");
    const auto count = [&] {
        for (int round = 0; round < 50; ++round) {
            QtFiles files;
            const auto lock = files.lock(folder.path());
            if (lock == nullptr)
                throw RunTimeError(ErrorNumber::WriteFailed);
            save(folder.file("count"), std::to_string(std::stoi(folder.read("count")) + 1));
        }
    };
    const Child first(count);
    const Child second(count);
    EXPECT_EQ(first.wait(), 0);
    EXPECT_EQ(second.wait(), 0);
    EXPECT_EQ(folder.read("count"), "100");
    EXPECT_EQ(QtFiles().lock(folder.file("gone")), nullptr);
}

} // namespace pelloric::qt
