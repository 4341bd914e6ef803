// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QLocale>

namespace pelloric::app {

/// From now on what the program says is in the language of the locale, or in English where there is
/// no catalogue of it. Needs no application object.
/// @return whether there is one
bool speakAs(const QLocale& locale);

/// From now on what the program says is English, as other programs expect it.
void speakEnglish();

} // namespace pelloric::app
