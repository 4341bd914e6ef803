// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#if defined(__unix__)

#include <unistd.h>

namespace pelloric {

/// Whose rights hold for a user who is no administrator; until it dies.
class OtherUser {
public:
    OtherUser()
    {
        if (user_ == 0 && seteuid(Nobody) != 0)
            _exit(1);
    }

    ~OtherUser()
    {
        if (user_ == 0 && seteuid(user_) != 0)
            _exit(1);
    }

    OtherUser(const OtherUser&) = delete;
    OtherUser& operator=(const OtherUser&) = delete;

private:
    static constexpr uid_t Nobody = 65534;

    uid_t user_ = geteuid();
};

} // namespace pelloric

#endif
