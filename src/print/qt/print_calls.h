// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

#include <chrono>
#include <functional>
#include <memory>
#include <optional>

namespace pelloric::qt {

/// A call into the print system that runs beside its caller.
class PrintCall {
public:
    virtual ~PrintCall() = default;

    /// Waits until the call has ended.
    /// @param patience  at most this long, the time that `turn` takes left out
    /// @param turn      called again and again meanwhile; may be empty
    /// @return  whether it has ended
    /// @throws what the call has thrown
    virtual bool wait(std::chrono::milliseconds patience, const std::function<void()>& turn) = 0;

    /// Why the print system was not called, in plain words; empty: it was. Of an ended call.
    virtual QString silence() const = 0;
};

/// Calls into the print system, which may never answer.
///
/// They run one after the other on a thread of their own, and each has a deadline; a call that
/// misses it goes on by itself and the next ones do without it. So what a call works on must belong
/// to it. Before each call the system is asked for a sign of life.
class PrintCalls {
public:
    /// How long a question may take.
    static constexpr std::chrono::milliseconds Patience { 3000 };

    PrintCalls();
    ~PrintCalls();
    PrintCalls(const PrintCalls&) = delete;
    PrintCalls& operator=(const PrintCalls&) = delete;

    /// What is done again and again while a call is waited for; it must not throw.
    void whileWaiting(std::function<void()> turn) { turn_ = std::move(turn); }

    /// Begins a call that nobody waits for yet.
    std::shared_ptr<PrintCall> begin(std::function<void()> work);

    /// The answer of a call; nothing when the print system is silent, of which `trouble` tells.
    /// @throws what the call throws
    template <typename Answer>
    std::optional<Answer> ask(
        std::function<Answer()> call, std::chrono::milliseconds patience = Patience)
    {
        const auto answer = std::make_shared<std::optional<Answer>>();
        const bool isAnswered = run([answer, call] { *answer = call(); }, patience);
        return isAnswered ? *answer : std::nullopt;
    }

    /// Why the last call got no answer, in plain words.
    const QString& trouble() const { return trouble_; }

private:
    class Line;

    bool run(std::function<void()> work, std::chrono::milliseconds patience);

    std::shared_ptr<Line> line_; ///< the thread that takes calls now
    std::function<void()> turn_;
    QString trouble_;
    std::chrono::steady_clock::time_point silentUntil_ {}; ///< nothing is asked before
};

/// How the silence of a print system is told after a time.
QString silenceAfter(std::chrono::milliseconds time);

} // namespace pelloric::qt
