// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "apps/qt/program.h"

#include <QFile>
#include <QRegularExpression>

#include <gmock/gmock.h>

#if defined(__linux__)

namespace pelloric::qt {

namespace {

/// Each promise of docs/security.md, watched from outside.
class Promises : public Program {
protected:
    /// The calls of the kernel that a run of the program makes.
    /// @param calls  as strace names them
    QStringList callsOf(const char* calls, const QStringList& arguments)
    {
        const QString log = QString::fromStdString(folder_.file("calls.log").string());
        QProcess process;
        QProcessEnvironment environment = surroundings();
        environment.insert(
            QStringLiteral("HOME"), QString::fromStdString(folder_.file("home").string()));
        // The sanitizer cannot look for leaks of a program that is watched.
        environment.insert(QStringLiteral("ASAN_OPTIONS"), QStringLiteral("detect_leaks=0"));
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(QString::fromStdString(folder_.path().string()));
        process.start(QStringLiteral("strace"),
            QStringList { QStringLiteral("-f"), QStringLiteral("-qq"), QStringLiteral("-s"),
                QStringLiteral("400"), QStringLiteral("-o"), log, QStringLiteral("-e"),
                QStringLiteral("trace=") + QLatin1String(calls), QStringLiteral(PELLORIC_PROGRAM) }
                + arguments);
        EXPECT_TRUE(process.waitForStarted()) << "strace is missing; install the Debian package";
        const Ended ended = finish(process);
        EXPECT_EQ(ended.status, 0) << ended.errors;
        QFile file(log);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    }

    void copySample()
    {
        QFile::copy(QStringLiteral(PELLORIC_TESTS_DIR "/../samples/samples.sqlite"),
            QString::fromStdString(folder_.file("s.sqlite").string()));
    }
};

} // namespace

TEST_F(Promises, HoldThatNothingGoesOverANetwork)
{
    copySample();
    folder_.write("t.csv", "a\nhttp://example.org/picture.png\n");
    folder_.write("t.json", "[{\"$ref\": \"http://example.org/rows.json\"}]\n");
    folder_.write("s.js", "print(typeof XMLHttpRequest, typeof fetch, typeof require)\n");
    for (const char* line : { "export t.csv -o t.pdf", "export t.csv -o t.svg",
             "export t.csv -o t.png", "export t.csv -o t.ostl", "export t.ostl -o u.pdf",
             "export t.json -o t.pdf", "export s.sqlite:wine -o t.pdf", "run s.js", "settings" }) {
        for (const QString& call : callsOf("socket,connect", words(line)))
            EXPECT_FALSE(call.contains("AF_INET")) << line << ": " << call.toStdString();
    }
    EXPECT_EQ(run(words("run s.js")).output, "undefined undefined undefined\n");
}

TEST_F(Promises, HoldThatNoProgramIsStarted)
{
    folder_.write("t.csv", "a\n$(touch started)\n");
    const QStringList calls
        = callsOf("execve,execveat", { "export", "t.csv", "-o", "t.pdf", "--title", "`id`" });
    EXPECT_EQ(calls.filter("exec").size(), 1) << calls.join('\n').toStdString();
}

TEST_F(Promises, HoldThatNothingIsWrittenButWhatWasAskedFor)
{
    folder_.write("t.csv", "a\n1\n");
    const QString folder = QString::fromStdString(folder_.path().string());
    const QRegularExpression writing(QStringLiteral("O_WRONLY|O_RDWR|O_CREAT|O_TRUNC"));
    const QRegularExpression path(QStringLiteral("\"([^\"]*)\""));
    for (const QString& call : callsOf("openat,open,creat", { "export", "t.csv", "-o", "t.pdf" })) {
        const QString name = path.match(call).captured(1);
        const bool isOwn = !name.startsWith('/') || name.startsWith(folder);
        EXPECT_TRUE(!call.contains(writing) || isOwn || name.startsWith("/dev/"))
            << call.toStdString();
    }
    EXPECT_THAT(folder_.names(), testing::UnorderedElementsAre("t.csv", "t.pdf", "calls.log"));
}

TEST_F(Promises, HoldThatDatabasesAreOnlyRead)
{
    copySample();
    const std::string before = folder_.read("s.sqlite");
    for (const char* query : { "DELETE FROM sqlite_master", "DROP TABLE x",
             "WITH n AS (SELECT 1) DELETE FROM sqlite_master", "ATTACH 'other.sqlite' AS o",
             "PRAGMA user_version = 7", "SELECT load_extension('x')", "SELECT 1; DROP TABLE x" }) {
        const Ended ended = run({ "export", "s.sqlite", "-o", "t.pdf", "--query", query });
        EXPECT_EQ(ended.status, 1) << query << ended.errors;
        EXPECT_EQ(folder_.read("s.sqlite"), before) << query;
    }
    EXPECT_THAT(folder_.names(), testing::ElementsAre("s.sqlite"));
}

TEST_F(Promises, HoldThatDataIsNeverRun)
{
    folder_.write("t.csv",
        "a,b\n=cmd|' /C calc'!A0,<script>alert(1)</script>\njavascript:alert(1),&lt;b&gt;\n");
    EXPECT_EQ(run(words("export t.csv -o t.svg")).status, 0);
    const std::string svg = folder_.read("t.svg");
    EXPECT_FALSE(has(svg, "<script"));
    EXPECT_FALSE(has(svg, "href=\"javascript"));
    EXPECT_EQ(run(words("export t.csv -o t.pdf")).status, 0);
    const std::string pdf = folder_.read("t.pdf");
    for (const char* action : { "/JavaScript", "/JS", "/Launch", "/OpenAction", "/URI", "/AA" })
        EXPECT_FALSE(has(pdf, action)) << action;
    const std::string text = pdfText("t.pdf");
    EXPECT_TRUE(has(text, "<script>alert(1)</script>")) << text;
    EXPECT_TRUE(has(text, "&lt;b&gt;")) << text;
}

} // namespace pelloric::qt

#endif
