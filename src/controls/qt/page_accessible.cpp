// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/page_accessible.h"

#include "controls/qt/page_surface.h"

#include <pelloric/sorvane.h>

#include <QWidget>

#include <algorithm>

namespace pelloric::qt {

namespace {

QAccessibleInterface* makeInterface(const QString&, QObject* object)
{
    if (auto* const surface = qobject_cast<PageSurface*>(object))
        return new PageAccessible(*surface, [surface] { return surface->pageText(); });
    if (auto* const canvas = qobject_cast<Sorvane*>(object))
        return new PageAccessible(*canvas, [canvas] { return canvas->shownText(); });
    return nullptr;
}

} // namespace

PageAccessible::PageAccessible(QWidget& widget, std::function<QString()> text)
    : QAccessibleWidget(&widget, QAccessible::Document)
    , text_(std::move(text))
{
}

void* PageAccessible::interface_cast(QAccessible::InterfaceType type)
{
    if (type == QAccessible::TextInterface)
        return static_cast<QAccessibleTextInterface*>(this);
    return QAccessibleWidget::interface_cast(type);
}

QAccessible::State PageAccessible::state() const
{
    QAccessible::State state = QAccessibleWidget::state();
    state.readOnly = true;
    state.multiLine = true;
    return state;
}

QString PageAccessible::text(QAccessible::Text kind) const
{
    return kind == QAccessible::Value ? text_() : QAccessibleWidget::text(kind);
}

QString PageAccessible::text(int begin, int end) const
{
    const QString all = text_();
    const int from = std::clamp<int>(begin, 0, static_cast<int>(all.size()));
    const int to = end < 0 ? static_cast<int>(all.size()) : end;
    return all.mid(from, std::max(0, to - from));
}

int PageAccessible::characterCount() const { return static_cast<int>(text_().size()); }

QRect PageAccessible::characterRect(int) const { return rect(); }

int PageAccessible::offsetAtPoint(const QPoint& point) const
{
    return rect().contains(point) ? 0 : -1;
}

QString PageAccessible::attributes(int, int* begin, int* end) const
{
    *begin = 0;
    *end = characterCount();
    return {};
}

void PageAccessible::selection(int, int* begin, int* end) const { *begin = *end = 0; }

void installPageAccessibility() { QAccessible::installFactory(makeInterface); }

} // namespace pelloric::qt
