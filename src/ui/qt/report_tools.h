// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QObject>
#include <QString>

#include <functional>

class QMainWindow;

namespace pelloric {

class MessageService;
struct ReportOptions;

} // namespace pelloric

namespace pelloric::qt {

class OptionsPanel;
class Sorvane;

/// What a preview window offers beyond the plain page: the panel of report options, and a status
/// line that tells what became of them. Neither is seen until it is asked for.
class ReportTools final : public QObject {
    Q_OBJECT

public:
    /// What the tools work on; all borrowed.
    struct Window {
        QMainWindow& window;
        Sorvane& canvas;
        MessageService& messages;
        std::function<void()> rebuild; ///< builds the pages anew, where a grid is kept
        std::function<bool()> isBusy; ///< commands are refused meanwhile
    };

    explicit ReportTools(const Window& window);

    /// What builds from now on do beyond the plain page.
    void setOptions(const ReportOptions& options);

    /// Shows the panel, or hides it and gives the keyboard back to the pages.
    void togglePanel();

    /// Hides the panel when the keyboard is in it. @return false: it is not
    bool escape();

    /// Pages were built, opened or cleared.
    void viewChanged();

    /// The document was saved; tells what a document file cannot hold of it.
    void documentSaved();

private:
    void apply();
    void showStatus(const QString& text);

    Window parts_;
    OptionsPanel* panel_;
    std::uint32_t documentNumber_ = 0; ///< that the status tells of
};

} // namespace pelloric::qt
