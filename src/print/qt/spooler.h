// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "print/qt/sheet.h"
#include "view/held_drawing.h"

#include <QString>

#include <memory>
#include <vector>

namespace pelloric::qt {

class QtFonts;
class QtGlyphFaces;

/// Makes the present thread one that may call the print system without a person before it.
void prepareCallingThread();

/// Why the print system cannot be asked, in plain English; empty: it answers.
QString silenceOfSystem();

/// Why the print system takes no jobs for a printer, in plain English; empty: it takes them.
///
/// @param printer  device name, with its instance behind a "/" where there is one; empty: none,
///                 which takes none
QString refusalOf(const QString& printer);

/// Whether a printer wants a password with each document, for which a person must be asked.
bool asksForPassword(const QString& printer);

/// Whether a printer turns pages that lie clockwise to put them on its upright sheets.
bool turnsClockwise(const QString& printer);

/// What a document is begun with.
struct SpoolOrder {
    QString printer; ///< device name
    QString title; ///< in the printer's queue
    Sheet sheet;
};

/// What its pages are drawn with.
struct SpoolFonts {
    QtFonts& fonts;
    QtGlyphFaces& faces;
};

/// A document on its way to a printer: drawn, then handed over.
class SpoolDocument {
public:
    virtual ~SpoolDocument() = default;

    /// Draws all pages; called once.
    /// @param pages  their origin is the corner of the printable area
    /// @return       false: they could not be kept
    virtual bool draw(const std::vector<HeldDrawing>& pages, const SpoolFonts& fonts) = 0;

    /// Gives it to the print system; may be called on another thread.
    /// @return  why it was not taken, in plain English; empty: nothing is known against it
    virtual QString handOver() = 0;
};

/// @return  null: there is no room where documents wait until they are complete
std::unique_ptr<SpoolDocument> newSpoolDocument(const SpoolOrder& order);

} // namespace pelloric::qt
