// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

class QAbstractButton;
class QTabWidget;
class QWidget;

namespace pelloric::qt {

/// Lets Alt and a letter of its caption press a button or choose an option.
void setAltKey(QAbstractButton& button, char key);

/// Lets Alt and a letter or digit give a control the focus.
///
/// @param caption  shows the letter; the control itself where it has no caption
void setFocusKey(QWidget& control, char key, QWidget& caption);

/// Lets Alt and a letter of its caption bring each tab to the front.
/// @param keys  one letter a tab, in their order
void setTabKeys(QTabWidget& tabs, const char* keys);

/// Shows the Alt keys of a window's controls without a mark in their texts, so that these read the
/// same everywhere: a line below the letter, and while Alt is held a badge on each control that
/// has no caption with its key.
void showAltKeys(QWidget& window);

} // namespace pelloric::qt
