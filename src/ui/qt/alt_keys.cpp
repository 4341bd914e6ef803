// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/alt_keys.h"

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <QRadioButton>
#include <QShortcut>
#include <QStyleOptionButton>
#include <QStyleOptionTab>
#include <QTabBar>
#include <QTabWidget>

#include <algorithm>

namespace pelloric::qt {

namespace {

/// The key of a control or its caption; of a tab bar one for each tab.
constexpr char KeyProperty[] = "altKey";

constexpr int BadgeAir = 3; ///< around a badge's letter: pixels

QKeySequence altAnd(QChar key) { return QKeySequence(QStringLiteral("Alt+") + key); }

/// A caption as it stands in a widget.
struct Caption {
    QString text {};
    QRect place {}; ///< of the text, in the widget
};

Caption captionOf(const QLabel& label)
{
    const auto alignment = QStyle::visualAlignment(label.layoutDirection(), label.alignment());
    return { label.text(),
        label.style()->itemTextRect(label.fontMetrics(), label.contentsRect(),
            static_cast<int>(alignment), true, label.text()) };
}

Caption captionOf(const QAbstractButton& button)
{
    QStyleOptionButton option;
    option.initFrom(&button);
    option.text = button.text();
    QStyle::SubElement element = QStyle::SE_PushButtonContents;
    Qt::Alignment alignment = Qt::AlignCenter;
    if (qobject_cast<const QCheckBox*>(&button) || qobject_cast<const QRadioButton*>(&button)) {
        element = qobject_cast<const QCheckBox*>(&button) ? QStyle::SE_CheckBoxContents
                                                          : QStyle::SE_RadioButtonContents;
        alignment
            = QStyle::visualAlignment(button.layoutDirection(), Qt::AlignLeft | Qt::AlignVCenter);
    }
    const QRect room = button.style()->subElementRect(element, &option, &button);
    return { option.text,
        button.style()->itemTextRect(
            button.fontMetrics(), room, static_cast<int>(alignment), true, option.text) };
}

Caption captionOf(const QTabBar& bar, int tab)
{
    QStyleOptionTab option;
    option.initFrom(&bar);
    option.rect = bar.tabRect(tab);
    option.shape = bar.shape();
    option.text = bar.tabText(tab);
    if (tab == bar.currentIndex())
        option.state |= QStyle::State_Selected;
    const QRect room = bar.style()->subElementRect(QStyle::SE_TabBarTabText, &option, &bar);
    return { option.text,
        bar.style()->itemTextRect(
            bar.fontMetrics(), room, static_cast<int>(Qt::AlignCenter), true, option.text) };
}

/// Lies over a window's controls and shows their keys; the pointer does not meet it.
class AltKeyMarks final : public QWidget {
public:
    explicit AltKeyMarks(QWidget& window)
        : QWidget(&window)
    {
        setObjectName(QStringLiteral("AltKeyMarks"));
        setAttribute(Qt::WA_TransparentForMouseEvents);
        setFocusPolicy(Qt::NoFocus);
        setGeometry(window.rect());
        raise();
        qApp->installEventFilter(this);
    }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override
    {
        switch (event->type()) {
        case QEvent::Resize:
            if (watched == parentWidget())
                setGeometry(parentWidget()->rect());
            break;
        case QEvent::ChildAdded:
        case QEvent::Show:
            if (watched == parentWidget())
                raise();
            break;
        case QEvent::KeyPress:
        case QEvent::KeyRelease:
            if (static_cast<QKeyEvent*>(event)->key() == Qt::Key_Alt)
                showBadges(event->type() == QEvent::KeyPress && window()->isActiveWindow());
            break;
        case QEvent::WindowDeactivate:
            showBadges(false);
            break;
        default:
            break;
        }
        return QWidget::eventFilter(watched, event);
    }

    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        for (const QWidget* const widget : parentWidget()->findChildren<QWidget*>()) {
            const QString keys = widget->property(KeyProperty).toString();
            if (keys.isEmpty() || !widget->isVisibleTo(parentWidget()))
                continue;
            if (const auto* const bar = qobject_cast<const QTabBar*>(widget))
                paintTabs(painter, *bar, keys);
            else if (const auto* const label = qobject_cast<const QLabel*>(widget))
                paintLine(painter, *label, captionOf(*label), keys.front());
            else if (const auto* const button = qobject_cast<const QAbstractButton*>(widget))
                paintLine(painter, *button, captionOf(*button), keys.front());
            else if (hasBadges_ && widget->isEnabled())
                paintBadge(painter, *widget, keys);
        }
    }

private:
    void showBadges(bool shown)
    {
        if (shown == hasBadges_)
            return;
        hasBadges_ = shown;
        update();
    }

    bool hasLines() const
    {
        return hasBadges_
            || style()->styleHint(QStyle::SH_UnderlineShortcut, nullptr, parentWidget()) != 0;
    }

    void paintTabs(QPainter& painter, const QTabBar& bar, const QString& keys)
    {
        for (int tab = 0; tab < bar.count() && tab < keys.size(); ++tab)
            paintLine(painter, bar, captionOf(bar, tab), keys.at(tab));
    }

    void paintLine(QPainter& painter, const QWidget& widget, const Caption& caption, QChar key)
    {
        const auto at = caption.text.indexOf(key, 0, Qt::CaseInsensitive);
        if (at < 0 || !hasLines())
            return;
        const QFontMetrics metrics = widget.fontMetrics();
        const int left = caption.place.left() + metrics.horizontalAdvance(caption.text.left(at));
        const int thickness = std::max(1, metrics.lineWidth());
        const int top
            = caption.place.top() + metrics.ascent() + std::max(1, metrics.underlinePos());
        const QRect line(left, top, metrics.horizontalAdvance(caption.text.at(at)), thickness);
        painter.fillRect(line.translated(widget.mapTo(parentWidget(), QPoint())),
            widget.palette().color(widget.foregroundRole()));
    }

    void paintBadge(QPainter& painter, const QWidget& widget, const QString& key)
    {
        QRect badge = fontMetrics().boundingRect(key).adjusted(
            -2 * BadgeAir, -BadgeAir, 2 * BadgeAir, BadgeAir);
        badge.moveTopLeft(widget.mapTo(parentWidget(), QPoint(0, 0)));
        painter.setPen(palette().color(QPalette::ToolTipText));
        painter.setBrush(palette().color(QPalette::ToolTipBase));
        painter.drawRect(badge);
        painter.drawText(badge, Qt::AlignCenter, key);
    }

    bool hasBadges_ = false;
};

} // namespace

void setAltKey(QAbstractButton& button, char key)
{
    button.setShortcut(altAnd(QLatin1Char(key)));
    button.setProperty(KeyProperty, QString(QLatin1Char(key)));
}

void setFocusKey(QWidget& control, char key, QWidget& caption)
{
    auto* const shortcut = new QShortcut(altAnd(QLatin1Char(key)), &caption);
    QObject::connect(shortcut, &QShortcut::activated, &control,
        [&control] { control.setFocus(Qt::ShortcutFocusReason); });
    caption.setProperty(KeyProperty, QString(QLatin1Char(key)));
}

void setTabKeys(QTabWidget& tabs, const char* keys)
{
    const QString letters = QString::fromLatin1(keys);
    for (int tab = 0; tab < letters.size(); ++tab) {
        auto* const shortcut = new QShortcut(altAnd(letters.at(tab)), &tabs);
        QObject::connect(shortcut, &QShortcut::activated, &tabs, [&tabs, tab] {
            tabs.setCurrentIndex(tab);
            tabs.tabBar()->setFocus(Qt::ShortcutFocusReason);
        });
    }
    tabs.tabBar()->setProperty(KeyProperty, letters);
    tabs.setAccessibleName(tabs.window()->windowTitle());
}

void showAltKeys(QWidget& window) { new AltKeyMarks(window); }

} // namespace pelloric::qt
