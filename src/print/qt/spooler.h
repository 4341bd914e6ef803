// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

namespace pelloric::qt {

/// Why the print system takes no jobs for a printer, in plain English; empty: it takes them.
///
/// @param printer  device name, with its instance behind a "/" where there is one; empty: none,
///                 which takes none
QString refusalOf(const QString& printer);

/// Why the document that this thread handed over just now was not taken; empty: nothing is known
/// against it.
QString handOverError();

} // namespace pelloric::qt
