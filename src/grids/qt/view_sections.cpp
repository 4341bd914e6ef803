// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/view_sections.h"

#include "platform/numbers.h"
#include "platform/units.h"

#include <QAbstractProxyModel>
#include <QHeaderView>

namespace pelloric::qt {

namespace {

} // namespace

SectionMap::SectionMap(int count)
    : count_(count)
{
}

SectionMap SectionMap::all(const QHeaderView& header)
{
    SectionMap map(header.count());
    if (!header.sectionsMoved())
        return map;
    map.logical_.reserve(static_cast<std::size_t>(map.count_));
    for (int place = 0; place < map.count_; ++place)
        map.logical_.push_back(header.logicalIndex(place));
    return map;
}

SectionMap SectionMap::shown(const QHeaderView& header)
{
    SectionMap map = all(header);
    if (!header.sectionsHidden())
        return map;
    std::vector<int> shown;
    for (int place = 0; place < map.count_; ++place) {
        const int logical = map.logical(place);
        if (!header.isSectionHidden(logical))
            shown.push_back(logical);
    }
    map.count_ = static_cast<int>(shown.size());
    map.logical_ = std::move(shown);
    return map;
}

void fetchAll(QAbstractItemModel& model, const QModelIndex& root)
{
    if (const auto* proxy = qobject_cast<const QAbstractProxyModel*>(&model)) {
        if (proxy->sourceModel())
            fetchAll(*proxy->sourceModel(), proxy->mapToSource(root));
    }
    while (model.canFetchMore(root)) {
        const int before = model.rowCount(root);
        model.fetchMore(root);
        if (model.rowCount(root) <= before)
            return;
    }
}

Twips sectionWidth(const QHeaderView& header, int logical)
{
    return twipsOfPixels(header.sectionSize(logical), header.logicalDpiX());
}

void setSectionWidth(QHeaderView& header, int logical, Twips width)
{
    if (header.isSectionHidden(logical))
        header.showSection(logical);
    const int pixels
        = roundToInt32(static_cast<double>(width) * header.logicalDpiX() / TwipsPerInch);
    if (pixels >= 0 && pixels < header.minimumSectionSize())
        header.setMinimumSectionSize(pixels);
    header.resizeSection(logical, pixels);
}

Twips twipsOfPixels(int pixels, int dpi)
{
    return dpi > 0 ? roundToInt32(static_cast<double>(pixels) * TwipsPerInch / dpi) : 0;
}

QString columnTitle(const QAbstractItemModel& model, int logical)
{
    return model.headerData(logical, Qt::Horizontal, Qt::DisplayRole).toString();
}

} // namespace pelloric::qt
