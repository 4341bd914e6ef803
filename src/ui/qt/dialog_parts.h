// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/qt/alt_keys.h"

#include <QColor>
#include <QString>

class QBoxLayout;
class QDialog;
class QLabel;
class QLineEdit;
class QPushButton;
class QWidget;

namespace pelloric::qt {

/// The object name of an element of a control array: "Option1(2)".
QString elementName(const char* array, int index);

/// A caption that is shown letter by letter; Alt and a letter of it go to the control it describes.
///
/// The caption itself holds no mark for the letter, so that it reads the same everywhere. A control
/// without an accessible name is named after it.
/// @param key    the letter; 0: none
/// @param buddy  what the caption describes; may be null
QLabel* captionFor(
    const QString& text, char key, QWidget* buddy, QWidget* parent, const QString& name = {});

/// A button that closes a dialog, and the letter that presses it with Alt.
struct ClosingButton {
    QString text;
    char key;
};

/// The two buttons at the end of a dialog.
struct ClosingButtons {
    QPushButton* ok;
    QPushButton* cancel;
};

/// Puts "OK" (or another caption) and "Cancel" (or another) at the end of a dialog: Enter presses
/// the first, Escape the second. From then on the dialog shows its Alt keys.
ClosingButtons addClosingButtons(
    QDialog& dialog, QBoxLayout& layout, const ClosingButton& ok, const ClosingButton& cancel);

/// The colour of a number 0x00BBGGRR; what lies outside 24 bits is left out.
QColor colorOf(double number);

/// The number 0x00BBGGRR of a colour.
double numberOf(const QColor& color);

/// Shows a hint where a text box is empty, half as strong as its text: a palette that a host has
/// darkened often keeps the ink of light ones for hints.
void showHint(QLineEdit& box, const QString& hint);

/// Shows a text box's text in a colour, on a ground that it can be read on in light and dark.
///
/// @param color  0x00BBGGRR
void showInColor(QLineEdit& box, double color);

} // namespace pelloric::qt
