// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "outcome.h"

#include "language.h"
#include "platform/qt/qt_phrase.h"
#include <QJsonArray>
#include <QJsonDocument>
#include <QStringList>

#include <array>
#include <utility>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "quiet", nullptr, phraseText(u"tell nothing but errors") },
    { "json", nullptr, phraseText(u"tell what was made in JSON, one object a line") },
});

/// How notes are told in this run of the program.
struct Telling {
    bool isQuiet = false;
    bool isJson = false;
    QStringList notes;
};

Telling& telling()
{
    static Telling present;
    return present;
}

} // namespace

OptionTable outcomeOptions() { return Options; }

void note(const QString& text)
{
    telling().notes.append(text);
    if (!telling().isQuiet && !telling().isJson)
        tell(text);
}

bool isQuiet() { return telling().isQuiet; }

Outcome::Outcome(const CommandLine& line)
    : isJson_(line.has("json"))
{
    telling() = { line.has("quiet"), isJson_, {} };
    if (isJson_)
        speakEnglish(); // other programs read it
}

void Outcome::tellMade(QJsonObject facts, const QString& sentence) const
{
    const QStringList notes = std::exchange(telling().notes, {});
    if (isJson_) {
        facts.insert(QStringLiteral("warnings"), QJsonArray::fromStringList(notes));
        print(QString::fromUtf8(QJsonDocument(facts).toJson(QJsonDocument::Compact))
            + QLatin1Char('\n'));
    } else if (!isQuiet() && !sentence.isEmpty()) {
        print(sentence);
    }
}

} // namespace pelloric::app
