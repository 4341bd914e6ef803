// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/grid_style_dialog.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/qt/color_picker.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/font_chooser.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QTabWidget>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace pelloric::qt {

namespace {

constexpr int ListCharacters = 56; ///< the font list is at least as wide as this many
constexpr int SwitchIndent = 16; ///< of the check boxes below their caption: pixels

/// 0 clear, 1 set, 2 grey: the toolkit counts the last two the other way round.
std::int16_t valueOf(Qt::CheckState state)
{
    switch (state) {
    case Qt::Unchecked:
        break;
    case Qt::Checked:
        return 1;
    case Qt::PartiallyChecked:
        return 2;
    }
    return 0;
}

Qt::CheckState stateOf(std::int16_t value)
{
    return value == 0 ? Qt::Unchecked : value == 2 ? Qt::PartiallyChecked : Qt::Checked;
}

/// A box that may stand grey, but that its user only sets and clears.
class OnOffBox final : public QCheckBox {
public:
    using QCheckBox::QCheckBox;

protected:
    void nextCheckState() override
    {
        setCheckState(checkState() == Qt::Checked ? Qt::Unchecked : Qt::Checked);
    }
};

} // namespace

GridStyleDialog::GridStyleDialog(const Platform& platform, QWidget* parent, ReportSettings* own)
    : QDialog(parent)
    , platform_(platform)
    , state_(platform_, own)
{
    setWindowTitle(toQString(GridStyleTitle));
    setModal(true);
    auto* tabs = new QTabWidget(this);
    tabs->setObjectName(QStringLiteral("tabStrip1"));
    tabs->addTab(makeOptionsTab(), toQString(GridStyleTabs[0]));
    tabs->addTab(makeColorsTab(), toQString(GridStyleTabs[1]));
    tabs->addTab(makeFontsTab(), toQString(GridStyleTabs[2]));
    setTabKeys(*tabs, "OLF");
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(tabs);
    const ClosingButtons buttons = addClosingButtons(
        *this, *layout, { QStringLiteral("OK"), 'K' }, { QStringLiteral("Cancel"), 'N' });
    connect(buttons.ok, &QPushButton::clicked, this, &GridStyleDialog::save);
}

QWidget* GridStyleDialog::makeOptionsTab()
{
    const QString captionName = QStringLiteral("Label1");
    QCheckBox* headers = makeSwitch(
        GridSwitch::ShowHeaders, QStringLiteral("ChkShow"), QStringLiteral("Headers"), 'H');
    headers->setTristate(true);
    QCheckBox* horizontal = makeSwitch(
        GridSwitch::GridHor, elementName("ChkGrid", 0), QStringLiteral("Horizontal  Grid"), 'Z');
    QCheckBox* vertical = makeSwitch(
        GridSwitch::GridVer, elementName("ChkGrid", 1), QStringLiteral("Vertical  Grid"), 'V');
    QCheckBox* merge = makeSwitch(
        GridSwitch::GridMerge, QStringLiteral("ChkMerge"), QStringLiteral("Merge Cell"), 'M');
    auto* page = new QWidget(this);
    auto* layout = new QGridLayout(page);
    layout->setColumnMinimumWidth(0, SwitchIndent);
    layout->setColumnStretch(1, 1);
    layout->addWidget(
        captionFor(QStringLiteral("Show"), 0, nullptr, page, captionName), 0, 0, 1, 2);
    layout->addWidget(headers, 1, 1);
    layout->setRowMinimumHeight(2, SwitchIndent / 2);
    layout->addWidget(
        captionFor(QStringLiteral("Grid"), 0, nullptr, page, captionName), 3, 0, 1, 2);
    layout->addWidget(horizontal, 4, 1);
    layout->addWidget(vertical, 5, 1);
    layout->addWidget(merge, 6, 1);
    layout->setRowStretch(7, 1);
    return page;
}

QCheckBox* GridStyleDialog::makeSwitch(
    GridSwitch which, const QString& name, const QString& text, char key)
{
    auto* box = new OnOffBox(text, this);
    box->setObjectName(name);
    setAltKey(*box, key);
    box->setCheckState(stateOf(state_.value(which)));
    connect(box, &QCheckBox::stateChanged, this,
        [this, which, box] { state_.setValue(which, valueOf(box->checkState())); });
    return box;
}

QWidget* GridStyleDialog::makeColorsTab()
{
    struct ColorRow {
        const char* name;
        const char* caption;
        char key;
        double GridStyleState::*color;
    };
    static constexpr ColorRow Rows[] = {
        { "clrHeader", "Header Color", 'H', &GridStyleState::headerColor },
        { "clrGrid", "Grid Line Color", 'G', &GridStyleState::gridLineColor },
    };
    auto* page = new QWidget(this);
    auto* grid = new QGridLayout(page);
    int line = 0;
    for (const ColorRow& row : Rows) {
        auto* picker = new ColorPicker(QLatin1String(row.name), page);
        picker->setColor(state_.*row.color);
        connect(picker, &ColorPicker::colorChanged, this,
            [this, field = row.color](double color) { state_.*field = color; });
        grid->addWidget(
            captionFor(QLatin1String(row.caption), row.key, picker, page, QStringLiteral("Label2")),
            line, 0);
        grid->addWidget(picker, line++, 1);
    }
    grid->setColumnStretch(2, 1);
    grid->setRowStretch(line, 1);
    return page;
}

QWidget* GridStyleDialog::makeFontsTab()
{
    auto* page = new QWidget(this);
    fonts_ = makeFontList(page);
    auto* change = new QPushButton(QStringLiteral("Change Font..."), page);
    change->setObjectName(QStringLiteral("cmdFont"));
    change->setAutoDefault(false);
    setAltKey(*change, 'C');
    connect(change, &QPushButton::clicked, this, &GridStyleDialog::changeFont);
    auto* layout = new QVBoxLayout(page);
    layout->addWidget(fonts_, 1);
    layout->addWidget(change, 0, Qt::AlignRight);
    showFonts();
    return page;
}

QTreeWidget* GridStyleDialog::makeFontList(QWidget* parent)
{
    auto* list = new QTreeWidget(parent);
    list->setObjectName(QStringLiteral("ListView1"));
    list->setAccessibleName(tr("Fonts"));
    setFocusKey(*list, '1', *list);
    list->setRootIsDecorated(false);
    list->setMinimumWidth(list->fontMetrics().averageCharWidth() * ListCharacters);
    list->setAllColumnsShowFocus(true);
    QStringList columns;
    for (const TextView column : FontColumns)
        columns.append(toQString(column));
    list->setHeaderLabels(columns);
    for (const TextView row : FontRows)
        new QTreeWidgetItem(list, { toQString(row), QString() });
    list->header()->setSectionResizeMode(0, QHeaderView::ResizeToContents);
    connect(list, &QTreeWidget::itemSelectionChanged, this, [this] {
        const QList<QTreeWidgetItem*> chosen = fonts_->selectedItems();
        state_.selectRow(chosen.isEmpty() ? Text() : toText(chosen.front()->text(0)));
    });
    return list;
}

/// Cancelling the font dialog changes nothing.
void GridStyleDialog::changeFont()
{
    const auto pressed = state_.pressChangeFont();
    if (const auto* refusal = std::get_if<Message>(&pressed)) {
        platform_.messages.show(*refusal);
        return;
    }
    try {
        state_.setChosenFont(chooseFont(this, std::get<ColoredFont>(pressed)));
        showFonts();
    } catch (const RunTimeError&) {
        // The user cancelled: the font stays.
    }
}

void GridStyleDialog::showFonts()
{
    for (int row = 0; row < fonts_->topLevelItemCount(); ++row) {
        const QString text = toQString(state_.description(static_cast<GridFont>(row)));
        fonts_->topLevelItem(row)->setText(1, text);
        fonts_->topLevelItem(row)->setToolTip(1, text);
    }
}

void GridStyleDialog::save()
{
    saved_ = state_.save();
    accept();
}

} // namespace pelloric::qt
