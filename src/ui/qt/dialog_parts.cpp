// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/dialog_parts.h"

#include <QAbstractButton>
#include <QBoxLayout>
#include <QDialog>
#include <QDialogButtonBox>
#include <QKeySequence>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QShortcut>

#include <cmath>

namespace pelloric::qt {

namespace {

constexpr double Colors = 0x1000000; ///< how many there are
constexpr double PaleLightness = 0.72; ///< from here a text is hard to read on white; 0 to 1
constexpr QRgb DarkGround = 0xFF303030;

QKeySequence altAnd(char key) { return QKeySequence(QStringLiteral("Alt+") + QLatin1Char(key)); }

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
        buddy->setAccessibleName(text.trimmed());
    if (key != 0) {
        auto* shortcut = new QShortcut(altAnd(key), label);
        QObject::connect(shortcut, &QShortcut::activated, buddy,
            [buddy] { buddy->setFocus(Qt::ShortcutFocusReason); });
    }
    return label;
}

void setAltKey(QAbstractButton& button, char key) { button.setShortcut(altAnd(key)); }

ClosingButtons addClosingButtons(
    QDialog& dialog, QBoxLayout& layout, const QString& okText, const QString& cancelText)
{
    auto* box = new QDialogButtonBox(&dialog);
    ClosingButtons buttons { box->addButton(okText, QDialogButtonBox::AcceptRole),
        box->addButton(cancelText, QDialogButtonBox::RejectRole) };
    buttons.ok->setObjectName(QStringLiteral("cmdOk"));
    buttons.ok->setDefault(true);
    buttons.cancel->setObjectName(QStringLiteral("cmdCancel"));
    buttons.cancel->setAutoDefault(false);
    QObject::connect(box, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    layout.addWidget(box);
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
