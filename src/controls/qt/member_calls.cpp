// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/member_calls.h"

#include "controls/messages.h"
#include "controls/qt/script_caller.h"
#include "platform/platform.h"
#include "platform/qt/qt_services.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/services.h"

#include <QObject>
#include <QPointer>
#include <QWidget>

namespace pelloric::qt {

MemberCalls::MemberCalls(QObject& control, std::shared_ptr<void> parts, Platform& platform,
    std::function<void()> restore)
    : control_(control)
    , parts_(std::move(parts))
    , platform_(platform)
    , restore_(std::move(restore))
{
}

/// Of a control that was deleted meanwhile nobody is told.
void MemberCalls::run(const std::function<void()>& member)
{
    const std::shared_ptr<void> alive = parts_;
    const QPointer<QObject> control(&control_);
    if (auto* const widget = qobject_cast<QWidget*>(&control_))
        setMessageSubject(widget->window());
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
    if (caller != nullptr && caller->raise(control_, error))
        return;
    if (error.number() != ErrorNumber::Cancelled)
        platform_.messages.show(messageOf(error));
}

} // namespace pelloric::qt
