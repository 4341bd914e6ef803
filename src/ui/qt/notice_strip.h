// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/preview_notice.h"

#include <QFrame>

class QLabel;
class QPushButton;

namespace pelloric::qt {

/// The strip above the pages: says what is wrong, and offers the ways out.
class NoticeStrip final : public QFrame {
    Q_OBJECT

public:
    explicit NoticeStrip(QWidget* parent);

    /// Shows a notice; without one the strip is hidden.
    void showNotice(const std::optional<PreviewNotice>& notice);

signals:
    void pageSetupAsked();
    void gridStyleAsked();
    void defaultsAsked();
    /// The user has read it.
    void dismissed();

protected:
    void changeEvent(QEvent* event) override;

private:
    void chooseColors();
    void drawIcon();

    std::optional<PreviewNotice> shown_;
    QLabel* icon_;
    QLabel* text_;
    QPushButton* pageSetup_;
    QPushButton* gridStyle_;
    QPushButton* defaults_;
    bool choosesColors_ = false;
};

} // namespace pelloric::qt
