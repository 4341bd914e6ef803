// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/tool_meanings.h"

#include "platform/qt/qt_text.h"
#include "ui/tool_table.h"

#include <QCoreApplication>

#include <array>
#include <utility>

namespace pelloric::qt {

namespace {

struct MeaningRow {
    ToolAction action;
    const char* meaning;
};

constexpr auto Meanings = std::to_array<MeaningRow>({
    { ToolAction::ShowGridStyle,
        QT_TRANSLATE_NOOP("ToolMeanings", "Fonts, colours and grid lines of the report") },
    { ToolAction::Refresh, QT_TRANSLATE_NOOP("ToolMeanings", "Read the table again") },
    { ToolAction::ZoomOut, QT_TRANSLATE_NOOP("ToolMeanings", "Show the pages twice as large") },
    { ToolAction::ZoomIn, QT_TRANSLATE_NOOP("ToolMeanings", "Show the pages half as large") },
    { ToolAction::FirstPage, QT_TRANSLATE_NOOP("ToolMeanings", "Go to the first page") },
    { ToolAction::PreviousPage, QT_TRANSLATE_NOOP("ToolMeanings", "Go back a page") },
    { ToolAction::NextPage, QT_TRANSLATE_NOOP("ToolMeanings", "Go on to the next page") },
    { ToolAction::LastPage, QT_TRANSLATE_NOOP("ToolMeanings", "Go to the last page") },
    { ToolAction::ManyPages,
        QT_TRANSLATE_NOOP("ToolMeanings", "Show all pages, or six of a long report") },
    { ToolAction::OnePage, QT_TRANSLATE_NOOP("ToolMeanings", "Show one page") },
    { ToolAction::Pan, QT_TRANSLATE_NOOP("ToolMeanings", "Drag the pages with the mouse") },
    { ToolAction::ShowPrintOptions, QT_TRANSLATE_NOOP("ToolMeanings", "Print all pages or some") },
    { ToolAction::ShowPageSetup,
        QT_TRANSLATE_NOOP("ToolMeanings", "Paper, margins, header and footer") },
    { ToolAction::WholePage, QT_TRANSLATE_NOOP("ToolMeanings", "Fill the window with one page") },
    { ToolAction::TwoPages, QT_TRANSLATE_NOOP("ToolMeanings", "Show two pages") },
    { ToolAction::ChooseScale,
        QT_TRANSLATE_NOOP("ToolMeanings", "Scale of the pages: pick one or type it") },
    { ToolAction::ChoosePage,
        QT_TRANSLATE_NOOP("ToolMeanings", "Go to a page: pick one or type its number") },
    { ToolAction::Exit, QT_TRANSLATE_NOOP("ToolMeanings", "Close the preview") },
    { ToolAction::FourPages, QT_TRANSLATE_NOOP("ToolMeanings", "Show four pages") },
    { ToolAction::ShowAbout, QT_TRANSLATE_NOOP("ToolMeanings", "Name and version") },
    { ToolAction::OpenFile, QT_TRANSLATE_NOOP("ToolMeanings", "Open saved pages") },
    { ToolAction::SaveFile, QT_TRANSLATE_NOOP("ToolMeanings", "Save the pages to a file") },
    { ToolAction::ClearPages, QT_TRANSLATE_NOOP("ToolMeanings", "Throw all pages away") },
    { ToolAction::Enlarge, QT_TRANSLATE_NOOP("ToolMeanings", "Larger text and columns") },
    { ToolAction::Shrink, QT_TRANSLATE_NOOP("ToolMeanings", "Smaller text and columns") },
});
static_assert(Meanings.size() == PreviewTools.size());

/// Keys beside those of the table: on many keyboards "+" needs the shift key.
constexpr auto FurtherKeys = std::to_array<std::pair<ToolAction, const char*>>({
    { ToolAction::ZoomOut, "Ctrl+=" },
    { ToolAction::ShowPrintOptions, "Print" },
    { ToolAction::FourPages, "Alt+4" },
    { ToolAction::ManyPages, "Alt+6" },
});

} // namespace

QString meaningOf(ToolAction action)
{
    for (const MeaningRow& row : Meanings) {
        if (row.action == action)
            return QCoreApplication::translate("ToolMeanings", row.meaning);
    }
    return {};
}

QKeySequence keysOf(const PreviewTool& tool)
{
    return QKeySequence::fromString(toQString(tool.shortcut), QKeySequence::PortableText);
}

QList<QKeySequence> allKeysOf(const PreviewTool& tool)
{
    QList<QKeySequence> keys;
    if (!tool.shortcut.empty())
        keys.append(keysOf(tool));
    for (const auto& [of, further] : FurtherKeys) {
        if (of == tool.action)
            keys.append(QKeySequence(QLatin1String(further)));
    }
    return keys;
}

} // namespace pelloric::qt
