// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/options.h>

#include <QDockWidget>

class QCheckBox;
class QComboBox;
class QFormLayout;
class QLabel;
class QLineEdit;
class QSpinBox;
class QVBoxLayout;

namespace pelloric::qt {

/// The panel beside the pages that switches what a report does beyond the plain page.
///
/// Whatever is changed in it is told at once; a text when it is left or Enter is pressed. Parts
/// that mean nothing at the moment are grey.
class OptionsPanel final : public QDockWidget {
    Q_OBJECT

public:
    explicit OptionsPanel(QWidget* parent = nullptr);

    /// Shows options without telling of a change.
    void setOptions(const ReportOptions& options);

    /// What is shown; what the panel has no part for stays as it was set.
    ReportOptions options() const;

    /// Says what was done to bring the table onto the sheet; nothing where nobody asked.
    void showFit(const FitResult& fit);

    /// Puts the keyboard into the panel.
    void enter();

signals:
    void changed();

private:
    void addLook(QVBoxLayout& all);
    void addWidth(QVBoxLayout& all);
    void addContent(QVBoxLayout& all);
    void addTotals(QVBoxLayout& all);
    void addPictures(QVBoxLayout& all);
    QWidget* fileRow(QLineEdit& file, const QString& title);
    void nameParts();
    void listen();
    void tellChange();
    void showUse();
    void readContent(ReportOptions& options) const;
    void readPictures(ReportOptions& options) const;

    ReportOptions kept_;
    bool isFilling_ = false;
    QCheckBox* asShown_ = nullptr;
    QComboBox* fit_ = nullptr;
    QSpinBox* pagesAcross_ = nullptr;
    QLabel* fitResult_ = nullptr;
    QSpinBox* keyColumns_ = nullptr;
    QComboBox* pageOrder_ = nullptr;
    QComboBox* rows_ = nullptr;
    QSpinBox* firstRow_ = nullptr;
    QSpinBox* lastRow_ = nullptr;
    QLineEdit* columns_ = nullptr;
    QLineEdit* groups_ = nullptr;
    QCheckBox* keepsGroups_ = nullptr;
    QComboBox* totalFunction_ = nullptr;
    QLineEdit* totals_ = nullptr;
    QLineEdit* watermark_ = nullptr;
    QLineEdit* watermarkFile_ = nullptr;
    QSpinBox* opacity_ = nullptr;
    QCheckBox* isAbove_ = nullptr;
    QLineEdit* logo_ = nullptr;
    QComboBox* logoSlot_ = nullptr;
};

} // namespace pelloric::qt
