// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_code.h"

//! [shown]
#include <pelloric/pelloric.h>

#include <QTreeWidget>

/// Hidden columns stay hidden, moved ones print where they stand.
void previewList(pelloric::qt::Kestrane& preview, QTreeWidget& list, const QString& footer)
{
    using Place = pelloric::AlignmentType;
    preview.AddHeader(QStringLiteral("Countries"), Place::LocLeft);
    preview.AddHeader(QStringLiteral("[Date Printed]"), Place::LocRight);
    preview.AddFooter(footer, Place::LocCenter); // "[Page # of Pages #]"
    preview.doPreview(&list);
}
//! [shown]
