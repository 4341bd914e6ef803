// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

namespace pelloric::pdf {

/// What a file says about itself to programs that catalogue files.
struct Metadata {
    Text title {};
    Text program {};
    Text language {};
    std::string created {}; ///< "20260131093000+01'00'"; empty: unknown
    bool isArchive = false; ///< claims PDF/A-2b
};

/// The metadata as XMP, which is XML.
std::string metadataOf(const Metadata& metadata);

} // namespace pelloric::pdf
