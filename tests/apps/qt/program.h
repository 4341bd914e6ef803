// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/temp_folder.h"
#include "support/test_paths.h"

#include <QProcess>
#include <QProcessEnvironment>

#include <gtest/gtest.h>

#include <functional>

namespace pelloric::qt {

inline constexpr int LongestRun = 60000; ///< milliseconds

/// How a run of the program ended.
struct Ended {
    int status = -1;
    std::string output;
    std::string errors;
};

/// Runs the program in a folder of its own, with settings of its own and without a display.
class Program : public testing::Test {
protected:
    Ended run(const QStringList& arguments)
    {
        QProcess process;
        start(process, arguments);
        return finish(process);
    }

    /// Those of the test without a display and with settings of its own.
    QProcessEnvironment surroundings() const
    {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        for (const char* name : { "DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM" })
            environment.remove(QString::fromLatin1(name));
        environment.insert(QStringLiteral("XDG_CONFIG_HOME"),
            QString::fromStdString(folder_.file("config").string()));
        return environment;
    }

    void start(QProcess& process, const QStringList& arguments) const
    {
        QProcessEnvironment environment = surroundings();
        if (surround)
            surround(process, environment);
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(QString::fromStdString(folder_.path().string()));
        process.start(QStringLiteral(PELLORIC_PROGRAM), arguments);
    }

    static Ended finish(QProcess& process)
    {
        EXPECT_TRUE(process.waitForFinished(LongestRun));
        return { process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1,
            process.readAllStandardOutput().toStdString(),
            process.readAllStandardError().toStdString() };
    }

    std::string settings() const
    {
        return TempFolder::bytesOf(folder_.file("config") / "pelloric" / "OstlConfig.ini");
    }

    std::string pdfText(const std::string& name) const
    {
        QProcess process;
        process.start(QStringLiteral("pdftotext"),
            { QStringLiteral("-layout"), QString::fromStdString(folder_.file(name).string()),
                QStringLiteral("-") });
        process.waitForFinished();
        return process.readAllStandardOutput().toStdString();
    }

    TempFolder folder_;
    /// Changes what the program finds around it, just before it starts.
    std::function<void(QProcess& process, QProcessEnvironment& environment)> surround;
};

inline QStringList words(const char* line)
{
    return QString::fromUtf8(line).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

inline bool has(const std::string& text, std::string_view part)
{
    return text.find(part) != std::string::npos;
}

} // namespace pelloric::qt
