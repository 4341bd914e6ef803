// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// The preview window that `Kestrane::doPreview` opens.
///
/// A program has one. It is made when a grid is previewed first, is used again while it is open,
/// and goes with the application.
///
/// @code
/// QApplication application(argc, argv);
/// pelloric::qt::usePreviewWindow();
/// @endcode

#include <pelloric/options.h>
#include <pelloric/version.h>

#include <QLocale>
#include <QString>

#include <optional>

namespace pelloric::qt {

class Sorvane;

/// From now on the facades of the program preview in the preview window, on the system's printers.
///
/// Call it once, when the application object is made. Where there is no settings file the default
/// one is put into place at the first preview.
PELLORIC_EXPORT void usePreviewWindow();

/// Keeps the settings file of this program in a folder of its own from now on; where there is none
/// yet, the default one is put into it.
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path: there is no
///         settings file, and it cannot be made
PELLORIC_EXPORT void setSettingsFolder(const QString& folder);

/// Gives the reports of windows that are made from now on settings of their own: the settings file
/// is not read for them, and their dialogs change this value alone.
/// @param settings  nothing: those of the settings file, as at first
PELLORIC_EXPORT void setPreviewSettings(std::optional<ReportSettings> settings);

/// Opens the window on a document file.
/// @throws RunTimeError FileNotFound, with the path
PELLORIC_EXPORT void openInPreview(const QString& path);

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
PELLORIC_EXPORT bool installTranslation(const QLocale& locale = QLocale());

/// Lets scripts of any engine in the process use the controls: their objects are grids, and errors
/// of a member are thrown in the script instead of shown in a box.
///
/// Of the component `script`. A host that gives its own engine a control calls this once before.
PELLORIC_EXPORT void letScriptsCall();

/// The page canvas of the window that is open; null when there is none.
PELLORIC_EXPORT Sorvane* previewCanvas();

} // namespace pelloric::qt
