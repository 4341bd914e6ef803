// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/units.h"

#include <QModelIndex>

#include <vector>

class QAbstractItemModel;
class QHeaderView;

namespace pelloric::qt {

/// The sections of a header in the order in which they are seen.
class SectionMap {
public:
    /// No sections.
    SectionMap() = default;

    /// So many sections in their own order.
    explicit SectionMap(int count);

    /// All sections, those that are hidden too, which have no width.
    static SectionMap all(const QHeaderView& header);

    /// The sections that are not hidden.
    static SectionMap shown(const QHeaderView& header);

    int count() const { return count_; }

    /// The model's number of a section.
    /// @param place  0 to `count() - 1`
    int logical(int place) const
    {
        return logical_.empty() ? place : logical_[static_cast<std::size_t>(place)];
    }

private:
    std::vector<int> logical_; ///< empty: every section in its own place
    int count_ = 0;
};

/// Lets a model fetch the rows that it has not fetched yet, through all of its proxies.
///
/// A model that has more but adds no row when it is asked is not asked again.
void fetchAll(QAbstractItemModel& model, const QModelIndex& root);

/// Pixels as twips, at the header's logical resolution.
Twips sectionWidth(const QHeaderView& header, int logical);

/// Sets a width in twips; a hidden section is shown, and the header's least width gives way.
void setSectionWidth(QHeaderView& header, int logical, Twips width);

/// Pixels as twips, rounded half to even.
Twips twipsOfPixels(int pixels, int dpi);

/// The title of a column as the header shows it.
QString columnTitle(const QAbstractItemModel& model, int logical);

} // namespace pelloric::qt
