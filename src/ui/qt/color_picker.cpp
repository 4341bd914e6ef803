// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/color_picker.h"

#include "ui/qt/dialog_parts.h"

#include <QColorDialog>
#include <QPainter>
#include <QStyle>

namespace pelloric::qt {

namespace {

constexpr int Inset = 6; ///< between the button's edge and the swatch: pixels
constexpr int CharactersWide = 16;

} // namespace

ColorPicker::ColorPicker(const QString& name, QWidget* parent)
    : QPushButton(parent)
{
    setObjectName(name);
    setAutoDefault(false);
    connect(this, &QPushButton::clicked, this, &ColorPicker::ask);
}

void ColorPicker::setColor(double color)
{
    color_ = color;
    setToolTip(colorOf(color).name().toUpper());
    setAccessibleDescription(toolTip());
    update();
}

QSize ColorPicker::sizeHint() const
{
    return { fontMetrics().averageCharWidth() * CharactersWide, QPushButton::sizeHint().height() };
}

void ColorPicker::paintEvent(QPaintEvent* event)
{
    QPushButton::paintEvent(event);
    QPainter painter(this);
    QColor edge = palette().color(QPalette::ButtonText);
    edge.setAlphaF(0.5F);
    painter.setPen(edge);
    QColor fill = colorOf(color_);
    if (!isEnabled())
        fill.setAlphaF(0.4F);
    painter.setBrush(fill);
    painter.drawRect(rect().adjusted(Inset, Inset, -Inset - 1, -Inset - 1));
}

void ColorPicker::ask()
{
    const QColor chosen = QColorDialog::getColor(colorOf(color_), this);
    if (!chosen.isValid())
        return;
    setColor(numberOf(chosen));
    Q_EMIT colorChanged(color_);
}

} // namespace pelloric::qt
