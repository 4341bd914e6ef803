// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_phrase.h"

#include "platform/qt/qt_text.h"

#include <vector>

namespace pelloric::qt {

QString phrased(TextView english, std::initializer_list<QString> values)
{
    std::vector<TextView> views;
    for (const QString& value : values)
        views.push_back(viewOf(value));
    return toQString(phrase(english, views));
}

} // namespace pelloric::qt
