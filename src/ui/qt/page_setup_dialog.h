// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/platform.h"
#include "platform/printer.h"
#include "ui/page_setup.h"

#include <QDialog>

#include <array>
#include <memory>
#include <optional>

class QLabel;
class QLayout;
class QLineEdit;
class QRadioButton;
class QTimer;
class QTreeWidget;

namespace pelloric::qt {

class HintLabel;
class PageSketch;
class SheetPicture;
class UpDownBox;

/// The modal dialog "Page Setup": paper, margins, header and footer of the settings file.
///
/// It opens with the standard papers where the print system has not told its own by then; these
/// come in later, and what was chosen meanwhile stays.
class PageSetupDialog final : public QDialog {
    Q_OBJECT

public:
    /// Loads the settings.
    /// @param platform  its services outlive the dialog
    /// @param own       shown and changed instead of the settings file; null: the file
    explicit PageSetupDialog(
        const Platform& platform, QWidget* parent = nullptr, ReportSettings* own = nullptr);

    /// How the save of "OK" ended, of which the dialog itself tells nobody; nothing before.
    std::optional<SaveOutcome> saved() const { return saved_; }

private:
    QWidget* makePageTab();
    QWidget* makePaperList(QWidget* parent);
    QLayout* makeSizeBoxes(QWidget* parent);
    QLayout* makeOrientation(QWidget* parent);
    QWidget* makeMarginsTab();
    UpDownBox* makeMarginBox(Margin margin, QWidget* parent);

    void fillPapers();
    void takePapers();
    void clickPaper();
    void chooseOrientation(bool portrait);
    void showPaper();
    void typeMargin(Margin margin);
    void showMargins();
    void showHints();
    void save();

    Platform platform_;
    std::unique_ptr<PrinterInquiry> inquiry_; ///< null: the print system has answered
    PageSetupState state_;
    std::optional<SaveOutcome> saved_;
    QTimer* answerTimer_;
    QTreeWidget* papers_ = nullptr;
    HintLabel* papersHint_ = nullptr;
    QLabel* paperName_ = nullptr;
    QLineEdit* width_ = nullptr;
    QLineEdit* height_ = nullptr;
    SheetPicture* upright_ = nullptr;
    SheetPicture* lying_ = nullptr;
    std::array<UpDownBox*, 4> margins_ {};
    HintLabel* sizeHint_ = nullptr;
    HintLabel* marginHint_ = nullptr;
    HintLabel* fileHint_ = nullptr;
    PageSketch* sketch_ = nullptr;
};

} // namespace pelloric::qt
