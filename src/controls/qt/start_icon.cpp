// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/start_icon.h"

#include "controls/qt/back_screen.h"

#include <QPainter>
#include <QSvgRenderer>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr int LargestSheet = 132; ///< height of the sheet: pixels
constexpr int SmallestSheet = 24; ///< below this there is only grey: pixels
constexpr int TextGap = 14; ///< between sheet and text: pixels
constexpr int TextAlpha = 190;

/// A sheet with a table on it, a corner folded.
constexpr char Sheet[] = R"(<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 96 120">
<path d="M9 6h56l24 24v81a4 4 0 0 1-4 4H9a4 4 0 0 1-4-4V10a4 4 0 0 1 4-4z" fill="#000" opacity=".16"/>
<path d="M8 3h56l24 24v81a4 4 0 0 1-4 4H8a4 4 0 0 1-4-4V7a4 4 0 0 1 4-4z" fill="#fff"/>
<path d="M64 3l24 24H68a4 4 0 0 1-4-4z" fill="#d5dae1"/>
<rect x="16" y="20" width="34" height="6" rx="2" fill="#5b7ba6"/>
<rect x="16" y="40" width="60" height="10" fill="#dfe5ee"/>
<path d="M16 40h60v54H16zM16 50h60M16 61h60M16 72h60M16 83h60M38 40v54M57 40v54" fill="none"
 stroke="#9aa7b8" stroke-width="1.6"/>
<rect x="38" y="100" width="20" height="4" rx="2" fill="#c4ccd7"/>
</svg>)";

} // namespace

StartIcon::StartIcon(QWidget* parent)
    : QFrame(parent)
{
    setObjectName(QStringLiteral("frmIcon"));
    setAccessibleName(tr("No document"));
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void StartIcon::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const QColor grey = BackScreen::grey(palette());
    painter.fillRect(rect(), grey);
    const int textHeight = fontMetrics().height();
    const double height = std::min(LargestSheet, this->height() - 4 * textHeight);
    if (height < SmallestSheet)
        return;
    painter.setRenderHint(QPainter::Antialiasing);
    const double width = height * 0.8;
    const double top = (this->height() - height - TextGap - textHeight) / 2;
    QSvgRenderer(QByteArray::fromRawData(Sheet, sizeof Sheet - 1))
        .render(&painter, QRectF((this->width() - width) / 2, top, width, height));
    QColor ink = grey.lightness() < 128 ? QColor(Qt::white) : QColor(Qt::black);
    ink.setAlpha(TextAlpha);
    painter.setPen(ink);
    const QRectF line(0, top + height + TextGap, this->width(), textHeight);
    painter.drawText(line, Qt::AlignHCenter | Qt::AlignVCenter, tr("Nothing to preview yet"));
}

} // namespace pelloric::qt
