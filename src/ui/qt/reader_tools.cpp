// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/reader_tools.h"

#include "controls/canvas.h"
#include "ui/page_reading.h"
#include "ui/preview_navigation.h"
#include "ui/qt/find_bar.h"
#include "ui/qt/keys_window.h"
#include "ui/qt/page_marks.h"
#include "ui/qt/page_strip.h"
#include "ui/tool_table.h"

#include <pelloric/sorvane.h>

#include <QApplication>
#include <QClipboard>
#include <QDockWidget>
#include <QMainWindow>
#include <QMenu>

#include <algorithm>

namespace pelloric::qt {

ReaderTools::ReaderTools(const Window& window)
    : QObject(&window.window)
    , parts_(window)
    , marks_(new PageMarks(window.canvas, this))
    , find_(new FindBar(window.canvas.canvas(), window.session, *marks_))
    , strip_(new PageStrip(window.canvas.canvas(), window.fonts))
    , findDock_(dock(find_, Qt::BottomDockWidgetArea))
    , stripDock_(dock(strip_, Qt::LeftDockWidgetArea))
    , commands_(commands())
{
    parts_.window.setCorner(Qt::BottomLeftCorner, Qt::LeftDockWidgetArea);
    addViewCommands(parts_.window, parts_.menu, commands_);
    connect(find_, &FindBar::closed, this, &ReaderTools::closeFind);
    connect(strip_, &PageStrip::pageChosen, this, [this](int page) {
        guarded([&] {
            if (const auto surface = parts_.session.showPage(page))
                bringToTop(parts_.canvas.canvas(), *surface);
        });
    });
}

/// The docks work on the marks and on the session, which go next.
ReaderTools::~ReaderTools()
{
    delete findDock_;
    delete stripDock_;
}

std::vector<ViewCommand> ReaderTools::commands()
{
    PreviewSession& session = parts_.session;
    const auto keys = [](std::initializer_list<const char*> names) {
        QList<QKeySequence> list;
        for (const char* const name : names)
            list.append(QKeySequence(QString::fromLatin1(name)));
        return list;
    };
    const auto tool
        = [&](const char* name, ToolAction action, const QString& text, const char* shown) {
              return ViewCommand { name, text + QLatin1Char('\t') + QString::fromLatin1(shown), {},
                  [this, id = toolOf(action).id] { guarded([&] { parts_.session.click(id); }); } };
          };
    std::vector<ViewCommand> all {
        { "SavePages", tr("Save as PDF"), keys({ "Ctrl+E" }), parts_.savePages },
        { "FitWidth", tr("Page Width"), keys({ "Ctrl+1" }),
            [&] { guarded([&] { session.fitPageWidth(); }); }, true },
        { "FitPage", tr("Page in View"), keys({ "Ctrl+2" }),
            [&] { guarded([&] { session.fitPage(); }); } },
        tool("ModeWhole", ToolAction::WholePage, tr("Fill the Window"), "Ctrl+0"),
        tool("ModeOne", ToolAction::OnePage, tr("One Page"), "Alt+1"),
        tool("ModeTwo", ToolAction::TwoPages, tr("Two Pages"), "Alt+2"),
        tool("ModeFour", ToolAction::FourPages, tr("Four Pages"), "Alt+4"),
        tool("ModeMany", ToolAction::ManyPages, tr("More Pages"), "Alt+6"),
        { "Find", tr("Find…"), keys({ "Ctrl+F" }), [this] { openFind(); }, true },
        { "FindNextPlace", tr("Next Place"), keys({ "F3", "Ctrl+K" }),
            [this] { findDock_->isVisible() ? find_->walk(true) : openFind(); } },
        { "FindPreviousPlace", tr("Previous Place"), keys({ "Shift+F3" }),
            [this] { findDock_->isVisible() ? find_->walk(false) : openFind(); } },
        { "SelectPage", tr("Select Page"), keys({ "Ctrl+A" }),
            [this] { guarded([&] { marks_->selectPage(pageInReading()); }); } },
        { "Copy", tr("Copy"), keys({ "Ctrl+C", "Ctrl+Ins" }), [this] { copy(); } },
        { "Thumbnails", tr("Pictures of the Pages"), keys({ "F9" }),
            [this] { stripDock_->setVisible(!stripDock_->isVisible()); }, true },
        { "ReportOptionsPanel", tr("Report Options"), keys({ "F4" }),
            [this] { guarded(parts_.showOptions); } },
        { "Keys", tr("Keys"), keys({ "F1" }),
            [this] { showKeys(parts_.window, allKeys(commands_)); } },
    };
    return all;
}

/// A frame without a title: it neither moves nor floats.
QDockWidget* ReaderTools::dock(QWidget* content, Qt::DockWidgetArea area)
{
    auto* const frame = new QDockWidget(&parts_.window);
    frame->setObjectName(content->objectName() + QStringLiteral("Dock"));
    frame->setWindowTitle(content->accessibleName());
    frame->setFeatures(QDockWidget::NoDockWidgetFeatures);
    frame->setTitleBarWidget(new QWidget(frame));
    frame->setWidget(content);
    if (area == Qt::BottomDockWidgetArea)
        content->setFixedHeight(content->sizeHint().height());
    frame->hide();
    parts_.window.addDockWidget(area, frame);
    return frame;
}

void ReaderTools::guarded(const std::function<void()>& command)
{
    if (!parts_.isBusy())
        command();
}

void ReaderTools::openFind()
{
    findDock_->show();
    find_->open();
}

void ReaderTools::closeFind()
{
    findDock_->hide();
    parts_.canvas.setFocus();
}

bool ReaderTools::escape()
{
    if (findDock_->isVisible()) {
        closeFind();
        return true;
    }
    return marks_->clearSelection();
}

/// The page in view, or the first one of a window of pages.
int ReaderTools::pageInReading() const
{
    const Canvas& canvas = parts_.canvas.canvas();
    if (showsPageWindow(canvas.view()))
        return std::max<int>(0, canvas.WindowMinPage());
    return pageInView(canvas.view(), canvas.facts()).value_or(0);
}

void ReaderTools::copy()
{
    const QString text = marks_->selectedText();
    if (!text.isEmpty())
        QApplication::clipboard()->setText(text);
}

void ReaderTools::viewChanged()
{
    const Canvas& canvas = parts_.canvas.canvas();
    if (canvas.isBuilding())
        return;
    if (documentNumber_ != canvas.documentNumber()) {
        documentNumber_ = canvas.documentNumber();
        marks_->documentChanged();
        find_->documentChanged();
    }
    strip_->showPosition();
}

} // namespace pelloric::qt
