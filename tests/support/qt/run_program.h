// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>

namespace pelloric::qt {

/// A program that runs longer hangs.
inline constexpr int LongestRunMs = 60000;

/// What a program that has ended left behind.
struct ProgramResult {
    int status = -1; ///< exit status; -1: it did not run to its end
    QString output; ///< standard output
    QString errors; ///< standard error
};

/// Runs a program to its end, a minute at most.
inline ProgramResult runProgram(const QString& program, const QStringList& arguments)
{
    QProcess process;
    process.start(program, arguments);
    if (!process.waitForFinished(LongestRunMs) || process.exitStatus() != QProcess::NormalExit)
        return { -1, {}, program + QStringLiteral(": ") + process.errorString() };
    return { process.exitCode(), QString::fromUtf8(process.readAllStandardOutput()),
        QString::fromUtf8(process.readAllStandardError()) };
}

} // namespace pelloric::qt
