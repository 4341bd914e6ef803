// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/spooler.h"

#include <cups/cups.h>

#include <memory>

namespace pelloric::qt {

namespace {

constexpr int AnswerMs = 5000;

struct FreeDestination {
    void operator()(cups_dest_t* destination) const { cupsFreeDests(1, destination); }
};
using Destination = std::unique_ptr<cups_dest_t, FreeDestination>;

/// An option as the scheduler writes it, and what it means for a job.
struct RefusingState {
    const char* option;
    const char* value;
    const char* meaning;
};

/// In the order in which they are told.
constexpr RefusingState RefusingStates[] = {
    { "printer-is-accepting-jobs", "false", "the printer rejects jobs" },
    { "printer-state", "5", "the printer is stopped" },
};

Destination destinationOf(const QString& printer)
{
    const QByteArray name = printer.section(u'/', 0, 0).toLocal8Bit();
    const QByteArray instance = printer.section(u'/', 1).toLocal8Bit();
    return Destination(cupsGetNamedDest(
        CUPS_HTTP_DEFAULT, name.constData(), instance.isEmpty() ? nullptr : instance.constData()));
}

QString lastError() { return QString::fromUtf8(cupsLastErrorString()); }

/// Why the print system cannot be asked; empty: it answers.
QString silenceOfSystem()
{
    http_t* const connection = httpConnect2(
        cupsServer(), ippPort(), nullptr, AF_UNSPEC, cupsEncryption(), 1, AnswerMs, nullptr);
    if (connection == nullptr)
        return QStringLiteral("the print system does not answer (%1)").arg(lastError());
    httpClose(connection);
    return {};
}

} // namespace

QString refusalOf(const QString& printer)
{
    if (printer.isEmpty()) {
        const QString silence = silenceOfSystem();
        return silence.isEmpty() ? QStringLiteral("there is no printer") : silence;
    }
    const Destination destination = destinationOf(printer);
    if (!destination) {
        const QString silence = silenceOfSystem();
        return silence.isEmpty() ? QStringLiteral("there is no such printer") : silence;
    }
    for (const RefusingState& state : RefusingStates) {
        const char* const value
            = cupsGetOption(state.option, destination->num_options, destination->options);
        if (value != nullptr && qstrcmp(value, state.value) == 0)
            return QString::fromLatin1(state.meaning);
    }
    return {};
}

QString handOverError()
{
    if (cupsLastError() <= IPP_STATUS_OK_CONFLICTING)
        return {};
    return QStringLiteral("the print system did not take the document (%1)").arg(lastError());
}

} // namespace pelloric::qt
