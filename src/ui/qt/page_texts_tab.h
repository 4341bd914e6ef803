// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/page_setup.h"

#include <QWidget>

#include <array>

class QLineEdit;
class QMenu;

namespace pelloric::qt {

/// The tab of the page setup dialog for the texts and fonts of page headers and footers.
///
/// A field is put into a box by the popup, which the right button, the menu key and the small
/// button beside the box open.
class PageTextsTab final : public QWidget {
    Q_OBJECT

public:
    /// @param state  borrowed; told what the user enters
    PageTextsTab(PageSetupState& state, QWidget* parent);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* makeTextsGroup(bool isHeader, QWidget* parent);
    QWidget* makeFormatBox(int box, QWidget* parent);
    void makeFieldMenu();
    void openFieldMenu(int box, const QPoint& globalPosition);
    void chooseField(int entry);
    void askFont(bool isHeader);
    void showFont(bool isHeader);

    PageSetupState& state_;
    QMenu* fields_ = nullptr;
    std::array<QLineEdit*, PageSetupState::FormatBoxes> formatBoxes_ {};
    QLineEdit* headerFont_ = nullptr;
    QLineEdit* footerFont_ = nullptr;
};

} // namespace pelloric::qt
