// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "progress_line.h"

#include "interruption.h"
#include "outcome.h"
#include "platform/qt/qt_phrase.h"

#include <algorithm>
#include <cstdio>

#ifdef Q_OS_WIN
#include <io.h>
#else
#include <unistd.h>
#endif

namespace pelloric::app {

namespace {

constexpr qint64 MillisecondsBetween = 100;
constexpr char BackToStart[] = "\r\033[K"; ///< and clears the line

bool isTerminal()
{
#ifdef Q_OS_WIN
    return _isatty(_fileno(stderr)) != 0;
#else
    return isatty(fileno(stderr)) != 0;
#endif
}

} // namespace

ProgressLine::ProgressLine()
    : isTerminal_(isTerminal() && !isQuiet())
{
    sinceShown_.start();
}

ProgressLine::~ProgressLine() { clear(); }

void ProgressLine::show(TextView work, std::int64_t done, std::int64_t total)
{
    if (!isTerminal_ || sinceShown_.elapsed() < MillisecondsBetween)
        return;
    sinceShown_.restart();
    const double part = total > 0 ? static_cast<double>(done) / static_cast<double>(total) : 0;
    const int percent = static_cast<int>(std::clamp(part, 0.0, 1.0) * 100);
    std::fprintf(stderr, "%s%s %d %%", BackToStart, toUtf8(phrase(work)).c_str(), percent);
    isShown_ = true;
}

Progress ProgressLine::of(TextView work)
{
    return [this, work](std::int64_t done, std::int64_t total) {
        show(work, done, total);
        return Interruption::mayGoOn();
    };
}

void ProgressLine::clear()
{
    if (isShown_)
        std::fputs(BackToStart, stderr);
    isShown_ = false;
}

LayoutProgress::LayoutProgress(Canvas& canvas, ProgressLine& line)
    : canvas_(canvas)
    , line_(line)
{
    canvas_.observe(*this);
}

LayoutProgress::~LayoutProgress() { canvas_.forget(*this); }

void LayoutProgress::progressChanged()
{
    const ProgressBar& bar = canvas_.progress();
    if (bar.visible)
        line_.show(phraseText(u"Laying out"), bar.value, bar.maximum);
}

} // namespace pelloric::app
