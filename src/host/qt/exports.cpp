// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/export.h>

#include "controls/qt/default_platform.h"
#include "document/ostl_losses.h"
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

OstlLosses writeOstlFile(const Canvas& canvas, const ExportRequest& request)
{
    const Platform platform = defaultPlatform().record();
    exportOstl(canvas.document(), canvas.page, { platform.codec, platform.decimalSeparator },
        optionsOf(request), pathOf(request.path));
    return ostlLosses(canvas.document(), platform.codec);
}

/// Lays a live view out as a request says.
Report reportOf(QObject& grid, const ExportRequest& request)
{
    Report report;
    report.useSettings(request.settings);
    report.setReportOptions(request.options);
    report.build(grid);
    return report;
}

ExportResult resultOf(const Report& report, QStringList files)
{
    return { .files = std::move(files),
        .pageCount = report.pageCount(),
        .rowCount = canvasOf(report).printedRows(),
        .fit = report.fitResult(),
        .leftOutOfTotals = report.leftOutOfTotals() };
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

ExportResult exportPdf(QObject& grid, const ExportRequest& request)
{
    const Report report = reportOf(grid, request);
    exportPdf(report, request);
    return resultOf(report, { request.path });
}

QStringList exportPng(const Report& report, const ExportRequest& request)
{
    return writePngs(canvasOf(report), request);
}

QStringList exportPng(const Sorvane& canvas, const ExportRequest& request)
{
    return writePngs(canvasOf(canvas), request);
}

ExportResult exportPng(QObject& grid, const ExportRequest& request)
{
    const Report report = reportOf(grid, request);
    return resultOf(report, exportPng(report, request));
}

QStringList exportSvg(const Report& report, const ExportRequest& request)
{
    return writeSvgs(canvasOf(report), request);
}

QStringList exportSvg(const Sorvane& canvas, const ExportRequest& request)
{
    return writeSvgs(canvasOf(canvas), request);
}

ExportResult exportSvg(QObject& grid, const ExportRequest& request)
{
    const Report report = reportOf(grid, request);
    return resultOf(report, exportSvg(report, request));
}

OstlLosses exportOstl(const Report& report, const ExportRequest& request)
{
    return writeOstlFile(canvasOf(report), request);
}

OstlLosses exportOstl(const Sorvane& canvas, const ExportRequest& request)
{
    return writeOstlFile(canvasOf(canvas), request);
}

ExportResult exportOstl(QObject& grid, const ExportRequest& request)
{
    const Report report = reportOf(grid, request);
    ExportResult result = resultOf(report, { request.path });
    result.ostlLosses = exportOstl(report, request);
    return result;
}

} // namespace pelloric::qt
