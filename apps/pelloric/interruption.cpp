// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "interruption.h"

#include "command_line.h"
#include "platform/qt/qt_services.h"

#include <atomic>
#include <csignal>
#include <cstdlib>

namespace pelloric::app {

namespace {

constexpr int Signals[] = { SIGINT, SIGTERM };

std::atomic<int> received = 0;
std::atomic<bool> endsAtOnce = false;
std::atomic<qt::QtMessageLoop*> loopToEnd = nullptr;
static_assert(std::atomic<int>::is_always_lock_free);
static_assert(std::atomic<bool>::is_always_lock_free);
static_assert(std::atomic<qt::QtMessageLoop*>::is_always_lock_free);

extern "C" void endWork(int signal)
{
    received = signal;
    if (endsAtOnce)
        std::_Exit(SignalBase + signal);
    if (qt::QtMessageLoop* const loop = loopToEnd)
        loop->cancel();
}

} // namespace

Interruption::Interruption(qt::QtMessageLoop& loop)
{
    loopToEnd = &loop;
    for (const int signal : Signals)
        std::signal(signal, &endWork);
}

Interruption::~Interruption()
{
    for (const int signal : Signals)
        std::signal(signal, SIG_DFL);
    loopToEnd = nullptr;
}

int Interruption::signal() { return received; }

Interruption::AtOnce::AtOnce() { endsAtOnce = true; }

Interruption::AtOnce::~AtOnce() { endsAtOnce = false; }

} // namespace pelloric::app
