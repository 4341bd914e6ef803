// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/silent_server.h"

#include <QtGlobal>

#include <cups/cups.h>

#include <cstring>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace pelloric::qt {

SilentServer::SilentServer()
    : before_(qgetenv("CUPS_SERVER"))
{
    const std::string path = (folder_.path() / "silent.sock").string();
    sockaddr_un address {};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, path.c_str(), sizeof address.sun_path - 1);
    const int socket = ::socket(AF_UNIX, SOCK_STREAM, 0);
    // The system takes connections for it as long as this many wait; nobody reads them.
    constexpr int Waiting = 100;
    if (::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0
        && ::listen(socket, Waiting) == 0)
        listener_ = socket;
    qputenv("CUPS_SERVER", path.c_str());
    cupsSetServer(path.c_str());
}

SilentServer::~SilentServer()
{
    ::close(listener_);
    qputenv("CUPS_SERVER", before_);
    cupsSetServer(nullptr);
}

} // namespace pelloric::qt
