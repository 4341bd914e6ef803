// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/script_controls.h"

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

void showInSize(QWidget& control, int width, int height)
{
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
