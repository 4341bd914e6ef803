// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/qt_printer_system.h"

#include "platform/qt/qt_text.h"
#include "print/paper_names.h"
#include "print/qt/paper_sizes.h"
#include "print/qt/sheet.h"
#include "print/qt/spooler.h"

#include <QPrinterInfo>
#include <QStringList>

#include <algorithm>

namespace pelloric::qt {

namespace {

using Clock = std::chrono::steady_clock;

std::vector<Text> systemNames()
{
    std::vector<Text> names;
    for (const QString& name : QPrinterInfo::availablePrinterNames())
        names.push_back(toText(name));
    return names;
}

Text systemCurrent()
{
    QString name = QPrinterInfo::defaultPrinterName();
    if (name.isEmpty())
        name = QPrinterInfo::availablePrinterNames().value(0);
    return toText(name);
}

std::vector<PaperForm> systemForms(const Text& printer)
{
    return printer.empty() ? standardPaperForms()
                           : formsOf(QPrinterInfo::printerInfo(toQString(printer)));
}

std::optional<PaperForm> systemSheet(const Text& printer, const PaperRequest& pages)
{
    const QPrinterInfo info = QPrinterInfo::printerInfo(toQString(printer));
    return info.isNull() ? std::nullopt : std::optional(formOf(sheetOf(info, pages)));
}

/// @param current  empty: not known yet
PrinterFacts systemFacts(Text current, const PaperRequest& pages)
{
    PrinterFacts facts { .names = systemNames() };
    facts.current = current.empty() ? systemCurrent() : std::move(current);
    facts.forms = systemForms(facts.current);
    facts.sheet = systemSheet(facts.current, pages);
    return facts;
}

/// A question that is being answered; after the deadline nothing is waited for.
class Inquiry final : public PrinterInquiry {
public:
    Inquiry(PrintCalls& calls, const Text& current, const PaperRequest& pages)
        : answer_(std::make_shared<PrinterFacts>())
        , call_(calls.begin(
              [answer = answer_, current, pages] { *answer = systemFacts(current, pages); }))
        , deadline_(Clock::now() + PrintCalls::Patience)
    {
    }

    const PrinterFacts* facts(std::chrono::milliseconds patience) override
    {
        if (given_)
            return &*given_;
        const auto rest
            = std::chrono::duration_cast<std::chrono::milliseconds>(deadline_ - Clock::now());
        if (call_->wait(std::clamp(rest, std::chrono::milliseconds(0), patience), {}))
            given_ = call_->silence().isEmpty() ? *answer_ : silent(call_->silence());
        else if (rest.count() <= 0)
            given_ = silent(silenceAfter(PrintCalls::Patience));
        return given_ ? &*given_ : nullptr;
    }

private:
    static PrinterFacts silent(const QString& trouble)
    {
        return { .forms = standardPaperForms(), .trouble = toText(trouble) };
    }

    std::shared_ptr<PrinterFacts> answer_; ///< read only when the call has ended
    std::shared_ptr<PrintCall> call_;
    Clock::time_point deadline_;
    std::optional<PrinterFacts> given_;
};

} // namespace

std::vector<Text> QtPrinterSystem::printerNames() const
{
    return calls_.ask<std::vector<Text>>(systemNames).value_or(std::vector<Text>());
}

Text QtPrinterSystem::currentPrinter() const
{
    if (current_.empty())
        current_ = calls_.ask<Text>(systemCurrent).value_or(Text());
    return current_;
}

void QtPrinterSystem::makeCurrent(TextView name)
{
    const std::vector<Text> names = printerNames();
    if (std::find(names.begin(), names.end(), name) != names.end())
        current_ = name;
}

bool QtPrinterSystem::opens(TextView name) const
{
    return !name.empty() && refusal(name).isEmpty();
}

QString QtPrinterSystem::refusal(TextView name) const
{
    const auto refusal
        = calls_.ask<QString>([printer = toQString(name)] { return refusalOf(printer); });
    return refusal ? *refusal : calls_.trouble();
}

std::vector<PaperForm> QtPrinterSystem::forms() const
{
    const Text name = currentPrinter();
    const auto forms = calls_.ask<std::vector<PaperForm>>([name] { return systemForms(name); });
    return forms ? *forms : standardPaperForms();
}

std::optional<PaperForm> QtPrinterSystem::sheetFor(const PaperRequest& pages) const
{
    const Text name = currentPrinter();
    return calls_.ask<std::optional<PaperForm>>([name, pages] { return systemSheet(name, pages); })
        .value_or(std::nullopt);
}

std::unique_ptr<PrinterInquiry> QtPrinterSystem::inquire(const PaperRequest& pages) const
{
    return std::make_unique<Inquiry>(calls_, current_, pages);
}

} // namespace pelloric::qt
