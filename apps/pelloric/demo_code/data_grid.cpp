// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_code.h"

//! [shown]
#include <pelloric/pelloric.h>

#include <QSqlTableModel>
#include <QTableView>

/// The view shows a QSqlTableModel: model->setTable("time_zones"), model->select(). As a data grid
/// its records are walked in place; doPreview(&view) prints it as it is shown instead.
void previewQuery(pelloric::qt::Kestrane& preview, QTableView& view, const QString& footer)
{
    using Place = pelloric::AlignmentType;
    preview.AddHeader(QStringLiteral("Time Zones"), Place::LocLeft);
    preview.AddHeader(QStringLiteral("[Date Printed]"), Place::LocRight);
    preview.AddFooter(footer, Place::LocCenter); // "[Page # of Pages #]"
    preview.doPreview(pelloric::qt::dataGrid(view).get());
}
//! [shown]
