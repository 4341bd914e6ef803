// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QListView>

namespace pelloric {

class Canvas;

} // namespace pelloric

namespace pelloric::qt {

class QtFonts;

/// A strip with a small picture of every page, painted when it comes into view: a long report costs
/// what is seen of it.
class PageStrip final : public QListView {
    Q_OBJECT

public:
    /// @param canvas  borrowed
    /// @param fonts   what pages are painted with; borrowed
    PageStrip(const Canvas& canvas, QtFonts& fonts, QWidget* parent = nullptr);

    /// Marks the page in view and takes the number of pages anew; nobody is told.
    void showPosition();

    QSize sizeHint() const override;

signals:
    /// The user went to a picture by mouse or keys.
    /// @param page  zero-based
    void pageChosen(int page);

protected:
    void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
    void showEvent(QShowEvent* event) override;

private:
    class Model;
    class Picture;

    const Canvas& canvas_;
    Model* model_;
    bool isShowing_ = false;
};

} // namespace pelloric::qt
