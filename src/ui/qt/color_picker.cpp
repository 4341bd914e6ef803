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

std::optional<QColor> chooseColor(QWidget* parent, const QColor& present)
{
    const QColor chosen = QColorDialog::getColor(present, parent);
    return chosen.isValid() ? std::optional(chosen) : std::nullopt;
}

ColorPicker::ColorPicker(const QString& name, QWidget* parent, ChooseColor choose)
    : QPushButton(parent)
    , choose_(std::move(choose))
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
    const std::optional<QColor> chosen = choose_(this, colorOf(color_));
    if (!chosen)
        return;
    setColor(numberOf(*chosen));
    Q_EMIT colorChanged(color_);
}

} // namespace pelloric::qt
