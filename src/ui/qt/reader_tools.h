// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/qt/view_actions.h"

#include <QObject>

#include <cstdint>
#include <functional>

class QDockWidget;
class QMainWindow;

namespace pelloric {

class PreviewSession;

} // namespace pelloric

namespace pelloric::qt {

class FindBar;
class PageMarks;
class PageStrip;
class QtFonts;
class Sorvane;

/// What a preview window offers its reader beside the tools: fits, finding, selecting and copying,
/// pictures of the pages, and the list of keys.
class ReaderTools final : public QObject {
    Q_OBJECT

public:
    /// What the tools work on; all borrowed.
    struct Window {
        QMainWindow& window;
        QMenu& menu; ///< further commands stand at its end
        Sorvane& canvas;
        PreviewSession& session;
        QtFonts& fonts;
        std::function<bool()> isBusy; ///< commands are refused meanwhile
        std::function<void()> savePages; ///< asks for a file, see `PreviewWindow::savePages`
        std::function<void()> showOptions; ///< shows or hides the panel of report options
    };

    explicit ReaderTools(const Window& window);
    ~ReaderTools() override;

    /// Closes the smallest thing that is open, and nothing but one. @return false: nothing was
    bool escape();

    /// The state of the session is another, or pages were built, opened or cleared.
    void viewChanged();

private:
    std::vector<ViewCommand> commands();
    QDockWidget* dock(QWidget* content, Qt::DockWidgetArea area);
    void guarded(const std::function<void()>& command);
    void openFind();
    void closeFind();
    void copy();
    int pageInReading() const;

    Window parts_;
    PageMarks* marks_;
    FindBar* find_;
    PageStrip* strip_;
    QDockWidget* findDock_;
    QDockWidget* stripDock_;
    std::vector<ViewCommand> commands_;
    std::uint32_t documentNumber_ = 0; ///< that finding and selecting were told of
};

} // namespace pelloric::qt
