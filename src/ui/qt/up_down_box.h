// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAbstractSpinBox>

#include <functional>

namespace pelloric::qt {

/// A text box with up-down buttons that leaves the text and the steps to its owner.
///
/// The box itself is the up-down control; its line edit is the text box, and each has an object
/// name of its own. Any text may be typed. The wheel steps only while the box has the focus.
class UpDownBox final : public QAbstractSpinBox {
public:
    /// Given the direction of one step; called once for each.
    using Step = std::function<void(bool up)>;

    /// @param name      object name of the up-down control
    /// @param textName  object name of the text box
    UpDownBox(const QString& name, const QString& textName, QWidget* parent);

    /// What a step does.
    void onStep(Step step) { step_ = std::move(step); }

    /// The text box.
    QLineEdit* textBox() const { return lineEdit(); }

    void stepBy(int steps) override;
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    StepEnabled stepEnabled() const override;
    void wheelEvent(QWheelEvent* event) override;

private:
    Step step_;
};

/// Rewrites what was typed into a text box, with the caret behind the same characters as before.
///
/// Handlers of the box's changes are not called for the rewriting.
/// @param caret  the caret's place in the new text; past its end means at the end
void rewriteText(QLineEdit& box, const QString& text, int caret);

} // namespace pelloric::qt
