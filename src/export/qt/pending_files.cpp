// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/pending_files.h"

namespace pelloric::qt {

void PendingFiles::write(const std::filesystem::path& path, const Writer& writer)
{
    if (files_.empty())
        sweepLeftovers(system_, path);
    SafeFile file(system_, path, group_);
    auto& open = static_cast<QtOpenFile&>(file.file());
    const bool isWritten = writer(open.device());
    if (!isWritten)
        open.write("\n"); // a disk that has taken a part says why when it is to take more
    if (!open.sync() || !isWritten)
        file.refuse();
    if (!files_.empty())
        file.close();
    files_.push_back(std::move(file));
}

void PendingFiles::putInPlace()
{
    while (!files_.empty()) {
        files_.back().putInPlace();
        files_.pop_back();
    }
}

} // namespace pelloric::qt
