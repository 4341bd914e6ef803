// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <QString>
#include <QStringView>

namespace pelloric::qt {

/// A copy of the text.
QString toQString(TextView text);

/// A copy of the text.
Text toText(QStringView text);

/// The same text, borrowed as long as the string is not changed.
TextView viewOf(QStringView text);

/// The same text, borrowed.
QStringView borrowed(TextView text);

/// A string on the same text without a copy; it must not outlive the text.
QString borrowedString(TextView text);

} // namespace pelloric::qt
