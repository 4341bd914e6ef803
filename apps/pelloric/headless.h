// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "commands.h"

#include <QApplication>

namespace pelloric::app {

/// Makes the toolkit need no display and no desktop, and keep its remarks to itself.
struct HeadlessSurroundings {
    HeadlessSurroundings();
};

/// The application object of a command without windows.
class HeadlessApplication {
public:
    explicit HeadlessApplication(const Invocation& invocation);

private:
    HeadlessSurroundings surroundings_;
    QGuiApplication application_;
};

/// The application object of a command whose controls nobody sees.
class HeadlessWidgets {
public:
    explicit HeadlessWidgets(const Invocation& invocation);

private:
    HeadlessSurroundings surroundings_;
    QApplication application_;
};

} // namespace pelloric::app
