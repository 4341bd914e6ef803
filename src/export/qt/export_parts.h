// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/qt/page_export.h"

namespace pelloric::qt {

/// @throws RunTimeError Overflow: a paper that is no size to write
void checkPaper(const PageSetup& setup);

/// The pages to put out, all of which exist.
/// @throws RunTimeError SubscriptOutOfRange: no such page
std::vector<int> pagesOf(const PageDocument& document, const ExportOptions& options);

} // namespace pelloric::qt
