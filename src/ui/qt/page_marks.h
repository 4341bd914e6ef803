// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/qt/page_guest.h"
#include "document/text_search.h"
#include "view/page_texts.h"

#include <QObject>

#include <optional>

class QColor;

namespace pelloric::qt {

class Sorvane;

/// What is marked on the pages of a preview: the places of a searched text, and the texts that were
/// selected with Shift and the mouse, or a page at a time.
class PageMarks final : public QObject, private PageGuest {
    Q_OBJECT

public:
    /// @param canvas  borrowed
    PageMarks(Sorvane& canvas, QObject* parent);
    ~PageMarks() override;

    /// Marks the places of a search.
    /// @param search  borrowed until another one is given; null: nothing is searched
    void showSearch(const TextSearch* search);

    /// Marks one place more than the others, or none.
    void showCurrent(std::optional<int> page, const TextMatch& match = {});

    /// Selects all texts of a page.
    void selectPage(int page);

    /// @return false: nothing was selected
    bool clearSelection();

    /// The selected texts as rows of a table.
    QString selectedText() const;

    /// Whether marks and selection may be of other pages than those that are shown now.
    void documentChanged();

signals:
    void selectionChanged();

private:
    /// A rectangle of a page that the mouse has drawn, or a whole page.
    struct Selection {
        int page = 0;
        QPointF from;
        QPointF to;
        bool isWhole = false;
    };

    void paintOver(int page, QPainter& painter, const QRectF& visible) override;
    bool takesMouse(int page, const QMouseEvent& event, QPointF at) override;
    void paintMatches(int page, QPainter& painter, const QRectF& visible);
    std::vector<PlacedText> selectedTexts() const;
    PageRect area(const Selection& selection) const;
    void repaint();

    Sorvane& canvas_;
    const TextSearch* search_ = nullptr;
    std::optional<int> currentPage_;
    TextMatch current_;
    std::optional<Selection> selection_;
    bool isDragging_ = false;
};

} // namespace pelloric::qt
