// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/phrase.h"

namespace pelloric {

namespace {

/// Errors are made where no services are at hand, so the one language of a program is kept here.
PhraseTranslator& translatorInForce()
{
    static PhraseTranslator translator = nullptr;
    return translator;
}

/// The value that the two characters at a place stand for; null where they are none.
const TextView* valueAt(TextView text, std::size_t at, std::span<const TextView> values)
{
    if (text[at] != u'%' || at + 1 == text.size() || text[at + 1] < u'1')
        return nullptr;
    const auto number = static_cast<std::size_t>(text[at + 1] - u'1');
    return number < values.size() ? &values[number] : nullptr;
}

} // namespace

Text phrase(TextView english, std::initializer_list<TextView> values)
{
    return phrase(english, std::span(values.begin(), values.size()));
}

Text phrase(TextView english, std::span<const TextView> values)
{
    const PhraseTranslator translator = translatorInForce();
    const Text wording = translator != nullptr ? translator(english) : Text(english);
    Text text;
    for (std::size_t at = 0; at < wording.size(); ++at) {
        if (const TextView* const value = valueAt(wording, at, values)) {
            text.append(*value);
            ++at;
        } else {
            text.push_back(wording[at]);
        }
    }
    return text;
}

void usePhraseTranslator(PhraseTranslator translator) { translatorInForce() = translator; }

} // namespace pelloric
