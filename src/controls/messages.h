// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/services.h"

namespace pelloric {

class RunTimeError;

/// Every message box that the controls show; texts and titles are the system's own.
enum class Notice {
    NoNextPage,
    BadDocumentFile,
    UnknownPaper,
    NoFontRow,
    NoPrinter,
    PrinterNotWorking, ///< the printer's name stands in front of the text
};

/// The message box of a notice.
Message messageOf(Notice notice);

/// The message box with which an error that reached the outermost member is told.
Message messageOf(const RunTimeError& error);

} // namespace pelloric
