// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_toolbar.h"

#include "platform/numbers.h"
#include "platform/qt/qt_text.h"
#include "ui/preview_navigation.h"
#include "ui/qt/choice_box.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/named_boxes.h"
#include "ui/qt/tool_meanings.h"
#include "ui/tool_table.h"

#include <QAction>
#include <QEvent>
#include <QLabel>
#include <QLineEdit>
#include <QShortcut>
#include <QToolButton>

#include <array>

namespace pelloric::qt {

namespace {

/// From left to right; the tools of a group stand in the order of the table.
constexpr auto GroupOrder = std::to_array<ToolGroup>({
    ToolGroup::File,
    ToolGroup::Print,
    ToolGroup::Report,
    ToolGroup::Zoom,
    ToolGroup::Pages,
    ToolGroup::Arrangement,
    ToolGroup::Window,
});

constexpr int ArrowSize = 10; ///< of the picture on the arrow at the end: pixels

constexpr int BoxGap = 4; ///< in front of a combo: pixels

constexpr int ScaleLetters = 9; ///< room for "   500 %" and what is typed
constexpr int PageLetters = 11; ///< room for "   NO. 32767" but for a letter

/// A caption without the blanks around it and the doubled ones in it.
QString plainCaption(const PreviewTool& tool) { return toQString(tool.caption).simplified(); }

/// What the tool does and its keys: "Larger text and columns (Ctrl+Up)".
QString tipOf(const PreviewTool& tool)
{
    return QStringLiteral("%1 (%2)").arg(
        meaningOf(tool.action), keysOf(tool).toString(QKeySequence::NativeText));
}

void describe(QObject& object, const PreviewTool& tool)
{
    object.setObjectName(toQString(tool.name));
    object.setProperty("toolId", tool.id);
    object.setProperty("category", toQString(ToolCategory));
    if (tool.kind == ToolKind::Combo)
        object.setProperty("band", toQString(ToolBandName));
}

QStringList scaleEntries()
{
    QStringList entries;
    for (const TextView entry : ScaleEntries)
        entries.append(toQString(entry));
    return entries;
}

/// The entry that stands for the same scale as a text; -1: none does.
int scaleEntryOf(TextView text)
{
    const double scale = leadingNumber(text);
    for (std::size_t entry = 0; entry < ScaleEntries.size(); ++entry) {
        if (leadingNumber(ScaleEntries[entry]) == scale)
            return static_cast<int>(entry);
    }
    return -1;
}

} // namespace

PreviewToolbar::PreviewToolbar(QWidget* parent)
    : QToolBar(parent)
{
    setObjectName(toQString(ToolbarName));
    setWindowTitle(tr("Tools"));
    setAccessibleName(tr("Tools"));
    setMovable(false);
    setFloatable(false);
    setContextMenuPolicy(Qt::NoContextMenu);
    setToolButtonStyle(Qt::ToolButtonTextUnderIcon);
    for (const ToolGroup group : GroupOrder) {
        if (group != GroupOrder.front())
            addSeparator();
        for (const PreviewTool& tool : PreviewTools) {
            if (tool.group == group)
                addTool(tool);
        }
    }
    scaleBox_->setEntries(scaleEntries());
    scaleBox_->showText(toQString(InitialScaleText), scaleEntryOf(InitialScaleText));
    pageBox_->setEntries({ toQString(pageEntry(1)) });
    pageBox_->showText(toQString(pageBoxText(1)), 0);
    drawIcons();
    measure();
}

/// What the tools need with their captions changes with the font and the style, and the label of
/// the page count grows.
void PreviewToolbar::measure()
{
    isMeasuring_ = true;
    setToolButtonStyle(Qt::ToolButtonTextUnderIcon);
    widthWithTexts_ = sizeHint().width();
    isMeasuring_ = false;
    chooseButtonStyle();
}

void PreviewToolbar::addTool(const PreviewTool& tool)
{
    switch (tool.kind) {
    case ToolKind::Button:
        addButton(tool);
        break;
    case ToolKind::Combo:
        addCombo(tool);
        break;
    case ToolKind::MenuItem:
        // Its keys work wherever the toolbar's do.
        window()->addAction(makeAction(tool));
        break;
    }
}

QAction* PreviewToolbar::makeAction(const PreviewTool& tool)
{
    auto* const action = new QAction(toQString(tool.caption), this);
    describe(*action, tool);
    action->setIconText(toQString(tool.caption));
    action->setToolTip(tipOf(tool));
    action->setEnabled(tool.enabled);
    action->setShortcuts(allKeysOf(tool));
    action->setAutoRepeat(tool.group == ToolGroup::Pages || tool.group == ToolGroup::Zoom);
    connect(action, &QAction::triggered, this, [this, id = tool.id] { emit clicked(id); });
    actions_[tool.id] = action;
    return action;
}

void PreviewToolbar::addButton(const PreviewTool& tool)
{
    QAction* const action = makeAction(tool);
    addAction(action);
    QWidget* const button = widgetForAction(action);
    describe(*button, tool);
    button->setAccessibleName(plainCaption(tool));
    button->setFocusPolicy(Qt::TabFocus);
}

void PreviewToolbar::addCombo(const PreviewTool& tool)
{
    auto* const box = new ChoiceBox(this);
    const bool isScale = tool.action == ToolAction::ChooseScale;
    describe(*box, tool);
    nameBox(*box, plainCaption(tool));
    box->setToolTip(tipOf(tool));
    box->setProperty("caption", toQString(tool.caption));
    box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    box->setMinimumContentsLength(isScale ? ScaleLetters : PageLetters);
    auto* const gap = new QWidget(this);
    gap->setFixedWidth(BoxGap);
    addWidget(gap);
    addWidget(box);
    connect(box, &ChoiceBox::chosen, this,
        isScale ? &PreviewToolbar::scaleChosen : &PreviewToolbar::pageChosen);
    auto* const keys = new QShortcut(keysOf(tool), window());
    connect(keys, &QShortcut::activated, box, [this, box] { focusBox(*box); });
    if (isScale) {
        scaleBox_ = box;
        return;
    }
    pageBox_ = box;
    pageCount_ = new QLabel(toQString(pageCountLabel(1)), this);
    pageCount_->setObjectName(QStringLiteral("PageCount"));
    pageCount_->setProperty("band", toQString(ToolBandName));
    addWidget(pageCount_);
}

QToolButton* PreviewToolbar::arrow() const
{
    return findChild<QToolButton*>(QStringLiteral("qt_toolbar_ext_button"));
}

bool PreviewToolbar::closeFurtherRow()
{
    QToolButton* const button = arrow();
    if (!button || !button->isChecked())
        return false;
    button->click();
    return true;
}

/// A box that does not fit is behind the arrow, which is opened first.
void PreviewToolbar::focusBox(ChoiceBox& box)
{
    QToolButton* const button = arrow();
    if (!box.isVisible() && button && !button->isChecked())
        button->click();
    box.setFocus(Qt::ShortcutFocusReason);
    box.lineEdit()->selectAll();
}

void PreviewToolbar::showNavigation(const NavigationState& state, int currentPage)
{
    const std::pair<ToolAction, bool> enabled[] = { { ToolAction::FirstPage, state.first },
        { ToolAction::PreviousPage, state.previous }, { ToolAction::NextPage, state.next },
        { ToolAction::LastPage, state.last }, { ToolAction::Refresh, state.rebuild },
        { ToolAction::Enlarge, state.rebuild }, { ToolAction::Shrink, state.rebuild } };
    for (const auto& [action, isEnabled] : enabled)
        actions_.at(toolOf(action).id)->setEnabled(isEnabled);
    if (pageBox_->count() != state.pageEntries) {
        QStringList entries;
        for (int number = 1; number <= state.pageEntries; ++number)
            entries.append(toQString(pageEntry(number)));
        pageBox_->setEntries(entries);
    }
    const bool isOnEntry = currentPage >= 0 && currentPage < pageBox_->count();
    pageBox_->showText(toQString(state.pageBox), isOnEntry ? currentPage : -1);
    scaleBox_->showText(toQString(state.scale), scaleEntryOf(state.scale));
    const int before = pageCount_->sizeHint().width();
    pageCount_->setText(toQString(state.countLabel));
    widthWithTexts_ += pageCount_->sizeHint().width() - before;
    chooseButtonStyle();
}

std::vector<QAction*> PreviewToolbar::contextActions() const
{
    std::vector<QAction*> actions;
    actions.reserve(ContextMenuTools.size());
    for (const ToolAction action : ContextMenuTools)
        actions.push_back(actions_.at(toolOf(action).id));
    return actions;
}

void PreviewToolbar::changeEvent(QEvent* event)
{
    QToolBar::changeEvent(event);
    const QEvent::Type type = event->type();
    if (type == QEvent::PaletteChange || type == QEvent::StyleChange)
        drawIcons();
    if ((type == QEvent::FontChange || type == QEvent::StyleChange) && pageCount_)
        measure();
}

void PreviewToolbar::drawIcons()
{
    for (const PreviewTool& tool : PreviewTools) {
        if (tool.kind != ToolKind::Combo)
            actions_.at(tool.id)->setIcon(libraryIcon(toQString(tool.icon), palette()));
    }
    // The style's own arrow is black on every ground.
    if (QToolButton* const button = arrow()) {
        button->setIcon(libraryIcon(QStringLiteral("more-tools"), palette()));
        button->setIconSize({ ArrowSize, ArrowSize });
    }
}

void PreviewToolbar::resizeEvent(QResizeEvent* event)
{
    QToolBar::resizeEvent(event);
    chooseButtonStyle();
}

/// Captions stand under the icons where there is room for all of them.
void PreviewToolbar::chooseButtonStyle()
{
    if (isMeasuring_)
        return;
    const auto style
        = width() >= widthWithTexts_ ? Qt::ToolButtonTextUnderIcon : Qt::ToolButtonIconOnly;
    if (style != toolButtonStyle())
        setToolButtonStyle(style);
}

} // namespace pelloric::qt
