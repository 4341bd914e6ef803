// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/view_actions.h"

#include <QAction>
#include <QMenu>

namespace pelloric::qt {

void addViewCommands(QWidget& window, QMenu& menu, const std::vector<ViewCommand>& commands)
{
    for (const ViewCommand& command : commands) {
        if (command.isNewGroup)
            menu.addSeparator();
        auto* const action = new QAction(command.text, &window);
        action->setObjectName(QString::fromLatin1(command.name));
        action->setShortcuts(command.keys);
        action->setShortcutContext(Qt::WindowShortcut);
        QObject::connect(action, &QAction::triggered, &window, command.run);
        window.addAction(action);
        menu.addAction(action);
    }
}

} // namespace pelloric::qt
