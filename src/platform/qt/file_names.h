// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

#include <filesystem>

namespace pelloric::qt {

/// A file name as a string that `pathOf` turns back into the same bytes.
///
/// Systems take any bytes as a name. A byte that is no UTF-8 becomes a second half of a surrogate
/// pair without a first, U+DC80 to U+DCFF, which no text holds.
QString fileNameOf(QByteArrayView bytes);

/// The path that a string names.
std::filesystem::path pathOf(const QString& name);

} // namespace pelloric::qt
