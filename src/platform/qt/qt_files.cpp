// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_files.h"

#include <QTemporaryFile>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <thread>

#ifdef Q_OS_UNIX
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace pelloric::qt {

namespace {

namespace fs = std::filesystem;

constexpr auto LongestLockWait = std::chrono::seconds(5);
constexpr auto LockPause = std::chrono::milliseconds(5);

OpenedFile opened(std::unique_ptr<QFile> file, bool isOpen)
{
    if (!isOpen)
        return { nullptr, faultOf(errno) };
    return { std::make_unique<QtOpenFile>(std::move(file)), FileFault::None };
}

#ifdef Q_OS_UNIX

/// An open file of the system; closed when it goes.
class Descriptor {
public:
    explicit Descriptor(int number)
        : number_(number)
    {
    }

    ~Descriptor()
    {
        if (number_ >= 0)
            ::close(number_);
    }

    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    bool isOpen() const { return number_ >= 0; }
    int number() const { return number_; }
    int release() { return std::exchange(number_, -1); }

private:
    int number_;
};

bool isLocked(const Descriptor& file) { return ::flock(file.number(), LOCK_EX | LOCK_NB) == 0; }

/// Whether the file still has a name.
bool hasName(const Descriptor& file)
{
    struct stat status { };
    return ::fstat(file.number(), &status) == 0 && status.st_nlink > 0;
}

void takeRights(const Descriptor& file, const fs::path& like)
{
    struct stat status { };
    if (::stat(like.c_str(), &status) != 0)
        return;
    // Another owner can be had by an administrator only, another group by its members only.
    if (::fchown(file.number(), status.st_uid, status.st_gid) != 0
        && ::fchown(file.number(), static_cast<uid_t>(-1), status.st_gid) != 0)
        errno = 0;
    ::fchmod(file.number(), status.st_mode & 07777U);
}

/// Hands a file over that was opened by its bytes, whether or not they are a text.
OpenedFile handedOver(Descriptor& made, const fs::path& path, QIODevice::OpenMode mode)
{
    auto file = std::make_unique<QFile>(path);
    const bool isOpen = file->open(made.number(), mode, QFileDevice::AutoCloseHandle);
    if (isOpen)
        made.release();
    return opened(std::move(file), isOpen);
}

/// Opens a file that exists, for reading and writing or for writing alone.
OpenedFile openPresent(const fs::path& path, QIODevice::OpenMode mode)
{
    errno = 0;
    const int access = mode == QIODevice::WriteOnly ? O_WRONLY : O_RDWR;
    Descriptor present(::open(path.c_str(), access | O_CLOEXEC));
    if (!present.isOpen())
        return { nullptr, faultOf(errno) };
    return handedOver(present, path, mode);
}

class SystemLock final : public FolderLock {
public:
    explicit SystemLock(int number)
        : folder_(number)
    {
    }

private:
    Descriptor folder_;
};

#else

OpenedFile openPresent(const fs::path& path, QIODevice::OpenMode mode)
{
    errno = 0;
    auto file = std::make_unique<QFile>(path);
    const bool isOpen = file->open(mode | QIODevice::ExistingOnly);
    return opened(std::move(file), isOpen);
}

#endif

} // namespace

QtOpenFile::QtOpenFile(std::unique_ptr<QFile> file)
    : file_(std::move(file))
{
}

bool QtOpenFile::write(std::string_view bytes)
{
    const auto size = static_cast<qint64>(bytes.size());
    errno = 0;
    return told(file_->write(bytes.data(), size) == size);
}

std::size_t QtOpenFile::read(std::span<char> buffer)
{
    errno = 0;
    const qint64 size = file_->read(buffer.data(), static_cast<qint64>(buffer.size()));
    told(size >= 0);
    return size < 0 ? 0 : static_cast<std::size_t>(size);
}

bool QtOpenFile::rewind()
{
    errno = 0;
    return told(file_->seek(0));
}

bool QtOpenFile::truncate()
{
    errno = 0;
    return told(file_->resize(file_->pos()));
}

bool QtOpenFile::sync()
{
    errno = 0;
    bool isDone = file_->flush() && file_->error() == QFileDevice::NoError;
#ifdef Q_OS_UNIX
    // A device or a pipe keeps nothing that could be forced out.
    isDone = isDone && (::fsync(file_->handle()) == 0 || errno == EINVAL || errno == EROFS);
#endif
    return told(isDone);
}

bool QtOpenFile::told(bool isDone)
{
    if (isDone)
        return true;
    if (file_->error() == QFileDevice::ResourceError)
        fault_ = FileFault::DiskFull;
    else if (file_->error() == QFileDevice::PermissionsError)
        fault_ = FileFault::NoRights;
    else
        fault_ = faultOf(errno);
    return false;
}

OpenedFile QtFiles::create(const fs::path& path, const std::optional<fs::path>& like)
{
    errno = 0;
#ifdef Q_OS_UNIX
    constexpr mode_t OnlyOurs = 0600;
    constexpr mode_t AsTheUserHasIt = 0666;
    Descriptor made(::open(path.c_str(), O_RDWR | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC,
        like ? OnlyOurs : AsTheUserHasIt));
    if (!made.isOpen())
        return { nullptr, faultOf(errno) };
    // Held as long as the file is open: who gets the lock knows that the writer has ended.
    if (!isLocked(made) && errno == EWOULDBLOCK) { // somebody is about to find it abandoned
        ::unlink(path.c_str());
        return { nullptr, FileFault::Exists };
    }
    if (!hasName(made))
        return { nullptr, FileFault::Exists };
    if (like)
        takeRights(made, *like);
    return handedOver(made, path, QIODevice::ReadWrite);
#else
    auto file = std::make_unique<QFile>(path);
    const bool isOpen = file->open(QIODevice::ReadWrite | QIODevice::NewOnly);
    if (isOpen && like)
        file->setPermissions(QFile(*like).permissions());
    if (!isOpen && QFile::exists(file->fileName()))
        errno = EEXIST;
    return opened(std::move(file), isOpen);
#endif
}

OpenedFile QtFiles::open(const fs::path& path) { return openPresent(path, QIODevice::ReadWrite); }

OpenedFile QtFiles::openDevice(const fs::path& path)
{
    return openPresent(path, QIODevice::WriteOnly);
}

OpenedFile QtFiles::spool()
{
    errno = 0;
    auto file = std::make_unique<QTemporaryFile>();
    const bool isOpen = file->open();
    return opened(std::move(file), isOpen);
}

void QtFiles::removeAbandoned(std::span<const fs::path> files)
{
#ifdef Q_OS_UNIX
    const auto isAbandoned = [](const fs::path& path, bool isRemoved) {
        const Descriptor file(::open(path.c_str(), O_RDWR | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
        const bool isFree = file.isOpen() && isLocked(file);
        if (isFree && isRemoved)
            ::unlink(path.c_str()); // still locked: its writer may have made it a moment ago
        return isFree;
    };
    if (!std::ranges::all_of(files, [&](const fs::path& path) { return isAbandoned(path, false); }))
        return;
    for (const fs::path& path : files)
        isAbandoned(path, true);
#else
    for (const fs::path& path : files)
        QFile(path).remove(); // refused while it is open
#endif
}

void QtFiles::syncFolder(const fs::path& folder)
{
#ifdef Q_OS_UNIX
    const Descriptor opened(::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (opened.isOpen())
        ::fsync(opened.number());
#else
    Q_UNUSED(folder)
#endif
}

std::unique_ptr<FolderLock> QtFiles::lock(const fs::path& folder)
{
#ifdef Q_OS_UNIX
    Descriptor opened(::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!opened.isOpen())
        return nullptr;
    const auto end = std::chrono::steady_clock::now() + LongestLockWait;
    while (!isLocked(opened)) {
        if (errno != EWOULDBLOCK || std::chrono::steady_clock::now() > end)
            return nullptr;
        std::this_thread::sleep_for(LockPause);
    }
    return std::make_unique<SystemLock>(opened.release());
#else
    Q_UNUSED(folder)
    return nullptr;
#endif
}

} // namespace pelloric::qt
