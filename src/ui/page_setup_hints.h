// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "ui/margin_sketch.h"

#include <array>

namespace pelloric {

class PageSetupState;

/// What the page setup dialog says beside its values while they are typed: why a value cannot be,
/// and what OK will do with it. A text is empty where all is well. Nothing of it changes what OK
/// does.
struct PageSetupHints {
    Text sizes; ///< of the two size boxes
    std::array<Text, AllMargins.size()> margins; ///< by `Margin`
    Text file; ///< what keeps OK from saving anything

    const Text& of(Margin margin) const { return margins[static_cast<std::size_t>(margin)]; }
};

/// The hints for the values as they stand in the boxes.
PageSetupHints hintsOf(const PageSetupState& state);

} // namespace pelloric
