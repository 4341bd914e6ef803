// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointF>
#include <QRectF>

class QMouseEvent;
class QPainter;

namespace pelloric::qt {

/// Marks pages on the screen, and on the screen only, and sees the mouse over them before the
/// canvas does.
class PageGuest {
public:
    virtual ~PageGuest() = default;

    /// A page has been painted.
    /// @param page     zero-based
    /// @param painter  scaled to twips of the page
    /// @param visible  the part that is seen: twips
    virtual void paintOver(int page, QPainter& painter, const QRectF& visible) = 0;

    /// The mouse moves or a button goes over a page, or beside it after a press.
    /// @param page  zero-based
    /// @param at    twips of the page
    /// @return      true: the canvas does not see it
    virtual bool takesMouse(int page, const QMouseEvent& event, QPointF at) = 0;
};

} // namespace pelloric::qt
