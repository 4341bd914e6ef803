// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <algorithm>
#include <array>
#include <cstdint>

namespace pelloric {

/// What a tool of the preview window does.
enum class ToolAction {
    ShowGridStyle,
    Refresh,
    ZoomOut,
    ZoomIn,
    FirstPage,
    PreviousPage,
    NextPage,
    LastPage,
    ManyPages,
    OnePage,
    Pan,
    ShowPrintOptions,
    ShowPageSetup,
    WholePage,
    TwoPages,
    ChooseScale,
    ChoosePage,
    Exit,
    FourPages,
    ShowAbout,
    OpenFile,
    SaveFile,
    ClearPages,
    Enlarge,
    Shrink, ///< the last one
};

/// What a tool is made as.
enum class ToolKind { Button, Combo, MenuItem };

/// Tools of one group stand together.
enum class ToolGroup { Report, Zoom, Pages, Arrangement, Print, File, Window };

/// One tool of the preview window; captions are kept to the blank.
struct PreviewTool {
    int id; ///< two numbers stand for a button and a combo each
    TextView name; ///< object name; several tools share one
    TextView caption;
    ToolKind kind;
    bool enabled; ///< when the window opens on one page
    ToolAction action;
    ToolGroup group;
    TextView shortcut; ///< in portable form, e.g. "Ctrl+P"; may be empty
    TextView icon; ///< name without folder and suffix; empty for combos
};

/// Every tool belongs to this category.
inline constexpr TextView ToolCategory = u"print";
/// The toolbar's object name, and the name of the band that carries the two combos.
inline constexpr TextView ToolbarName = u"ActiveBar1";
inline constexpr TextView ToolBandName = u"toolshow";

/// In the order of the tool numbers; "Zoom In" calls `zoomOut` and the other way round, for the
/// canvas names its members after its divisor.
inline constexpr auto PreviewTools = std::to_array<PreviewTool>({
    { 1, u"tool1", u"Design  Report", ToolKind::Button, true, ToolAction::ShowGridStyle,
        ToolGroup::Report, u"Ctrl+D", u"design" },
    { 2, u"toolFresh", u"ReFresh", ToolKind::Button, true, ToolAction::Refresh, ToolGroup::Report,
        u"F5", u"refresh" },
    { 3, u"toolOut", u"Zoom In", ToolKind::Button, true, ToolAction::ZoomOut, ToolGroup::Zoom,
        u"Ctrl++", u"zoom-in" },
    { 4, u"toolIn", u"Zoom Out", ToolKind::Button, true, ToolAction::ZoomIn, ToolGroup::Zoom,
        u"Ctrl+-", u"zoom-out" },
    { 5, u"tool5", u"The First Page", ToolKind::Button, false, ToolAction::FirstPage,
        ToolGroup::Pages, u"Ctrl+Home", u"first" },
    { 6, u"tool6", u"Previous Page", ToolKind::Button, false, ToolAction::PreviousPage,
        ToolGroup::Pages, u"Ctrl+PgUp", u"previous" },
    { 7, u"tool7", u"Next Page", ToolKind::Button, false, ToolAction::NextPage, ToolGroup::Pages,
        u"Ctrl+PgDown", u"next" },
    { 8, u"tool8", u"the Last Page", ToolKind::Button, false, ToolAction::LastPage,
        ToolGroup::Pages, u"Ctrl+End", u"last" },
    { 9, u"tool9", u" Show More Pages", ToolKind::Button, true, ToolAction::ManyPages,
        ToolGroup::Arrangement, u"Ctrl+6", u"more-pages" },
    { 10, u"tool10", u"Show One Page", ToolKind::Button, true, ToolAction::OnePage,
        ToolGroup::Arrangement, u"Alt+1", u"one-page" },
    { 11, u"tool11", u"Move Smoth", ToolKind::Button, true, ToolAction::Pan, ToolGroup::Zoom,
        u"Ctrl+M", u"hand" },
    { 12, u"tool12", u"Print", ToolKind::Button, true, ToolAction::ShowPrintOptions,
        ToolGroup::Print, u"Ctrl+P", u"print" },
    { 13, u"tool13", u"Page Setup", ToolKind::Button, true, ToolAction::ShowPageSetup,
        ToolGroup::Print, u"Ctrl+Shift+P", u"page-setup" },
    { 15, u"tool15", u" Show Whole Page", ToolKind::Button, true, ToolAction::WholePage,
        ToolGroup::Arrangement, u"Ctrl+0", u"whole-page" },
    { 16, u"tool15", u"Show Two Page", ToolKind::Button, true, ToolAction::TwoPages,
        ToolGroup::Arrangement, u"Alt+2", u"two-pages" },
    { 16, u"cmbScala", u"Show Scala", ToolKind::Combo, true, ToolAction::ChooseScale,
        ToolGroup::Zoom, u"Ctrl+L", u"" },
    { 15, u"Page NO.", u"Page NO.", ToolKind::Combo, true, ToolAction::ChoosePage, ToolGroup::Pages,
        u"Ctrl+G", u"" },
    { 17, u"toolExit", u"Exit", ToolKind::Button, true, ToolAction::Exit, ToolGroup::Window,
        u"Ctrl+W", u"exit" },
    { 18, u"tool15", u"Show Four Page", ToolKind::Button, true, ToolAction::FourPages,
        ToolGroup::Arrangement, u"Ctrl+4", u"four-pages" },
    { 19, u"toolAbout", u"About", ToolKind::Button, true, ToolAction::ShowAbout, ToolGroup::Window,
        u"Shift+F1", u"about" },
    { 20, u"OpenFile", u"Open File", ToolKind::Button, true, ToolAction::OpenFile, ToolGroup::File,
        u"Ctrl+O", u"open" },
    { 21, u"SaveFile", u"Save File", ToolKind::Button, true, ToolAction::SaveFile, ToolGroup::File,
        u"Ctrl+S", u"save" },
    { 22, u"", u"Clear  All Pages", ToolKind::MenuItem, true, ToolAction::ClearPages,
        ToolGroup::File, u"Ctrl+Del", u"clear" },
    { 23, u"tool23", u"Maximum ", ToolKind::Button, true, ToolAction::Enlarge, ToolGroup::Report,
        u"Ctrl+Up", u"enlarge" },
    { 24, u"tool24", u"Minimum", ToolKind::Button, true, ToolAction::Shrink, ToolGroup::Report,
        u"Ctrl+Down", u"shrink" },
});
static_assert(PreviewTools.size() == static_cast<std::size_t>(ToolAction::Shrink) + 1);

/// Whether every tool is there, and once.
constexpr bool hasEveryTool()
{
    for (std::size_t action = 0; action < PreviewTools.size(); ++action) {
        const auto does = [&](const PreviewTool& tool) {
            return tool.action == static_cast<ToolAction>(action);
        };
        if (std::count_if(PreviewTools.begin(), PreviewTools.end(), does) != 1)
            return false;
    }
    return true;
}
static_assert(hasEveryTool());

/// The tool that does something.
constexpr const PreviewTool& toolOf(ToolAction action)
{
    return *std::find_if(PreviewTools.begin(), PreviewTools.end(),
        [&](const PreviewTool& tool) { return tool.action == action; });
}

/// What the context menu of a page holds, in its order.
inline constexpr auto ContextMenuTools
    = std::to_array({ ToolAction::ClearPages, ToolAction::OpenFile, ToolAction::SaveFile });

/// The tool that a click on a number means; combos raise changes and are never clicked.
/// @return  null: there is none of that number
const PreviewTool* clickedTool(int id);

/// The window's title, which ends with a blank.
inline constexpr TextView PreviewTitle = u"Print Preview ";

/// Titles, filter and folder of the two file dialogs.
inline constexpr TextView OpenFileTitle = u"Open File";
inline constexpr TextView SaveFileTitle = u"Save File";
inline constexpr TextView FileFilterName = u"Ostrel (*.ostl)";
#ifdef _WIN32
inline constexpr TextView InitialFileFolder = u"C:\\";
#else
inline constexpr TextView InitialFileFolder = u"/";
#endif

/// What a scale is held between where people choose one; 1 is 100 %.
inline constexpr double SmallestScale = 0.01;
inline constexpr double LargestScale = 64;

/// What the scale combo shows before anything was zoomed.
inline constexpr TextView InitialScaleText = u"   100 %";

/// The entries of the scale combo, in order.
inline constexpr auto ScaleEntries = std::to_array<TextView>({
    u"   500 %",
    u"   200 %",
    u"   150 %",
    u"   100 %",
    u"   75 %",
    u"   50 %",
    u"   25 %",
    u"   10 %",
});

/// An entry of the page combo: "   NO. 3".
/// @param number  from 1
Text pageEntry(int number);

/// What the page combo shows while one page is current: "NO. 3".
/// @param number  from 1
Text pageBoxText(int number);

/// What the page combo shows for a window of pages: "【1-6】".
/// @param first  from 1
/// @param last   from 1
Text pageBoxText(int first, int last);

/// The label beside the page combo: " 【共 21 页】".
Text pageCountLabel(int pages);

/// The text of a scale: 100 divided by the divisor, at most 7 significant digits, then "%".
Text scaleText(float divisor);

} // namespace pelloric
