// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/files.h"

#include <string>

namespace pelloric {

/// Names what belongs together among files that are being written.
class SavingGroup {
public:
    SavingGroup();

    /// An unused name for one of its files; short whatever the file's place is called, for names
    /// have a limit.
    std::filesystem::path name() const;

private:
    std::string id_;
};

/// Removes what programs that were killed left in a folder.
/// @param path  any file of the folder, or a link to one
void sweepLeftovers(FileSystem& files, const std::filesystem::path& path);

/// A file that is written beside its place and put there once it is whole.
///
/// Until then, and after any failure, the place holds what it held. The file is made anew under a
/// name of its own, has the rights of the file it replaces from its first byte on, and is on the
/// disk before it takes the name. A link is followed. A file that may not be written is not
/// replaced either; in a folder that takes no new file, the present one is rewritten in place. A
/// device or a pipe is written to directly.
class SafeFile {
public:
    /// Opens the file. What programs that were killed left in its folder is swept up first.
    /// @param files  borrowed
    /// @throws RunTimeError PermissionDenied, DiskFull or WriteFailed, with the path
    SafeFile(FileSystem& files, const std::filesystem::path& path);

    /// Opens a file of several that are put into place together; sweeps nothing.
    SafeFile(FileSystem& files, const std::filesystem::path& path, const SavingGroup& group);

    /// Removes what was not put into place.
    ~SafeFile();
    SafeFile(SafeFile&& other) noexcept;
    SafeFile(const SafeFile&) = delete;
    SafeFile& operator=(const SafeFile&) = delete;

    /// @throws RunTimeError DiskFull or WriteFailed, with the path
    void write(std::string_view bytes);

    /// The open file, for writers that take nothing else.
    OpenFile& file() { return *file_; }

    /// Closes the file, all of which was written; it is put into place later.
    ///
    /// One file of a group stays open until all others are in place: it shows that they are needed.
    /// @throws RunTimeError DiskFull or WriteFailed, with the path
    void close();

    /// Puts the file into its place; it is closed then.
    /// @throws RunTimeError as the constructor: the place holds what it held
    void putInPlace();

    /// Reports the open file's failure.
    /// @throws RunTimeError DiskFull or WriteFailed, with the path
    [[noreturn]] void refuse() const;

private:
    void open(const SavingGroup& group);
    void openBeside(const SavingGroup& group);
    void takePlace();
    void rewriteInPlace();
    [[noreturn]] void refuse(FileFault fault) const;

    FileSystem* files_;
    std::filesystem::path path_; ///< as it was given
    std::filesystem::path target_; ///< links followed
    std::filesystem::path written_; ///< beside the target; empty: there is none
    std::unique_ptr<OpenFile> file_;
    bool exists_ = false;
    bool isDevice_ = false;
};

} // namespace pelloric
