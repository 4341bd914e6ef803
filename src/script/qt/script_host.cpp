// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_host.h"

#include "controls/canvas.h"
#include "controls/member_table.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "script/qt/script_controls.h"
#include "script/qt/script_prelude.h"
#include "ui/qt/preview_window.h"
#include <pelloric/preview.h>

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QEventLoop>
#include <QMap>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <functional>
#include <iterator>

namespace pelloric::qt {

/// Keeps the message boxes for the script; each is answered OK at once.
class ScriptMessages final : public MessageService {
public:
    void show(const Message& message) override { shown.push_back(message); }

    std::vector<Message> shown;
};

namespace {

constexpr int LongestWait = 10'000; ///< milliseconds
constexpr auto ExitMark = "pelloric: the script asked to end";

constexpr const char* OwnMembers[] = { "grab", "resize" }; ///< of a control that a script made

/// How a script may use a member of a control.
struct MemberUse {
    bool reads = false;
    bool writes = false;
    bool calls = false; ///< an event is used as a member that is called, too
};

void addUse(MemberUse& use, MemberKind kind)
{
    use.reads = use.reads || kind == MemberKind::Field || kind == MemberKind::PropertyGet;
    use.writes = use.writes || kind == MemberKind::Field || kind == MemberKind::PropertyPut;
    use.calls = use.calls || kind == MemberKind::Method || kind == MemberKind::Event;
}

/// By name; a property that is read and written is one member.
QMap<QString, MemberUse> usesOf(std::span<const MemberRow> table)
{
    QMap<QString, MemberUse> uses;
    for (const MemberRow& row : table)
        addUse(uses[QString::fromLatin1(row.name.data(), std::ssize(row.name))], row.kind);
    return uses;
}

QString iconName(MessageIcon icon)
{
    switch (icon) {
    case MessageIcon::Information:
        return QStringLiteral("information");
    case MessageIcon::Critical:
        return QStringLiteral("critical");
    case MessageIcon::None:
        break;
    }
    return {};
}

/// A published record: an object made by its constructor in the script.
QJSValue record(QJSEngine& engine, const char* name)
{
    return engine.globalObject().property(QLatin1String(name)).callAsConstructor();
}

QJSValue pointRecord(QJSEngine& engine, Tpoint point)
{
    QJSValue value = record(engine, "Tpoint");
    value.setProperty(QStringLiteral("x"), point.x);
    value.setProperty(QStringLiteral("y"), point.y);
    return value;
}

QJSValue lineRecord(QJSEngine& engine, const Lineobj& line)
{
    QJSValue value = record(engine, "Lineobj");
    value.setProperty(QStringLiteral("pt1"), pointRecord(engine, line.pt1));
    value.setProperty(QStringLiteral("pt2"), pointRecord(engine, line.pt2));
    value.setProperty(QStringLiteral("LineStyle"), line.LineStyle);
    value.setProperty(QStringLiteral("LineColor"), line.LineColor);
    value.setProperty(QStringLiteral("LineWidth"), line.LineWidth);
    value.setProperty(QStringLiteral("FillStyle"), line.FillStyle);
    value.setProperty(QStringLiteral("FillColor"), line.FillColor);
    return value;
}

QJSValue fontRecord(QJSEngine& engine, const Font& font)
{
    QJSValue value = engine.newObject();
    value.setProperty(QStringLiteral("Name"), toQString(font.name));
    value.setProperty(QStringLiteral("Size"), static_cast<double>(font.size));
    value.setProperty(QStringLiteral("Bold"), font.bold);
    value.setProperty(QStringLiteral("Italic"), font.italic);
    return value;
}

QJSValue textRecord(QJSEngine& engine, const Textobj& text)
{
    QJSValue value = record(engine, "Textobj");
    value.setProperty(QStringLiteral("pt"), pointRecord(engine, text.pt));
    value.setProperty(QStringLiteral("Str"), toQString(text.Str));
    value.setProperty(QStringLiteral("prnFont"), fontRecord(engine, text.prnFont));
    value.setProperty(QStringLiteral("ForeColor"), text.ForeColor);
    return value;
}

MapLocation pictureOf(const QJSValue& value)
{
    const auto shortOf = [&](const char* name) {
        return roundToInt16(value.property(QLatin1String(name)).toNumber());
    };
    const auto textOf
        = [&](const char* name) { return toText(value.property(QLatin1String(name)).toString()); };
    return { shortOf("nLeft"), shortOf("nTop"), shortOf("nWidth"), shortOf("nHeight"),
        textOf("nFJBH"), textOf("strFilePath") };
}

Canvas& canvasOf(QObject* object)
{
    auto* const control = qobject_cast<Sorvane*>(object);
    if (control == nullptr)
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"a Sorvane was expected"));
    return control->canvas();
}

} // namespace

ScriptHost::ScriptHost(QtPlatform& platform, ScriptTables& tables, ScriptWindows windows)
    : platform_(platform)
    , tables_(tables)
    , windows_(windows)
    , opener_(platform)
    , messages_(std::make_unique<ScriptMessages>())
{
    letScriptsCall();
    platform_.useMessages(*messages_);
    opener_.setShowing(windows == ScriptWindows::Shown);
}

ScriptHost::~ScriptHost() = default;

int ScriptHost::run(const QString& path, const QStringList& arguments)
{
    std::ifstream file(pathOf(path), std::ios::binary);
    const std::string bytes { std::istreambuf_iterator<char>(file), {} };
    if (!file.is_open() || file.bad()) {
        std::fprintf(stderr, "pelloric: cannot read the script %s: %s\n", qPrintable(path),
            std::strerror(errno));
        return 1;
    }
    return runText(QString::fromStdString(bytes), path, arguments);
}

int ScriptHost::runText(const QString& text, const QString& name, const QStringList& arguments)
{
    exitStatus_.reset();
    isOutputLost_ = false;
    engine_ = std::make_unique<QJSEngine>();
    engine_->installExtensions(QJSEngine::ConsoleExtension);
    QJSValue result = evaluatePrelude(arguments);
    QStringList trace; // a script may throw what is no error, a text for example
    if (!result.isError()) {
        const QJSValue promises = result;
        result = engine_->evaluate(text, name, 1, &trace);
        if (!exitStatus_)
            status_ = result.isError() || !trace.isEmpty() ? report(result, name) : 0;
        if (!exitStatus_)
            status_ = std::max(status_, reportRejections(promises, name));
        if (!exitStatus_ && status_ == 0)
            waitForWindows();
    } else {
        status_ = report(result, name);
    }
    const int status = exitStatus_.value_or(status_);
    engine_.reset();
    return isOutputLost_ ? std::max(status, 1) : status;
}

/// @return  a function that tells about promises
QJSValue ScriptHost::evaluatePrelude(const QStringList& arguments)
{
    QJSValue list = engine_->newArray(static_cast<uint>(arguments.size()));
    for (qsizetype index = 0; index < arguments.size(); ++index)
        list.setProperty(static_cast<quint32>(index), arguments[index]);
    QJSEngine::setObjectOwnership(this, QJSEngine::CppOwnership);
    const QJSValue prelude = engine_->evaluate(
        QString::fromUtf8(ScriptPrelude), QString::fromLatin1(ScriptPreludeName));
    return prelude.isError()
        ? prelude
        : prelude.call({ engine_->globalObject(), engine_->newQObject(this), list });
}

/// Lets promises settle until none does any more, then reports those that were rejected and that
/// nobody looked after.
int ScriptHost::reportRejections(const QJSValue& promises, const QString& name)
{
    QJSValue outcome = promises.call();
    for (int settled = -1; !exitStatus_;) {
        const int now = outcome.property(QStringLiteral("settled")).toInt();
        if (now == settled)
            break;
        settled = now;
        QCoreApplication::sendPostedEvents();
        outcome = promises.call();
    }
    const QJSValue reasons = outcome.property(QStringLiteral("reasons"));
    const int count = reasons.property(QStringLiteral("length")).toInt();
    for (int at = 0; at < count; ++at)
        report(reasons.property(static_cast<quint32>(at)), name, "a promise was rejected: ");
    return count > 0 ? 1 : 0;
}

/// Until the person in front of it has closed the preview window.
void ScriptHost::waitForWindows()
{
    while (windows_ == ScriptWindows::Shown && opener_.window() != nullptr && !exitStatus_)
        QCoreApplication::processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents);
}

int ScriptHost::report(const QJSValue& error, const QString& name, const char* what)
{
    const QJSValue number = error.property(QStringLiteral("number"));
    const QString kind
        = number.isNumber() ? QStringLiteral(" (error %1)").arg(number.toInt()) : QString();
    std::fprintf(stderr, "%s:%d: %s%s%s\n", qPrintable(name),
        error.property(QStringLiteral("lineNumber")).toInt(), what, qPrintable(error.toString()),
        qPrintable(kind));
    return 1;
}

/// An error of the library becomes an exception of the script.
QJSValue ScriptHost::answer(const std::function<QJSValue()>& call)
{
    try {
        return call();
    } catch (const RunTimeError& error) {
        QJSValue thrown = engine_->newErrorObject(QJSValue::GenericError, toQString(error.text()));
        thrown.setProperty(QStringLiteral("number"), static_cast<int>(error.number()));
        engine_->throwError(thrown);
    }
    return {};
}

void ScriptHost::print(const QString& line)
{
    const QByteArray bytes = line.toUtf8() + '\n';
    errno = 0;
    const bool isWritten
        = std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), stdout)
            == static_cast<std::size_t>(bytes.size())
        && std::fflush(stdout) == 0;
    if (isWritten)
        return;
    const QString reason = QString::fromLocal8Bit(std::strerror(errno));
    if (!isOutputLost_)
        std::fprintf(stderr, "pelloric: what the script prints is lost: %s\n", qPrintable(reason));
    isOutputLost_ = true;
    engine_->throwError(QStringLiteral("print: cannot write: ") + reason);
}

void ScriptHost::exit(double status)
{
    constexpr double MostStatus = 255;
    if (!(status >= 0 && status <= MostStatus) || status != std::floor(status)) {
        engine_->throwError(QStringLiteral("exit: a status is a whole number from 0 to 255"));
        return;
    }
    exitStatus_ = static_cast<int>(status);
    engine_->setInterrupted(true);
    engine_->throwError(QString::fromLatin1(ExitMark));
}

QJSValue ScriptHost::csv(const QString& path)
{
    return answer([&] { return engine_->newQObject(tables_.csv(path)); });
}

QJSValue ScriptHost::sqlite(const QString& path, const QString& tableOrQuery)
{
    return answer([&] { return engine_->newQObject(tables_.sqlite(path, tableOrQuery)); });
}

QJSValue ScriptHost::newControl(const QString& kind)
{
    if (kind == QLatin1String("Sorvane"))
        return engine_->newQObject(new ScriptSorvane(platform_));
    auto* const facade = new ScriptKestrane(platform_);
    facade->setPreviewOpener(&opener_);
    return engine_->newQObject(facade);
}

QJSValue ScriptHost::members(const QString& kind)
{
    const bool isFacade = kind == QLatin1String("Kestrane");
    QMap<QString, MemberUse> uses = isFacade ? usesOf(KestraneMembers) : usesOf(SorvaneMembers);
    if (kind != QLatin1String("PreviewCanvas")) {
        for (const char* const name : OwnMembers)
            uses[QString::fromLatin1(name)].calls = true;
    }
    QJSValue list = engine_->newArray(static_cast<uint>(uses.size()));
    quint32 index = 0;
    for (auto use = uses.begin(); use != uses.end(); ++use) {
        QJSValue entry = engine_->newObject();
        entry.setProperty(QStringLiteral("name"), use.key());
        entry.setProperty(QStringLiteral("reads"), use->reads);
        entry.setProperty(QStringLiteral("writes"), use->writes);
        entry.setProperty(QStringLiteral("calls"), use->calls);
        list.setProperty(index++, entry);
    }
    return list;
}

QString ScriptHost::refusal(const QString& name)
{
    return toQString(RunTimeError(ErrorNumber::NoSuchMember, viewOf(name)).text());
}

QJSValue ScriptHost::previewCanvas()
{
    PreviewWindow* const window = opener_.window();
    if (window == nullptr)
        return QJSValue(QJSValue::NullValue);
    Sorvane& canvas = window->canvas();
    QJSEngine::setObjectOwnership(&canvas, QJSEngine::CppOwnership);
    return engine_->newQObject(&canvas);
}

void ScriptHost::wait(int milliseconds)
{
    const QDeadlineTimer deadline(std::clamp(milliseconds, 0, LongestWait));
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
    } while (!deadline.hasExpired());
}

QJSValue ScriptHost::lines(QObject* canvas, int page)
{
    return answer([&] {
        const PageDocument& document = canvasOf(canvas).document();
        const auto count = static_cast<uint>(document.lines(page).size());
        QJSValue list = engine_->newArray(count);
        for (uint index = 0; index < count; ++index)
            list.setProperty(index, lineRecord(*engine_, document.line(page, index)));
        return list;
    });
}

QJSValue ScriptHost::texts(QObject* canvas, int page)
{
    return answer([&] {
        const PageDocument& document = canvasOf(canvas).document();
        const auto count = static_cast<uint>(document.texts(page).size());
        QJSValue list = engine_->newArray(count);
        for (uint index = 0; index < count; ++index)
            list.setProperty(index, textRecord(*engine_, document.text(page, index)));
        return list;
    });
}

void ScriptHost::placePicture(QObject* canvas, int page, const QJSValue& picture)
{
    answer([&] {
        canvasOf(canvas).document().placePicture(page, pictureOf(picture));
        static_cast<Sorvane*>(canvas)->update();
        return QJSValue();
    });
}

QJSValue ScriptHost::takeMessages()
{
    QJSValue list = engine_->newArray(static_cast<uint>(messages_->shown.size()));
    quint32 index = 0;
    for (const Message& message : std::exchange(messages_->shown, {})) {
        QJSValue entry = engine_->newObject();
        entry.setProperty(QStringLiteral("text"), toQString(message.text));
        entry.setProperty(QStringLiteral("title"),
            message.title ? QJSValue(toQString(*message.title)) : QJSValue(QJSValue::NullValue));
        entry.setProperty(QStringLiteral("icon"), iconName(message.icon));
        list.setProperty(index++, entry);
    }
    return list;
}

} // namespace pelloric::qt
