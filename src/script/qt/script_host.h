// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/qt/preview_opener.h"

#include <QJSEngine>
#include <QJSValue>
#include <QObject>
#include <QStringList>

#include <functional>
#include <memory>
#include <optional>

namespace pelloric::qt {

class QtPlatform;
class ScriptMessages;

/// Makes grids for scripts: tables of CSV files and of SQLite databases.
///
/// The program that runs scripts puts its readers in.
class ScriptTables {
public:
    virtual ~ScriptTables() = default;

    /// A grid over a CSV or TSV file. @throws RunTimeError the file's own
    virtual QObject* csv(const QString& path) = 0;

    /// A grid over a table or a query of an SQLite database. @throws RunTimeError the database's
    /// own
    virtual QObject* sqlite(const QString& path, const QString& tableOrQuery) = 0;
};

/// Whether people see the preview window that a script opens.
enum class ScriptWindows { Hidden, Shown };

/// A late-bound host: a script makes the controls by name, sets their fields, calls their methods
/// and connects their events.
///
/// The script sees `Sorvane`, `Kestrane`, the published records and enumerations, `args`,
/// `messages`, `print(...)`, `exit(status)`, `csv(path)`, `sqlite(path, tableOrQuery)`,
/// `lines(canvas, page)`, `texts(canvas, page)`, `placePicture(canvas, page, picture)` and
/// `previewCanvas()`, the canvas of the preview window or null; a control that the script made also
/// has `grab(path)` and `resize(width, height)`. Letter case of a control's members is free; one
/// that it does not have is error 438, read or written.
class ScriptHost final : public QObject {
    Q_OBJECT
public:
    /// @param platform  services of the controls; borrowed. Its message boxes are collected in the
    ///                  script's `messages` from now on.
    /// @param tables    borrowed
    /// @param windows   shown: a run ends when the preview window is closed
    ScriptHost(
        QtPlatform& platform, ScriptTables& tables, ScriptWindows windows = ScriptWindows::Hidden);
    ~ScriptHost() override;

    /// Runs a script file.
    ///
    /// An exception that the script does not catch is told on standard error with file and line,
    /// and so is the rejection of a promise that nobody looks after.
    /// @return  the exit status: what `exit` was given, 1 after an exception or a rejection, else
    ///          0; at least 1 when what the script printed could not be written
    int run(const QString& path, const QStringList& arguments);

    /// Runs a script text. @param name  stands for the file in messages
    int runText(const QString& text, const QString& name, const QStringList& arguments);

    /// Prints a line on standard output.
    Q_INVOKABLE void print(const QString& line);
    /// Ends the script with an exit status.
    Q_INVOKABLE void exit(double status);
    Q_INVOKABLE QJSValue csv(const QString& path);
    Q_INVOKABLE QJSValue sqlite(const QString& path, const QString& tableOrQuery);
    /// @param kind  "Sorvane" or "Kestrane"
    Q_INVOKABLE QJSValue newControl(const QString& kind);
    /// What a control publishes: objects with `name`, `reads`, `writes` and `calls`.
    /// @param kind  "Sorvane", "Kestrane" or "PreviewCanvas"
    Q_INVOKABLE QJSValue members(const QString& kind);
    /// What a script is told of a member that a control does not have.
    Q_INVOKABLE QString refusal(const QString& name);
    /// The canvas of the preview window, or null when none is open.
    Q_INVOKABLE QJSValue previewCanvas();
    /// Lets pending messages run for some milliseconds, 10,000 at most.
    Q_INVOKABLE void wait(int milliseconds);
    /// The lines of a page (from 0) as `Lineobj` records.
    Q_INVOKABLE QJSValue lines(QObject* canvas, int page);
    /// The texts of a page (from 0) as `Textobj` records.
    Q_INVOKABLE QJSValue texts(QObject* canvas, int page);
    /// Gives a page (from 0) its picture, a `MapLocation`.
    Q_INVOKABLE void placePicture(QObject* canvas, int page, const QJSValue& picture);
    /// The message boxes that were shown: objects with `text`, `title` and `icon`.
    Q_INVOKABLE QJSValue takeMessages();

private:
    QJSValue answer(const std::function<QJSValue()>& call);
    QJSValue evaluatePrelude(const QStringList& arguments);
    int report(const QJSValue& error, const QString& name, const char* what = "");
    int reportRejections(const QJSValue& promises, const QString& name);
    void waitForWindows();

    QtPlatform& platform_;
    ScriptTables& tables_;
    ScriptWindows windows_;
    QtPreviewOpener opener_;
    std::unique_ptr<ScriptMessages> messages_;
    std::unique_ptr<QJSEngine> engine_;
    std::optional<int> exitStatus_;
    int status_ = 0; ///< unless `exit` says otherwise
    bool isOutputLost_ = false;
};

} // namespace pelloric::qt
