// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_controls.h"

#include <QCoreApplication>
#include <QJSEngine>
#include <QPixmap>

namespace pelloric::qt {

namespace {

void savePicture(QWidget& control, const QString& path)
{
    if (control.QWidget::grab().save(path))
        return;
    if (QJSEngine* const engine = qjsEngine(&control))
        engine->throwError(QStringLiteral("grab: cannot write ") + path);
}

constexpr int LongestSide = 8192; ///< pixels of a control whose picture still fits in memory

void showInSize(QWidget& control, int width, int height)
{
    const auto fits = [](int side) { return side >= 0 && side <= LongestSide; };
    if (!fits(width) || !fits(height)) {
        if (QJSEngine* const engine = qjsEngine(&control))
            engine->throwError(QStringLiteral("resize: a side takes 0 to 8192 pixels"));
        return;
    }
    control.QWidget::resize(width, height);
    control.show();
    QCoreApplication::processEvents();
}

} // namespace

void ScriptSorvane::grab(const QString& path) { savePicture(*this, path); }

void ScriptSorvane::resize(int width, int height) { showInSize(*this, width, height); }

void ScriptKestrane::grab(const QString& path) { savePicture(*this, path); }

void ScriptKestrane::resize(int width, int height) { showInSize(*this, width, height); }

} // namespace pelloric::qt
