// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QIcon>
#include <QWidget>

namespace pelloric::qt {

/// The small picture of a sheet, upright or lying.
class SheetPicture final : public QWidget {
public:
    SheetPicture(const QString& name, bool portrait, QWidget* parent);

    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    bool portrait_;
};

/// The picture of a paper in a list: a sheet or an envelope.
QIcon paperIcon(bool isEnvelope);

} // namespace pelloric::qt
