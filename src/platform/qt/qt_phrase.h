// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/phrase.h"

#include <QString>

#include <initializer_list>

namespace pelloric::qt {

/// `phrase` with the toolkit's strings.
QString phrased(TextView english, std::initializer_list<QString> values = {});

} // namespace pelloric::qt
