// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/progress_area.h"

#include "controls/canvas.h"

#include <QHBoxLayout>
#include <QProgressBar>

#include <algorithm>
#include <limits>

namespace pelloric::qt {

namespace {

constexpr qint64 StepTime = 40; ///< between two moves of the bar: milliseconds

int barValue(std::int64_t value)
{
    constexpr std::int64_t Largest = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp<std::int64_t>(value, 0, Largest));
}

} // namespace

ProgressArea::ProgressArea(QWidget* parent)
    : QFrame(parent)
    , bar_(new QProgressBar(this))
{
    setObjectName(QStringLiteral("PicProgress"));
    setAccessibleName(tr("Progress area"));
    setAutoFillBackground(true);
    bar_->setObjectName(QStringLiteral("ProgressBar1"));
    bar_->setAccessibleName(tr("Progress"));
    bar_->setRange(0, 1);
    bar_->setValue(0);
    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(4, 1, 4, 1);
    layout->addWidget(bar_);
    setVisible(false);
}

void ProgressArea::showProgress(const ProgressBar& progress)
{
    const bool appears = progress.visible && isHidden();
    const bool isEnd = !progress.visible || progress.value >= progress.maximum;
    if (!appears && !isEnd && shown_.isValid() && shown_.elapsed() < StepTime)
        return;
    shown_.start();
    bar_->setRange(0, std::max(1, barValue(progress.maximum)));
    if (appears) {
        setVisible(true);
        raise();
        bar_->setValue(barValue(progress.value));
        repaint();
        return;
    }
    bar_->setValue(barValue(progress.value));
    setVisible(progress.visible);
}

} // namespace pelloric::qt
