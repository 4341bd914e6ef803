// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "stack_guard.h"

#include "command_line.h"
#include "platform/qt/qt_phrase.h"

#include <algorithm>

#ifdef Q_OS_UNIX

#include <sys/resource.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdint>
#include <string>

namespace pelloric::app {

namespace {

/// As far as the address space that every process keeps free for its stack allows.
constexpr rlim_t StackBytes = 120U << 20U;

/// How far from the end of the stack a function may touch it first.
constexpr std::uintptr_t Reach = 4U << 20U;

/// What the handler of a signal may read.
struct StackEnd {
    std::uintptr_t lowest = 0; ///< address
    std::string message;
};

StackEnd& stackEnd()
{
    static StackEnd end;
    return end;
}

/// Whether an address lies at the end of the program's stack, or on a page that nobody may touch,
/// such as the one at the end of the engine's own stack.
bool isBehindAStack(const siginfo_t& fault)
{
    const auto at = reinterpret_cast<std::uintptr_t>(fault.si_addr);
    const std::uintptr_t lowest = stackEnd().lowest;
    if (at + Reach >= lowest && at <= lowest + Reach)
        return true;
    errno = 0;
    return fault.si_code == SEGV_ACCERR
        && access(static_cast<const char*>(fault.si_addr), F_OK) != 0 && errno == EFAULT;
}

/// Any other fault happens again, to the system's own handler.
void tellOverflow(int signal, siginfo_t* fault, void*)
{
    const StackEnd& end = stackEnd();
    if (!isBehindAStack(*fault)) {
        std::signal(signal, SIG_DFL);
        return;
    }
    const auto told = write(STDERR_FILENO, end.message.data(), end.message.size());
    _exit(told < 0 ? Failed + 1 : Failed);
}

/// The handler has a stack of its own, for there is nothing left of the other one.
void handleOverflow()
{
    static std::array<char, 1U << 16U> room;
    stack_t stack {};
    stack.ss_sp = room.data();
    stack.ss_size = room.size();
    struct sigaction action { };
    action.sa_sigaction = tellOverflow;
    action.sa_flags = SA_SIGINFO | SA_ONSTACK;
    if (sigaltstack(&stack, nullptr) == 0)
        sigaction(SIGSEGV, &action, nullptr);
}

} // namespace

void guardStack()
{
    rlimit limit {};
    if (getrlimit(RLIMIT_STACK, &limit) != 0)
        return;
    if (limit.rlim_cur < StackBytes) {
        limit.rlim_cur = std::min(limit.rlim_max, StackBytes);
        setrlimit(RLIMIT_STACK, &limit);
    }
    if (limit.rlim_cur == RLIM_INFINITY)
        return;
    const char here = 0;
    stackEnd() = { reinterpret_cast<std::uintptr_t>(&here) - limit.rlim_cur,
        "pelloric: "
            + qt::phrased(u"the script nests values deeper than its stack holds").toStdString()
            + "\n" };
#if !defined(__SANITIZE_ADDRESS__) // which tells of it itself
    handleOverflow();
#endif
}

} // namespace pelloric::app

#else

namespace pelloric::app {

void guardStack() { }

} // namespace pelloric::app

#endif
