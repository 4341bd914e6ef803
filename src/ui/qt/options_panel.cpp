// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/options_panel.h"

#include "document/limits.h"
#include "platform/name_list.h"
#include "platform/qt/qt_text.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/fit_text.h"
#include "ui/qt/named_boxes.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFileDialog>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QScrollArea>
#include <QScrollBar>
#include <QSpinBox>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <cmath>
#include <limits>

namespace pelloric::qt {

namespace {

constexpr int MostRows = std::numeric_limits<int>::max();
constexpr int MostPagesAcross = 100;
constexpr int FirstRange = 100; ///< rows of a range that nobody has set yet
constexpr int Percent = 100;

enum FitChoice { FitOff, FitSheet, FitPages };

QString shownList(const std::vector<Text>& names) { return toQString(listOf(names)); }

QString columnsOf(const std::vector<Aggregation>& totals)
{
    std::vector<Text> names;
    names.reserve(totals.size());
    for (const Aggregation& total : totals)
        names.push_back(total.column);
    return shownList(names);
}

template <typename Part> Part* named(Part* part, const char* name)
{
    part->setObjectName(QLatin1String(name));
    return part;
}

QSpinBox* numberBox(const char* name, int first, int last)
{
    auto* const box = named(new QSpinBox, name);
    box->setRange(first, last);
    box->setKeyboardTracking(false);
    return box;
}

QComboBox* choiceBox(const char* name, const QStringList& entries)
{
    auto* const box = named(new QComboBox, name);
    box->addItems(entries);
    box->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    return box;
}

QLineEdit* textBox(const char* name, const QString& hint)
{
    auto* const box = named(new QLineEdit, name);
    showHint(*box, hint);
    return box;
}

QFormLayout* addGroup(QVBoxLayout& all, const QString& title)
{
    auto* const group = new QGroupBox(title);
    auto* const form = new QFormLayout(group);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->setRowWrapPolicy(QFormLayout::DontWrapRows);
    all.addWidget(group);
    return form;
}

} // namespace

OptionsPanel::OptionsPanel(QWidget* parent)
    : QDockWidget(tr("Report Options"), parent)
{
    setObjectName(QStringLiteral("ReportOptions"));
    setFeatures(DockWidgetClosable | DockWidgetMovable);
    setAllowedAreas(Qt::LeftDockWidgetArea | Qt::RightDockWidgetArea);
    auto* const body = new QWidget;
    auto* const all = new QVBoxLayout(body);
    addLook(*all);
    addWidth(*all);
    addContent(*all);
    addTotals(*all);
    addPictures(*all);
    all->addStretch();
    auto* const area = new QScrollArea;
    area->setWidgetResizable(true);
    area->setFrameShape(QFrame::NoFrame);
    area->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    area->setWidget(body);
    area->setMinimumWidth(
        body->minimumSizeHint().width() + area->verticalScrollBar()->sizeHint().width());
    area->setAccessibleName(windowTitle());
    setWidget(area);
    nameParts();
    setOptions({});
    listen();
}

void OptionsPanel::addLook(QVBoxLayout& all)
{
    QFormLayout* const form = addGroup(all, tr("Look"));
    asShown_ = named(new QCheckBox(tr("Cells &as the view shows them")), "asShown");
    form->addRow(asShown_);
}

void OptionsPanel::addWidth(QVBoxLayout& all)
{
    QFormLayout* const form = addGroup(all, tr("Width"));
    fit_ = choiceBox(
        "fit", { tr("As it is, in bands"), tr("Turn, then shrink"), tr("Shrink to pages across") });
    pagesAcross_ = numberBox("pagesAcross", 1, MostPagesAcross);
    fitResult_ = named(new QLabel, "fitResult");
    fitResult_->setWordWrap(true);
    keyColumns_ = numberBox("keyColumns", 0, MostColumns);
    pageOrder_ = choiceBox("pageOrder", { tr("Across, then down"), tr("Down, then across") });
    form->addRow(tr("&Fit:"), fit_);
    form->addRow(tr("Pages a&cross:"), pagesAcross_);
    form->addRow(fitResult_);
    form->addRow(tr("&Key columns:"), keyColumns_);
    form->addRow(tr("Page or&der:"), pageOrder_);
}

void OptionsPanel::addContent(QVBoxLayout& all)
{
    QFormLayout* const form = addGroup(all, tr("Rows and Columns"));
    rows_ = choiceBox("rows", { tr("All"), tr("Selected in the view"), tr("Range") });
    firstRow_ = numberBox("firstRow", 1, MostRows);
    lastRow_ = numberBox("lastRow", 1, MostRows);
    columns_ = textBox("columns", tr("all, or titles: Name, Price"));
    form->addRow(tr("&Rows:"), rows_);
    form->addRow(tr("From:"), firstRow_);
    form->addRow(tr("&To:"), lastRow_);
    form->addRow(tr("Co&lumns:"), columns_);
}

void OptionsPanel::addTotals(QVBoxLayout& all)
{
    QFormLayout* const form = addGroup(all, tr("Groups and Totals"));
    groups_ = textBox("groups", tr("titles: Country"));
    keepsGroups_ = named(new QCheckBox(tr("K&eep groups on a page")), "keepsGroups");
    totalFunction_ = choiceBox(
        "totalFunction", { tr("Sum"), tr("Count"), tr("Mean"), tr("Minimum"), tr("Maximum") });
    totals_ = textBox("totals", tr("titles: Price"));
    form->addRow(tr("Group b&y:"), groups_);
    form->addRow(keepsGroups_);
    form->addRow(tr("T&otal:"), totalFunction_);
    form->addRow(tr("of col&umns:"), totals_);
}

void OptionsPanel::addPictures(QVBoxLayout& all)
{
    QFormLayout* const form = addGroup(all, tr("Watermark and Logo"));
    watermark_ = textBox("watermark", tr("a text, such as Draft"));
    watermarkFile_ = textBox("watermarkFile", tr("or a picture file"));
    opacity_ = numberBox("opacity", 1, Percent);
    opacity_->setSuffix(QStringLiteral(" %"));
    isAbove_ = named(new QCheckBox(tr("A&bove the table")), "isAbove");
    logo_ = textBox("logo", tr("a picture file"));
    logoSlot_ = choiceBox("logoSlot", { tr("Left"), tr("Centre"), tr("Right") });
    form->addRow(tr("Text:"), watermark_);
    form->addRow(tr("&Picture:"), fileRow(*watermarkFile_, tr("Picture of the watermark")));
    form->addRow(tr("Opac&ity:"), opacity_);
    form->addRow(isAbove_);
    form->addRow(tr("Lo&go:"), fileRow(*logo_, tr("Picture of the logo")));
    form->addRow(tr("&Slot:"), logoSlot_);
}

/// The name of a file, and a button that lets people choose it.
QWidget* OptionsPanel::fileRow(QLineEdit& file, const QString& title)
{
    auto* const row = new QWidget;
    row->setFocusProxy(&file);
    file.setAccessibleName(title);
    auto* const button = named(new QToolButton, "chooseFile");
    button->setIcon(style()->standardIcon(QStyle::SP_DialogOpenButton));
    button->setFocusPolicy(Qt::TabFocus);
    button->setAccessibleName(tr("Choose: %1").arg(title));
    button->setToolTip(tr("Choose a file"));
    auto* const layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(&file, 1);
    layout->addWidget(button);
    connect(button, &QToolButton::clicked, this, [this, &file, title] {
        const QString chosen = QFileDialog::getOpenFileName(
            this, title, file.text(), tr("Pictures (*.png *.jpg *.jpeg *.bmp *.gif *.svg)"));
        if (chosen.isEmpty())
            return;
        file.setText(chosen);
        tellChange();
    });
    return row;
}

/// The parts are called as the labels beside them, for assistive technology.
void OptionsPanel::nameParts()
{
    for (QLabel* const label : findChildren<QLabel*>()) {
        QString name = label->text().remove(QLatin1Char('&'));
        if (name.endsWith(QLatin1Char(':')) || name.endsWith(QChar(u'：')))
            name.chop(1);
        if (auto* const combo = qobject_cast<QComboBox*>(label->buddy()))
            nameBox(*combo, name);
        else if (auto* const spin = qobject_cast<QAbstractSpinBox*>(label->buddy()))
            nameBox(*spin, name);
        else if (label->buddy() && label->buddy()->accessibleName().isEmpty())
            label->buddy()->setAccessibleName(name);
    }
}

void OptionsPanel::listen()
{
    for (QCheckBox* const box : findChildren<QCheckBox*>())
        connect(box, &QCheckBox::toggled, this, &OptionsPanel::tellChange);
    for (QComboBox* const box : findChildren<QComboBox*>())
        connect(box, &QComboBox::currentIndexChanged, this, &OptionsPanel::tellChange);
    for (QSpinBox* const box : findChildren<QSpinBox*>())
        connect(box, &QSpinBox::valueChanged, this, &OptionsPanel::tellChange);
    for (QLineEdit* const box : { columns_, groups_, totals_, watermark_, watermarkFile_, logo_ })
        connect(box, &QLineEdit::editingFinished, this, [this, box] {
            if (!box->isModified())
                return;
            box->setModified(false);
            tellChange();
        });
}

void OptionsPanel::setOptions(const ReportOptions& options)
{
    isFilling_ = true;
    kept_ = options;
    const bool fitsPages = options.fit.pagesAcross > 0;
    asShown_->setChecked(options.asShown);
    fit_->setCurrentIndex(fitsPages ? FitPages : options.fit.toSheet ? FitSheet : FitOff);
    pagesAcross_->setValue(std::max(1, options.fit.pagesAcross));
    keyColumns_->setValue(options.keyColumns);
    pageOrder_->setCurrentIndex(static_cast<int>(options.pageOrder));
    rows_->setCurrentIndex(static_cast<int>(options.rows));
    firstRow_->setValue(static_cast<int>(std::min<std::int64_t>(options.firstRow, MostRows)));
    lastRow_->setValue(options.lastRow > 0
            ? static_cast<int>(std::min<std::int64_t>(options.lastRow, MostRows))
            : FirstRange);
    columns_->setText(shownList(options.columns));
    groups_->setText(shownList(options.groupColumns));
    keepsGroups_->setChecked(options.keepsGroups);
    totalFunction_->setCurrentIndex(
        options.totals.empty() ? 0 : static_cast<int>(options.totals.front().function));
    totals_->setText(columnsOf(options.totals));
    watermark_->setText(toQString(options.watermark.text));
    watermarkFile_->setText(toQString(options.watermark.imageFile));
    opacity_->setValue(static_cast<int>(std::lround(options.watermark.opacity * Percent)));
    isAbove_->setChecked(options.watermark.isAbove);
    logo_->setText(toQString(options.logo.imageFile));
    logoSlot_->setCurrentIndex(std::clamp(options.logo.slot, 0, logoSlot_->count() - 1));
    isFilling_ = false;
    showUse();
}

ReportOptions OptionsPanel::options() const
{
    ReportOptions options = kept_;
    options.asShown = asShown_->isChecked();
    options.fit.toSheet = fit_->currentIndex() == FitSheet;
    options.fit.pagesAcross = fit_->currentIndex() == FitPages ? pagesAcross_->value() : 0;
    options.keyColumns = keyColumns_->value();
    if (options.keyColumns != kept_.keyColumns)
        options.keyColumnNames.clear();
    options.pageOrder = static_cast<PageOrder>(pageOrder_->currentIndex());
    readContent(options);
    readPictures(options);
    return options;
}

/// Totals of several functions stay as the host has set them until people change them.
void OptionsPanel::readContent(ReportOptions& options) const
{
    options.rows = static_cast<RowChoice>(rows_->currentIndex());
    if (options.rows == RowChoice::Range) {
        options.firstRow = firstRow_->value();
        options.lastRow = lastRow_->value();
    }
    options.columns = namesOf(toText(columns_->text()));
    options.groupColumns = namesOf(toText(groups_->text()));
    options.keepsGroups = keepsGroups_->isChecked();
    const auto function = static_cast<AggregateFunction>(totalFunction_->currentIndex());
    const bool isKept = totals_->text() == columnsOf(kept_.totals)
        && (kept_.totals.empty() || kept_.totals.front().function == function);
    if (isKept)
        return;
    options.totals.clear();
    for (Text& name : namesOf(toText(totals_->text())))
        options.totals.push_back({ std::move(name), function });
}

void OptionsPanel::readPictures(ReportOptions& options) const
{
    options.watermark.text = toText(watermark_->text());
    options.watermark.imageFile = toText(watermarkFile_->text());
    options.watermark.opacity = static_cast<double>(opacity_->value()) / Percent;
    options.watermark.isAbove = isAbove_->isChecked();
    options.logo.imageFile = toText(logo_->text());
    options.logo.slot = logoSlot_->currentIndex();
}

void OptionsPanel::showFit(const FitResult& fit)
{
    fitResult_->setText(fitText(fit));
    fitResult_->setVisible(fit.rule != FitRule::NotAsked);
}

void OptionsPanel::enter() { asShown_->setFocus(Qt::TabFocusReason); }

void OptionsPanel::tellChange()
{
    if (isFilling_)
        return;
    showUse();
    emit changed();
}

/// Parts that mean nothing at the moment are grey.
void OptionsPanel::showUse()
{
    const bool isRange = rows_->currentIndex() == static_cast<int>(RowChoice::Range);
    const bool isMarked = !watermark_->text().isEmpty() || !watermarkFile_->text().isEmpty();
    pagesAcross_->setEnabled(fit_->currentIndex() == FitPages);
    firstRow_->setEnabled(isRange);
    lastRow_->setEnabled(isRange);
    keepsGroups_->setEnabled(!groups_->text().isEmpty());
    opacity_->setEnabled(isMarked);
    isAbove_->setEnabled(isMarked);
    logoSlot_->setEnabled(!logo_->text().isEmpty());
}

} // namespace pelloric::qt
