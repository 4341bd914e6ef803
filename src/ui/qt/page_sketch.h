// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/margin_sketch.h"

#include <QWidget>

#include <array>

namespace pelloric {
class PageSetupState;
}

namespace pelloric::qt {

class MarginLine;

/// The picture "PicPreview" in its frame: a white sheet with the ruled table inside the margins,
/// over which the four margin lines "PicTop(0)" to "PicTop(3)" lie and can be dragged.
///
/// The frame's proportions are kept; what a sketch unit is on the screen follows from its size.
class PageSketch final : public QWidget {
    Q_OBJECT

public:
    /// @param state  borrowed; told what the pointer does
    PageSketch(PageSetupState& state, QWidget* parent);

    /// Places picture and lines as the state has them now and draws them again.
    void refresh();

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

Q_SIGNALS:
    /// A margin line was dropped; its margin is in the state.
    void lineReleased();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    friend class MarginLine;

    double pixelsPerUnit() const;
    void placeLine(Margin margin);
    void paintPicture();
    QPointF unitsInside(Margin margin, QPointF globalPosition) const;
    void pressLine(Margin margin, QPointF globalPosition);
    void moveOverLine(Margin margin, QPointF globalPosition);
    void releaseLine();

    PageSetupState& state_;
    QWidget* picture_;
    std::array<MarginLine*, 4> lines_ {};
};

} // namespace pelloric::qt
