// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "ui/qt/page_setup_dialog.h"

#include <QApplication>
#include <QTabWidget>
#include <QTimer>

#include <cstdio>

namespace {

/// Where a control's middle is in the dialog: one line "name x y".
void tellPlace(const QDialog& dialog, const char* name)
{
    const auto* control = dialog.findChild<QWidget*>(QLatin1String(name));
    if (control == nullptr)
        return;
    const QPoint place = control->mapTo(&dialog, control->rect().center());
    std::printf("%s %d %d\n", name, place.x(), place.y());
}

void tellPlaces(const QDialog& dialog)
{
    for (const char* name : { "PicTop(0)", "PicTop(1)", "PicTop(2)", "PicTop(3)", "cmdOk" })
        tellPlace(dialog, name);
    std::puts("ready");
    std::fflush(stdout);
}

} // namespace

/// Shows the page setup dialog on its margins, on the settings in the folder that is named.
///
/// Writes where its controls are, and ends with 0 once "OK" has written the settings.
int main(int argc, char** argv)
{
    const QApplication application(argc, argv);
    if (argc != 2)
        return 2;
    pelloric::qt::QtPlatform platform;
    platform.folders().setSystemDirectory(argv[1]);
    pelloric::deployDefaultSettings(platform.record());
    pelloric::qt::PageSetupDialog dialog(platform.record());
    dialog.findChild<QTabWidget*>(QStringLiteral("tabStrip1"))->setCurrentIndex(1);
    QTimer::singleShot(500, &dialog, [&dialog] { tellPlaces(dialog); });
    dialog.exec();
    return dialog.saved() == pelloric::SaveOutcome::Written ? 0 : 1;
}
