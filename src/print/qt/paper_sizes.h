// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <QPageSize>

class QPrinterInfo;

namespace pelloric::qt {

/// The standard forms, then those of the printer's own that are none of them by name and size;
/// empty without a printer.
std::vector<PaperForm> formsOf(const QPrinterInfo& printer);

/// The paper of a code in `formsOf`, as the printer itself names it where it has that size.
///
/// @param code  the 1-based place in the list
/// @return      not valid when no form has the code
QPageSize pageSizeOf(const QPrinterInfo& printer, std::int16_t code);

/// The code of the first form with the size of a paper; 0 when there is none.
std::int16_t formCodeOf(const QPrinterInfo& printer, const QPageSize& paper);

} // namespace pelloric::qt
