// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessible>
#include <QComboBox>
#include <QWidget>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace pelloric::qt {

/// What assistive technology calls an object.
inline QString nameOf(QObject* object)
{
    QAccessibleInterface* const told = QAccessible::queryAccessibleInterface(object);
    return told ? told->text(QAccessible::Name) : QString();
}

inline std::string labelOf(const QWidget& widget)
{
    return std::string(widget.metaObject()->className()) + " " + widget.objectName().toStdString();
}

/// The controls of a window that the keyboard can be in, as the Tab key walks them now.
inline std::vector<QWidget*> tabStops(QWidget& window)
{
    std::vector<QWidget*> stops;
    for (QWidget* widget = window.nextInFocusChain(); widget != &window;
         widget = widget->nextInFocusChain()) {
        if ((widget->focusPolicy() & Qt::TabFocus) != 0 && widget->isVisible()
            && widget->isEnabled() && !widget->focusProxy() && widget->window() == &window)
            stops.push_back(widget);
    }
    return stops;
}

inline QRect placeOf(const QWidget& widget)
{
    return { widget.mapTo(widget.window(), QPoint()), widget.size() };
}

/// Expects a name of every control of a window that takes the focus, on all its tabs.
inline void expectNames(QWidget& window)
{
    int controls = 0;
    for (QWidget* const widget : window.findChildren<QWidget*>()) {
        if (widget->focusPolicy() == Qt::NoFocus)
            continue;
        ++controls;
        const QString name = nameOf(widget);
        EXPECT_FALSE(name.isEmpty()) << labelOf(window) << ": " << labelOf(*widget);
        if (const auto* const box = qobject_cast<QComboBox*>(widget)) {
            EXPECT_NE(name, box->currentText()) << labelOf(*widget);
        }
    }
    EXPECT_GT(controls, 0) << labelOf(window);
}

/// Expects the Tab key to walk the controls that are seen as the eye reads.
inline void expectTabOrder(QWidget& window)
{
    const std::vector<QWidget*> stops = tabStops(window);
    ASSERT_GT(stops.size(), 2U);
    for (std::size_t at = 1; at < stops.size(); ++at) {
        const QRect before = placeOf(*stops[at - 1]);
        const QRect after = placeOf(*stops[at]);
        const bool isAbove = after.bottom() < before.top();
        const bool isLeft = after.right() < before.left();
        const bool isBelow = after.top() > before.bottom();
        EXPECT_FALSE(isAbove && after.left() < before.right())
            << labelOf(*stops[at - 1]) << " before " << labelOf(*stops[at]);
        EXPECT_FALSE(isLeft && !isBelow)
            << labelOf(*stops[at - 1]) << " before " << labelOf(*stops[at]);
    }
}

} // namespace pelloric::qt
