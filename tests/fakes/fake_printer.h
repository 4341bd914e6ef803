// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/fake_surface.h"
#include "platform/printer.h"

#include <algorithm>
#include <set>

namespace pelloric {

/// A printer that logs its calls; there is none unless a test names it.
class FakePrinter : public LoggingSurface<Printer> {
public:
    Text deviceName() const override { return name; }
    std::int16_t paperSize() const override { return paper; }
    std::int16_t orientation() const override { return direction; }

    void applyPaperSize(std::int16_t code) override
    {
        paper = code;
        add("paper " + std::to_string(code));
    }

    void applyOrientation(std::int16_t code) override
    {
        direction = code;
        add("orientation " + std::to_string(code));
    }

    void setDocumentTitle(TextView title) override { add("title " + toUtf8(title)); }
    void newPage() override { add("new page"); }
    void endDoc() override { add("end doc"); }

    Text name; ///< what `deviceName()` answers
    std::int16_t paper = 9;
    std::int16_t direction = 1;
};

/// Printers of a system that has none unless a test adds some.
class FakePrinterSystem : public PrinterSystem {
public:
    std::vector<Text> printerNames() const override { return names; }
    Text currentPrinter() const override { return current; }

    void makeCurrent(TextView name) override
    {
        if (knows(name))
            current = name;
    }

    bool opens(TextView name) const override { return knows(name) && !closed.contains(Text(name)); }
    std::vector<PaperForm> forms() const override { return paperForms; }
    std::optional<PaperForm> sheetFor(const PaperRequest&) const override { return sheet; }

    std::vector<Text> names;
    Text current;
    std::set<Text> closed; ///< printers that do not open
    std::vector<PaperForm> paperForms;
    std::optional<PaperForm> sheet; ///< on which all pages are put

private:
    bool knows(TextView name) const
    {
        return std::find(names.begin(), names.end(), name) != names.end();
    }
};

} // namespace pelloric
