// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

namespace pelloric::qt {

/// A `Sorvane` as a script makes it: it can also be sized and its picture be saved.
class ScriptSorvane final : public Sorvane {
    Q_OBJECT
public:
    using Sorvane::Sorvane;

    /// Saves a picture of the control; a script gets an error when it cannot.
    Q_INVOKABLE void grab(const QString& path);
    /// Gives the control a size in pixels and shows it.
    Q_INVOKABLE void resize(int width, int height);
};

/// A `Kestrane` as a script makes it: it can also be sized and its picture be saved.
class ScriptKestrane final : public Kestrane {
    Q_OBJECT
public:
    using Kestrane::Kestrane;

    /// Saves a picture of the control; a script gets an error when it cannot.
    Q_INVOKABLE void grab(const QString& path);
    /// Gives the control a size in pixels and shows it.
    Q_INVOKABLE void resize(int width, int height);
};

} // namespace pelloric::qt
