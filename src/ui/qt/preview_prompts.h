// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>
#include <QStringList>

#include <functional>

class QWidget;

namespace pelloric {

class AutomationObject;

} // namespace pelloric

namespace pelloric::qt {

/// A question for the path of a file.
struct FileQuestion {
    QString title;
    QString folder; ///< shown first
    QString filter; ///< in the toolkit's form: "Name (*.suffix)"
    bool isSave = false;
    QString name {}; ///< proposed; may be empty
    QStringList suffixes {}; ///< one of them ends the path, the first is added; empty: any ending
    QStringList places {}; ///< folders that are offered beside the usual ones
};

/// What the preview window asks people and tells about itself; a host may put its own in.
struct PreviewPrompts {
    /// Answers the chosen path, or an empty one for a cancelled question.
    std::function<QString(QWidget& window, const FileQuestion& question)> chooseFile;

    /// The grid of the preview is about to be read, also by "ReFresh" and after a dialog; a host
    /// may bring its column widths up to date. May be empty.
    std::function<void(AutomationObject& grid)> beforeBuild = {};

    /// Asks whether files that exist may be replaced, one or more: full paths. A refusal ends what
    /// would have replaced them.
    std::function<bool(QWidget& window, const QStringList& files)> mayReplace = {};

    /// Shows the about box and returns when it is closed.
    std::function<void(QWidget& window)> showAbout;
};

/// The toolkit's file dialog, and a box with the library's name and version.
PreviewPrompts standardPrompts();

/// The question that a title of the tool table stands for.
FileQuestion openFileQuestion();
/// The question that a title of the tool table stands for.
FileQuestion saveFileQuestion();

} // namespace pelloric::qt
