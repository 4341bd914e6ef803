// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QFile>

#include <filesystem>
#include <functional>
#include <vector>

namespace pelloric::qt {

/// Files written under other names beside their places, put there together once all are whole.
///
/// What is not put into place is removed again, so that a failure leaves the files there were. A
/// place that is no plain file, such as a pipe, is written to directly.
class PendingFiles {
public:
    /// Writes one file; is told the open file, and answers whether all went well.
    using Writer = std::function<bool(QFile& file)>;

    PendingFiles() = default;
    ~PendingFiles();
    PendingFiles(const PendingFiles&) = delete;
    PendingFiles& operator=(const PendingFiles&) = delete;

    /// Writes a file that is to stand at a path.
    /// @throws RunTimeError WriteFailed, with the path; or what the writer throws
    void write(const std::filesystem::path& path, const Writer& writer);

    /// Puts all files into their places, replacing any files there.
    /// @throws RunTimeError WriteFailed, with the path: it and those behind it are as they were
    void putInPlace();

private:
    struct Pending {
        std::filesystem::path target; ///< links followed
        std::filesystem::path written;
    };

    std::vector<Pending> files_;
};

} // namespace pelloric::qt
