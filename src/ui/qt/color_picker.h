// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPushButton>

namespace pelloric::qt {

/// A button that shows a colour and lets the user choose another in the toolkit's dialog.
class ColorPicker final : public QPushButton {
    Q_OBJECT

public:
    ColorPicker(const QString& name, QWidget* parent);

    /// The colour as 0x00BBGGRR, just as it was set or as the user chose it.
    double color() const { return color_; }

    /// Shows a colour; nothing is reported.
    void setColor(double color);

    QSize sizeHint() const override;

Q_SIGNALS:
    /// The user chose a colour, 0x00BBGGRR.
    void colorChanged(double color);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void ask();

    double color_ = 0;
};

} // namespace pelloric::qt
