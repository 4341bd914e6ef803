// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/temp_folder.h"
#include "support/test_paths.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace pelloric {

/// The approved text of tests/golden/`name`.
///
/// tools/approve_goldens.sh sets PELLORIC_APPROVE_GOLDENS; then `actual` is written there first.
inline std::string golden(const std::string& name, const std::string& actual)
{
    const auto path = std::filesystem::path(PELLORIC_TESTS_DIR) / "golden" / name;
    if (std::getenv("PELLORIC_APPROVE_GOLDENS") != nullptr) {
        std::filesystem::create_directories(path.parent_path());
        std::ofstream(path, std::ios::binary) << actual;
    }
    return TempFolder::bytesOf(path);
}

} // namespace pelloric
