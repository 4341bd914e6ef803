// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"

#include <chrono>
#include <memory>
#include <optional>
#include <vector>

namespace pelloric {

/// A paper that a printer offers.
struct PaperForm {
    Text name; ///< as the printer names it
    double widthMm = 0; ///< millimetres, portrait
    double heightMm = 0; ///< millimetres, portrait

    bool operator==(const PaperForm&) const = default;
};

/// Pages that are to be printed, as far as paper goes.
struct PaperRequest {
    std::int16_t code = 0; ///< paper-size code; one that names no form asks for the pages' own size
    std::int16_t orientation = 1; ///< 1 portrait, 2 landscape
    Twips width = 0; ///< of a page; 0: unknown
    Twips height = 0; ///< of a page; 0: unknown

    bool operator==(const PaperRequest&) const = default;
};

/// What a print system tells at one time.
struct PrinterFacts {
    std::vector<Text> names {}; ///< as `PrinterSystem::printerNames`
    Text current {}; ///< as `PrinterSystem::currentPrinter`
    std::vector<PaperForm> forms {}; ///< as `PrinterSystem::forms`
    std::optional<PaperForm> sheet {}; ///< of the pages asked about, as it lies; nothing: unknown
    Text trouble {}; ///< why it told nothing, in plain words; empty: it answered
};

/// A question that a print system answers beside its asker.
class PrinterInquiry {
public:
    virtual ~PrinterInquiry() = default;

    /// The answer, or null while there is none yet; there is one after a few seconds in any case.
    /// @param patience  how long to wait for it at most
    virtual const PrinterFacts* facts(std::chrono::milliseconds patience) = 0;
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

    /// Tells the size of the following documents' pages, for which a sheet of that size is taken
    /// until a paper is applied; widths of 0 take it back.
    virtual void setPageSize(Twips width, Twips height)
    {
        static_cast<void>(width);
        static_cast<void>(height);
    }

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

    /// The sheet on which the current printer puts pages, as it lies; nothing: unknown.
    virtual std::optional<PaperForm> sheetFor(const PaperRequest& pages) const
    {
        static_cast<void>(pages);
        return std::nullopt;
    }

    /// Begins to ask for everything at once, so that nobody has to wait for the answer.
    virtual std::unique_ptr<PrinterInquiry> inquire(const PaperRequest& pages) const;
};

} // namespace pelloric
