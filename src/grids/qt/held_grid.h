// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <QObject>

#include <memory>

namespace pelloric::qt {

/// Carries a grid of this library through places where only a QObject can go, as from a script to
/// a control.
class HeldGrid final : public QObject {
    Q_OBJECT
public:
    explicit HeldGrid(std::shared_ptr<AutomationObject> grid, QObject* parent = nullptr);

    /// A grid on the same rows that may outlive this object.
    std::unique_ptr<AutomationObject> share() const;

private:
    std::shared_ptr<AutomationObject> grid_;
};

} // namespace pelloric::qt
