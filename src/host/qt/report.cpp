// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/report.h>

#include "controls/canvas.h"
#include "controls/qt/default_platform.h"
#include "document/ostl_reader.h"
#include "document/records.h"
#include "grids/qt/grid_for.h"
#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/preview_navigation.h"

namespace pelloric::qt {

struct Report::Parts {
    Platform platform = defaultPlatform().record();
    Canvas canvas { platform };
};

Report::Report()
    : parts_(std::make_unique<Parts>())
{
}

Report::~Report() = default;
Report::Report(Report&& other) noexcept = default;
Report& Report::operator=(Report&& other) noexcept = default;

void Report::useSettings(std::optional<ReportSettings> settings)
{
    parts_->canvas.useSettings(std::move(settings));
}

void Report::setReportOptions(const ReportOptions& options) { parts_->canvas.options = options; }

const ReportOptions& Report::reportOptions() const { return parts_->canvas.options; }

FitResult Report::fitResult() const { return parts_->canvas.fit(); }

std::vector<LeftOut> Report::leftOutOfTotals() const { return parts_->canvas.leftOut(); }

void Report::build(QObject& grid)
{
    const std::unique_ptr<AutomationObject> object = gridFor(grid);
    Canvas& canvas = parts_->canvas;
    canvas.m_PrintObj = gridKindOf(*object);
    canvas.doPreview(*object);
    if (canvas.table() == nullptr)
        throw RunTimeError(ErrorNumber::ObjectMissing,
            phrase(u"no column of the grid is wide enough to be printed"));
}

void Report::open(const QString& path)
{
    Canvas& canvas = parts_->canvas;
    canvas.clear();
    const std::filesystem::path file = pathOf(path);
    if (readOstl(canvas.platform().codec, file, canvas.document(), canvas.page)
        == OstlResult::BadHeader)
        throw RunTimeError(
            ErrorNumber::TypeMismatch, phrase(u"%1 is no document file", { pathText(file) }));
}

int Report::pageCount() const { return parts_->canvas.Totalpages(); }

int Report::pageWidth() const { return parts_->canvas.page.myWidth; }

int Report::pageHeight() const { return parts_->canvas.page.myHeight; }

QString Report::pageText(int pageNumber) const
{
    QStringList lines;
    for (const TextRecord& record : parts_->canvas.document().texts(pageNumber - 1))
        lines.append(toQString(
            replaceAll(record.text(), PageCountToken, decimal(parts_->canvas.Totalpages()))));
    return lines.join(QLatin1Char('\n'));
}

Canvas& Report::canvas() const { return parts_->canvas; }

} // namespace pelloric::qt
