// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <initializer_list>
#include <span>

namespace pelloric {

/// A text for people, in the language in force: English unless a translator was given.
///
/// Texts that are published in one wording, and what goes into files, are no phrases.
/// @param english  with "%1" to "%9" where values stand; a catalogue may put them in another order
/// @param values   stand as they are, even where they hold a "%"
Text phrase(TextView english, std::initializer_list<TextView> values = {});
Text phrase(TextView english, std::span<const TextView> values);

/// Marks a text of a table that `phrase` is given later, so that catalogues take it up.
constexpr TextView phraseText(TextView english) { return english; }

/// The wording of an English phrase in another language; the same text where there is none.
using PhraseTranslator = Text (*)(TextView english);

/// From now on phrases are in the translator's language; null: in English. Threads that make
/// phrases must not run meanwhile.
void usePhraseTranslator(PhraseTranslator translator);

} // namespace pelloric
