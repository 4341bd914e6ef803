// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "windows.h"

#include "language.h"
#include "platform/qt/qt_phrase.h"
#include "platform/run_time_error.h"
#include "settings/default_settings.h"
#include "ui/qt/translation.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>
#include <QWidget>

#include <algorithm>
#include <array>
#include <memory>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "language", "LANG",
        phraseText(u"of hints, tips and errors (the locale's): de, en, zh_CN, or system; the rest "
                   u"has one wording") },
});

/// The toolkit's own texts, such as those of its file dialogs, where its catalogues are installed.
void translateToolkit(const QLocale& locale)
{
    auto catalogue = std::make_unique<QTranslator>(QCoreApplication::instance());
    if (catalogue->load(locale, QStringLiteral("qtbase"), QStringLiteral("_"),
            QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(catalogue.release());
}

} // namespace

OptionTable windowOptions() { return Options; }

void chooseLanguage(const CommandLine& line)
{
    const QString name = line.has("language") ? line.value("language") : QStringLiteral("system");
    const bool isSystem = name == QLatin1String("system");
    const QLocale locale = isSystem ? QLocale::system() : QLocale(name);
    const bool isKnown = qt::installTranslation(locale);
    qt::installTranslation(locale, QStringLiteral("pelloric_program"));
    speakAs(locale);
    if (isKnown)
        translateToolkit(locale);
    else if (!isSystem)
        throw CommandError(
            qt::phrased(u"--language %1: there are de, en, zh_CN, and system").arg(name),
            WrongUsage);
}

bool hasDisplay()
{
#if defined(Q_OS_UNIX) && !defined(Q_OS_MACOS)
    return qEnvironmentVariableIsSet("DISPLAY") || qEnvironmentVariableIsSet("WAYLAND_DISPLAY")
        || qEnvironmentVariableIsSet("QT_QPA_PLATFORM");
#else
    return true;
#endif
}

WindowedApplication::WindowedApplication(const Invocation& invocation)
{
    if (!hasDisplay())
        throw CommandError(qt::phrased(
            u"there is no display to show windows on; \"pelloric export\" and \"pelloric demo "
            u"--walk OUT\" need none"));
    application_ = std::make_unique<QApplication>(invocation.argc, invocation.argv);
}

/// A window that was closed while it was filled, before the program waits for the user, is no
/// reason to wait.
int WindowedApplication::run()
{
    const QWidgetList windows = QApplication::topLevelWidgets();
    const bool isShown = std::ranges::any_of(windows, &QWidget::isVisible);
    return isShown ? QApplication::exec() : Done;
}

void prepareSettings(const Platform& platform)
{
    try {
        deployDefaultSettings(platform);
    } catch (const RunTimeError& error) {
        tell(describe(error));
    }
}

} // namespace pelloric::app
