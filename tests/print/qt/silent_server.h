// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/temp_folder.h"

#include <QByteArray>

namespace pelloric::qt {

/// A print server that takes connections and never answers; programs and this process reach it as
/// long as the object lives.
class SilentServer {
public:
    SilentServer();
    ~SilentServer();
    SilentServer(const SilentServer&) = delete;
    SilentServer& operator=(const SilentServer&) = delete;

    bool isListening() const { return listener_ >= 0; }

private:
    TempFolder folder_;
    QByteArray before_; ///< what CUPS_SERVER was
    int listener_ = -1;
};

} // namespace pelloric::qt
