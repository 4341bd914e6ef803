// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/temp_folder.h"
#include "support/qt/run_program.h"

#include <QByteArray>
#include <QProcess>

#include <string>
#include <vector>

namespace pelloric::qt {

/// A job as the scheduler logged it.
struct SpooledJob {
    int number = 0;
    QString printer;
    QString media;
    QString sides;
    QString copies; ///< "-": none were asked for, which is one
    QString format;
    QString title;
};

/// A print scheduler of this process, without printers at first; ends with the object.
class PrivateCups {
public:
    /// @param fileKib  no file of the spool can be larger, as on a full disk; 0: any size
    explicit PrivateCups(int fileKib = 0);
    ~PrivateCups();

    /// Why it does not run, empty when it does.
    std::string failure() const { return failure_.toStdString(); }

    /// Adds a printer with the papers of tests/data/forms.ppd, two-sided by default.
    bool addPrinter(const QString& name);

    /// As above, with some lines of its description changed.
    struct Change {
        QByteArray from;
        QByteArray to;
    };
    bool addPrinter(const QString& name, const std::vector<Change>& changes);

    /// Runs one of the scheduler's commands: lpadmin, cupsdisable, cupsreject, ...
    bool command(const QString& program, const QStringList& arguments);

    /// All jobs that have been printed, in the order of their numbers; waits for those under way.
    std::vector<SpooledJob> jobs();

    /// The document of a job as it reached the spooler.
    QString documentOf(int job) const;

    /// The folder of the scheduler's files.
    QString folder() const;

    /// Ends it.
    void stop();

private:
    bool addDescribedPrinter(const QString& name, const QString& description);
    QString waitUntilReady();

    TempFolder folder_;
    QProcess process_;
    QString failure_;
};

} // namespace pelloric::qt
