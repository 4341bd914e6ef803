// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

#include <string>
#include <vector>

namespace pelloric::qt {

/// A font of a file, which may hold several.
struct FontFile {
    std::string path;
    unsigned index = 0; ///< among the fonts of the file
};

/// The files that hold the installed fonts of a family; none where the system does not tell.
std::vector<FontFile> fontFilesOf(const QString& family);

} // namespace pelloric::qt
