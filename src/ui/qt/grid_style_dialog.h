// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/platform.h"
#include "ui/grid_style.h"

#include <QDialog>

#include <optional>

class QCheckBox;
class QTreeWidget;

namespace pelloric::qt {

class ColorPicker;

/// The modal dialog "Report Face Designer": switches, colours and fonts of the settings file.
class GridStyleDialog final : public QDialog {
    Q_OBJECT

public:
    /// Loads the settings.
    /// @param platform  its services outlive the dialog
    /// @param own       shown and changed instead of the settings file; null: the file
    explicit GridStyleDialog(
        const Platform& platform, QWidget* parent = nullptr, ReportSettings* own = nullptr);

    /// How the save of "OK" ended, of which the dialog itself tells nobody; nothing before.
    std::optional<SaveOutcome> saved() const { return saved_; }

private:
    QWidget* makeOptionsTab();
    QCheckBox* makeSwitch(GridSwitch which, const QString& name, const QString& text, char key);
    QWidget* makeColorsTab();
    QWidget* makeFontsTab();
    QTreeWidget* makeFontList(QWidget* parent);
    void changeFont();
    void showFonts();
    void save();

    Platform platform_;
    GridStyleState state_;
    std::optional<SaveOutcome> saved_;
    QTreeWidget* fonts_ = nullptr;
};

} // namespace pelloric::qt
