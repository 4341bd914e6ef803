// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/private_cups.h"

#include "support/test_paths.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QRegularExpression>
#include <QThread>

#include <cups/cups.h>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr int StartMs = 10000;
constexpr int JobsMs = 60000;
constexpr int PauseMs = 30;

QString testsFolder() { return QString::fromUtf8(PELLORIC_TESTS_DIR); }

/// A line of the page log; nothing is number 0.
SpooledJob jobOf(const QString& line)
{
    static const QRegularExpression pattern(
        QStringLiteral("^job=(\\d+) printer=(\\S*) media=(\\S*) sides=(\\S*) copies=(\\S*) "
                       "format=(\\S*) state=\\S* title=(.*)$"));
    const QRegularExpressionMatch match = pattern.match(line);
    if (!match.hasMatch())
        return {};
    return { match.captured(1).toInt(), match.captured(2), match.captured(3), match.captured(4),
        match.captured(5), match.captured(6), match.captured(7) };
}

} // namespace

PrivateCups::PrivateCups(int fileKib)
{
    const QByteArray server = (folder() + QStringLiteral("/cups.sock")).toUtf8();
    cupsSetServer(server.constData());
    qputenv("PATH", qgetenv("PATH") + ":/usr/sbin:/sbin");
    qputenv("CUPS_SERVER", server);
    qputenv("CUPS_SERVERROOT", (folder() + QStringLiteral("/etc")).toUtf8());
    qputenv("HOME", folder().toUtf8());
    qputenv("PRIVATE_CUPS_FILE_KIB", fileKib > 0 ? QByteArray::number(fileKib) : QByteArray());
    process_.setProcessChannelMode(QProcess::MergedChannels);
    process_.start(testsFolder() + QStringLiteral("/support/private_cups.sh"), { folder() });
    failure_ = waitUntilReady();
}

PrivateCups::~PrivateCups() { stop(); }

QString PrivateCups::waitUntilReady()
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < StartMs && !process_.waitForFinished(PauseMs)) {
        const ProgramResult result = runProgram(QStringLiteral("lpstat"), { QStringLiteral("-r") });
        if (result.status == -1)
            return QStringLiteral("lpstat not found: install the package cups-client");
        if (result.output.contains(QStringLiteral("is running")))
            return {};
    }
    return QStringLiteral("the scheduler does not run: ") + QString::fromUtf8(process_.readAll());
}

bool PrivateCups::addPrinter(const QString& name)
{
    return addDescribedPrinter(name, testsFolder() + QStringLiteral("/data/forms.ppd"));
}

bool PrivateCups::addPrinter(const QString& name, const std::vector<Change>& changes)
{
    QFile described(testsFolder() + QStringLiteral("/data/forms.ppd"));
    QFile changed(folder() + QLatin1Char('/') + name + QStringLiteral(".ppd"));
    if (!described.open(QIODevice::ReadOnly) || !changed.open(QIODevice::WriteOnly))
        return false;
    QByteArray text = described.readAll();
    for (const Change& change : changes) {
        if (!text.contains(change.from))
            return false;
        text.replace(change.from, change.to);
    }
    changed.write(text);
    changed.close();
    return addDescribedPrinter(name, changed.fileName());
}

bool PrivateCups::addDescribedPrinter(const QString& name, const QString& description)
{
    return command(QStringLiteral("lpadmin"),
        { QStringLiteral("-p"), name, QStringLiteral("-E"), QStringLiteral("-v"),
            QStringLiteral("file:/dev/null"), QStringLiteral("-P"), description,
            QStringLiteral("-o"), QStringLiteral("sides-default=two-sided-long-edge") });
}

bool PrivateCups::command(const QString& program, const QStringList& arguments)
{
    return runProgram(program, arguments).status == 0;
}

std::vector<SpooledJob> PrivateCups::jobs()
{
    const QStringList open { QStringLiteral("-W"), QStringLiteral("not-completed"),
        QStringLiteral("-o") };
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < JobsMs
        && !runProgram(QStringLiteral("lpstat"), open).output.trimmed().isEmpty())
        QThread::msleep(PauseMs);
    std::vector<SpooledJob> jobs;
    QFile log(folder() + QStringLiteral("/log/page_log"));
    if (log.open(QIODevice::ReadOnly)) {
        for (const QString& line : QString::fromUtf8(log.readAll()).split(u'\n')) {
            if (const SpooledJob job = jobOf(line); job.number > 0)
                jobs.push_back(job);
        }
    }
    std::sort(jobs.begin(), jobs.end(),
        [](const SpooledJob& one, const SpooledJob& other) { return one.number < other.number; });
    return jobs;
}

QString PrivateCups::documentOf(int job) const
{
    return QStringLiteral("%1/spool/d%2-001").arg(folder()).arg(job, 5, 10, QChar(u'0'));
}

QString PrivateCups::folder() const { return QString::fromStdString(folder_.path().string()); }

void PrivateCups::stop()
{
    if (process_.state() == QProcess::NotRunning)
        return;
    process_.terminate();
    if (!process_.waitForFinished(StartMs))
        process_.kill();
    process_.waitForFinished(StartMs);
}

} // namespace pelloric::qt
