// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/print_options_dialog.h"

#include "platform/numbers.h"
#include "platform/printer.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/up_down_box.h"

#include <QComboBox>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QToolTip>
#include <QVBoxLayout>

#include <limits>

namespace pelloric::qt {

namespace {

constexpr int PrinterCharacters = 28; ///< the printer list is at least as wide as this many

} // namespace

PrintOptionsDialog::PrintOptionsDialog(const Platform& platform, Print print, QWidget* parent)
    : QDialog(parent)
    , platform_(platform)
    , print_(std::move(print))
{
    setObjectName(QStringLiteral("frmPrintPar"));
    setWindowTitle(QStringLiteral("Print"));
    setModal(true);
    auto* layout = new QVBoxLayout(this);
    layout->setSizeConstraint(QLayout::SetFixedSize); // as high as its wrapped lines ask for
    layout->addWidget(makePrinterGroup());
    layout->addWidget(makeRangeGroup());
    layout->addWidget(makeCopiesGroup());
    const ClosingButtons buttons = addClosingButtons(
        *this, *layout, { QStringLiteral("Print"), 'P' }, { QStringLiteral("Close"), 'L' });
    connect(buttons.ok, &QPushButton::clicked, this, &PrintOptionsDialog::press);
}

QWidget* PrintOptionsDialog::makePrinterGroup()
{
    auto* group = new QGroupBox(QStringLiteral("Printer"), this);
    group->setObjectName(QStringLiteral("Frame3"));
    printers_ = new QComboBox(group);
    printers_->setObjectName(QStringLiteral("cboPrinter"));
    printers_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    printers_->setMinimumContentsLength(PrinterCharacters);
    for (const Text& name : platform_.printers.printerNames())
        printers_->addItem(toQString(name));
    printers_->setCurrentIndex(
        printers_->findText(toQString(platform_.printers.currentPrinter()), Qt::MatchExactly));
    connect(printers_, &QComboBox::textActivated, this,
        [this](const QString& name) { choosePrinter(platform_.printers, toText(name)); });
    auto* layout = new QHBoxLayout(group);
    layout->addWidget(
        captionFor(QStringLiteral("Name:"), 'N', printers_, group, QStringLiteral("Label3")));
    layout->addWidget(printers_, 1);
    return group;
}

QWidget* PrintOptionsDialog::makeRangeGroup()
{
    auto* group = new QGroupBox(QStringLiteral("Page Range"), this);
    group->setObjectName(QStringLiteral("Frame1"));
    all_ = new QRadioButton(QStringLiteral("All"), group);
    all_->setObjectName(elementName("Option1", 0));
    all_->setChecked(true);
    setAltKey(*all_, 'A');
    auto* some = new QRadioButton(QStringLiteral("Range："), group);
    some->setObjectName(elementName("Option1", 1));
    setAltKey(*some, 'R');
    range_ = new QLineEdit(group);
    range_->setObjectName(QStringLiteral("Text1"));
    range_->setEnabled(false);
    connect(all_, &QRadioButton::toggled, this, &PrintOptionsDialog::chooseRange);
    connect(some, &QRadioButton::clicked, range_, qOverload<>(&QWidget::setFocus));
    auto* hint = captionFor(QStringLiteral("Enter page number and/or page range  separated by "
                                           "commas.For example 1,3,5-12."),
        0, range_, group, QStringLiteral("Label1"));
    hint->setWordWrap(true);
    auto* layout = new QVBoxLayout(group);
    layout->addWidget(all_);
    auto* line = new QHBoxLayout;
    line->addWidget(some);
    line->addWidget(range_, 1);
    layout->addLayout(line);
    layout->addWidget(hint);
    range_->setAccessibleName(tr("Page range"));
    setFocusKey(*range_, '1', *range_);
    return group;
}

QWidget* PrintOptionsDialog::makeCopiesGroup()
{
    auto* group = new QGroupBox(QStringLiteral("Copies"), this);
    group->setObjectName(QStringLiteral("Frame2"));
    copies_ = new UpDownBox(QStringLiteral("UpDown1"), QStringLiteral("Text2"), group);
    copies_->textBox()->setText(toQString(InitialCopies));
    copies_->onStep([this](bool up) {
        QLineEdit& box = *copies_->textBox();
        box.setText(toQString(steppedCopies(toText(box.text()), up)));
    });
    connect(copies_->textBox(), &QLineEdit::textChanged, this, &PrintOptionsDialog::filterCopies);
    auto* layout = new QHBoxLayout(group);
    layout->addWidget(captionFor(
        QStringLiteral("Number of Copies"), 'C', copies_, group, QStringLiteral("Label2")));
    layout->addWidget(copies_);
    layout->addStretch();
    return group;
}

void PrintOptionsDialog::chooseRange(bool allPages)
{
    if (allPages)
        choices_.chooseAll();
    else
        choices_.chooseRange();
    range_->setEnabled(choices_.rangeEnabled);
}

void PrintOptionsDialog::filterCopies()
{
    QLineEdit& box = *copies_->textBox();
    const QString typed = box.text();
    const auto filtered = [](QStringView text) { return toQString(filteredCopies(viewOf(text))); };
    const auto caret = filtered(QStringView(typed).first(box.cursorPosition())).size();
    rewriteText(box, filtered(typed), static_cast<int>(caret));
}

void PrintOptionsDialog::press()
{
    if (isPrinting_)
        return;
    const PrintEntries entries { .allPages = choices_.allPages,
        .range = toText(range_->text()),
        .copies = toText(copies_->textBox()->text()) };
    try {
        const auto pressed = pressPrint(platform_.printers, entries);
        if (const auto* refusal = std::get_if<Message>(&pressed))
            platform_.messages.show(*refusal);
        else
            printAndClose(std::get<PrintArguments>(pressed));
    } catch (const RunTimeError&) {
        pointAtExcess();
    }
}

/// Nothing is printed; the user sees which box asks for too much.
void PrintOptionsDialog::pointAtExcess()
{
    constexpr double MostCopies = std::numeric_limits<std::int16_t>::max();
    const bool isCopies = leadingNumber(toText(copies_->textBox()->text())) > MostCopies;
    QLineEdit& box = isCopies ? *copies_->textBox() : *range_;
    box.setFocus();
    box.selectAll();
    QToolTip::showText(box.mapToGlobal(QPoint(0, box.height())),
        isCopies ? tr("These are more copies than can be printed.")
                 : tr("These are more pages than can be printed."),
        &box);
}

void PrintOptionsDialog::printAndClose(const PrintArguments& arguments)
{
    isPrinting_ = true;
    setEnabled(false);
    try {
        print_(arguments);
    } catch (const RunTimeError&) {
        // The command ends; the print procedure has told what there is to tell.
    }
    setEnabled(true);
    isPrinting_ = false;
    accept();
}

void PrintOptionsDialog::done(int result)
{
    if (!isPrinting_)
        QDialog::done(result);
}

} // namespace pelloric::qt
