// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text.h"

namespace pelloric::qt {

QString toQString(TextView text) { return borrowed(text).toString(); }

Text toText(QStringView text) { return Text(viewOf(text)); }

TextView viewOf(QStringView text)
{
    return TextView(text.utf16(), static_cast<std::size_t>(text.size()));
}

QStringView borrowed(TextView text)
{
    return QStringView(text.data(), static_cast<qsizetype>(text.size()));
}

QString borrowedString(TextView text)
{
    return QString::fromRawData(
        reinterpret_cast<const QChar*>(text.data()), static_cast<qsizetype>(text.size()));
}

} // namespace pelloric::qt
