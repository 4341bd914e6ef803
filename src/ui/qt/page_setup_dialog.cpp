// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_setup_dialog.h"

#include "platform/qt/qt_text.h"
#include "print/paper_names.h"
#include "ui/numeric_text.h"
#include "ui/page_setup_hints.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/hint_label.h"
#include "ui/qt/page_sketch.h"
#include "ui/qt/page_texts_tab.h"
#include "ui/qt/sheet_picture.h"
#include "ui/qt/up_down_box.h"

#include <QGridLayout>
#include <QGroupBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QTabWidget>
#include <QTimer>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace pelloric::qt {

namespace {

struct MarginRow {
    Margin margin;
    const char* caption;
    const char* spin;
    const char* text;
    char key;
};

/// In the order in which the boxes stand.
constexpr MarginRow MarginRows[] = {
    { Margin::Top, "Top:", "cmdTop", "txtTop", 'T' },
    { Margin::Bottom, "Buttom:", "cmdButtom", "txtButtom", 'B' },
    { Margin::Left, "Left:", "cmdLeft", "txtLeft", 'L' },
    { Margin::Right, "Right:", "cmdRight", "txtRight", 'R' },
};

/// A print system that answers at once fills the list before the dialog opens.
constexpr std::chrono::milliseconds BeforeOpening { 150 };
constexpr int BetweenLooksMs = 50; ///< for an answer that is still to come

/// The papers of an answer, or while there is none the standard ones.
std::vector<PaperForm> formsOf(const PrinterFacts* facts)
{
    return facts ? facts->forms : standardPaperForms();
}

QFrame* bareFrame(const QString& name, QWidget* parent)
{
    auto* frame = new QFrame(parent);
    frame->setObjectName(name);
    return frame;
}

} // namespace

PageSetupDialog::PageSetupDialog(const Platform& platform, QWidget* parent, ReportSettings* own)
    : QDialog(parent)
    , platform_(platform)
    , inquiry_(platform_.printers.inquire({}))
    , state_(platform_, formsOf(inquiry_->facts(BeforeOpening)), own)
    , answerTimer_(new QTimer(this))
{
    setWindowTitle(toQString(PageSetupTitle));
    setModal(true);
    auto* tabs = new QTabWidget(this);
    tabs->setObjectName(QStringLiteral("tabStrip1"));
    tabs->addTab(makePageTab(), toQString(PageSetupTabs[0]));
    tabs->addTab(makeMarginsTab(), toQString(PageSetupTabs[1]));
    tabs->addTab(new PageTextsTab(state_, this), toQString(PageSetupTabs[2]));
    setTabKeys(*tabs, "GMD");
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(tabs);
    fileHint_ = new HintLabel(QStringLiteral("labFileHint"), this);
    layout->addWidget(fileHint_);
    const ClosingButtons buttons = addClosingButtons(
        *this, *layout, { QStringLiteral("OK"), 'K' }, { QStringLiteral("Cancel"), 'C' });
    connect(buttons.ok, &QPushButton::clicked, this, &PageSetupDialog::save);
    showPaper();
    showMargins();
    answerTimer_->setInterval(BetweenLooksMs);
    connect(answerTimer_, &QTimer::timeout, this, &PageSetupDialog::takePapers);
    takePapers();
}

QWidget* PageSetupDialog::makePageTab()
{
    auto* page = new QWidget(this);
    auto* group = new QGroupBox(QStringLiteral("Page"), page);
    group->setObjectName(QStringLiteral("Frame1"));
    auto* inside = new QVBoxLayout(group);
    inside->addWidget(makePaperList(group), 1);
    papersHint_ = new HintLabel(QStringLiteral("labPapersHint"), group);
    inside->addWidget(papersHint_);
    auto* below = new QHBoxLayout;
    below->addLayout(makeSizeBoxes(group), 1);
    below->addLayout(makeOrientation(group));
    inside->addLayout(below);
    auto* layout = new QVBoxLayout(page);
    layout->addWidget(group);
    return page;
}

QWidget* PageSetupDialog::makePaperList(QWidget* parent)
{
    papers_ = new QTreeWidget(parent);
    papers_->setObjectName(QStringLiteral("ListView1"));
    papers_->setAccessibleName(tr("Papers"));
    setFocusKey(*papers_, '1', *papers_);
    papers_->setRootIsDecorated(false);
    papers_->setUniformRowHeights(true);
    papers_->setAllColumnsShowFocus(true);
    QStringList columns;
    for (const TextView column : PaperColumns)
        columns.append(toQString(column));
    papers_->setHeaderLabels(columns);
    QHeaderView& header = *papers_->header();
    header.setStretchLastSection(false);
    header.setSectionResizeMode(QHeaderView::ResizeToContents);
    header.setSectionResizeMode(0, QHeaderView::Stretch);
    fillPapers();
    connect(papers_, &QTreeWidget::itemSelectionChanged, this, &PageSetupDialog::clickPaper);
    connect(papers_, &QTreeWidget::itemClicked, this, &PageSetupDialog::clickPaper);
    return papers_;
}

QLayout* PageSetupDialog::makeSizeBoxes(QWidget* parent)
{
    paperName_ = captionFor({}, 0, nullptr, parent, QStringLiteral("labPagerSize"));
    width_ = new QLineEdit(parent);
    width_->setObjectName(QStringLiteral("txtWidth"));
    connect(width_, &QLineEdit::textEdited, this, [this](const QString& text) {
        state_.paper.widthBox = toText(text);
        showHints();
    });
    height_ = new QLineEdit(parent);
    height_->setObjectName(QStringLiteral("txtHeight"));
    connect(height_, &QLineEdit::textEdited, this, [this](const QString& text) {
        state_.paper.heightBox = toText(text);
        showHints();
    });
    auto* grid = new QGridLayout;
    grid->addWidget(paperName_, 0, 0, 1, 2);
    grid->addWidget(captionFor(QStringLiteral("Width:"), 'W', width_, parent), 1, 0);
    grid->addWidget(width_, 1, 1);
    grid->addWidget(captionFor(QStringLiteral("Height:"), 'H', height_, parent), 2, 0);
    grid->addWidget(height_, 2, 1);
    sizeHint_ = new HintLabel(QStringLiteral("labSizeHint"), parent);
    grid->addWidget(sizeHint_, 0, 2, 3, 1);
    grid->setColumnStretch(2, 1);
    grid->setRowStretch(3, 1);
    return grid;
}

QLayout* PageSetupDialog::makeOrientation(QWidget* parent)
{
    auto* portrait = new QRadioButton(QStringLiteral("Portrait"), parent);
    portrait->setObjectName(elementName("Option1", 1));
    setAltKey(*portrait, 'P');
    auto* landscape = new QRadioButton(QStringLiteral("Landscape"), parent);
    landscape->setObjectName(elementName("Option1", 2));
    setAltKey(*landscape, 'L');
    (state_.paper.isPortrait() ? portrait : landscape)->setChecked(true);
    connect(portrait, &QRadioButton::toggled, this, &PageSetupDialog::chooseOrientation);
    upright_ = new SheetPicture(QStringLiteral("ImgV"), true, parent);
    lying_ = new SheetPicture(QStringLiteral("ImgH"), false, parent);
    auto* options = new QVBoxLayout;
    options->addStretch();
    options->addWidget(portrait);
    options->addWidget(landscape);
    options->addStretch();
    auto* layout = new QHBoxLayout;
    layout->addLayout(options);
    layout->addWidget(upright_);
    layout->addWidget(lying_);
    return layout;
}

QWidget* PageSetupDialog::makeMarginsTab()
{
    auto* page = new QWidget(this);
    QFrame* frame = bareFrame(QStringLiteral("Frame2"), page);
    auto* grid = new QGridLayout(frame);
    grid->setContentsMargins(0, 0, 0, 0);
    int line = 0;
    for (const MarginRow& row : MarginRows) {
        UpDownBox* box = makeMarginBox(row.margin, frame);
        box->setObjectName(QLatin1String(row.spin));
        box->textBox()->setObjectName(QLatin1String(row.text));
        grid->addWidget(captionFor(QLatin1String(row.caption), row.key, box, frame), line, 0);
        grid->addWidget(box, line++, 1);
    }
    auto* restore = new QPushButton(QStringLiteral("Restore Original"), frame);
    restore->setObjectName(QStringLiteral("cmdRestore"));
    restore->setAutoDefault(false);
    setAltKey(*restore, 'O');
    connect(restore, &QPushButton::clicked, this, [this] {
        state_.restoreMargins();
        showMargins();
    });
    grid->addWidget(restore, line, 0, 1, 2);
    grid->setRowMinimumHeight(line, restore->sizeHint().height() * 2);
    marginHint_ = new HintLabel(QStringLiteral("labMarginHint"), frame);
    grid->addWidget(marginHint_, line + 1, 0, 1, 2);
    grid->setRowStretch(line + 2, 1);
    auto* back = new QGroupBox(QStringLiteral("Preview"), page);
    back->setObjectName(QStringLiteral("fraBack"));
    sketch_ = new PageSketch(state_, back);
    connect(sketch_, &PageSketch::lineReleased, this, &PageSetupDialog::showMargins);
    auto* inside = new QVBoxLayout(back);
    inside->addWidget(sketch_);
    auto* layout = new QHBoxLayout(page);
    layout->addWidget(frame);
    layout->addWidget(back, 1);
    return page;
}

UpDownBox* PageSetupDialog::makeMarginBox(Margin margin, QWidget* parent)
{
    auto* box = new UpDownBox({}, {}, parent);
    margins_[static_cast<std::size_t>(margin)] = box;
    box->onStep([this, margin](bool up) {
        state_.stepMargin(margin, up);
        showMargins();
    });
    connect(box->textBox(), &QLineEdit::textChanged, this, [this, margin] { typeMargin(margin); });
    return box;
}

/// The paper in force stands out, but is no choice of the user's yet: the label still waits.
void PageSetupDialog::fillPapers()
{
    const QSignalBlocker silent(papers_);
    papers_->clear();
    const QIcon sheet = paperIcon(false);
    const QIcon envelope = paperIcon(true);
    for (const PaperRow& row : state_.paperRows()) {
        auto* item = new QTreeWidgetItem(papers_,
            { toQString(row.name), toQString(row.cx), toQString(row.cy), toQString(row.value) });
        item->setIcon(0, row.isEnvelope ? envelope : sheet);
        for (int column = 1; column < papers_->columnCount(); ++column)
            item->setTextAlignment(column, Qt::AlignRight | Qt::AlignVCenter);
    }
    if (QTreeWidgetItem* present = papers_->topLevelItem(state_.paper.paperCode - 1)) {
        papers_->setCurrentItem(present);
        papers_->scrollToItem(present, QAbstractItemView::PositionAtCenter);
    }
}

/// Puts the printer's papers into the list as soon as the print system has told them.
void PageSetupDialog::takePapers()
{
    const PrinterFacts* const facts = inquiry_->facts(std::chrono::milliseconds(0));
    if (!facts)
        return answerTimer_->start();
    if (answerTimer_->isActive()) {
        state_.setForms(facts->forms);
        fillPapers();
    }
    answerTimer_->stop();
    if (!facts->trouble.empty())
        papersHint_->say(tr("These are the standard papers: %1.").arg(toQString(facts->trouble)));
}

void PageSetupDialog::clickPaper()
{
    const QList<QTreeWidgetItem*> chosen = papers_->selectedItems();
    if (chosen.isEmpty())
        return;
    const int row = papers_->indexOfTopLevelItem(chosen.front());
    state_.paper.chooseRow(state_.paperRows()[static_cast<std::size_t>(row)]);
    showPaper();
}

void PageSetupDialog::chooseOrientation(bool portrait)
{
    state_.chooseOrientation(portrait);
    showPaper();
    sketch_->refresh();
}

void PageSetupDialog::showPaper()
{
    paperName_->setText(toQString(state_.paper.caption));
    width_->setText(toQString(state_.paper.widthBox));
    height_->setText(toQString(state_.paper.heightBox));
    upright_->setVisible(state_.paper.isPortrait());
    lying_->setVisible(!state_.paper.isPortrait());
    showHints();
}

void PageSetupDialog::typeMargin(Margin margin)
{
    QLineEdit& box = *margins_[static_cast<std::size_t>(margin)]->textBox();
    const QString typed = box.text();
    const Text before = numericCharacters(viewOf(QStringView(typed).first(box.cursorPosition())));
    state_.typeMargin(margin, toText(typed));
    rewriteText(box, toQString(state_.marginBox(margin)), static_cast<int>(before.size()));
    sketch_->refresh();
    showHints();
}

void PageSetupDialog::showMargins()
{
    for (const Margin margin : AllMargins) {
        const QString text = toQString(state_.marginBox(margin));
        rewriteText(*margins_[static_cast<std::size_t>(margin)]->textBox(), text,
            static_cast<int>(text.indexOf(QLatin1Char(' '))));
    }
    sketch_->refresh();
    showHints();
}

/// Beside the values: why they cannot be, and what OK will do with them.
void PageSetupDialog::showHints()
{
    const PageSetupHints hints = hintsOf(state_);
    sizeHint_->say(toQString(hints.sizes));
    fileHint_->say(toQString(hints.file));
    QStringList margins;
    for (const MarginRow& row : MarginRows) {
        const QString hint = toQString(hints.of(row.margin));
        margins_[static_cast<std::size_t>(row.margin)]->setAccessibleDescription(hint);
        if (!hint.isEmpty())
            margins.append(hint);
    }
    marginHint_->say(margins.join(QLatin1Char('\n')));
}

void PageSetupDialog::save()
{
    saved_ = state_.save();
    accept();
}

} // namespace pelloric::qt
