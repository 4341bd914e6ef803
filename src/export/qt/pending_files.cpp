// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/pending_files.h"

#include "platform/file_bytes.h"
#include "platform/run_time_error.h"

#include <string>

namespace pelloric::qt {

namespace {

constexpr int MostNames = 1000; ///< tried beside a target before the last is taken

[[noreturn]] void refuse(const std::filesystem::path& path)
{
    throw RunTimeError(ErrorNumber::WriteFailed, pathText(path));
}

std::filesystem::path unusedName(const std::filesystem::path& target)
{
    std::filesystem::path path;
    std::error_code ignored;
    for (int number = 0; number < MostNames; ++number) {
        path = target;
        path += ".saving" + std::to_string(number);
        if (!std::filesystem::exists(std::filesystem::symlink_status(path, ignored)))
            break;
    }
    return path;
}

/// Whether a file that exists may be written; one that is read-only is not replaced.
bool isWritable(const std::filesystem::path& path)
{
    return QFile(path).open(QIODevice::ReadWrite | QIODevice::ExistingOnly);
}

bool writeTo(const std::filesystem::path& path, const PendingFiles::Writer& writer)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate) || !writer(file))
        return false;
    file.flush();
    const bool isWhole = file.error() == QFileDevice::NoError;
    file.close();
    return isWhole && file.error() == QFileDevice::NoError;
}

} // namespace

PendingFiles::~PendingFiles()
{
    std::error_code ignored;
    for (const Pending& pending : files_)
        std::filesystem::remove(pending.written, ignored);
}

void PendingFiles::write(const std::filesystem::path& path, const Writer& writer)
{
    std::error_code error;
    std::filesystem::path target = std::filesystem::canonical(path, error);
    if (error)
        target = path;
    const auto status = std::filesystem::status(target, error);
    const bool exists = std::filesystem::exists(status);
    if (exists && !std::filesystem::is_regular_file(status)) {
        if (std::filesystem::is_directory(status) || !writeTo(target, writer))
            refuse(path);
        return;
    }
    if (exists && !isWritable(target))
        refuse(path);
    files_.push_back({ target, unusedName(target) });
    if (!writeTo(files_.back().written, writer))
        refuse(path);
    if (exists)
        std::filesystem::permissions(files_.back().written, status.permissions(), error);
}

void PendingFiles::putInPlace()
{
    while (!files_.empty()) {
        std::error_code error;
        const Pending& pending = files_.front();
        std::filesystem::rename(pending.written, pending.target, error);
        if (error)
            refuse(pending.target);
        files_.erase(files_.begin());
    }
}

} // namespace pelloric::qt
