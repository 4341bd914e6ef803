// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/dialog_parts.h"

#include "ui/qt/named_boxes.h"

#include <QAbstractSpinBox>
#include <QBoxLayout>
#include <QComboBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <cmath>

namespace pelloric::qt {

namespace {

constexpr double Colors = 0x1000000; ///< how many there are
constexpr double PaleLightness = 0.72; ///< from here a text is hard to read on white; 0 to 1
constexpr QRgb DarkGround = 0xFF303030;
constexpr float HintStrength = 0.5F; ///< of a text's ink

/// A control's name for assistive technology: its caption without blanks and colon at the ends.
void nameAfter(QWidget& control, const QString& caption)
{
    QString name = caption.trimmed();
    if (name.endsWith(QLatin1Char(':')))
        name.chop(1);
    if (auto* const combo = qobject_cast<QComboBox*>(&control))
        nameBox(*combo, name);
    else if (auto* const spin = qobject_cast<QAbstractSpinBox*>(&control))
        nameBox(*spin, name);
    else
        control.setAccessibleName(name);
}

/// How light a colour looks, 0 to 1.
double lightnessOf(const QColor& color)
{
    return 0.299 * color.redF() + 0.587 * color.greenF() + 0.114 * color.blueF();
}

} // namespace

QString elementName(const char* array, int index)
{
    return QStringLiteral("%1(%2)").arg(QLatin1String(array)).arg(index);
}

QLabel* captionFor(
    const QString& text, char key, QWidget* buddy, QWidget* parent, const QString& name)
{
    auto* label = new QLabel(text, parent);
    label->setObjectName(name);
    label->setTextFormat(Qt::PlainText);
    if (buddy == nullptr)
        return label;
    label->setBuddy(buddy);
    if (buddy->accessibleName().isEmpty())
        nameAfter(*buddy, text);
    if (key != 0)
        setFocusKey(*buddy, key, *label);
    return label;
}

ClosingButtons addClosingButtons(
    QDialog& dialog, QBoxLayout& layout, const ClosingButton& ok, const ClosingButton& cancel)
{
    auto* box = new QDialogButtonBox(&dialog);
    ClosingButtons buttons { box->addButton(ok.text, QDialogButtonBox::AcceptRole),
        box->addButton(cancel.text, QDialogButtonBox::RejectRole) };
    setAltKey(*buttons.ok, ok.key);
    setAltKey(*buttons.cancel, cancel.key);
    buttons.ok->setObjectName(QStringLiteral("cmdOk"));
    buttons.ok->setDefault(true);
    buttons.cancel->setObjectName(QStringLiteral("cmdCancel"));
    buttons.cancel->setAutoDefault(false);
    QObject::connect(box, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    layout.addWidget(box);
    showAltKeys(dialog);
    return buttons;
}

QColor colorOf(double number)
{
    const double whole = std::isfinite(number) ? std::fmod(std::nearbyint(number), Colors) : 0;
    const auto bits = static_cast<std::uint32_t>(whole < 0 ? whole + Colors : whole);
    return QColor(static_cast<int>(bits & 0xFFU), static_cast<int>(bits >> 8U & 0xFFU),
        static_cast<int>(bits >> 16U & 0xFFU));
}

double numberOf(const QColor& color)
{
    return color.red() + 0x100 * color.green() + 0x10000 * color.blue();
}

void showHint(QLineEdit& box, const QString& hint)
{
    QPalette palette = box.palette();
    QColor ink = palette.color(QPalette::Text);
    ink.setAlphaF(HintStrength);
    palette.setColor(QPalette::PlaceholderText, ink);
    box.setPalette(palette);
    box.setPlaceholderText(hint);
}

void showInColor(QLineEdit& box, double color)
{
    const QColor ink = colorOf(color);
    QPalette palette;
    palette.setColor(
        QPalette::Base, lightnessOf(ink) < PaleLightness ? QColor(Qt::white) : QColor(DarkGround));
    palette.setColor(QPalette::Text, ink);
    box.setPalette(palette);
}

} // namespace pelloric::qt
