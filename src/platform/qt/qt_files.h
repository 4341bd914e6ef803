// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/files.h"

#include <QFile>

namespace pelloric::qt {

/// A file of `QtFiles`.
class QtOpenFile final : public OpenFile {
public:
    /// @param file  open
    explicit QtOpenFile(std::unique_ptr<QFile> file);

    bool write(std::string_view bytes) override;
    std::size_t read(std::span<char> buffer) override;
    bool rewind() override;
    bool truncate() override;
    bool sync() override;
    FileFault fault() const override { return fault_; }

    /// The file for those who write to devices; `sync` tells whether all went well.
    QFile& device() { return *file_; }

private:
    bool told(bool isDone);

    std::unique_ptr<QFile> file_;
    FileFault fault_ = FileFault::None;
};

/// Files of the system: what is written is forced to the disk, and locks are the system's own.
class QtFiles final : public FileSystem {
public:
    OpenedFile create(const std::filesystem::path& path,
        const std::optional<std::filesystem::path>& like) override;
    OpenedFile open(const std::filesystem::path& path) override;
    OpenedFile openDevice(const std::filesystem::path& path) override;
    OpenedFile spool() override;
    void removeAbandoned(std::span<const std::filesystem::path> files) override;
    void syncFolder(const std::filesystem::path& folder) override;
    std::unique_ptr<FolderLock> lock(const std::filesystem::path& folder) override;
};

} // namespace pelloric::qt
