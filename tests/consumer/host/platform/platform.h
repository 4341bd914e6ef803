// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// A header of the host that is called as one of the library's own.
inline int ownPlatform() { return 42; }
