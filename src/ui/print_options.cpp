// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/print_options.h"

#include "controls/messages.h"
#include "platform/numbers.h"
#include "platform/printer.h"
#include "platform/run_time_error.h"
#include "print/page_list.h"
#include "ui/numeric_text.h"

namespace pelloric {

std::variant<Message, PrintArguments> pressPrint(
    const PrinterSystem& printers, const PrintEntries& entries)
{
    if (printers.printerNames().empty())
        return messageOf(Notice::NoPrinter);
    const Text printer = printers.currentPrinter();
    if (!printers.opens(printer)) {
        Message message = messageOf(Notice::PrinterNotWorking);
        message.text.insert(0, printer);
        return message;
    }
    return PrintArguments { entries.allPages, pageListOf(trimmed(entries.range)),
        copiesOf(entries.copies) };
}

PrintDoubt rangeDoubt(const PrintEntries& entries, int pages)
{
    if (entries.allPages)
        return PrintDoubt::None;
    const TextView range = trimmed(entries.range);
    if (range.empty())
        return PrintDoubt::EmptyRange;
    try {
        for (const std::int16_t number : pageNumbersOf(pageListOf(range))) {
            if (number >= 1 && (pages == 0 || number <= pages))
                return PrintDoubt::None;
        }
    } catch (const RunTimeError&) {
        return PrintDoubt::LongRange;
    }
    return PrintDoubt::NoPageOfRange;
}

PrintDoubt copiesDoubt(TextView copies)
{
    try {
        return copiesOf(copies) < 1 ? PrintDoubt::NoCopy : PrintDoubt::None;
    } catch (const RunTimeError&) {
        return PrintDoubt::ManyCopies;
    }
}

void PrintChoices::chooseAll() { *this = {}; }

void PrintChoices::chooseRange()
{
    allPages = false;
    rangeEnabled = true;
}

void choosePrinter(PrinterSystem& printers, TextView text)
{
    for (const Text& name : printers.printerNames()) {
        if (trimmed(name) == text) {
            printers.makeCurrent(name);
            return;
        }
    }
}

Text filteredCopies(TextView text) { return numericCharacters(text); }

Text steppedCopies(TextView text, bool up)
{
    const double copies = leadingNumber(text);
    if (up)
        return formatNumber(copies + 1);
    return copies > 0 ? formatNumber(copies - 1) : Text(text);
}

} // namespace pelloric
