// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/find_bar.h"

#include "controls/canvas.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "ui/page_reading.h"
#include "ui/preview_navigation.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/page_marks.h"
#include "view/page_texts.h"

#include <QElapsedTimer>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QStyle>
#include <QToolButton>

#include <limits>

namespace pelloric::qt {

namespace {

constexpr int SliceMs = 15; ///< how long a search keeps the window waiting
constexpr int PagesAtOnce = 16; ///< between two looks at the clock
constexpr int TextWidth = 280; ///< of what is searched: pixels
constexpr int MostLetters = 200; ///< that are searched

} // namespace

FindBar::FindBar(Canvas& canvas, PreviewSession& session, PageMarks& marks, QWidget* parent)
    : QWidget(parent)
    , canvas_(canvas)
    , session_(session)
    , marks_(marks)
    , text_(new QLineEdit(this))
    , count_(new QLabel(this))
    , previous_(addButton("FindPrevious", tr("Previous place (Shift+F3)")))
    , next_(addButton("FindNext", tr("Next place (F3)")))
    , close_(addButton("FindClose", tr("Close (Esc)")))
{
    setObjectName(QStringLiteral("FindBar"));
    setAccessibleName(tr("Find"));
    text_->setObjectName(QStringLiteral("txtFind"));
    text_->setAccessibleName(tr("Text to find"));
    showHint(*text_, tr("Find on the pages"));
    text_->setClearButtonEnabled(true);
    text_->setMaximumWidth(TextWidth);
    text_->setMaxLength(MostLetters);
    count_->setObjectName(QStringLiteral("FindCount"));
    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(6, 3, 6, 3);
    layout->addWidget(text_, 1);
    layout->addWidget(previous_);
    layout->addWidget(next_);
    layout->addWidget(count_);
    layout->addStretch(1);
    layout->addWidget(close_);
    timer_.setInterval(0);
    connect(&timer_, &QTimer::timeout, this, &FindBar::searchOn);
    connect(text_, &QLineEdit::textChanged, this, &FindBar::search);
    connect(previous_, &QToolButton::clicked, this, [this] { walk(false); });
    connect(next_, &QToolButton::clicked, this, [this] { walk(true); });
    connect(close_, &QToolButton::clicked, this, &FindBar::closed);
    drawIcons();
    showCount();
}

QToolButton* FindBar::addButton(const char* name, const QString& text)
{
    auto* const button = new QToolButton(this);
    button->setObjectName(QString::fromLatin1(name));
    button->setAutoRaise(true);
    button->setToolTip(text);
    button->setAccessibleName(text);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

void FindBar::drawIcons()
{
    previous_->setIcon(libraryIcon(QStringLiteral("find-previous"), palette()));
    next_->setIcon(libraryIcon(QStringLiteral("find-next"), palette()));
    close_->setIcon(libraryIcon(QStringLiteral("close"), palette()));
}

void FindBar::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        drawIcons();
}

void FindBar::open()
{
    text_->setFocus(Qt::ShortcutFocusReason);
    text_->selectAll();
}

void FindBar::showEvent(QShowEvent*) { search(); }

void FindBar::hideEvent(QHideEvent*)
{
    timer_.stop();
    search_ = {};
    marks_.showSearch(nullptr);
}

void FindBar::documentChanged()
{
    if (isVisible())
        search();
}

void FindBar::search()
{
    page_ = -1;
    marks_.showSearch(nullptr);
    search_ = TextSearch(canvas_.document(), viewOf(text_->text()));
    firstPage_ = pageInView(canvas_.view(), canvas_.facts()).value_or(0);
    marks_.showSearch(&search_);
    if (!search_.isDone())
        timer_.start();
    showCount();
}

/// @return false: all pages are searched
bool FindBar::searchFor(int milliseconds)
{
    if (canvas_.isBuilding())
        return true; // the pages are others before long
    QElapsedTimer clock;
    clock.start();
    while (clock.elapsed() < milliseconds) {
        if (!search_.searchPages(PagesAtOnce))
            return false;
    }
    return true;
}

void FindBar::searchOn()
{
    if (!searchFor(SliceMs))
        timer_.stop();
    if (page_ < 0)
        goToFirst();
    showCount();
}

/// The first place from the page on that was in view, as soon as it is known.
void FindBar::goToFirst()
{
    const int page = search_.pageWithMatch(firstPage_, true);
    if (page >= 0 && (page >= firstPage_ || search_.isDone()))
        goTo(page, 0);
}

void FindBar::walk(bool isForward)
{
    if (!canvas_.isBuilding())
        searchFor(std::numeric_limits<int>::max());
    timer_.stop();
    if (search_.count() == 0) {
        showCount();
        return;
    }
    const int wanted = place_ + (isForward ? 1 : -1);
    if (page_ >= 0 && wanted >= 0 && wanted < search_.countOn(page_))
        return goTo(page_, wanted);
    const int from = page_ < 0 ? firstPage_ : page_ + (isForward ? 1 : -1);
    const int page = search_.pageWithMatch(from, isForward);
    goTo(page, isForward ? 0 : search_.countOn(page) - 1);
}

void FindBar::goTo(int page, int place)
{
    const std::vector<TextMatch> matches = search_.matches(page);
    if (place < 0 || place >= std::ssize(matches))
        return;
    page_ = page;
    place_ = place;
    const TextMatch& match = matches[static_cast<std::size_t>(place)];
    marks_.showCurrent(page, match);
    if (const auto surface = session_.showPage(page))
        bringIntoSight(
            canvas_, *surface, areaOf(canvas_.document(), page, match, canvas_.platform().metrics));
    showCount();
}

void FindBar::showCount()
{
    const bool isFound = search_.count() > 0;
    previous_->setEnabled(isFound);
    next_->setEnabled(isFound);
    if (text_->text().isEmpty())
        count_->clear();
    else if (!isFound)
        count_->setText(search_.isDone() ? tr("Not found") : tr("Searching…"));
    else if (page_ < 0)
        count_->setText(tr("%L1 found").arg(search_.count()));
    else
        count_->setText(
            tr("%L1 of %L2").arg(search_.countBefore(page_) + place_ + 1).arg(search_.count()));
}

void FindBar::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        return walk(!(event->modifiers() & Qt::ShiftModifier));
    case Qt::Key_Escape:
        emit closed();
        return;
    default:
        QWidget::keyPressEvent(event);
    }
}

} // namespace pelloric::qt
