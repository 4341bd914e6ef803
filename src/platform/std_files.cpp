// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/std_files.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstdio>

namespace pelloric {

namespace {

namespace fs = std::filesystem;

struct CloseFile {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

class StdFile final : public OpenFile {
public:
    StdFile(std::FILE* file, fs::path path)
        : file_(file)
        , path_(std::move(path))
    {
    }

    bool write(std::string_view bytes) override
    {
        turn(Direction::Writing);
        return told(std::fwrite(bytes.data(), 1, bytes.size(), file_.get()) == bytes.size());
    }

    std::size_t read(std::span<char> buffer) override
    {
        turn(Direction::Reading);
        const std::size_t size = std::fread(buffer.data(), 1, buffer.size(), file_.get());
        told(std::ferror(file_.get()) == 0);
        return size;
    }

    bool rewind() override
    {
        direction_ = Direction::None;
        return told(std::fseek(file_.get(), 0, SEEK_SET) == 0);
    }

    bool truncate() override
    {
        if (!sync())
            return false;
        const long size = std::ftell(file_.get());
        std::error_code error;
        fs::resize_file(path_, static_cast<std::uintmax_t>(size), error);
        errno = error.value();
        return told(!error);
    }

    bool sync() override { return told(std::fflush(file_.get()) == 0); }

    FileFault fault() const override { return fault_; }

private:
    enum class Direction { None, Reading, Writing };

    /// A file may be written after it was read, and read after it was written, only behind a seek.
    void turn(Direction direction)
    {
        if (direction_ != Direction::None && direction_ != direction)
            std::fseek(file_.get(), 0, SEEK_CUR);
        direction_ = direction;
        errno = 0;
    }

    bool told(bool isDone)
    {
        if (!isDone)
            fault_ = faultOf(errno);
        return isDone;
    }

    std::unique_ptr<std::FILE, CloseFile> file_;
    fs::path path_;
    Direction direction_ = Direction::None;
    FileFault fault_ = FileFault::None;
};

OpenedFile opened(std::FILE* file, const fs::path& path)
{
    if (file == nullptr)
        return { nullptr, faultOf(errno) };
    return { std::make_unique<StdFile>(file, path), FileFault::None };
}

std::FILE* openAs(const fs::path& path, const char* mode)
{
    errno = 0;
    return std::fopen(path.string().c_str(), mode);
}

} // namespace

OpenedFile StdFiles::create(const fs::path& path, const std::optional<fs::path>& like)
{
    std::error_code ignored;
    if (fs::exists(fs::symlink_status(path, ignored))) // not every system's library knows the "x"
        return { nullptr, FileFault::Exists };
    OpenedFile result = opened(openAs(path, "w+bx"), path);
    if (result.file && like)
        fs::permissions(path, fs::status(*like, ignored).permissions(), ignored);
    return result;
}

OpenedFile StdFiles::open(const fs::path& path) { return opened(openAs(path, "r+b"), path); }

OpenedFile StdFiles::openDevice(const fs::path& path) { return opened(openAs(path, "wb"), path); }

OpenedFile StdFiles::spool() { return opened(std::tmpfile(), {}); }

void StdFiles::removeAbandoned(std::span<const fs::path> files)
{
    const auto isOld = [](const fs::path& path) {
        std::error_code error;
        const auto written = fs::last_write_time(path, error);
        return !error && fs::file_time_type::clock::now() - written > std::chrono::hours(24);
    };
    std::error_code ignored;
    if (std::ranges::all_of(files, isOld)) {
        for (const fs::path& path : files)
            fs::remove(path, ignored);
    }
}

void StdFiles::syncFolder(const fs::path&) { }

std::unique_ptr<FolderLock> StdFiles::lock(const fs::path&) { return nullptr; }

} // namespace pelloric
