// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

class QAbstractItemView;
class QString;
class QTableView;
class QTableWidget;
class QTreeWidget;

namespace pelloric::qt {
class Kestrane;
}

// What the demonstration runs when "Preview" is pressed, and shows beside each grid for hosts to
// copy; so it stands outside of all namespaces, as it would there.

/// A table widget as a flex grid.
void previewTable(pelloric::qt::Kestrane& preview, QTableWidget& table, const QString& footer);

/// A tree widget as a list view.
void previewList(pelloric::qt::Kestrane& preview, QTreeWidget& list, const QString& footer);

/// A table view on a table of a database.
void previewQuery(pelloric::qt::Kestrane& preview, QTableView& view, const QString& footer);

/// A table view on any model.
void previewView(
    pelloric::qt::Kestrane& preview, QTableView& view, const QString& title, const QString& footer);

/// Any view, its cells as it shows them.
void previewAsShown(pelloric::qt::Kestrane& preview, QAbstractItemView& view, const QString& title,
    const QString& footer);
