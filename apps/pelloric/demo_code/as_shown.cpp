// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_code.h"

//! [shown]
#include <pelloric/pelloric.h>

#include <QAbstractItemView>

/// Cells look as the view shows them, and a table that is too wide is turned, then shrunk.
void previewAsShown(pelloric::qt::Kestrane& preview, QAbstractItemView& view, const QString& title,
    const QString& footer)
{
    using Place = pelloric::AlignmentType;
    pelloric::ReportOptions options;
    options.asShown = true;
    options.fit.toSheet = true;
    preview.setReportOptions(options);
    preview.AddHeader(title, Place::LocLeft);
    preview.AddHeader(QStringLiteral("[Date Printed]"), Place::LocRight);
    preview.AddFooter(footer, Place::LocCenter); // "[Page # of Pages #]"
    preview.doPreview(&view);
}
//! [shown]
