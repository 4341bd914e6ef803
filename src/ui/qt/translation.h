// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QLocale>
#include <QString>

namespace pelloric::qt {

/// Shows the texts of windows that are made from now on in a language: German, English or
/// simplified Chinese. Without a call they are English.
///
/// What is published stays as it is in every language: the captions of tools and dialogs, the
/// message boxes, and all names. Translated is what explains them: hints, tips, further menus, and
/// what screen readers say. Texts of the toolkit itself, such as its file dialogs, come from the
/// toolkit's own catalogues. Call it once there is an application object; a later call replaces
/// the language.
///
/// @param locale  by its languages in order of preference
/// @return        whether there is a catalogue for it; without one the texts are English
bool installTranslation(const QLocale& locale = QLocale());

/// The same from another catalogue that is compiled in, for programs that add texts of their own.
/// @param name  of the files ":/pelloric/translations/NAME_LANGUAGE.qm"; one catalogue of each name
///              is in force
bool installTranslation(const QLocale& locale, const QString& name);

} // namespace pelloric::qt
