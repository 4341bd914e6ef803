// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/sheet.h"

#include "platform/qt/qt_text.h"
#include "platform/units.h"
#include "print/paper_fit.h"
#include "print/qt/paper_sizes.h"
#include "print/qt/spooler.h"

#include <QPrinter>
#include <QPrinterInfo>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr std::int16_t Landscape = 2;

QPageLayout::Orientation orientationOf(const PaperRequest& pages)
{
    return pages.orientation == Landscape ? QPageLayout::Landscape : QPageLayout::Portrait;
}

bool isSame(const QSizeF& one, const QSizeF& other)
{
    return std::abs(one.width() - other.width()) < SamePaperMm
        && std::abs(one.height() - other.height()) < SamePaperMm;
}

/// The sizes that a printer takes besides its own papers: millimetres.
bool takesSize(const QPrinterInfo& printer, const QSizeF& size)
{
    if (!printer.supportsCustomPageSizes())
        return false;
    const QSizeF least = printer.minimumPhysicalPageSize().size(QPageSize::Millimeter);
    const QSizeF most = printer.maximumPhysicalPageSize().size(QPageSize::Millimeter);
    const auto lies = [](double length, double low, double high) {
        return length > low - SamePaperMm && (high <= 0 || length < high + SamePaperMm);
    };
    return lies(size.width(), least.width(), most.width())
        && lies(size.height(), least.height(), most.height());
}

/// The sheet of the pages' own size; not valid when the printer has none.
Sheet exactSheet(const QPrinterInfo& printer, const PaperRequest& pages)
{
    const QSizeF size(pages.width / TwipsPerMm, pages.height / TwipsPerMm);
    const QSizeF turned = size.transposed();
    for (const QPageSize& paper : printer.supportedPageSizes()) {
        const QSizeF own = paper.size(QPageSize::Millimeter);
        if (isSame(own, size))
            return { .paper = paper, .orientation = QPageLayout::Portrait };
        if (isSame(own, turned))
            return { .paper = paper, .orientation = QPageLayout::Landscape };
    }
    const bool lies = size.width() > size.height();
    const QSizeF& upright = lies ? turned : size;
    if (!takesSize(printer, upright))
        return {};
    return { .paper = QPageSize(upright, QPageSize::Millimeter, {}, QPageSize::ExactMatch),
        .orientation = lies ? QPageLayout::Landscape : QPageLayout::Portrait };
}

} // namespace

QMarginsF turnedEdges(const QMarginsF& edges, bool clockwise)
{
    if (clockwise)
        return { edges.top(), edges.right(), edges.bottom(), edges.left() };
    return { edges.bottom(), edges.left(), edges.top(), edges.right() };
}

Sheet sheetOf(const QPrinterInfo& info, const PaperRequest& pages)
{
    Sheet sheet { .paper = pageSizeOf(info, pages.code), .orientation = orientationOf(pages) };
    if (!sheet.paper.isValid() && pages.width > 0 && pages.height > 0)
        sheet = exactSheet(info, pages);
    if (!sheet.paper.isValid())
        sheet = { .paper = info.defaultPageSize(), .orientation = orientationOf(pages) };
    QPrinter printer(info, QPrinter::HighResolution);
    if (sheet.paper.isValid())
        printer.setPageSize(sheet.paper);
    QPageLayout layout = printer.pageLayout();
    layout.setUnits(QPageLayout::Point);
    sheet.paper = layout.pageSize();
    sheet.edges = layout.minimumMargins();
    if (sheet.orientation == QPageLayout::Landscape)
        sheet.edges = turnedEdges(sheet.edges, turnsClockwise(info.printerName()));
    return sheet;
}

PaperForm formOf(const Sheet& sheet)
{
    QSizeF size = sheet.paper.size(QPageSize::Millimeter);
    if (sheet.orientation == QPageLayout::Landscape)
        size.transpose();
    return { toText(sheet.paper.name()), size.width(), size.height() };
}

} // namespace pelloric::qt
