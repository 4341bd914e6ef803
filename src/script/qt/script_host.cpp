// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_host.h"

#include "controls/canvas.h"
#include "platform/numbers.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "script/qt/script_controls.h"
#include "script/qt/script_engine_caller.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QEventLoop>
#include <QFile>

#include <algorithm>
#include <array>
#include <cstdio>
#include <functional>

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

/// What the script finds besides the language itself.
constexpr auto Prelude = R"js(
(function (global, host, argumentList) {
    const enumerations = {
        OrderStyle: { Whole: 0, One: 1, Two: 2, Four: 3, Multiple: 4, UserCustom: 5, Six: 6 },
        PrintObjKind: { MSHFlexGrid: 0, MSFlexGrid: 1, ListView: 2, datagrid: 3 },
        AlignmentType: { LocLeft: 0, LocCenter: 1, LocRight: 2 },
    };
    const records = {
        Tpoint: { x: 0, y: 0 },
        Lineobj: { pt1: null, pt2: null, LineStyle: 0, LineColor: 0, LineWidth: 1, FillStyle: 1,
            FillColor: 0 },
        Textobj: { pt: null, Str: "", prnFont: null, ForeColor: 0 },
        MapLocation: { nLeft: 0, nTop: 0, nWidth: 0, nHeight: 0, nFJBH: "", strFilePath: "" },
        ColPos: { StartCol: 0, EndCol: 0 },
        MuliPageType: { nPages: 0, MinPage: 0, MaxPage: 0 },
    };
    const define = (name, value) => Object.defineProperty(global, name, { value });
    const control = (make, constants) => {
        const constructor = function () {
            return Object.preventExtensions(make());
        };
        return Object.assign(constructor, constants);
    };
    for (const name in enumerations)
        define(name, Object.freeze(enumerations[name]));
    for (const name in records)
        define(name, function (values) { return Object.assign(this, records[name], values); });
    define("Sorvane", control(() => host.newSorvane(), enumerations.OrderStyle));
    define("Kestrane", control(() => host.newKestrane(), enumerations.AlignmentType));
    define("args", Object.freeze(argumentList));
    define("print", (...values) => host.print(values.map(String).join(" ")));
    define("exit", (status = 0) => host.exit(status));
    define("csv", (path) => host.csv(path));
    define("sqlite", (path, source) => host.sqlite(path, source));
    define("wait", (milliseconds) => host.wait(milliseconds));
    define("lines", (canvas, page) => host.lines(canvas, page));
    define("texts", (canvas, page) => host.texts(canvas, page));
    define("placePicture", (canvas, page, picture) => host.placePicture(canvas, page, picture));
    const messages = [];
    Object.defineProperty(global, "messages", {
        get: () => { messages.push(...host.takeMessages()); return messages; },
    });
})
)js";

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
        throw RunTimeError(ErrorNumber::TypeMismatch, u"a Sorvane was expected");
    return control->canvas();
}

} // namespace

ScriptHost::ScriptHost(QtPlatform& platform, ScriptTables& tables)
    : platform_(platform)
    , tables_(tables)
    , messages_(std::make_unique<ScriptMessages>())
{
    letScriptsCall();
    platform_.useMessages(*messages_);
}

ScriptHost::~ScriptHost() = default;

int ScriptHost::run(const QString& path, const QStringList& arguments)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        std::fprintf(stderr, "pelloric: cannot read the script %s: %s\n", qPrintable(path),
            qPrintable(file.errorString()));
        return 1;
    }
    return runText(QString::fromUtf8(file.readAll()), path, arguments);
}

int ScriptHost::runText(const QString& text, const QString& name, const QStringList& arguments)
{
    exitStatus_.reset();
    engine_ = std::make_unique<QJSEngine>();
    engine_->installExtensions(QJSEngine::ConsoleExtension);
    QJSValue result = evaluatePrelude(arguments);
    QStringList trace; // a script may throw what is no error, a text for example
    if (!result.isError())
        result = engine_->evaluate(text, name, 1, &trace);
    const bool isThrown = result.isError() || !trace.isEmpty();
    const int status = exitStatus_ ? *exitStatus_ : isThrown ? report(result, name) : 0;
    engine_.reset();
    return status;
}

QJSValue ScriptHost::evaluatePrelude(const QStringList& arguments)
{
    QJSValue list = engine_->newArray(static_cast<uint>(arguments.size()));
    for (qsizetype index = 0; index < arguments.size(); ++index)
        list.setProperty(static_cast<quint32>(index), arguments[index]);
    QJSEngine::setObjectOwnership(this, QJSEngine::CppOwnership);
    const QJSValue prelude = engine_->evaluate(QString::fromUtf8(Prelude));
    return prelude.isError()
        ? prelude
        : prelude.call({ engine_->globalObject(), engine_->newQObject(this), list });
}

int ScriptHost::report(const QJSValue& error, const QString& name)
{
    const QJSValue number = error.property(QStringLiteral("number"));
    const QString kind
        = number.isNumber() ? QStringLiteral(" (error %1)").arg(number.toInt()) : QString();
    std::fprintf(stderr, "%s:%d: %s%s\n", qPrintable(name),
        error.property(QStringLiteral("lineNumber")).toInt(), qPrintable(error.toString()),
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
    const QByteArray bytes = line.toUtf8();
    std::printf("%s\n", bytes.constData());
    std::fflush(stdout);
}

void ScriptHost::exit(int status)
{
    exitStatus_ = status;
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

QJSValue ScriptHost::newSorvane() { return engine_->newQObject(new ScriptSorvane(platform_)); }

QJSValue ScriptHost::newKestrane() { return engine_->newQObject(new ScriptKestrane(platform_)); }

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
