// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/default_platform.h"

#include "print/qt/qt_printing.h"

#include <QCoreApplication>

#include <memory>

namespace pelloric::qt {

namespace {

struct Services {
    QtPlatform platform;
    QtPrinting printing { platform };
};

std::unique_ptr<Services>& services()
{
    static std::unique_ptr<Services> instance;
    return instance;
}

/// Fonts must not outlive the application.
void dropServices() { services().reset(); }

} // namespace

QtPlatform& defaultPlatform()
{
    if (!services()) {
        services() = std::make_unique<Services>();
        qAddPostRoutine(dropServices);
    }
    return services()->platform;
}

} // namespace pelloric::qt
