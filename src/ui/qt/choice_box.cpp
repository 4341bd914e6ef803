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
    lineEdit()->installEventFilter(this);
    connect(this, &QComboBox::textActivated, this, &ChoiceBox::chosen);
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

/// Enter is handled before the line edit sees it: the box would raise a change of its own for a
/// text that is the same as an entry.
bool ChoiceBox::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != lineEdit())
        return QComboBox::eventFilter(watched, event);
    if (event->type() == QEvent::ShortcutOverride
        && static_cast<QKeyEvent*>(event)->key() == Qt::Key_Escape) {
        event->accept(); // Escape leaves the box, not the window
        return true;
    }
    if (event->type() == QEvent::FocusOut) {
        const auto reason = static_cast<QFocusEvent*>(event)->reason();
        if (reason != Qt::PopupFocusReason && reason != Qt::ActiveWindowFocusReason)
            takeBack();
    }
    if (event->type() == QEvent::KeyPress) {
        switch (static_cast<QKeyEvent*>(event)->key()) {
        case Qt::Key_Return:
        case Qt::Key_Enter:
            emit chosen(currentText());
            lineEdit()->selectAll();
            return true;
        case Qt::Key_Escape:
            takeBack();
            emit left();
            return true;
        default:
            break;
        }
    }
    return QComboBox::eventFilter(watched, event);
}

void ChoiceBox::wheelEvent(QWheelEvent* event)
{
    if (hasFocus())
        QComboBox::wheelEvent(event);
    else
        event->ignore();
}

} // namespace pelloric::qt
