// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/safe_file.h"

#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <array>
#include <map>
#include <random>
#include <utility>
#include <vector>

namespace pelloric {

namespace {

namespace fs = std::filesystem;

constexpr std::string_view NamePrefix = ".pelloric-";
constexpr std::string_view NameSuffix = ".saving";
constexpr int GroupDigits = 12;
constexpr int FileDigits = 8;
constexpr int MostNames = 100; ///< tried before a folder counts as one that takes no file
constexpr int MostLinks = 40; ///< followed one after the other
constexpr std::size_t ChunkBytes = 1U << 16U;

std::string randomDigits(int count)
{
    constexpr std::string_view Digits = "0123456789abcdef";
    static std::random_device random;
    std::string text;
    for (int digit = 0; digit < count; ++digit)
        text += Digits[random() % Digits.size()];
    return text;
}

/// The group that a file's name tells of; nothing: the name is none of ours.
std::optional<std::string> groupOf(const fs::path& path)
{
    const std::string name = path.filename().string();
    const std::size_t length = NamePrefix.size() + GroupDigits + 1 + FileDigits + NameSuffix.size();
    if (name.size() != length || !name.starts_with(NamePrefix) || !name.ends_with(NameSuffix))
        return std::nullopt;
    return name.substr(NamePrefix.size(), GroupDigits);
}

/// Where a link leads in the end, even if nothing is there yet.
fs::path followed(fs::path path)
{
    std::error_code error;
    for (int link = 0; link < MostLinks && fs::is_symlink(fs::symlink_status(path, error));
         ++link) {
        const fs::path next = fs::read_symlink(path, error);
        if (error)
            break;
        path = next.is_absolute() ? next : path.parent_path() / next;
    }
    return path;
}

fs::path folderOf(const fs::path& path)
{
    return path.has_parent_path() ? path.parent_path() : fs::path(".");
}

/// Copies a file from its first byte on to where another one stands.
bool copy(OpenFile& from, OpenFile& to)
{
    if (!from.rewind())
        return false;
    std::array<char, ChunkBytes> chunk {};
    while (const std::size_t size = from.read(chunk)) {
        if (!to.write({ chunk.data(), size }))
            return false;
    }
    return from.fault() == FileFault::None;
}

} // namespace

SavingGroup::SavingGroup()
    : id_(randomDigits(GroupDigits))
{
}

fs::path SavingGroup::name() const
{
    return std::string(NamePrefix) + id_ + "-" + randomDigits(FileDigits) + std::string(NameSuffix);
}

void sweepLeftovers(FileSystem& files, const fs::path& path)
{
    std::error_code error;
    std::map<std::string, std::vector<fs::path>> groups;
    for (fs::directory_iterator entry(folderOf(followed(path)), error), end; !error && entry != end;
         entry.increment(error)) {
        if (const auto group = groupOf(entry->path()))
            groups[*group].push_back(entry->path());
    }
    for (const auto& [id, group] : groups)
        files.removeAbandoned(group);
}

SafeFile::SafeFile(FileSystem& files, const fs::path& path)
    : files_(&files)
    , path_(path)
    , target_(followed(path))
{
    sweepLeftovers(files, target_);
    open(SavingGroup());
}

SafeFile::SafeFile(FileSystem& files, const fs::path& path, const SavingGroup& group)
    : files_(&files)
    , path_(path)
    , target_(followed(path))
{
    open(group);
}

SafeFile::SafeFile(SafeFile&& other) noexcept
    : files_(other.files_)
    , path_(std::move(other.path_))
    , target_(std::move(other.target_))
    , written_(std::exchange(other.written_, {}))
    , file_(std::move(other.file_))
    , exists_(other.exists_)
    , isDevice_(other.isDevice_)
{
}

SafeFile::~SafeFile()
{
    file_.reset(); // some systems remove no file that is open
    std::error_code ignored;
    if (!written_.empty())
        fs::remove(written_, ignored);
}

void SafeFile::open(const SavingGroup& group)
{
    std::error_code ignored;
    const auto status = fs::status(target_, ignored);
    exists_ = fs::exists(status);
    const bool isEndless = fs::is_symlink(fs::symlink_status(target_, ignored));
    if (isEndless)
        throw RunTimeError(ErrorNumber::WriteFailed,
            phrase(u"%1 is a link that leads to no file", { pathText(path_) }));
    if (fs::is_directory(status) || target_.filename().empty())
        refuse(FileFault::Other);
    isDevice_ = exists_ && !fs::is_regular_file(status);
    if (!isDevice_) {
        openBeside(group);
        return;
    }
    OpenedFile device = files_->openDevice(target_);
    if (!device.file)
        refuse(device.fault);
    file_ = std::move(device.file);
}

void SafeFile::openBeside(const SavingGroup& group)
{
    if (exists_) {
        const OpenedFile present = files_->open(target_);
        if (!present.file)
            refuse(present.fault);
    }
    const auto like = exists_ ? std::optional(target_) : std::nullopt;
    OpenedFile opened { nullptr, FileFault::Exists };
    for (int name = 0; name < MostNames && opened.fault == FileFault::Exists; ++name) {
        written_ = folderOf(target_) / group.name();
        opened = files_->create(written_, like);
    }
    if (!opened.file) {
        written_.clear();
        if (!exists_)
            refuse(opened.fault);
        opened = files_->spool();
    }
    if (!opened.file)
        refuse(opened.fault);
    file_ = std::move(opened.file);
}

void SafeFile::write(std::string_view bytes)
{
    if (!file_->write(bytes))
        refuse();
}

void SafeFile::close()
{
    if (!file_->sync())
        refuse();
    if (!written_.empty())
        file_.reset();
}

void SafeFile::putInPlace()
{
    if (file_ && !file_->sync())
        refuse();
    if (!isDevice_)
        takePlace();
    file_.reset();
}

void SafeFile::takePlace()
{
    std::error_code error;
    if (!written_.empty())
        fs::rename(written_, target_, error);
    if (error) { // some systems rename no file that is open
        file_.reset();
        fs::rename(written_, target_, error);
    }
    if (!written_.empty() && !error) {
        written_.clear();
        files_->syncFolder(folderOf(target_));
        return;
    }
    if (!file_)
        file_ = files_->open(written_).file;
    if (!file_)
        refuse(FileFault::Other);
    rewriteInPlace();
    if (!written_.empty())
        fs::remove(std::exchange(written_, {}), error);
}

/// What stands there is kept aside, and put back if the disk does not take the new file.
void SafeFile::rewriteInPlace()
{
    const OpenedFile present = files_->open(target_);
    if (!present.file)
        refuse(present.fault);
    const OpenedFile kept = files_->spool();
    if (!kept.file || !copy(*present.file, *kept.file))
        refuse(kept.file ? kept.file->fault() : kept.fault);
    OpenFile& target = *present.file;
    if (target.rewind() && copy(*file_, target) && target.truncate() && target.sync())
        return;
    const FileFault fault = target.fault();
    if (target.rewind() && copy(*kept.file, target))
        target.truncate();
    refuse(fault);
}

void SafeFile::refuse() const { refuse(file_->fault()); }

void SafeFile::refuse(FileFault fault) const
{
    throw RunTimeError(errorNumberOf(fault), pathText(path_));
}

} // namespace pelloric
