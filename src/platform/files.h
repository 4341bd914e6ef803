// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/run_time_error.h"

#include <cstddef>
#include <filesystem>
#include <memory>
#include <optional>
#include <span>
#include <string_view>

namespace pelloric {

/// Why a file could not be opened or written.
enum class FileFault { None, Exists, NoRights, DiskFull, Other };

/// The reason behind an error number of the system.
FileFault faultOf(int error);

/// What is thrown for it: PermissionDenied, DiskFull, or WriteFailed.
ErrorNumber errorNumberOf(FileFault fault);

/// A file that is open for writing; closed when it goes.
class OpenFile {
public:
    virtual ~OpenFile() = default;

    /// Writes behind what was read or written last. @return  whether all bytes were taken
    virtual bool write(std::string_view bytes) = 0;

    /// Reads behind what was read or written last. @return  how many bytes; 0 at the end
    virtual std::size_t read(std::span<char> buffer) = 0;

    /// Goes back to the first byte.
    virtual bool rewind() = 0;

    /// Ends the file behind what was read or written last.
    virtual bool truncate() = 0;

    /// Returns when all that was written is on the disk, as far as the system can tell.
    virtual bool sync() = 0;

    /// Why the last of these failed.
    virtual FileFault fault() const = 0;
};

/// An answer of the file system: a file, or why there is none.
struct OpenedFile {
    std::unique_ptr<OpenFile> file {};
    FileFault fault = FileFault::None;
};

/// A lock that other programs respect; given back when it goes.
class FolderLock {
public:
    virtual ~FolderLock() = default;
};

/// What writing files safely asks of a system.
class FileSystem {
public:
    virtual ~FileSystem() = default;

    /// Makes a file that did not exist; a link of that name is not followed.
    /// @param like  the file whose rights it has from the first byte on; nothing: those of a new
    /// one
    virtual OpenedFile create(
        const std::filesystem::path& path, const std::optional<std::filesystem::path>& like)
        = 0;

    /// Opens a file that exists, with what it holds.
    virtual OpenedFile open(const std::filesystem::path& path) = 0;

    /// Opens a device or a pipe, which can only be written.
    virtual OpenedFile openDevice(const std::filesystem::path& path) = 0;

    /// A file without a name, gone when it is closed.
    virtual OpenedFile spool() = 0;

    /// Removes files that `create` made if the program that made them has ended since.
    /// @param files  of one program, which has one of them open as long as it needs any
    virtual void removeAbandoned(std::span<const std::filesystem::path> files) = 0;

    /// Returns when names that were put into a folder are on the disk.
    virtual void syncFolder(const std::filesystem::path& folder) = 0;

    /// Keeps other programs from rewriting files of a folder.
    /// @return  null: the lock cannot be had in reasonable time
    virtual std::unique_ptr<FolderLock> lock(const std::filesystem::path& folder) = 0;
};

} // namespace pelloric
