// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

#include <vector>

class QWidget;

namespace pelloric::qt {

struct ViewCommand;

/// What keys do, in one line.
struct KeyLine {
    QString keys;
    QString meaning;
};

/// Every key of the preview window: those that read, those of the tools, and those of further
/// commands, in this order.
std::vector<KeyLine> allKeys(const std::vector<ViewCommand>& commands);

/// Shows the keys in a window of their own, `frmKeys`, beside which work goes on; one that is open
/// already comes to the front.
void showKeys(QWidget& parent, const std::vector<KeyLine>& keys);

} // namespace pelloric::qt
