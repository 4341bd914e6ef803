// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <QString>

namespace pelloric::qt {

/// The printers that the print system knows; needs a QGuiApplication.
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

private:
    mutable Text current_; ///< empty: there was no printer yet
};

} // namespace pelloric::qt
