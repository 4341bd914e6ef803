// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <optional>

namespace pelloric {

/// Lengths that differ by less are the same paper's: millimetres.
inline constexpr double SamePaperMm = 1;

/// Whether a paper has the size of pages, upright or turned.
/// @param width   of a page: twips
/// @param height  of a page: twips
bool isPaperOf(const PaperForm& paper, Twips width, Twips height);

/// What is to be told before pages are printed on a sheet of another size, in plain words; empty:
/// they fit, or nothing is known.
/// @param sheet  as it lies; nothing: unknown
Text paperWarning(const PaperRequest& pages, const std::optional<PaperForm>& sheet);

} // namespace pelloric
