// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/choice_box.h"

#include <QFocusEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QSignalBlocker>
#include <QWheelEvent>

namespace pelloric::qt {

ChoiceBox::ChoiceBox(QWidget* parent)
    : QComboBox(parent)
{
    setEditable(true);
    setInsertPolicy(NoInsert);
    setCompleter(nullptr);
    setFocusPolicy(Qt::StrongFocus);
    connect(this, &QComboBox::textActivated, this, &ChoiceBox::pick);
}

/// The arrow keys and the wheel pick, too, and go on from there.
void ChoiceBox::pick(const QString& text)
{
    const bool wasOpen = isOpen_;
    emit chosen(text);
    if (wasOpen)
        emit left();
}

void ChoiceBox::showPopup()
{
    isOpen_ = true;
    QComboBox::showPopup();
}

/// An entry is told of after the list was closed.
void ChoiceBox::hidePopup()
{
    QComboBox::hidePopup();
    QMetaObject::invokeMethod(
        this, [this] { isOpen_ = false; }, Qt::QueuedConnection);
}

void ChoiceBox::showText(const QString& text, int entry)
{
    shown_ = text;
    entry_ = entry;
    takeBack();
}

void ChoiceBox::setEntries(const QStringList& entries)
{
    const QSignalBlocker blocker(this);
    clear();
    addItems(entries);
    takeBack();
}

void ChoiceBox::takeBack()
{
    const QSignalBlocker blocker(this);
    const QSignalBlocker lineBlocker(lineEdit());
    setCurrentIndex(entry_);
    setEditText(shown_);
    lineEdit()->setCursorPosition(0);
}

/// Enter is kept from the line edit: the box would raise a change of its own for a text that is the
/// same as an entry.
void ChoiceBox::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        emit chosen(currentText());
        emit left();
        break;
    case Qt::Key_Escape:
        takeBack();
        emit left();
        break;
    default:
        QComboBox::keyPressEvent(event);
    }
}

void ChoiceBox::focusOutEvent(QFocusEvent* event)
{
    if (event->reason() != Qt::PopupFocusReason && event->reason() != Qt::ActiveWindowFocusReason)
        takeBack();
    QComboBox::focusOutEvent(event);
}

void ChoiceBox::wheelEvent(QWheelEvent* event)
{
    if (hasFocus())
        QComboBox::wheelEvent(event);
    else
        event->ignore();
}

} // namespace pelloric::qt
