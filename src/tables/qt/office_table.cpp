// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/office_table.h"

#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "tables/qt/zip_entries.h"

#include <QFileInfo>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr int ConversionTime = 120000; ///< milliseconds

constexpr char ZipMark[] = "PK\x03\x04";
constexpr char OldOfficeMark[] = "\xD0\xCF\x11\xE0";

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

std::string startOf(const std::filesystem::path& path)
{
    return firstFileBytes(path, sizeof ZipMark - 1);
}

QString extensionOf(const std::filesystem::path& path)
{
    return toQString(pathText(path.extension())).toLower();
}

/// Converts an office file of another kind.
/// @return  the file as .xlsx, in the folder
std::filesystem::path converted(const std::filesystem::path& path, const QTemporaryDir& folder)
{
    const QString program = QStandardPaths::findExecutable(QStringLiteral("soffice"));
    if (program.isEmpty())
        refuse(
            phrase(u"this office file has to be converted by LibreOffice, which is not installed; "
                   u"install libreoffice-calc, or save the file as .xlsx, .ods or CSV"));
    // Under a name of our own, for LibreOffice takes a name that begins with "-" for an option.
    const QString name = folder.filePath(QStringLiteral("table")) + extensionOf(path);
    std::error_code error;
    if (!std::filesystem::copy_file(path, pathOf(name), error))
        refuse(phrase(u"the file cannot be copied into %1 to be converted: %2",
            { toText(folder.path()), fromUtf8(error.message()) }));
    QProcess process;
    process.start(program,
        { QStringLiteral("--headless"), QStringLiteral("--convert-to"), QStringLiteral("xlsx"),
            QStringLiteral("--outdir"), folder.path(), name });
    const bool hasEnded = process.waitForFinished(ConversionTime);
    const QString made = folder.filePath(QStringLiteral("table.xlsx"));
    if (!hasEnded || process.exitCode() != 0 || !QFileInfo::exists(made))
        refuse(phrase(u"LibreOffice could not convert this file; save it as .xlsx, .ods or CSV"));
    return pathOf(made);
}

/// Whether an archive is an office file whatever its name, as one that came through a pipe.
bool holdsSheets(const std::filesystem::path& path)
{
    try {
        const ZipEntries file(path);
        return file.has("xl/workbook.xml") || file.read("mimetype").contains("spreadsheet");
    } catch (const RunTimeError&) {
        return false;
    }
}

} // namespace

bool isOfficeFile(const std::filesystem::path& path)
{
    const std::string start = startOf(path);
    const QString extension = extensionOf(path);
    if (start == OldOfficeMark)
        return true;
    if (start != ZipMark)
        return false;
    constexpr const char* Zipped[] = { ".xlsx", ".xlsm", ".ods", ".xltx" };
    return holdsSheets(path) || std::ranges::any_of(Zipped, [&](const char* zipped) {
        return extension == QLatin1String(zipped);
    });
}

TableGrid readOffice(const OfficeSource& source)
{
    const QTemporaryDir folder;
    const bool isOld = startOf(source.path) == OldOfficeMark;
    const std::filesystem::path path = isOld ? converted(source.path, folder) : source.path;
    const ZipEntries file(path);
    SheetCells cells = file.has("content.xml") ? readOdsSheet(file, source.sheet)
                                               : readXlsxSheet(file, source.sheet);
    const HiddenCount hidden = source.takesHidden ? HiddenCount() : cells.leaveOutHidden();
    if (source.leftOut != nullptr)
        *source.leftOut = hidden;
    return cells.toTable();
}

} // namespace pelloric::qt
