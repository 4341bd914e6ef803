// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>

#include <filesystem>
#include <memory>

struct zip;

namespace pelloric::qt {

/// The files in a ZIP archive.
class ZipEntries {
public:
    /// @throws RunTimeError TypeMismatch: it is no archive; FileNotFound
    explicit ZipEntries(const std::filesystem::path& path);

    bool has(const QByteArray& name) const;

    /// The bytes of a file; none where there is no such file.
    /// @throws RunTimeError TypeMismatch: it is damaged; Overflow: it is larger than 2 GB
    QByteArray read(const QByteArray& name) const;

private:
    struct Discard {
        void operator()(zip* archive) const;
    };

    std::unique_ptr<zip, Discard> archive_;
};

} // namespace pelloric::qt
