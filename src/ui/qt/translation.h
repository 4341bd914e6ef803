// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/preview.h>

#include <QLocale>
#include <QString>

namespace pelloric::qt {

/// The context of the phrases of the core in the catalogues.
inline constexpr char PhraseContext[] = "Phrase";

/// The same as `installTranslation` of one argument from another catalogue that is compiled in, for
/// programs that add texts of their own.
/// @param name  of the files ":/pelloric/translations/NAME_LANGUAGE.qm"; one catalogue of each name
///              is in force
bool installTranslation(const QLocale& locale, const QString& name);

} // namespace pelloric::qt
