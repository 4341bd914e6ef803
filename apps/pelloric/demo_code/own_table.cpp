// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_code.h"

//! [shown]
#include <pelloric/pelloric.h>

#include <QTableView>

/// The view may show any model: a QStandardItemModel, a proxy, one of your own.
void previewView(
    pelloric::qt::Kestrane& preview, QTableView& view, const QString& title, const QString& footer)
{
    using Place = pelloric::AlignmentType;
    preview.AddHeader(title, Place::LocLeft);
    preview.AddHeader(QStringLiteral("[Date Printed]"), Place::LocRight);
    preview.AddFooter(footer, Place::LocCenter); // "[Page # of Pages #]"
    preview.doPreview(&view);
}
//! [shown]
