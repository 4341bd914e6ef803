// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "headless.h"

#include <cstdio>

namespace pelloric::app {

namespace {

void keepGraveMessages(QtMsgType type, const QMessageLogContext&, const QString& text)
{
    if (type == QtCriticalMsg || type == QtFatalMsg)
        std::fprintf(stderr, "pelloric: %s\n", text.toUtf8().constData());
}

} // namespace

HeadlessSurroundings::HeadlessSurroundings()
{
    qInstallMessageHandler(keepGraveMessages);
    qputenv("QT_QPA_PLATFORM", "offscreen");
}

HeadlessApplication::HeadlessApplication(const Invocation& invocation)
    : application_(invocation.argc, invocation.argv)
{
}

HeadlessWidgets::HeadlessWidgets(const Invocation& invocation)
    : application_(invocation.argc, invocation.argv)
{
}

} // namespace pelloric::app
