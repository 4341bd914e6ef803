// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessibleWidget>

#include <functional>

namespace pelloric::qt {

/// A widget whose pages a screen reader reads: their texts, row by row, with tabs between cells.
class PageAccessible final : public QAccessibleWidget, public QAccessibleTextInterface {
public:
    /// @param text  of the pages as they are shown now
    PageAccessible(QWidget& widget, std::function<QString()> text);

    void* interface_cast(QAccessible::InterfaceType type) override;
    QAccessible::State state() const override;
    QString text(QAccessible::Text kind) const override;

    QString text(int begin, int end) const override;
    int characterCount() const override;
    QRect characterRect(int offset) const override;
    int offsetAtPoint(const QPoint& point) const override;
    QString attributes(int offset, int* begin, int* end) const override;

    // A text that is only read has neither caret nor selection.
    void selection(int index, int* begin, int* end) const override;
    int selectionCount() const override { return 0; }
    void addSelection(int, int) override { }
    void removeSelection(int) override { }
    void setSelection(int, int, int) override { }
    int cursorPosition() const override { return 0; }
    void setCursorPosition(int) override { }
    void scrollToSubstring(int, int) override { }

private:
    std::function<QString()> text_;
};

/// From now on screen readers find the texts of canvases and page surfaces.
void installPageAccessibility();

} // namespace pelloric::qt
