// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/files.h"

namespace pelloric {

/// Files by the standard library alone: nothing is forced to the disk, and no lock keeps other
/// programs away.
class StdFiles final : public FileSystem {
public:
    OpenedFile create(const std::filesystem::path& path,
        const std::optional<std::filesystem::path>& like) override;
    OpenedFile open(const std::filesystem::path& path) override;
    OpenedFile openDevice(const std::filesystem::path& path) override;
    OpenedFile spool() override;
    /// Removes files of which none was written within a day.
    void removeAbandoned(std::span<const std::filesystem::path> files) override;
    void syncFolder(const std::filesystem::path& folder) override;
    std::unique_ptr<FolderLock> lock(const std::filesystem::path& folder) override;
};

} // namespace pelloric
