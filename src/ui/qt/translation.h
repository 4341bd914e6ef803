// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/preview.h>

#include <QLocale>
#include <QString>
#include <QTranslator>

#include <memory>

namespace pelloric::qt {

/// The context of the phrases of the core in the catalogues.
inline constexpr char PhraseContext[] = "Phrase";

/// A catalogue that is compiled in; null where there is none for the locale. Needs no application
/// object.
/// @param name  see `installTranslation`
std::unique_ptr<QTranslator> catalogueOf(const QLocale& locale, const QString& name);

/// The same as `installTranslation` of one argument from another catalogue that is compiled in, for
/// programs that add texts of their own.
/// @param name  of the files ":/pelloric/translations/NAME_LANGUAGE.qm"; one catalogue of each name
///              is in force
bool installTranslation(const QLocale& locale, const QString& name);

} // namespace pelloric::qt
