// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "commands.h"

#include <QGuiApplication>

namespace pelloric::app {

/// The application object of a command without windows: it needs no display and no desktop, and
/// keeps the toolkit's remarks to itself.
class HeadlessApplication {
public:
    explicit HeadlessApplication(const Invocation& invocation);

private:
    struct Surroundings {
        Surroundings();
    };

    Surroundings surroundings_;
    QGuiApplication application_;
};

} // namespace pelloric::app
