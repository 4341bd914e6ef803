// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/default_platform.h"

#include <QCoreApplication>

#include <memory>

namespace pelloric::qt {

namespace {

std::unique_ptr<QtPlatform>& platform()
{
    static std::unique_ptr<QtPlatform> instance;
    return instance;
}

/// Fonts must not outlive the application.
void dropPlatform() { platform().reset(); }

} // namespace

QtPlatform& defaultPlatform()
{
    if (!platform()) {
        platform() = std::make_unique<QtPlatform>();
        qAddPostRoutine(dropPlatform);
    }
    return *platform();
}

} // namespace pelloric::qt
