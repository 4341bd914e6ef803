// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/safe_file.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "platform/std_files.h"
#include "support/errors.h"
#include "support/file_size_limit.h"

#include <gtest/gtest.h>

#include <chrono>

namespace pelloric {

namespace {

namespace fs = std::filesystem;

void save(FileSystem& files, const fs::path& path, std::string_view bytes)
{
    SafeFile file(files, path);
    file.write(bytes);
    file.putInPlace();
}

/// Files of a folder that takes no new one.
class FullFolder : public FileSystem {
public:
    OpenedFile create(const fs::path&, const std::optional<fs::path>&) override
    {
        return { nullptr, FileFault::NoRights };
    }
    OpenedFile open(const fs::path& path) override { return files_.open(path); }
    OpenedFile openDevice(const fs::path& path) override { return files_.openDevice(path); }
    OpenedFile spool() override { return files_.spool(); }
    void removeAbandoned(std::span<const fs::path> files) override
    {
        files_.removeAbandoned(files);
    }
    void syncFolder(const fs::path& folder) override { files_.syncFolder(folder); }
    std::unique_ptr<FolderLock> lock(const fs::path& folder) override
    {
        return files_.lock(folder);
    }

private:
    StdFiles files_;
};

/// A file on a disk that takes some bytes more, once they are written over.
class LimitedFile : public OpenFile {
public:
    LimitedFile(std::unique_ptr<OpenFile> file, std::size_t room)
        : file_(std::move(file))
        , room_(room)
    {
    }

    bool write(std::string_view bytes) override
    {
        isFull_ = !isFull_ && bytes.size() > room_;
        return file_->write(isFull_ ? bytes.substr(0, room_) : bytes) && !isFull_;
    }
    std::size_t read(std::span<char> buffer) override { return file_->read(buffer); }
    bool rewind() override { return file_->rewind(); }
    bool truncate() override { return file_->truncate(); }
    bool sync() override { return file_->sync(); }
    FileFault fault() const override { return isFull_ ? FileFault::DiskFull : file_->fault(); }

private:
    std::unique_ptr<OpenFile> file_;
    std::size_t room_;
    bool isFull_ = false;
};

/// The same, and what is there can take some bytes only.
class FullDisk final : public FullFolder {
public:
    OpenedFile open(const fs::path& path) override
    {
        return { std::make_unique<LimitedFile>(FullFolder::open(path).file, 5), FileFault::None };
    }
};

fs::path leftover(const TempFolder& folder, std::string_view bytes)
{
    return folder.write((SavingGroup().name()).string(), bytes);
}

} // namespace

TEST(SafeFile, TakesItsPlaceWhenItIsPutThere)
{
    const TempFolder folder;
    folder.write("a", "old");
    StdFiles files;
    SafeFile file(files, folder.file("a"));
    file.write("new ");
    file.write("content");
    EXPECT_EQ(folder.read("a"), "old");
    EXPECT_EQ(folder.names().size(), 2U);
    file.putInPlace();
    EXPECT_EQ(folder.read("a"), "new content");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(SafeFile, LeavesWhatThereWasUnlessItIsPutInPlace)
{
    const TempFolder folder;
    folder.write("a", "old");
    StdFiles files;
    for (const char* name : { "a", "b" })
        SafeFile(files, folder.file(name)).write("new");
    EXPECT_EQ(folder.read("a"), "old");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(SafeFile, TakesAnyNameThatTheDiskTakes)
{
    const TempFolder folder;
    const std::string name(255, 'n');
    StdFiles files;
    for (const char* content : { "new", "newer" }) {
        save(files, folder.file(name), content);
        EXPECT_EQ(folder.read(name), content);
    }
}

TEST(SafeFile, RefusesAFolderAnEmptyNameAndAFolderThatIsMissing)
{
    const TempFolder folder;
    StdFiles files;
    for (const fs::path& path : { folder.path(), fs::path(), folder.file("gone") / "a" }) {
        try {
            SafeFile file(files, path);
            ADD_FAILURE() << path;
        } catch (const RunTimeError& error) {
            EXPECT_EQ(error.number(), ErrorNumber::WriteFailed);
            EXPECT_TRUE(contains(error.text(), fromUtf8(path.filename().string())));
        }
    }
    EXPECT_EQ(folder.names().size(), 0U);
}

TEST(SafeFile, RewritesTheFileInAFolderThatTakesNoOther)
{
    const TempFolder folder;
    folder.write("a", std::string(1000, 'o'));
    FullFolder files;
    save(files, folder.file("a"), "new");
    EXPECT_EQ(folder.read("a"), "new");
    EXPECT_EQ(
        errorOf([&] { save(files, folder.file("b"), "new"); }), ErrorNumber::PermissionDenied);
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(SafeFile, PutsTheOldContentBackWhenTheDiskDoesNotTakeTheNewOne)
{
    const TempFolder folder;
    folder.write("a", "old");
    FullDisk files;
    EXPECT_EQ(errorOf([&] { save(files, folder.file("a"), "too long"); }), ErrorNumber::DiskFull);
    EXPECT_EQ(folder.read("a"), "old");
}

TEST(SafeFile, SweepsUpWhatWasLeftADayAgo)
{
    const TempFolder folder;
    const fs::path old = leftover(folder, "half");
    const fs::path fresh = leftover(folder, "half");
    folder.write(".pelloric-notes.saving", "somebody's");
    fs::last_write_time(old, fs::last_write_time(old) - std::chrono::hours(25));
    StdFiles files;
    save(files, folder.file("a"), "new");
    EXPECT_FALSE(fs::exists(old));
    EXPECT_TRUE(fs::exists(fresh));
    EXPECT_EQ(folder.read(".pelloric-notes.saving"), "somebody's");
}

TEST(SafeFile, OfAGroupMayBeClosedBeforeItIsPutInPlace)
{
    const TempFolder folder;
    StdFiles files;
    const SavingGroup group;
    SafeFile first(files, folder.file("a"), group);
    SafeFile second(files, folder.file("b"), group);
    first.write("one");
    second.write("two");
    second.close();
    EXPECT_FALSE(fs::exists(folder.file("b")));
    second.putInPlace();
    first.putInPlace();
    EXPECT_EQ(folder.read("a"), "one");
    EXPECT_EQ(folder.read("b"), "two");
    EXPECT_EQ(folder.names().size(), 2U);
}

TEST(StdFiles, MakeNoFileInThePlaceOfAnother)
{
    const TempFolder folder;
    folder.write("a", "old");
    StdFiles files;
    const OpenedFile made = files.create(folder.file("a"), std::nullopt);
    EXPECT_FALSE(made.file);
    EXPECT_EQ(made.fault, FileFault::Exists);
    EXPECT_EQ(folder.read("a"), "old");
}

#if defined(__unix__)
TEST(SafeFile, FollowsALinkEvenToAFileThatIsNotThereYet)
{
    const TempFolder folder;
    fs::create_symlink("b", folder.file("a"));
    fs::create_symlink(folder.file("a"), folder.file("first"));
    StdFiles files;
    for (const char* content : { "new", "newer" }) {
        save(files, folder.file("first"), content);
        EXPECT_TRUE(fs::is_symlink(folder.file("first")));
        EXPECT_TRUE(fs::is_symlink(folder.file("a")));
        EXPECT_EQ(folder.read("b"), content);
    }
    EXPECT_EQ(folder.names().size(), 3U);
}

TEST(SafeFile, RefusesARingOfLinks)
{
    const TempFolder folder;
    fs::create_symlink("b", folder.file("a"));
    fs::create_symlink("a", folder.file("b"));
    StdFiles files;
    EXPECT_EQ(errorOf([&] { save(files, folder.file("a"), "new"); }), ErrorNumber::WriteFailed);
    EXPECT_TRUE(fs::is_symlink(folder.file("a")));
    EXPECT_EQ(folder.names().size(), 2U);
}

TEST(SafeFile, ChangesNothingWhenTheDiskIsFull)
{
    const TempFolder folder;
    folder.write("a", "old");
    StdFiles files;
    std::optional<ErrorNumber> error;
    {
        const FileSizeLimit limit(50);
        error = errorOf([&] { save(files, folder.file("a"), std::string(100, 'n')); });
    }
    EXPECT_EQ(error, ErrorNumber::DiskFull);
    EXPECT_EQ(folder.read("a"), "old");
    EXPECT_EQ(folder.names().size(), 1U);
}

TEST(SafeFile, WritesToADeviceDirectly)
{
    StdFiles files;
    EXPECT_EQ(errorOf([&] { save(files, "/dev/null", "new"); }), std::nullopt);
    EXPECT_EQ(errorOf([&] { save(files, "/dev/full", "new"); }), ErrorNumber::DiskFull);
    EXPECT_TRUE(fs::is_character_file("/dev/null"));
}
#endif

} // namespace pelloric
