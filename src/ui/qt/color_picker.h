// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPushButton>

#include <functional>
#include <optional>

namespace pelloric::qt {

/// Asks the user for a colour, beginning with one; nothing when the user cancels.
using ChooseColor = std::function<std::optional<QColor>(QWidget* parent, const QColor& present)>;

/// The toolkit's colour dialog.
std::optional<QColor> chooseColor(QWidget* parent, const QColor& present);

/// A button that shows a colour and lets the user choose another.
class ColorPicker final : public QPushButton {
    Q_OBJECT

public:
    ColorPicker(const QString& name, QWidget* parent, ChooseColor choose = chooseColor);

    /// The colour as 0x00BBGGRR, just as it was set or as the user chose it.
    double color() const { return color_; }

    /// Shows a colour; nothing is reported.
    void setColor(double color);

    /// Replaces the colour dialog.
    void useDialog(ChooseColor choose) { choose_ = std::move(choose); }

    QSize sizeHint() const override;

Q_SIGNALS:
    /// The user chose a colour, 0x00BBGGRR.
    void colorChanged(double color);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void ask();

    ChooseColor choose_;
    double color_ = 0;
};

} // namespace pelloric::qt
