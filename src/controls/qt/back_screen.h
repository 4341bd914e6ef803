// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

#include <vector>

namespace pelloric::qt {

/// The grey viewport; draws the shadows of the pages that lie in it.
class BackScreen final : public QWidget {
    Q_OBJECT

public:
    explicit BackScreen(QWidget* parent);

    /// @param pages  those that are shown: pixels
    void setPages(std::vector<QRect> pages);

    /// The grey for a palette: a middle one, or a dark one where windows are dark.
    static QColor grey(const QPalette& palette);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    std::vector<QRect> pages_;
};

} // namespace pelloric::qt
