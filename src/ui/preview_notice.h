// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <optional>

namespace pelloric {

class RunTimeError;
struct Platform;
struct ReportSettings;

/// What the strip above the pages says, and which ways out it offers.
struct PreviewNotice {
    Text text; ///< whole sentences
    bool offersPageSetup = false;
    bool offersGridStyle = false;
    bool offersDefaults = false; ///< to make every setting usable again

    bool operator==(const PreviewNotice&) const = default;
};

/// Why no pages could be built: what is wrong with the settings, or else what the error says.
/// @param own  the settings of the report's own; null: it goes by the settings file
PreviewNotice noticeOfFailure(
    const RunTimeError& error, const Platform& platform, const ReportSettings* own);

/// What is wrong with settings by which pages were built all the same; nothing when all is well.
/// @param own  see `noticeOfFailure`
std::optional<PreviewNotice> noticeOfSettings(const Platform& platform, const ReportSettings* own);

/// An error that has nothing to do with the settings.
PreviewNotice noticeOfError(const RunTimeError& error);

} // namespace pelloric
