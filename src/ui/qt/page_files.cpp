// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_files.h"

#include "controls/canvas.h"
#include "export/qt/page_export.h"
#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/qt/preview_prompts.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QStandardPaths>

#include <algorithm>
#include <array>
#include <utility>

namespace pelloric::qt {

namespace {

constexpr int MostFolders = 8; ///< in the side bar

/// A kind of file that pages can be saved as.
struct PageFile {
    const char* suffix;
    const char* description;
    bool isOnePerPage;
    void (*write)(const Canvas& canvas, QtFonts& fonts, const ExportOptions& options,
        const std::filesystem::path& path);
};

void writePdf(const Canvas& canvas, QtFonts& fonts, const ExportOptions& options,
    const std::filesystem::path& path)
{
    exportPdf(canvas.document(), canvas.page, fonts, options, path);
}

void writePngs(
    const Canvas& canvas, QtFonts&, const ExportOptions& options, const std::filesystem::path& path)
{
    exportPngs(canvas.document(), canvas.page, options, path);
}

void writeSvgs(const Canvas& canvas, QtFonts& fonts, const ExportOptions& options,
    const std::filesystem::path& path)
{
    exportSvg(canvas.document(), canvas.page, fonts, options, path);
}

/// The first is the one that is offered.
constexpr auto PageFiles = std::to_array<PageFile>({
    { "pdf", QT_TRANSLATE_NOOP("pelloric::qt::PageFiles", "PDF document"), false, writePdf },
    { "png", QT_TRANSLATE_NOOP("pelloric::qt::PageFiles", "PNG pictures"), true, writePngs },
    { "svg", QT_TRANSLATE_NOOP("pelloric::qt::PageFiles", "SVG drawings"), true, writeSvgs },
});

QString words(const char* text)
{
    return QCoreApplication::translate("pelloric::qt::PageFiles", text);
}

/// A title as a file can be named.
QString nameAfter(const QString& title)
{
    QString name = title.simplified();
    for (QChar& character : name) {
        if (QStringLiteral("/\\:*?\"<>|").contains(character))
            character = QLatin1Char('-');
    }
    return name.isEmpty() ? words(QT_TRANSLATE_NOOP("pelloric::qt::PageFiles", "report")) : name;
}

/// What a path's ending stands for; null: nothing that pages can be saved as.
const PageFile* kindOf(const std::filesystem::path& path)
{
    const QString suffix = QFileInfo(toQString(pathText(path))).suffix().toLower();
    const auto kind = std::ranges::find_if(
        PageFiles, [&](const PageFile& file) { return suffix == QLatin1String(file.suffix); });
    return kind != PageFiles.end() ? &*kind : nullptr;
}

} // namespace

FileQuestion savePagesQuestion(const QString& title, const QString& folder)
{
    FileQuestion question { .title
        = words(QT_TRANSLATE_NOOP("pelloric::qt::PageFiles", "Save as PDF")),
        .folder = folder,
        .filter = {},
        .isSave = true };
    QStringList filters;
    for (const PageFile& file : PageFiles) {
        const QString suffix = QLatin1String(file.suffix);
        filters.append(QStringLiteral("%1 (*.%2)").arg(words(file.description), suffix));
        question.suffixes.append(suffix);
    }
    question.filter = filters.join(QStringLiteral(";;"));
    question.name = nameAfter(title) + QLatin1Char('.') + question.suffixes.front();
    return question;
}

std::vector<std::filesystem::path> filesInTheWay(
    const Canvas& canvas, const std::filesystem::path& path)
{
    const PageFile* const kind = kindOf(path);
    std::vector<std::filesystem::path> files;
    if (kind == nullptr || !kind->isOnePerPage)
        return files;
    for (std::filesystem::path& file : pageFilePaths(canvas.document(), {}, path)) {
        if (file != path && QFileInfo::exists(toQString(pathText(file))))
            files.push_back(std::move(file));
    }
    return files;
}

void savePages(
    Canvas& canvas, QtFonts& fonts, const std::filesystem::path& path, const Progress& progress)
{
    const PageFile* const kind = kindOf(path);
    if (kind == nullptr)
        throw RunTimeError(ErrorNumber::InvalidCall,
            phrase(u"%1: the name must end in .pdf, .png or .svg", { pathText(path) }));
    const ExportOptions options { .title = canvas.documentTitle(), .progress = progress };
    canvas.keepDocument([&] { kind->write(canvas, fonts, options, path); });
}

void UsedFolders::use(const QString& file)
{
    const QString folder = QFileInfo(file).absolutePath();
    folders_.removeAll(folder);
    folders_.prepend(folder);
    while (folders_.size() > MostFolders)
        folders_.removeLast();
}

QString UsedFolders::last() const
{
    return folders_.isEmpty() ? QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation)
                              : folders_.front();
}

} // namespace pelloric::qt
