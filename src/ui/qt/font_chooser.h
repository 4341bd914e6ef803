// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "report/report_style.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QFontComboBox;
class QLineEdit;
class QPushButton;

namespace pelloric::qt {

class ColorPicker;

/// Asks the user for a font and its colour in a `FontChooser`, beginning with one.
///
/// @throws RunTimeError Cancelled: the user closed the dialog without choosing
ColoredFont chooseFont(QWidget* parent, const ColoredFont& present);

/// The modal font dialog: face, size, the four styles and the colour, with a sample.
///
/// A face that is not installed stays as it is until another is chosen.
class FontChooser final : public QDialog {
    Q_OBJECT

public:
    explicit FontChooser(const ColoredFont& present, QWidget* parent = nullptr);

    /// What the controls show; the face is empty when its box is.
    ColoredFont chosen() const;

private:
    QWidget* makeFaceGroup();
    QWidget* makeStyleGroup();
    QWidget* makeSample();
    void showFont(const ColoredFont& font);
    void showSample();

    QFontComboBox* face_ = nullptr;
    QComboBox* size_ = nullptr;
    QCheckBox* bold_ = nullptr;
    QCheckBox* italic_ = nullptr;
    QCheckBox* strikeOut_ = nullptr;
    QCheckBox* underline_ = nullptr;
    ColorPicker* color_ = nullptr;
    QLineEdit* sample_ = nullptr;
    QPushButton* ok_ = nullptr;
};

} // namespace pelloric::qt
