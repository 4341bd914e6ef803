// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/up_down_box.h"

#include <QLineEdit>
#include <QSignalBlocker>
#include <QStyleOptionSpinBox>
#include <QWheelEvent>

#include <algorithm>
#include <cstdlib>

namespace pelloric::qt {

namespace {

constexpr int CharactersShown = 9; ///< the box is as wide as this many digits

} // namespace

UpDownBox::UpDownBox(const QString& name, const QString& textName, QWidget* parent)
    : QAbstractSpinBox(parent)
{
    setObjectName(name);
    textBox()->setObjectName(textName);
    setFocusPolicy(Qt::StrongFocus);
}

void UpDownBox::stepBy(int steps)
{
    for (int step = 0; step < std::abs(steps) && step_; ++step)
        step_(steps > 0);
}

QSize UpDownBox::sizeHint() const
{
    ensurePolished();
    const QSize text(fontMetrics().horizontalAdvance(QLatin1Char('0')) * CharactersShown,
        lineEdit()->sizeHint().height());
    QStyleOptionSpinBox option;
    initStyleOption(&option);
    return style()->sizeFromContents(QStyle::CT_SpinBox, &option, text, this);
}

QSize UpDownBox::minimumSizeHint() const { return sizeHint(); }

QAbstractSpinBox::StepEnabled UpDownBox::stepEnabled() const
{
    return StepUpEnabled | StepDownEnabled;
}

void UpDownBox::wheelEvent(QWheelEvent* event)
{
    if (hasFocus())
        QAbstractSpinBox::wheelEvent(event);
    else
        event->ignore();
}

void rewriteText(QLineEdit& box, const QString& text, int caret)
{
    if (box.text() == text)
        return;
    const QSignalBlocker silent(box);
    box.setText(text);
    box.setCursorPosition(std::min(caret, static_cast<int>(text.size())));
}

} // namespace pelloric::qt
