// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_code.h"

//! [shown]
#include <pelloric/pelloric.h>

#include <QTableWidget>

/// Once, after the QApplication: pelloric::qt::usePreviewWindow();
/// "preview" is a Kestrane on the form: new pelloric::qt::Kestrane(form).
void previewTable(pelloric::qt::Kestrane& preview, QTableWidget& table, const QString& footer)
{
    using Place = pelloric::AlignmentType;
    preview.AddHeader(QStringLiteral("Wines"), Place::LocLeft);
    preview.AddHeader(QStringLiteral("[Date Printed]"), Place::LocRight);
    preview.AddFooter(footer, Place::LocCenter); // "[Page # of Pages #]"
    preview.doPreview(&table);
}
//! [shown]
