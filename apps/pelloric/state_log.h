// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QFile>
#include <QSize>
#include <QTimer>

namespace pelloric::qt {
class QtPreviewOpener;
}

namespace pelloric::app {

/// Writes what the preview window shows to a file, one line for each change, so that a script that
/// drives the program by keys and pointer can tell what came of it.
///
/// A line is "state" with pairs such as "current=2"; when the window has opened, lines such as
/// "place tool7 120 34 Next Page" tell where each control stands in it: pixels of its middle.
class StateLog {
public:
    /// @param opener  outlives the log
    /// @throws CommandError the file cannot be written
    StateLog(const QString& file, qt::QtPreviewOpener& opener);

private:
    void look();
    void write(const QString& line);
    void writePlaces();
    QString state() const;

    qt::QtPreviewOpener& opener_;
    QFile file_;
    QTimer timer_;
    QString last_;
    QSize lastSize_;
};

} // namespace pelloric::app
