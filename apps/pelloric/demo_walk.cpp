// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_walk.h"

#include "command_line.h"
#include "controls/canvas.h"
#include "demo_window.h"
#include "export/qt/page_export.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "table_source.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"
#include "ui/tool_table.h"
#include <pelloric/sorvane.h>

#include <QAbstractButton>
#include <QAction>
#include <QApplication>
#include <QFileInfo>
#include <QPixmap>
#include <QTabWidget>
#include <QWidget>

#include <array>
#include <filesystem>

namespace pelloric::app {

namespace {

/// The size of the preview window on the screenshots: pixels.
constexpr QSize PreviewSize { 1180, 800 };

/// A page of the demonstration: the name of its files and of its button.
struct DemoPage {
    const char* name;
    const char* button;
};

constexpr auto DemoPages = std::to_array<DemoPage>({
    { "flex-grid", "previewFlexGrid" },
    { "list-view", "previewListView" },
    { "data-grid", "previewDataGrid" },
    { "spans", "previewSpans" },
    { "tree", "previewTree" },
});

/// A tool that is clicked, and the name of the screenshot after it.
struct Step {
    ToolAction tool;
    const char* name;
};

constexpr auto Steps = std::to_array<Step>({
    { ToolAction::NextPage, "next-page" },
    { ToolAction::WholePage, "whole-page" },
    { ToolAction::TwoPages, "two-pages" },
    { ToolAction::FourPages, "four-pages" },
    { ToolAction::ManyPages, "more-pages" },
    { ToolAction::OnePage, "one-page" },
    { ToolAction::ZoomOut, "zoom-in" },
    { ToolAction::ZoomIn, "zoom-out" },
});

class Walk {
public:
    Walk(DemoWindow& demo, qt::QtPreviewOpener& opener, qt::QtPlatform& platform, QString out)
        : demo_(demo)
        , opener_(opener)
        , platform_(platform)
        , out_(std::move(out))
    {
    }

    void run()
    {
        std::error_code error;
        if (!std::filesystem::create_directories(pathOf(out_), error) && error)
            throw CommandError(qt::phrased(u"%1: the folder cannot be made: %2",
                { out_, QString::fromStdString(error.message()) }));
        qt::PreviewPrompts prompts;
        prompts.chooseFile = [this](QWidget&, const qt::FileQuestion&) { return document(); };
        opener_.setPrompts(prompts);
        demo_.show();
        for (std::size_t page = 0; page < DemoPages.size(); ++page)
            showPage(static_cast<int>(page), DemoPages[page]);
        saveAndOpen();
        click(ToolAction::Exit);
        settle();
        if (opener_.window() != nullptr)
            throw CommandError(qt::phrased(u"the preview window did not close"));
    }

private:
    QString document() const { return out_ + QStringLiteral("/report.ostl"); }

    static void settle()
    {
        for (int turn = 0; turn < 3; ++turn)
            QApplication::processEvents();
    }

    void said(const QString& file)
    {
        if (!QFileInfo::exists(file))
            throw CommandError(qt::phrased(u"%1 was not written").arg(file));
        print(file + QLatin1Char('\n'));
    }

    void shoot(QWidget& widget, const QString& name)
    {
        settle();
        const QString file = QStringLiteral("%1/%2.png").arg(out_, name);
        if (!widget.grab().save(file))
            throw CommandError(qt::phrased(u"%1 cannot be written").arg(file));
        said(file);
    }

    qt::PreviewWindow& window()
    {
        if (opener_.window() == nullptr)
            throw CommandError(qt::phrased(u"the preview window is not open"));
        return *opener_.window();
    }

    void click(ToolAction tool)
    {
        for (QAction* const action : window().findChildren<QAction*>()) {
            if (action->property("toolId").toInt() != toolOf(tool).id)
                continue;
            action->trigger();
            return settle();
        }
        throw CommandError(qt::phrased(u"there is no tool %1").arg(toolOf(tool).id));
    }

    void showPage(int index, const DemoPage& page)
    {
        const QString name = QString::fromLatin1(page.name);
        demo_.pages().setCurrentIndex(index);
        shoot(demo_, QStringLiteral("demo-") + name);
        demo_.findChild<QAbstractButton*>(QString::fromLatin1(page.button))->click();
        window().resize(PreviewSize);
        shoot(window(), name + QStringLiteral("-preview"));
        if (index == 0) {
            for (const Step& step : Steps) {
                click(step.tool);
                shoot(window(), QStringLiteral("%1-%2").arg(name, QLatin1String(step.name)));
            }
        }
        exportPages(name);
    }

    void exportPages(const QString& name)
    {
        const Canvas& canvas = window().canvas().canvas();
        const QString file = QStringLiteral("%1/%2.pdf").arg(out_, name);
        qt::ExportOptions options;
        options.title = qt::toText(name);
        qt::exportPdf(canvas.document(), canvas.page, platform_.fonts(), options, pathOf(file));
        said(file);
    }

    void saveAndOpen()
    {
        const int pages = window().canvas().canvas().Totalpages();
        click(ToolAction::SaveFile);
        said(document());
        click(ToolAction::ClearPages);
        click(ToolAction::OpenFile);
        if (window().canvas().canvas().Totalpages() != pages)
            throw CommandError(qt::phrased(u"the saved document has other pages"));
        shoot(window(), QStringLiteral("reopened"));
    }

    DemoWindow& demo_;
    qt::QtPreviewOpener& opener_;
    qt::QtPlatform& platform_;
    QString out_;
};

} // namespace

void walkDemo(
    DemoWindow& demo, qt::QtPreviewOpener& opener, qt::QtPlatform& platform, const QString& out)
{
    Walk(demo, opener, platform, out).run();
}

} // namespace pelloric::app
