// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "platform/text.h"

#include <QStringList>

#include <filesystem>
#include <vector>

namespace pelloric {
class Canvas;
}

namespace pelloric::qt {

class QtFonts;
struct FileQuestion;

/// Asks where pages are to be saved as PDF, or as pictures by the name's ending.
/// @param title   of the document, which the name is proposed after; may be empty
/// @param folder  shown first
FileQuestion savePagesQuestion(const QString& title, const QString& folder);

/// The files that saving the pages of a canvas would replace without the person having been asked:
/// pictures of several pages go to numbered files beside the name that was chosen.
std::vector<std::filesystem::path> filesInTheWay(
    const Canvas& canvas, const std::filesystem::path& path);

/// Writes the pages of a canvas as the path's ending says: .pdf, .png or .svg, the pictures one
/// file a page as the exports name them.
/// @param progress  told how many pages are done
/// @throws RunTimeError InvalidCall: another ending; WriteFailed; Cancelled
void savePages(
    Canvas& canvas, QtFonts& fonts, const std::filesystem::path& path, const Progress& progress);

/// The folders that files were opened from and saved to in this session, the last one first.
class UsedFolders {
public:
    void use(const QString& file);

    const QStringList& folders() const { return folders_; }

    /// The last one, or where the user's documents are before there is one.
    QString last() const;

private:
    QStringList folders_;
};

} // namespace pelloric::qt
