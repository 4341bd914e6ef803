// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/platform.h"
#include "ui/print_options.h"

#include <QDialog>

#include <functional>

class QComboBox;
class QLineEdit;
class QRadioButton;

namespace pelloric::qt {

class UpDownBox;

/// The modal dialog "Print": printer, pages and copies; prints through the preview window.
class PrintOptionsDialog final : public QDialog {
    Q_OBJECT

public:
    /// The preview window's print procedure; returns when everything is printed.
    using Print = std::function<void(const PrintArguments&)>;

    /// @param platform  its services outlive the dialog
    PrintOptionsDialog(const Platform& platform, Print print, QWidget* parent = nullptr);

    /// Closes the dialog unless it is printing.
    void done(int result) override;

private:
    QWidget* makePrinterGroup();
    QWidget* makeRangeGroup();
    QWidget* makeCopiesGroup();
    void chooseRange(bool allPages);
    void filterCopies();
    void press();
    void printAndClose(const PrintArguments& arguments);
    void pointAtExcess();

    Platform platform_;
    Print print_;
    PrintChoices choices_;
    QComboBox* printers_ = nullptr;
    QRadioButton* all_ = nullptr;
    QLineEdit* range_ = nullptr;
    UpDownBox* copies_ = nullptr;
    bool isPrinting_ = false;
};

} // namespace pelloric::qt
