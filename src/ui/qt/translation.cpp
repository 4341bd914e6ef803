// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/translation.h"

#include "platform/phrase.h"
#include "platform/qt/qt_text.h"

#include <QCoreApplication>
#include <QTranslator>

#include <memory>

/// The catalogues are part of a library that may be linked statically; the macro works outside
/// namespaces only.
static void initCatalogues() { Q_INIT_RESOURCE(pelloric_catalogues); }

namespace pelloric::qt {

namespace {

/// What the core says, in the language of the catalogues that are installed.
Text translatedPhrase(TextView english)
{
    return toText(QCoreApplication::translate(PhraseContext, toUtf8(english).c_str()));
}

} // namespace

std::unique_ptr<QTranslator> catalogueOf(const QLocale& locale, const QString& name)
{
    initCatalogues();
    auto catalogue = std::make_unique<QTranslator>();
    if (!catalogue->load(
            locale, name, QStringLiteral("_"), QStringLiteral(":/pelloric/translations")))
        return nullptr;
    return catalogue;
}

bool installTranslation(const QLocale& locale)
{
    usePhraseTranslator(translatedPhrase);
    return installTranslation(locale, QStringLiteral("pelloric"));
}

bool installTranslation(const QLocale& locale, const QString& name)
{
    QCoreApplication* const application = QCoreApplication::instance();
    if (!application)
        return false;
    const QString object = QStringLiteral("translation of ") + name;
    delete application->findChild<QTranslator*>(object, Qt::FindDirectChildrenOnly);
    std::unique_ptr<QTranslator> catalogue = catalogueOf(locale, name);
    if (!catalogue)
        return false;
    catalogue->setObjectName(object);
    catalogue->setParent(application);
    return QCoreApplication::installTranslator(catalogue.release());
}

} // namespace pelloric::qt
