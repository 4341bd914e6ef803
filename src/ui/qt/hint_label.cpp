// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/hint_label.h"

#include <QAccessible>
#include <QHBoxLayout>
#include <QLabel>
#include <QStyle>

namespace pelloric::qt {

HintLabel::HintLabel(const QString& name, QWidget* parent)
    : QWidget(parent)
    , text_(new QLabel(this))
{
    auto* const icon = new QLabel(this);
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    icon->setPixmap(style()
                        ->standardIcon(QStyle::SP_MessageBoxWarning)
                        .pixmap(QSize(size, size), devicePixelRatioF()));
    text_->setObjectName(name);
    text_->setTextFormat(Qt::PlainText);
    text_->setWordWrap(true);
    text_->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(icon, 0, Qt::AlignTop);
    layout->addWidget(text_, 1);
    hide();
}

void HintLabel::say(const QString& sentence)
{
    if (sentence == text_->text())
        return;
    text_->setText(sentence);
    setVisible(!sentence.isEmpty());
    if (sentence.isEmpty())
        return;
    text_->setAccessibleName(sentence);
    QAccessibleEvent told(text_, QAccessible::Alert);
    QAccessible::updateAccessibility(&told);
}

QString HintLabel::sentence() const { return text_->text(); }

} // namespace pelloric::qt
