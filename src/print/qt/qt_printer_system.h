// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"
#include "print/qt/print_calls.h"

#include <QString>

namespace pelloric::qt {

/// The printers that the print system knows; needs a QGuiApplication.
///
/// A system that does not answer within a few seconds has no printers and the standard papers.
class QtPrinterSystem final : public PrinterSystem {
public:
    std::vector<Text> printerNames() const override;

    /// The system's default printer at first, or the first of all when none is the default; it
    /// stays the current one, even when it is taken away, until another is made current.
    Text currentPrinter() const override;

    void makeCurrent(TextView name) override;
    bool opens(TextView name) const override;

    /// Why a printer takes no jobs, in plain English; empty: it takes them. The empty name, which
    /// stands for no printer at all, is told why there is none.
    QString refusal(TextView name) const;

    std::vector<PaperForm> forms() const override;
    std::optional<PaperForm> sheetFor(const PaperRequest& pages) const override;
    std::unique_ptr<PrinterInquiry> inquire(const PaperRequest& pages) const override;

    /// All that is asked of the print system goes through here.
    PrintCalls& calls() const { return calls_; }

private:
    mutable PrintCalls calls_;
    mutable Text current_; ///< empty: there was no printer yet
};

} // namespace pelloric::qt
