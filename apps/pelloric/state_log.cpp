// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "state_log.h"

#include "command_line.h"
#include "controls/canvas.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"
#include <pelloric/sorvane.h>

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>

namespace pelloric::app {

namespace {

constexpr int LookEveryMs = 50;

/// The number of a control's tool, for those that share a name.
QString numberOf(const QWidget& widget)
{
    const QVariant id = widget.property("toolId");
    return id.isValid() ? id.toString() : QStringLiteral("-");
}

QString captionOf(const QWidget& widget)
{
    const auto* const button = qobject_cast<const QAbstractButton*>(&widget);
    return button != nullptr ? button->text() : widget.property("caption").toString();
}

/// What is open besides the preview window: its class name, or "-".
QString topmost(const QWidget& window)
{
    if (const QWidget* const popup = QApplication::activePopupWidget())
        return QString::fromLatin1(popup->metaObject()->className());
    const QWidget* const modal = QApplication::activeModalWidget();
    return modal != nullptr && modal != &window
        ? QString::fromLatin1(modal->metaObject()->className())
        : QStringLiteral("-");
}

} // namespace

StateLog::StateLog(const QString& file, qt::QtPreviewOpener& opener)
    : opener_(opener)
    , file_(file)
{
    if (!file_.open(QIODevice::WriteOnly | QIODevice::Truncate))
        throw CommandError(QStringLiteral("%1: %2").arg(file, file_.errorString()));
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { look(); });
    timer_.start(LookEveryMs);
}

void StateLog::look()
{
    const QString now = state();
    if (now == last_)
        return;
    last_ = now;
    const qt::PreviewWindow* const window = opener_.window();
    if (window == nullptr)
        lastSize_ = {};
    else if (window->isVisible() && window->size() != lastSize_)
        writePlaces();
    write(now);
}

void StateLog::write(const QString& line)
{
    file_.write(line.toUtf8() + '\n');
    file_.flush();
}

void StateLog::writePlaces()
{
    qt::PreviewWindow& window = *opener_.window();
    lastSize_ = window.size();
    for (const QWidget* const widget : window.findChildren<QWidget*>()) {
        const bool isTool = widget->property("toolId").isValid();
        if (!widget->isVisible()
            || (!isTool && !widget->objectName().startsWith(QLatin1String("paper("))))
            continue;
        const QPoint middle = widget->mapTo(&window, widget->rect().center());
        write(QStringLiteral("place %1 %2 %3 %4 %5")
                  .arg(QString(widget->objectName()).remove(QLatin1Char(' ')), numberOf(*widget))
                  .arg(middle.x())
                  .arg(middle.y())
                  .arg(captionOf(*widget)));
    }
}

QString StateLog::state() const
{
    qt::PreviewWindow* const window = opener_.window();
    if (window == nullptr || !window->isVisible())
        return QStringLiteral("state closed");
    const Canvas& canvas = window->canvas().canvas();
    const ViewState& view = canvas.view();
    return QStringLiteral("state open busy=%1 total=%2 current=%3 mode=%4 window=%5 first=%6 "
                          "last=%7 divisor=%8 x=%9 y=%10 visible=%11 size=%12x%13 top=%14")
        .arg(canvas.isBuilding() ? 1 : 0)
        .arg(canvas.Totalpages())
        .arg(canvas.document().currentPage + 1)
        .arg(static_cast<int>(canvas.WindowOrderStyle()))
        .arg(canvas.WindowPages())
        .arg(canvas.WindowMinPage())
        .arg(canvas.WindowMaxPage())
        .arg(static_cast<double>(canvas.DispScale()))
        .arg(view.offset.x)
        .arg(view.offset.y)
        .arg(view.baseVisible ? 1 : 0)
        .arg(window->width())
        .arg(window->height())
        .arg(topmost(*window));
}

} // namespace pelloric::app
