// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"

#include <vector>

namespace pelloric {

/// A paper that a printer offers.
struct PaperForm {
    Text name; ///< as the printer names it
    double widthMm = 0; ///< millimetres, portrait
    double heightMm = 0; ///< millimetres, portrait

    bool operator==(const PaperForm&) const = default;
};

/// The current printer: a surface whose origin is the top-left corner of the printable area.
class Printer : public DrawingSurface {
public:
    /// The current printer's device name; empty when there is none.
    virtual Text deviceName() const = 0;

    /// The paper-size code in force: the 1-based place in the list of paper forms.
    virtual std::int16_t paperSize() const = 0;

    /// 1 portrait, 2 landscape.
    virtual std::int16_t orientation() const = 0;

    /// Makes a paper the one of the following documents; a code without a form is ignored.
    virtual void applyPaperSize(std::int16_t code) = 0;

    /// Sets the orientation of the following documents, which are printed one-sided.
    virtual void applyOrientation(std::int16_t code) = 0;

    /// What the following documents are called in the printer's queue.
    virtual void setDocumentTitle(TextView title) = 0;

    /// Ends the page and begins another of the same document.
    /// @throws RunTimeError InvalidCall: the printer does not take it
    virtual void newPage() = 0;

    /// Hands the document over to the spooler; without a document nothing happens.
    /// @throws RunTimeError InvalidCall: the printer does not take it
    virtual void endDoc() = 0;
};

/// The printers of the system.
class PrinterSystem {
public:
    virtual ~PrinterSystem() = default;

    /// Device names in the system's order.
    virtual std::vector<Text> printerNames() const = 0;

    /// Device name of the current printer; empty when there is none.
    virtual Text currentPrinter() const = 0;

    /// Makes another printer the current one; an unknown name changes nothing.
    virtual void makeCurrent(TextView name) = 0;

    /// Whether the spooler opens the printer: it exists, is not stopped and takes jobs.
    virtual bool opens(TextView name) const = 0;

    /// The one list of papers: the standard forms, then the current printer's own.
    virtual std::vector<PaperForm> forms() const = 0;
};

} // namespace pelloric
