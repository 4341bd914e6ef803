// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/report_tools.h"

#include "controls/canvas.h"
#include "controls/messages.h"
#include "document/ostl_losses.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include "ui/qt/fit_text.h"
#include "ui/qt/options_panel.h"

#include <pelloric/sorvane.h>

#include <QApplication>
#include <QMainWindow>
#include <QStatusBar>

namespace pelloric::qt {

ReportTools::ReportTools(const Window& window)
    : QObject(&window.window)
    , parts_(window)
    , panel_(new OptionsPanel(&window.window))
{
    parts_.window.addDockWidget(Qt::RightDockWidgetArea, panel_);
    panel_->hide();
    connect(panel_, &OptionsPanel::changed, this, &ReportTools::apply);
}

void ReportTools::setOptions(const ReportOptions& options)
{
    parts_.canvas.setReportOptions(options);
    panel_->setOptions(options);
}

/// A host may have given the canvas other options meanwhile.
void ReportTools::togglePanel()
{
    if (!panel_->isVisible())
        panel_->setOptions(parts_.canvas.reportOptions());
    panel_->setVisible(!panel_->isVisible());
    if (panel_->isVisible())
        panel_->enter();
    else
        parts_.canvas.setFocus();
}

bool ReportTools::escape()
{
    const QWidget* const focused = QApplication::focusWidget();
    if (!panel_->isVisible() || focused == nullptr || !panel_->isAncestorOf(focused))
        return false;
    togglePanel();
    return true;
}

/// An error of the build is told, and leaves the pages and their options as they were.
void ReportTools::apply()
{
    if (parts_.isBusy())
        return;
    const ReportOptions earlier = parts_.canvas.reportOptions();
    parts_.canvas.setReportOptions(panel_->options());
    try {
        parts_.rebuild();
    } catch (const RunTimeError& error) {
        parts_.canvas.setReportOptions(earlier);
        if (error.number() != ErrorNumber::Cancelled)
            parts_.messages.show(messageOf(error));
    }
}

void ReportTools::viewChanged()
{
    const Canvas& canvas = parts_.canvas.canvas();
    if (canvas.isBuilding() || documentNumber_ == canvas.documentNumber())
        return;
    documentNumber_ = canvas.documentNumber();
    panel_->showFit(canvas.fit());
    QStringList told { fitText(canvas.fit()) };
    for (const LeftOut& column : canvas.leftOut())
        told += tr("Cells of %1 that show no number and that its total leaves out: %2.")
                    .arg(toQString(column.column))
                    .arg(column.cells);
    showStatus(told.join(QLatin1Char(' ')).trimmed());
}

void ReportTools::documentSaved()
{
    Canvas& canvas = parts_.canvas.canvas();
    const OstlLosses losses = ostlLosses(canvas.document(), canvas.platform().codec);
    if (losses.pictures || losses.icons)
        showStatus(tr("The file holds the pages without watermark, logo and icons; save them as "
                      "PDF to keep those."));
}

/// There is no line as long as there is nothing to tell.
void ReportTools::showStatus(const QString& text)
{
    auto* bar = parts_.window.findChild<QStatusBar*>(QString(), Qt::FindDirectChildrenOnly);
    if (!bar && text.isEmpty())
        return;
    bar = parts_.window.statusBar();
    bar->setObjectName(QStringLiteral("ReportStatus"));
    bar->setSizeGripEnabled(false);
    bar->showMessage(text);
    bar->setVisible(!text.isEmpty());
}

} // namespace pelloric::qt
