// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_metrics.h"

namespace pelloric::qt {

class QtFonts;

/// Measures with the installed fonts.
class QtTextMetrics final : public TextMetrics {
public:
    /// @param fonts  borrowed, must outlive the service and what it hands out
    explicit QtTextMetrics(QtFonts& fonts);

    FaceMetrics& face(TextView name, bool bold, bool italic) override;

private:
    QtFonts& fonts_;
};

} // namespace pelloric::qt
