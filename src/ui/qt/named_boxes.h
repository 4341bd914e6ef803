// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

class QAbstractSpinBox;
class QComboBox;
class QString;

namespace pelloric::qt {

/// Names a combo box, its text box and its list for assistive technology.
///
/// On some systems the toolkit tells a combo box by its value, whatever name it was given; a box
/// that is named here is told by its name, and its value is its value.
void nameBox(QComboBox& box, const QString& name);

/// Names a box with up-down buttons and its text box.
void nameBox(QAbstractSpinBox& box, const QString& name);

} // namespace pelloric::qt
