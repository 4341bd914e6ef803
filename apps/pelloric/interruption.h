// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric::qt {
class QtMessageLoop;
}

namespace pelloric::app {

/// Lets Ctrl+C end the work that is under way cleanly, as long as the object lives; there is one.
///
/// A layout ends at its next turn of the loop; other work asks now and then whether to go on.
class Interruption {
public:
    /// @param loop  borrowed
    explicit Interruption(qt::QtMessageLoop& loop);
    ~Interruption();
    Interruption(const Interruption&) = delete;
    Interruption& operator=(const Interruption&) = delete;

    /// The signal that asked to end; 0 when none did.
    static int signal();

    static bool mayGoOn() { return signal() == 0; }

    /// As long as it lives, Ctrl+C ends the program at once: for work that cannot be asked to end,
    /// such as waiting for a pipe or a long query, and that leaves nothing behind.
    class AtOnce {
    public:
        AtOnce();
        ~AtOnce();
        AtOnce(const AtOnce&) = delete;
        AtOnce& operator=(const AtOnce&) = delete;
    };
};

} // namespace pelloric::app
