// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/text_search.h"

#include <QTimer>
#include <QWidget>

class QLabel;
class QLineEdit;
class QToolButton;

namespace pelloric {

class Canvas;
class PreviewSession;

} // namespace pelloric

namespace pelloric::qt {

class PageMarks;

/// The bar below the pages that finds a text on them: counts and marks its places while it is
/// typed, and walks through them.
///
/// Some pages are searched at a time, so that the window stays alive.
class FindBar final : public QWidget {
    Q_OBJECT

public:
    /// @param canvas, session, marks  of the same window; borrowed
    FindBar(Canvas& canvas, PreviewSession& session, PageMarks& marks, QWidget* parent = nullptr);

    /// Takes the focus, with what was searched last selected.
    void open();

    /// Goes to the next place, or the one before; from the last one to the first again.
    void walk(bool isForward);

    /// Other pages are shown now: they are searched anew.
    void documentChanged();

signals:
    /// The user is done with the bar.
    void closed();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    QToolButton* addButton(const char* name, const QString& text);
    void drawIcons();
    void search();
    void searchOn();
    bool searchFor(int milliseconds);
    void goTo(int page, int place);
    void goToFirst();
    void showCount();

    Canvas& canvas_;
    PreviewSession& session_;
    PageMarks& marks_;
    QLineEdit* text_;
    QLabel* count_;
    QToolButton* previous_;
    QToolButton* next_;
    QToolButton* close_;
    QTimer timer_;
    TextSearch search_;
    int firstPage_ = 0; ///< in view when the search began
    int page_ = -1; ///< of the place that was gone to; -1: none was
    int place_ = 0; ///< its number on the page
};

} // namespace pelloric::qt
