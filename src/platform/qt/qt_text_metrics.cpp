// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text_metrics.h"

#include "platform/qt/qt_fonts.h"

namespace pelloric::qt {

QtTextMetrics::QtTextMetrics(QtFonts& fonts)
    : fonts_(fonts)
{
}

FaceMetrics& QtTextMetrics::face(TextView name, bool bold, bool italic)
{
    return fonts_.face(name, bold, italic);
}

} // namespace pelloric::qt
