// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/platform.h"
#include "platform/printer.h"
#include "ui/print_options.h"
#include "ui/qt/dialog_parts.h"

#include <QDialog>

#include <array>
#include <chrono>
#include <functional>
#include <memory>

class QComboBox;
class QLabel;
class QLineEdit;
class QProgressBar;
class QPushButton;
class QRadioButton;
class QTimer;

namespace pelloric::qt {

class HintLabel;
class UpDownBox;

/// The pages that are to be printed.
struct PrintPages {
    int count = 0; ///< 0: unknown
    PaperRequest paper {}; ///< the sheets that they want
};

/// The modal dialog "Print": printer, pages and copies; prints through the preview window.
///
/// Nobody waits for the print system before the dialog opens: the printers come in when it has
/// told them. While it prints, the dialog shows how far it is and offers to end.
class PrintOptionsDialog final : public QDialog {
    Q_OBJECT

public:
    /// The preview window's print procedure; returns when everything is printed or the user has
    /// ended it, and then answers why the dialog stays open.
    using Print = std::function<QString(const PrintArguments&)>;

    /// @param platform  its services outlive the dialog
    PrintOptionsDialog(const Platform& platform, Print print, const PrintPages& pages = {},
        QWidget* parent = nullptr);
    ~PrintOptionsDialog() override;

    /// What ends the printing after the page in work, when its user wants it to.
    void onStop(std::function<void()> stop) { stop_ = std::move(stop); }

    /// Shows how many pages are sent.
    void showSent(std::int64_t sent, std::int64_t wanted);

    /// Whether the user went for a file instead, which is offered where there is no printer.
    bool wantsFile() const { return wantsFile_; }

    /// Closes the dialog; while it prints, ends the printing instead.
    void done(int result) override;

private:
    QWidget* makePrinterGroup();
    QWidget* makeRangeGroup();
    QWidget* makeCopiesGroup();
    QWidget* makeProgress();
    void askPrinters(std::chrono::milliseconds patience);
    void takeAnswer(std::chrono::milliseconds patience);
    void showPrinters(const PrinterFacts& facts);
    void showDoubts();
    void chooseRange(bool allPages);
    void filterCopies();
    void press();
    void pressOnce();
    void printAndClose(const PrintArguments& arguments);
    void showPrinting(bool isPrinting);
    PrintEntries entries() const;
    void pointAtExcess();

    Platform platform_;
    Print print_;
    PrintChoices choices_;
    PrintPages pages_;
    std::function<void()> stop_;
    std::unique_ptr<PrinterInquiry> inquiry_; ///< null: nothing is asked now
    QTimer* answerTimer_;
    QComboBox* printers_ = nullptr;
    HintLabel* printerHint_ = nullptr;
    HintLabel* rangeHint_ = nullptr;
    HintLabel* copiesHint_ = nullptr;
    HintLabel* endHint_ = nullptr;
    QWidget* progress_ = nullptr;
    QLabel* sentText_ = nullptr;
    QProgressBar* sentBar_ = nullptr;
    QPushButton* stopButton_ = nullptr;
    std::array<QWidget*, 3> groups_ {};
    ClosingButtons buttons_ {};
    QRadioButton* all_ = nullptr;
    QLineEdit* range_ = nullptr;
    UpDownBox* copies_ = nullptr;
    QPushButton* fileButton_ = nullptr;
    bool wantsFile_ = false;
    bool isPrinting_ = false;
    bool isLeaving_ = false; ///< everything is sent
};

} // namespace pelloric::qt
