// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/qt/qt_files.h"
#include "platform/safe_file.h"

#include <filesystem>
#include <functional>
#include <vector>

namespace pelloric::qt {

/// Files that are put into their places together once all are whole.
///
/// What is not put into place is removed again, so that a failure leaves the files there were.
class PendingFiles {
public:
    /// Writes one file; is told the open file, and answers whether all went well.
    using Writer = std::function<bool(QFile& file)>;

    /// Writes a file that is to stand at a path.
    /// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path; or what the
    ///         writer throws
    void write(const std::filesystem::path& path, const Writer& writer);

    /// Puts all files into their places, the last one first, replacing any files there.
    /// @throws RunTimeError as `write`: that file and those before it are as they were
    void putInPlace();

private:
    QtFiles system_;
    SavingGroup group_;
    std::vector<SafeFile> files_; ///< put into place from the last one on
};

} // namespace pelloric::qt
