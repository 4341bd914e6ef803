// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QKeySequence>
#include <QList>
#include <QString>

namespace pelloric {

enum class ToolAction;
struct PreviewTool;

} // namespace pelloric

namespace pelloric::qt {

/// What a tool does, in plain words and in the user's language.
QString meaningOf(ToolAction action);

/// The keys of a tool, which stand in its tip.
QKeySequence keysOf(const PreviewTool& tool);

/// The same and those that do the same.
QList<QKeySequence> allKeysOf(const PreviewTool& tool);

} // namespace pelloric::qt
