// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/export.h>

#include "controls/qt/default_platform.h"
#include "document/ostl_writer.h"
#include "export/qt/page_export.h"
#include "host/qt/host_canvas.h"
#include "platform/file_bytes.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_text.h"

namespace pelloric::qt {

namespace {

ExportOptions optionsOf(const ExportRequest& request)
{
    ExportOptions options { .dpi = request.dpi,
        .jobs = request.jobs,
        .title = toText(request.title),
        .language = toText(request.language),
        .isTagged = request.isTagged,
        .isArchive = request.isArchive,
        .progress = request.progress };
    for (const int number : request.pageNumbers)
        options.pages.push_back(number - 1);
    return options;
}

QStringList namesOf(const std::vector<std::filesystem::path>& paths)
{
    QStringList names;
    for (const std::filesystem::path& path : paths)
        names.append(toQString(pathText(path)));
    return names;
}

void writePdf(const Canvas& canvas, const ExportRequest& request)
{
    exportPdf(canvas.document(), canvas.page, defaultPlatform().fonts(), optionsOf(request),
        pathOf(request.path));
}

QStringList writePngs(const Canvas& canvas, const ExportRequest& request)
{
    return namesOf(
        exportPngs(canvas.document(), canvas.page, optionsOf(request), pathOf(request.path)));
}

QStringList writeSvgs(const Canvas& canvas, const ExportRequest& request)
{
    return namesOf(exportSvg(canvas.document(), canvas.page, defaultPlatform().fonts(),
        optionsOf(request), pathOf(request.path)));
}

void writeOstlFile(const Canvas& canvas, const ExportRequest& request)
{
    const Platform platform = defaultPlatform().record();
    exportOstl(canvas.document(), canvas.page, { platform.codec, platform.decimalSeparator },
        optionsOf(request), pathOf(request.path));
}

} // namespace

void exportPdf(const Report& report, const ExportRequest& request)
{
    writePdf(canvasOf(report), request);
}

void exportPdf(const Sorvane& canvas, const ExportRequest& request)
{
    writePdf(canvasOf(canvas), request);
}

QStringList exportPng(const Report& report, const ExportRequest& request)
{
    return writePngs(canvasOf(report), request);
}

QStringList exportPng(const Sorvane& canvas, const ExportRequest& request)
{
    return writePngs(canvasOf(canvas), request);
}

QStringList exportSvg(const Report& report, const ExportRequest& request)
{
    return writeSvgs(canvasOf(report), request);
}

QStringList exportSvg(const Sorvane& canvas, const ExportRequest& request)
{
    return writeSvgs(canvasOf(canvas), request);
}

void exportOstl(const Report& report, const ExportRequest& request)
{
    writeOstlFile(canvasOf(report), request);
}

void exportOstl(const Sorvane& canvas, const ExportRequest& request)
{
    writeOstlFile(canvasOf(canvas), request);
}

} // namespace pelloric::qt
