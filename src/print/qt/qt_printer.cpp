// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/qt_printer.h"

#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/units.h"
#include "print/qt/paper_sizes.h"
#include "print/qt/qt_printer_system.h"
#include "print/qt/spooler.h"
#include "view/held_drawing.h"

#include <QDir>
#include <QPrinterInfo>
#include <QStorageInfo>

#include <optional>
#include <vector>

namespace pelloric::qt {

namespace {

/// A document is sent over networks, too; its window lives meanwhile.
constexpr std::chrono::milliseconds HandOverPatience { 30000 };

/// A document waits in the folder of temporary files until it is complete.
constexpr qint64 RoomForDocument = 8 * 1024 * 1024;

[[noreturn]] void refuse(const QString& printer, const QString& reason)
{
    const QString text = printer.isEmpty() ? reason : printer + QStringLiteral(": ") + reason;
    throw RunTimeError(ErrorNumber::InvalidCall, toText(text));
}

/// @throws RunTimeError InvalidCall: there is no room where documents wait
void requireRoom(const QString& printer)
{
    const QString folder = QDir::tempPath();
    const QStorageInfo storage(folder);
    if (storage.isValid() && storage.bytesAvailable() < RoomForDocument)
        refuse(printer, phrased(u"no room for the document in %1", { folder }));
}

/// What a printer says before a document begins.
struct Welcome {
    QString refusal {}; ///< empty: it takes the document
    bool asksForPassword = false;
    std::optional<Sheet> sheet {}; ///< when it was asked for
};

Welcome welcomeOf(const QString& printer, const std::optional<PaperRequest>& pages)
{
    Welcome welcome { .refusal = refusalOf(printer) };
    if (!welcome.refusal.isEmpty() || !pages)
        return welcome;
    welcome.asksForPassword = asksForPassword(printer);
    welcome.sheet = sheetOf(QPrinterInfo::printerInfo(printer), *pages);
    return welcome;
}

} // namespace

/// One job.
struct QtPrinter::Document {
    std::shared_ptr<SpoolDocument> spool; ///< outlives this where it is handed over late
    QString printer;
    bool asksForPassword = false;
    std::vector<HeldDrawing> pages = std::vector<HeldDrawing>(1);
};

QtPrinter::QtPrinter(const QtPrinterSystem& system, QtFonts& fonts)
    : system_(system)
    , fonts_(fonts)
    , faces_(fonts)
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
    const auto code = system_.calls().ask<std::int16_t>([printer = toQString(name)] {
        const QPrinterInfo info = QPrinterInfo::printerInfo(printer);
        return info.isNull() ? std::int16_t { 0 } : formCodeOf(info, info.defaultPageSize());
    });
    return code.value_or(std::int16_t { 0 });
}

void QtPrinter::applyPaperSize(std::int16_t code)
{
    if (code < 1 || static_cast<std::size_t>(code) > system_.forms().size())
        return;
    paperSize_ = code;
    paperPrinter_ = deviceName();
    pageSize_ = {};
    place_.reset();
}

void QtPrinter::setPageSize(Twips width, Twips height)
{
    pageSize_ = { width, height };
    place_.reset();
}

void QtPrinter::applyOrientation(std::int16_t code)
{
    orientation_ = code;
    place_.reset();
}

void QtPrinter::setDocumentTitle(TextView title)
{
    title_ = title;
    isAnnounced_ = !document_;
}

void QtPrinter::newPage()
{
    drawing();
    HeldDrawing& page = document_->pages.emplace_back();
    applyAttributes(page);
    page.clear();
}

void QtPrinter::endDoc()
{
    if (!document_)
        return;
    const std::unique_ptr<Document> document = std::move(document_);
    attributes_.current = {};
    if (!document->spool->draw(document->pages, { fonts_, faces_ }))
        refuse(document->printer, phrased(u"the document could not be ended"));
    const QString error = handOver(*document);
    if (!error.isEmpty())
        refuse(document->printer, error);
}

/// A person who is asked for a password is asked here, before the screen.
QString QtPrinter::handOver(const Document& document) const
{
    if (document.asksForPassword)
        return document.spool->handOver();
    const auto error = system_.calls().ask<QString>(
        [spool = document.spool] { return spool->handOver(); }, HandOverPatience);
    return error ? *error : system_.calls().trouble();
}

/// The surface of the document, which begins here if there is none.
DrawingSurface& QtPrinter::drawing()
{
    if (!document_)
        begin();
    return document_->pages.back();
}

/// The surface on which an attribute takes effect at once; null: it waits for a document.
DrawingSurface* QtPrinter::attributeSurface()
{
    if (!document_ && isAnnounced_)
        begin();
    return document_ ? &document_->pages.back() : nullptr;
}

/// 0: none.
std::int16_t QtPrinter::appliedPaper(const Text& printer) const
{
    return printer == paperPrinter_ ? paperSize_ : std::int16_t { 0 };
}

/// The pages as they are put on paper; a code that was applied goes before their size.
PaperRequest QtPrinter::pages(const Text& printer) const
{
    PaperRequest pages { .orientation = orientation_, .width = pageSize_.x, .height = pageSize_.y };
    if (pages.width <= 0 || pages.height <= 0)
        pages.code = appliedPaper(printer);
    return pages;
}

/// Asks the printer whether it takes a document, and for its sheet where that is not known yet.
/// @throws RunTimeError InvalidCall: there is no printer, or it takes no document
void QtPrinter::requireTaker(const Text& name)
{
    const QString printer = toQString(name);
    std::optional<PaperRequest> asked;
    if (!place_ || place_->printer != name)
        asked = pages(name);
    const auto welcome
        = system_.calls().ask<Welcome>([printer, asked] { return welcomeOf(printer, asked); });
    if (!welcome)
        refuse(printer, system_.calls().trouble());
    if (!welcome->refusal.isEmpty())
        refuse(printer, welcome->refusal);
    if (welcome->sheet)
        place_ = Place { name, *welcome->sheet, welcome->asksForPassword };
}

/// @throws RunTimeError InvalidCall: there is no printer, or it takes no document
void QtPrinter::begin()
{
    isAnnounced_ = false;
    const Text name = deviceName();
    const QString printer = toQString(name);
    requireTaker(name);
    requireRoom(printer);
    auto document = std::make_unique<Document>();
    document->printer = printer;
    document->asksForPassword = place_->asksForPassword;
    document->spool = newSpoolDocument({ printer, toQString(title_), place_->sheet });
    if (!document->spool)
        refuse(printer, phrased(u"the document could not be begun"));
    applyAttributes(document->pages.back());
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
