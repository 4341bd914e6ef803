// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "language.h"

#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "report/report_totals.h"
#include "ui/qt/translation.h"

#include <QTranslator>

#include <array>
#include <memory>

namespace pelloric::app {

namespace {

/// The program's own texts, and those of the library.
using Catalogues = std::array<std::unique_ptr<QTranslator>, 2>;

Catalogues& presentCatalogues()
{
    static Catalogues catalogues;
    return catalogues;
}

Text wordingOf(TextView english)
{
    const std::string source = toUtf8(english);
    for (const std::unique_ptr<QTranslator>& catalogue : presentCatalogues()) {
        const QString wording = catalogue->translate(qt::PhraseContext, source.c_str());
        if (!wording.isEmpty())
            return qt::toText(wording);
    }
    return Text(english);
}

} // namespace

bool speakAs(const QLocale& locale)
{
    Catalogues catalogues { qt::catalogueOf(locale, QStringLiteral("pelloric_program")),
        qt::catalogueOf(locale, QStringLiteral("pelloric")) };
    const bool isThere = catalogues[0] != nullptr && catalogues[1] != nullptr;
    if (isThere)
        presentCatalogues() = std::move(catalogues);
    usePhraseTranslator(isThere ? wordingOf : nullptr);
    return isThere;
}

TotalWords totalWordsIn(const QLocale& locale)
{
    TotalWords words = englishTotalWords();
    const auto catalogue = qt::catalogueOf(locale, QStringLiteral("pelloric"));
    if (catalogue == nullptr)
        return words;
    for (Text* const word :
        { &words.total, &words.sum, &words.count, &words.mean, &words.minimum, &words.maximum }) {
        const QString wording = catalogue->translate(qt::PhraseContext, toUtf8(*word).c_str());
        if (!wording.isEmpty())
            *word = qt::toText(wording);
    }
    return words;
}

void speakEnglish() { usePhraseTranslator(nullptr); }

} // namespace pelloric::app
