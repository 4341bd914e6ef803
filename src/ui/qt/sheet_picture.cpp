// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/sheet_picture.h"

#include <QPainter>
#include <QSvgRenderer>

namespace pelloric::qt {

namespace {

constexpr int PictureSize = 72; ///< pixels of a plain screen
constexpr int IconSizes[] = { 16, 32, 48 };

/// A sheet with some lines of text, a corner folded.
constexpr char Sheet[] = R"(<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 16 16">
<path d="M3.5 1.5h6l3 3v10h-9z" fill="#fff" stroke="#6b7785"/>
<path d="M9.5 1.5v3h3" fill="#d5dae1" stroke="#6b7785" stroke-linejoin="round"/>
<path d="M5.5 7.5h5M5.5 9.5h5M5.5 11.5h3" stroke="#8fa6c8" stroke-linecap="round"/></svg>)";

constexpr char Envelope[] = R"(<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 16 16">
<rect x="1.5" y="3.5" width="13" height="9" rx=".6" fill="#fff" stroke="#6b7785"/>
<path d="M1.8 4l6.2 5 6.2-5M1.8 12l4.4-4.3M14.2 12L9.8 7.7" fill="none" stroke="#8fa6c8"/></svg>)";

/// A sheet with a letter on it that stands upright, so that the picture tells up from across.
void paintSheet(QPainter& painter, const QRectF& sheet)
{
    painter.setPen(QPen(QColor(0x6B, 0x77, 0x85), 1));
    painter.setBrush(Qt::white);
    painter.drawRect(sheet);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0xC0, 0xC0, 0xFF));
    const double step = 6;
    const double inset = 7;
    for (double y = sheet.top() + inset + 14; y < sheet.bottom() - inset; y += step)
        painter.drawRect(QRectF(sheet.left() + inset, y, sheet.width() - 2 * inset, 2));
    painter.setBrush(QColor(0x3A, 0x62, 0xC8));
    painter.drawRect(QRectF(sheet.left() + inset, sheet.top() + inset, sheet.width() / 2, 6));
}

QPixmap drawn(QSvgRenderer& renderer, int size)
{
    QPixmap pixmap(size, size);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    renderer.render(&painter);
    return pixmap;
}

} // namespace

SheetPicture::SheetPicture(const QString& name, bool portrait, QWidget* parent)
    : QWidget(parent)
    , portrait_(portrait)
{
    setObjectName(name);
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
}

QSize SheetPicture::sizeHint() const { return { PictureSize, PictureSize }; }

void SheetPicture::paintEvent(QPaintEvent*)
{
    const double longSide = PictureSize - 6;
    const double shortSide = longSide / 1.414;
    QRectF sheet(0, 0, portrait_ ? shortSide : longSide, portrait_ ? longSide : shortSide);
    sheet.moveCenter(QRectF(rect()).center());
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    paintSheet(painter, sheet);
}

QIcon paperIcon(bool isEnvelope)
{
    QSvgRenderer renderer(QByteArray(isEnvelope ? Envelope : Sheet));
    QIcon icon;
    for (const int size : IconSizes)
        icon.addPixmap(drawn(renderer, size));
    return icon;
}

} // namespace pelloric::qt
