// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/options.h>

#include <QLocale>

namespace pelloric::app {

/// From now on what the program says is in the language of the locale, or in English where there is
/// no catalogue of it. Needs no application object.
/// @return whether there is one
bool speakAs(const QLocale& locale);

/// The words of totals in the language of a locale, whatever the program speaks: what is on paper
/// does not depend on who reads what the program says.
TotalWords totalWordsIn(const QLocale& locale);

/// From now on what the program says is English, as other programs expect it.
void speakEnglish();

} // namespace pelloric::app
