// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <memory>

class QObject;

namespace pelloric {

class RunTimeError;
struct Platform;

} // namespace pelloric

namespace pelloric::qt {

/// The trap that every published member of a control runs under.
///
/// An error that reaches it ends there: as an error of the script when the control
/// belongs to a script engine, else as one message box. What the user has ended needs no box.
///
/// Some members let messages run, and a host may delete the control in them: the parts that
/// members work on stay until the last member that runs is through. A member takes them before
/// messages can run, and touches nothing else of the control afterwards.
class MemberCalls {
public:
    /// @param control   whose members they are; borrowed
    /// @param parts     what the members work on, the platform among it
    /// @param platform  has the message boxes
    /// @param restore   shows what is left of the control's state after an error
    MemberCalls(QObject& control, std::shared_ptr<void> parts, Platform& platform,
        std::function<void()> restore);

    /// Runs a member that the host calls; nothing leaves it.
    void run(const std::function<void()>& member);

    /// Runs a step that nobody waits for, as a window's events are; its error ends it without a
    /// word.
    static void endQuietly(const std::function<void()>& step);

    /// Refuses to read a property that can only be written: a script gets an error.
    void refuseRead(const char* name);

private:
    void report(const RunTimeError& error);

    QObject& control_;
    std::shared_ptr<void> parts_;
    Platform& platform_;
    std::function<void()> restore_;
};

} // namespace pelloric::qt
