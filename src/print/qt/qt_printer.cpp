// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/qt_printer.h"

#include "platform/qt/qt_drawing_surface.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "print/qt/paper_sizes.h"
#include "print/qt/spooler.h"

#include <QDir>
#include <QPageLayout>
#include <QPainter>
#include <QPrinter>
#include <QPrinterInfo>
#include <QStorageInfo>

#include <optional>

namespace pelloric::qt {

namespace {

constexpr double TwipsPerInch = 1440;
constexpr std::int16_t Landscape = 2;

/// Fine enough that the thinnest line is 0.12 points wide, and coarse enough that it is seen.
constexpr int Resolution = 600;

/// A document waits in the folder of temporary files until it is complete.
constexpr qint64 RoomForDocument = 8 * 1024 * 1024;

[[noreturn]] void refuse(const QString& printer, const QString& reason)
{
    const QString text = printer.isEmpty() ? reason : printer + QStringLiteral(": ") + reason;
    throw RunTimeError(ErrorNumber::InvalidCall, toText(text));
}

/// @throws RunTimeError InvalidCall: the printer takes no document now
void requireTaker(const QString& printer)
{
    const QString refusal = refusalOf(printer);
    if (!refusal.isEmpty())
        refuse(printer, refusal);
    const QString folder = QDir::tempPath();
    const QStorageInfo storage(folder);
    if (storage.isValid() && storage.bytesAvailable() < RoomForDocument)
        refuse(printer, QStringLiteral("no room for the document in %1").arg(folder));
}

void setUp(QPrinter& printer, const QPageSize& paper, std::int16_t orientation)
{
    const QList<int> resolutions = printer.supportedResolutions();
    if (resolutions.isEmpty() || resolutions.contains(Resolution))
        printer.setResolution(Resolution);
    printer.setFullPage(false);
    if (paper.isValid())
        printer.setPageSize(paper);
    printer.setPageOrientation(
        orientation == Landscape ? QPageLayout::Landscape : QPageLayout::Portrait);
    const QPageLayout layout = printer.pageLayout();
    printer.setPageMargins(layout.minimumMargins(), layout.units());
    printer.setDuplex(QPrinter::DuplexNone);
    printer.setCopyCount(1);
}

} // namespace

/// One job; its parts end in the reverse order.
struct QtPrinter::Document {
    explicit Document(const QPrinterInfo& info)
        : printer(info, QPrinter::HighResolution)
    {
    }

    QPrinter printer;
    QPainter painter;
    std::optional<QtDrawingSurface> surface;
};

QtPrinter::QtPrinter(const PrinterSystem& system, QtFonts& fonts)
    : system_(system)
    , fonts_(fonts)
{
}

QtPrinter::~QtPrinter() = default;

void QtPrinter::clear() { drawing().clear(); }

void QtPrinter::setFontName(TextView name)
{
    attributes_.fontName = name;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFontName(name);
}

void QtPrinter::setFontSize(float size)
{
    attributes_.fontSize = size;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFontSize(size);
}

void QtPrinter::setFontBold(bool bold)
{
    attributes_.fontBold = bold;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFontBold(bold);
}

void QtPrinter::setFontItalic(bool italic)
{
    attributes_.fontItalic = italic;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFontItalic(italic);
}

void QtPrinter::setFontTransparent(bool transparent)
{
    attributes_.fontTransparent = transparent;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFontTransparent(transparent);
}

void QtPrinter::setForeColor(Color color)
{
    attributes_.foreColor = color;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setForeColor(color);
}

void QtPrinter::setDrawWidth(std::int16_t width)
{
    attributes_.drawWidth = width;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setDrawWidth(width);
}

void QtPrinter::setDrawStyle(std::int16_t style)
{
    attributes_.drawStyle = style;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setDrawStyle(style);
}

void QtPrinter::setFillStyle(std::int16_t style)
{
    attributes_.fillStyle = style;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFillStyle(style);
}

void QtPrinter::setFillColor(Color color)
{
    attributes_.fillColor = color;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setFillColor(color);
}

void QtPrinter::setCurrentX(Twips x)
{
    attributes_.current.x = x;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setCurrentX(x);
}

void QtPrinter::setCurrentY(Twips y)
{
    attributes_.current.y = y;
    if (DrawingSurface* const surface = attributeSurface())
        surface->setCurrentY(y);
}

void QtPrinter::line(Tpoint from, Tpoint to) { drawing().line(from, to); }

void QtPrinter::box(Tpoint corner, Tpoint opposite, Color outline)
{
    drawing().box(corner, opposite, outline);
}

void QtPrinter::print(TextView text) { drawing().print(text); }

void QtPrinter::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    drawing().picture(filePath, topLeft, size);
}

Text QtPrinter::deviceName() const { return system_.currentPrinter(); }

std::int16_t QtPrinter::paperSize() const
{
    const Text name = deviceName();
    if (const std::int16_t applied = appliedPaper(name); applied != 0)
        return applied;
    const QPrinterInfo info = QPrinterInfo::printerInfo(toQString(name));
    return info.isNull() ? std::int16_t { 0 } : formCodeOf(info, info.defaultPageSize());
}

void QtPrinter::applyPaperSize(std::int16_t code)
{
    if (code < 1 || static_cast<std::size_t>(code) > system_.forms().size())
        return;
    paperSize_ = code;
    paperPrinter_ = deviceName();
}

void QtPrinter::setDocumentTitle(TextView title)
{
    title_ = title;
    isAnnounced_ = !document_;
}

void QtPrinter::newPage()
{
    drawing();
    if (!document_->printer.newPage()) {
        document_.reset();
        refuse(toQString(deviceName()), QStringLiteral("the page could not be ended"));
    }
    document_->surface->clear();
}

void QtPrinter::endDoc()
{
    if (!document_)
        return;
    const QString name = document_->printer.printerName();
    const bool isEnded = document_->painter.end();
    const QString error
        = isEnded ? handOverError() : QStringLiteral("the document could not be ended");
    document_.reset();
    attributes_.current = {};
    if (!error.isEmpty())
        refuse(name, error);
}

/// The surface of the document, which begins here if there is none.
DrawingSurface& QtPrinter::drawing()
{
    if (!document_)
        begin();
    return *document_->surface;
}

/// The surface on which an attribute takes effect at once; null: it waits for a document.
DrawingSurface* QtPrinter::attributeSurface()
{
    if (!document_ && isAnnounced_)
        begin();
    return document_ ? &*document_->surface : nullptr;
}

/// 0: none.
std::int16_t QtPrinter::appliedPaper(const Text& printer) const
{
    return printer == paperPrinter_ ? paperSize_ : std::int16_t { 0 };
}

QPageSize QtPrinter::paperOf(const QPrinterInfo& printer) const
{
    const QPageSize paper = pageSizeOf(printer, appliedPaper(toText(printer.printerName())));
    return paper.isValid() ? paper : printer.defaultPageSize();
}

/// @throws RunTimeError InvalidCall: there is no printer, or it takes no document
void QtPrinter::begin()
{
    isAnnounced_ = false;
    const QString name = toQString(deviceName());
    requireTaker(name);
    const QPrinterInfo info = QPrinterInfo::printerInfo(name);
    auto document = std::make_unique<Document>(info);
    document->printer.setDocName(toQString(title_));
    setUp(document->printer, paperOf(info), orientation_);
    if (!document->painter.begin(&document->printer))
        refuse(name, QStringLiteral("the document could not be begun"));
    const double scale = document->printer.logicalDpiX() / TwipsPerInch;
    document->painter.scale(scale, scale);
    document->surface.emplace(document->painter, fonts_);
    applyAttributes(*document->surface);
    document_ = std::move(document);
}

void QtPrinter::applyAttributes(DrawingSurface& surface) const
{
    surface.setFontName(attributes_.fontName);
    surface.setFontSize(attributes_.fontSize);
    surface.setFontBold(attributes_.fontBold);
    surface.setFontItalic(attributes_.fontItalic);
    surface.setFontTransparent(attributes_.fontTransparent);
    surface.setForeColor(attributes_.foreColor);
    surface.setDrawWidth(attributes_.drawWidth);
    surface.setDrawStyle(attributes_.drawStyle);
    surface.setFillStyle(attributes_.fillStyle);
    surface.setFillColor(attributes_.fillColor);
    surface.setCurrentX(attributes_.current.x);
    surface.setCurrentY(attributes_.current.y);
}

} // namespace pelloric::qt
