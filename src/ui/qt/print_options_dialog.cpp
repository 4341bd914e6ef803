// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/print_options_dialog.h"

#include "platform/numbers.h"
#include "platform/qt/qt_services.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "print/paper_fit.h"
#include "ui/qt/hint_label.h"
#include "ui/qt/up_down_box.h"

#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QProgressBar>
#include <QPushButton>
#include <QRadioButton>
#include <QTimer>
#include <QToolTip>
#include <QVBoxLayout>

#include <limits>

namespace pelloric::qt {

namespace {

constexpr int PrinterCharacters = 28; ///< the printer list is at least as wide as this many

/// A print system that answers at once fills the dialog before it opens.
constexpr std::chrono::milliseconds BeforeOpening { 150 };
constexpr int BetweenLooksMs = 50; ///< for an answer that is still to come

QString wordsOf(PrintDoubt doubt, int pages)
{
    switch (doubt) {
    case PrintDoubt::None:
        break;
    case PrintDoubt::EmptyRange:
        return PrintOptionsDialog::tr("No page is named yet, so nothing would be printed.");
    case PrintDoubt::NoPageOfRange:
        return pages > 0
            ? PrintOptionsDialog::tr("None of these pages exists: the last one is %1.").arg(pages)
            : PrintOptionsDialog::tr("This names no page, so nothing would be printed.");
    case PrintDoubt::LongRange:
        return PrintOptionsDialog::tr("These are more pages than can be printed.");
    case PrintDoubt::NoCopy:
        return PrintOptionsDialog::tr("Without a copy nothing would be printed.");
    case PrintDoubt::ManyCopies:
        return PrintOptionsDialog::tr("These are more copies than can be printed.");
    }
    return {};
}

} // namespace

PrintOptionsDialog::PrintOptionsDialog(
    const Platform& platform, Print print, const PrintPages& pages, QWidget* parent)
    : QDialog(parent)
    , platform_(platform)
    , print_(std::move(print))
    , pages_(pages)
    , answerTimer_(new QTimer(this))
{
    setObjectName(QStringLiteral("frmPrintPar"));
    setWindowTitle(QStringLiteral("Print"));
    setModal(true);
    auto* layout = new QVBoxLayout(this);
    layout->setSizeConstraint(QLayout::SetFixedSize); // as high as its wrapped lines ask for
    groups_ = { makePrinterGroup(), makeRangeGroup(), makeCopiesGroup() };
    for (QWidget* const group : groups_)
        layout->addWidget(group);
    endHint_ = new HintLabel(QStringLiteral("labEnd"), this);
    layout->addWidget(endHint_);
    layout->addWidget(makeProgress());
    buttons_ = addClosingButtons(
        *this, *layout, { QStringLiteral("Print"), 'P' }, { QStringLiteral("Close"), 'L' });
    connect(buttons_.ok, &QPushButton::clicked, this, &PrintOptionsDialog::press);
    answerTimer_->setInterval(BetweenLooksMs);
    connect(
        answerTimer_, &QTimer::timeout, this, [this] { takeAnswer(std::chrono::milliseconds(0)); });
    askPrinters(BeforeOpening);
}

PrintOptionsDialog::~PrintOptionsDialog() = default;

QWidget* PrintOptionsDialog::makePrinterGroup()
{
    auto* group = new QGroupBox(QStringLiteral("Printer"), this);
    group->setObjectName(QStringLiteral("Frame3"));
    printers_ = new QComboBox(group);
    printers_->setObjectName(QStringLiteral("cboPrinter"));
    printers_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    printers_->setMinimumContentsLength(PrinterCharacters);
    connect(printers_, &QComboBox::textActivated, this, [this](const QString& name) {
        choosePrinter(platform_.printers, toText(name));
        askPrinters(std::chrono::milliseconds(0)); // another printer has other papers
    });
    printerHint_ = new HintLabel(QStringLiteral("labPrinterHint"), group);
    auto* layout = new QGridLayout(group);
    layout->addWidget(
        captionFor(QStringLiteral("Name:"), 'N', printers_, group, QStringLiteral("Label3")), 0, 0);
    layout->addWidget(printers_, 0, 1);
    layout->addWidget(printerHint_, 1, 0, 1, 2);
    fileButton_ = new QPushButton(tr("Save as PDF instead..."), group);
    fileButton_->setObjectName(QStringLiteral("cmdSavePages"));
    fileButton_->setAutoDefault(false);
    fileButton_->hide();
    setAltKey(*fileButton_, 'S');
    connect(fileButton_, &QPushButton::clicked, this, [this] {
        wantsFile_ = true;
        reject();
    });
    layout->addWidget(fileButton_, 2, 0, 1, 2, Qt::AlignLeft);
    layout->setColumnStretch(1, 1);
    return group;
}

/// Asks the print system for its printers, and for the sheet of the current one.
void PrintOptionsDialog::askPrinters(std::chrono::milliseconds patience)
{
    inquiry_ = platform_.printers.inquire(pages_.paper);
    takeAnswer(patience);
}

void PrintOptionsDialog::takeAnswer(std::chrono::milliseconds patience)
{
    const PrinterFacts* const facts = inquiry_ ? inquiry_->facts(patience) : nullptr;
    if (!facts)
        return answerTimer_->start();
    answerTimer_->stop();
    showPrinters(*facts);
    inquiry_.reset();
}

void PrintOptionsDialog::showPrinters(const PrinterFacts& facts)
{
    printers_->clear();
    for (const Text& name : facts.names)
        printers_->addItem(toQString(name));
    printers_->setCurrentIndex(printers_->findText(toQString(facts.current), Qt::MatchExactly));
    fileButton_->setVisible(facts.names.empty());
    if (facts.names.empty() && facts.trouble.empty())
        printerHint_->say(tr("There is no printer."));
    else if (!facts.trouble.empty())
        printerHint_->say(tr("No printers can be listed: %1.").arg(toQString(facts.trouble)));
    else
        printerHint_->say(toQString(paperWarning(pages_.paper, facts.sheet)));
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
    connect(range_, &QLineEdit::textChanged, this, &PrintOptionsDialog::showDoubts);
    rangeHint_ = new HintLabel(QStringLiteral("labRangeHint"), group);
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
    layout->addWidget(rangeHint_);
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
    copiesHint_ = new HintLabel(QStringLiteral("labCopiesHint"), group);
    auto* layout = new QGridLayout(group);
    layout->addWidget(captionFor(QStringLiteral("Number of Copies"), 'C', copies_, group,
                          QStringLiteral("Label2")),
        0, 0);
    layout->addWidget(copies_, 0, 1);
    layout->addWidget(copiesHint_, 1, 0, 1, 3);
    layout->setColumnStretch(2, 1);
    return group;
}

/// What is seen while pages are sent: how many, and the button that ends it.
QWidget* PrintOptionsDialog::makeProgress()
{
    progress_ = new QWidget(this);
    sentText_ = new QLabel(progress_);
    sentText_->setObjectName(QStringLiteral("labSent"));
    sentBar_ = new QProgressBar(progress_);
    sentBar_->setObjectName(QStringLiteral("barSent"));
    sentBar_->setAccessibleName(tr("Pages sent"));
    sentBar_->setTextVisible(false);
    stopButton_ = new QPushButton(tr("Cancel"), progress_);
    stopButton_->setObjectName(QStringLiteral("cmdStop"));
    stopButton_->setAutoDefault(false);
    stopButton_->setToolTip(tr("Ends printing after the page that is being sent (Escape)"));
    setAltKey(*stopButton_, 'E');
    keepAnswering(*stopButton_);
    connect(stopButton_, &QPushButton::clicked, this, [this] { done(QDialog::Rejected); });
    auto* layout = new QGridLayout(progress_);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(sentText_, 0, 0);
    layout->addWidget(sentBar_, 1, 0);
    layout->addWidget(stopButton_, 1, 1);
    layout->setColumnStretch(0, 1);
    progress_->hide();
    return progress_;
}

void PrintOptionsDialog::chooseRange(bool allPages)
{
    if (allPages)
        choices_.chooseAll();
    else
        choices_.chooseRange();
    range_->setEnabled(choices_.rangeEnabled);
    showDoubts();
}

PrintEntries PrintOptionsDialog::entries() const
{
    return { .allPages = choices_.allPages,
        .range = toText(range_->text()),
        .copies = toText(copies_->textBox()->text()) };
}

void PrintOptionsDialog::showDoubts()
{
    const PrintEntries present = entries();
    rangeHint_->say(wordsOf(rangeDoubt(present, pages_.count), pages_.count));
    copiesHint_->say(wordsOf(copiesDoubt(present.copies), pages_.count));
}

void PrintOptionsDialog::filterCopies()
{
    QLineEdit& box = *copies_->textBox();
    const QString typed = box.text();
    const auto filtered = [](QStringView text) { return toQString(filteredCopies(viewOf(text))); };
    const auto caret = filtered(QStringView(typed).first(box.cursorPosition())).size();
    rewriteText(box, filtered(typed), static_cast<int>(caret));
    showDoubts();
}

/// The print system is asked, which lets messages run.
void PrintOptionsDialog::press()
{
    if (isPrinting_)
        return;
    isPrinting_ = true;
    endHint_->say({});
    pressOnce();
    isPrinting_ = false;
    if (isLeaving_)
        accept();
}

void PrintOptionsDialog::pressOnce()
{
    try {
        const auto pressed = pressPrint(platform_.printers, entries());
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
    showPrinting(true);
    QString why;
    try {
        why = print_(arguments);
    } catch (const RunTimeError&) {
        // The command ends; the print procedure has told what there is to tell.
    }
    showPrinting(false);
    endHint_->say(why);
    isLeaving_ = why.isEmpty();
}

void PrintOptionsDialog::showPrinting(bool isPrinting)
{
    for (QWidget* const group : groups_)
        group->setEnabled(!isPrinting);
    buttons_.ok->setEnabled(!isPrinting);
    buttons_.cancel->setEnabled(!isPrinting);
    stopButton_->setEnabled(true);
    sentText_->clear();
    sentBar_->setRange(0, 0);
    progress_->setVisible(isPrinting);
    if (isPrinting)
        stopButton_->setFocus();
    else
        buttons_.ok->setFocus();
}

void PrintOptionsDialog::showSent(std::int64_t sent, std::int64_t wanted)
{
    constexpr std::int64_t Steps = 1000;
    sentText_->setText(tr("%1 of %2 pages sent").arg(sent).arg(wanted));
    sentBar_->setRange(0, static_cast<int>(Steps));
    sentBar_->setValue(static_cast<int>(wanted > 0 ? sent * Steps / wanted : 0));
}

void PrintOptionsDialog::done(int result)
{
    if (!isPrinting_)
        return QDialog::done(result);
    stopButton_->setEnabled(false);
    if (stop_)
        stop_();
}

} // namespace pelloric::qt
