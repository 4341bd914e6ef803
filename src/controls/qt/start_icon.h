// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QFrame>

namespace pelloric::qt {

/// What a canvas shows before it has a document, `frmIcon`: a sheet of paper and a short text.
class StartIcon final : public QFrame {
    Q_OBJECT

public:
    explicit StartIcon(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace pelloric::qt
