// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QKeySequence>
#include <QObject>

#include <functional>
#include <vector>

class QAction;
class QMenu;
class QWidget;

namespace pelloric::qt {

/// A command of the preview window that is no tool: its keys work in all of the window, and it
/// stands in the context menu.
struct ViewCommand {
    const char* name; ///< object name
    QString text; ///< in the menu
    QList<QKeySequence> keys; ///< the first one stands beside the text
    std::function<void()> run;
    bool isNewGroup = false; ///< a line stands above it in the menu
};

/// Makes the actions of commands: they belong to the window and stand at the menu's end.
void addViewCommands(QWidget& window, QMenu& menu, const std::vector<ViewCommand>& commands);

} // namespace pelloric::qt
