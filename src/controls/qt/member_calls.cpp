// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/member_calls.h"

#include "controls/messages.h"
#include "controls/qt/script_caller.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/services.h"

#include <QObject>
#include <QPointer>

namespace pelloric::qt {

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
    if (const ScriptCaller* const caller = scriptCaller())
        caller->raise(control_, RunTimeError(ErrorNumber::NoSuchMember, fromUtf8(name)));
}

void MemberCalls::report(const RunTimeError& error)
{
    restore_();
    const ScriptCaller* const caller = scriptCaller();
    if (caller == nullptr || !caller->raise(control_, error))
        platform_.messages.show(messageOf(error));
}

} // namespace pelloric::qt
