// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

class QLabel;

namespace pelloric::qt {

/// A sentence beside a control that says what is wrong with what stands in it; takes no room while
/// there is nothing to say.
class HintLabel final : public QWidget {
public:
    /// @param name  object name of the sentence's label
    HintLabel(const QString& name, QWidget* parent);

    /// Shows a sentence; an empty one hides the hint.
    void say(const QString& sentence);

    QString sentence() const;

private:
    QLabel* text_;
};

} // namespace pelloric::qt
