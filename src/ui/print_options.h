// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/services.h"

#include <cstdint>
#include <variant>

namespace pelloric {

class PrinterSystem;

/// What the print options dialog hands to the print procedure.
struct PrintArguments {
    bool allPages = true;
    Text pageList; ///< one-based page numbers separated by ","; made even when all are printed
    std::int16_t copies = 1;

    bool operator==(const PrintArguments&) const = default;
};

/// What stands in the print options dialog.
struct PrintEntries {
    bool allPages = true;
    Text range; ///< as typed
    Text copies; ///< as typed; empty means 1
};

/// The dialog's "Print": either why it cannot print, or what is printed.
///
/// @throws RunTimeError Overflow: copies past 16 bits, or a page list longer than any document
std::variant<Message, PrintArguments> pressPrint(
    const PrinterSystem& printers, const PrintEntries& entries);

/// What is wrong with a range or a number of copies while it is typed.
enum class PrintDoubt { None, EmptyRange, NoPageOfRange, LongRange, NoCopy, ManyCopies };

/// Whether a range prints nothing, or more than can be printed.
/// @param pages  of the document; 0: unknown
PrintDoubt rangeDoubt(const PrintEntries& entries, int pages);

/// Whether a number of copies prints nothing, or more than can be printed.
/// @param copies  as typed
PrintDoubt copiesDoubt(TextView copies);

/// The choices of the print options dialog besides what is typed.
struct PrintChoices {
    bool allPages = true;
    Text pageList; ///< emptied when all pages are chosen
    bool rangeEnabled = false; ///< the range box can be typed into

    /// "All" was chosen.
    void chooseAll();
    /// "Range" was chosen.
    void chooseRange();
};

/// The text of the copies box when the dialog opens.
inline constexpr TextView InitialCopies = u"1";

/// Makes the first printer whose trimmed device name is this text the current one, if there is one.
void choosePrinter(PrinterSystem& printers, TextView text);

/// What stays of a text that was typed into the copies box: digits and points.
Text filteredCopies(TextView text);

/// The text of the copies box after one of its buttons was pressed.
///
/// Up adds one without end; down takes one off only while the number is above 0.
Text steppedCopies(TextView text, bool up);

} // namespace pelloric
