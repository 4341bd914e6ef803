// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/member_calls.h"

#include "controls/messages.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/services.h"

#include <QJSEngine>
#include <QObject>
#include <QPointer>

namespace pelloric::qt {

namespace {

QJSValue::ErrorType scriptError(ErrorNumber number)
{
    switch (number) {
    case ErrorNumber::Overflow:
    case ErrorNumber::SubscriptOutOfRange:
        return QJSValue::RangeError;
    case ErrorNumber::TypeMismatch:
        return QJSValue::TypeError;
    default:
        return QJSValue::GenericError;
    }
}

void throwInScript(QJSEngine& engine, const RunTimeError& error)
{
    QJSValue thrown = engine.newErrorObject(scriptError(error.number()), toQString(error.text()));
    thrown.setProperty(QStringLiteral("number"), static_cast<int>(error.number()));
    engine.throwError(thrown);
}

} // namespace

MemberCalls::MemberCalls(QObject& control, Platform& platform, std::function<void()> restore)
    : control_(control)
    , platform_(platform)
    , restore_(std::move(restore))
{
}

/// A host may delete the control while its member lets messages run: nobody is told then.
void MemberCalls::run(const std::function<void()>& member)
{
    const QPointer<QObject> control(&control_);
    try {
        member();
    } catch (const RunTimeError& error) {
        if (control)
            report(error);
    } catch (const std::exception& error) {
        if (control)
            report(RunTimeError(ErrorNumber::InvalidCall, fromUtf8(error.what())));
    }
}

void MemberCalls::endQuietly(const std::function<void()>& step)
{
    try {
        step();
    } catch (const std::exception&) {
        // The step is over; what it had done by then stays.
    }
}

void MemberCalls::refuseRead(const char* name)
{
    if (QJSEngine* const engine = qjsEngine(&control_))
        throwInScript(*engine, RunTimeError(ErrorNumber::NoSuchMember, fromUtf8(name)));
}

void MemberCalls::report(const RunTimeError& error)
{
    restore_();
    if (QJSEngine* const engine = qjsEngine(&control_))
        throwInScript(*engine, error);
    else
        platform_.messages.show(messageOf(error));
}

} // namespace pelloric::qt
