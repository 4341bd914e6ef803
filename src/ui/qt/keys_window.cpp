// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/keys_window.h"

#include "ui/qt/tool_meanings.h"
#include "ui/qt/view_actions.h"
#include "ui/tool_table.h"

#include <QCoreApplication>
#include <QDialog>
#include <QHeaderView>
#include <QScreen>
#include <QScrollBar>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <array>

namespace pelloric::qt {

namespace {

/// A key that reads or scrolls.
struct ReadingKey {
    const char* keys;
    const char* meaning;
};

constexpr auto ReadingKeys = std::to_array<ReadingKey>({
    { "PgDown, Space", QT_TRANSLATE_NOOP("KeysWindow", "Read on, at the end the next page") },
    { "PgUp, Shift+Space",
        QT_TRANSLATE_NOOP("KeysWindow", "Read back, at the top the page before") },
    { "Up, Down, Left, Right", QT_TRANSLATE_NOOP("KeysWindow", "Scroll a little") },
    { "Home, End", QT_TRANSLATE_NOOP("KeysWindow", "Top and bottom of the page") },
    { "Ctrl+Wheel", QT_TRANSLATE_NOOP("KeysWindow", "Scale under the pointer") },
    { "Shift+Wheel", QT_TRANSLATE_NOOP("KeysWindow", "Scroll sideways") },
    { "Shift+Drag", QT_TRANSLATE_NOOP("KeysWindow", "Select texts") },
    { "Menu", QT_TRANSLATE_NOOP("KeysWindow", "Menu of the pages") },
    { "Esc", QT_TRANSLATE_NOOP("KeysWindow", "Close what is open, end what runs, then leave") },
});

/// As large as the list, as far as the screen goes.
QSize firstSize(const QTreeWidget& list)
{
    const int lines = list.topLevelItemCount() + 1;
    const QSize whole(list.header()->length() + list.verticalScrollBar()->sizeHint().width(),
        list.header()->sizeHint().height() + lines * list.sizeHintForRow(0));
    return whole.boundedTo(list.screen()->availableSize() * 9 / 10);
}

/// Key names in the user's language, where the toolkit knows them.
QString nativeKeys(const QString& keys)
{
    QStringList parts = keys.split(QStringLiteral(", "));
    for (QString& part : parts) {
        const QString native = QKeySequence::fromString(part).toString(QKeySequence::NativeText);
        if (!native.isEmpty())
            part = native;
    }
    return parts.join(QStringLiteral(", "));
}

QString namesOf(const QList<QKeySequence>& keys)
{
    QStringList names;
    for (const QKeySequence& sequence : keys)
        names.append(sequence.toString(QKeySequence::NativeText));
    return names.join(QStringLiteral(", "));
}

} // namespace

std::vector<KeyLine> allKeys(const std::vector<ViewCommand>& commands)
{
    std::vector<KeyLine> lines;
    lines.reserve(ReadingKeys.size() + commands.size() + PreviewTools.size());
    for (const ReadingKey& row : ReadingKeys)
        lines.push_back({ nativeKeys(QString::fromLatin1(row.keys)),
            QCoreApplication::translate("KeysWindow", row.meaning) });
    for (const ViewCommand& command : commands) {
        if (!command.keys.isEmpty())
            lines.push_back({ namesOf(command.keys), command.text });
    }
    for (const PreviewTool& tool : PreviewTools)
        lines.push_back({ namesOf(allKeysOf(tool)), meaningOf(tool.action) });
    return lines;
}

void showKeys(QWidget& parent, const std::vector<KeyLine>& keys)
{
    const QString name = QStringLiteral("frmKeys");
    auto* dialog = parent.findChild<QDialog*>(name);
    if (!dialog) {
        dialog = new QDialog(&parent);
        dialog->setObjectName(name);
        dialog->setAttribute(Qt::WA_DeleteOnClose);
        dialog->setWindowTitle(QCoreApplication::translate("KeysWindow", "Keys"));
        auto* const list = new QTreeWidget(dialog);
        list->setObjectName(QStringLiteral("Keys"));
        list->setAccessibleName(dialog->windowTitle());
        list->setHeaderLabels({ QCoreApplication::translate("KeysWindow", "Keys"),
            QCoreApplication::translate("KeysWindow", "What they do") });
        list->setRootIsDecorated(false);
        list->setUniformRowHeights(true);
        list->setAlternatingRowColors(true);
        for (const KeyLine& line : keys)
            list->addTopLevelItem(new QTreeWidgetItem({ line.keys, line.meaning }));
        list->header()->setSectionResizeMode(QHeaderView::ResizeToContents);
        auto* const layout = new QVBoxLayout(dialog);
        layout->setContentsMargins(0, 0, 0, 0);
        layout->addWidget(list);
        dialog->resize(firstSize(*list));
    }
    dialog->show();
    dialog->raise();
    dialog->activateWindow();
}

} // namespace pelloric::qt
