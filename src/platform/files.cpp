// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/files.h"

#include <cerrno>

namespace pelloric {

FileFault faultOf(int error)
{
    switch (error) {
    case EEXIST:
        return FileFault::Exists;
    case EACCES:
    case EPERM:
    case EROFS:
        return FileFault::NoRights;
    case ENOSPC:
    case EFBIG:
#ifdef EDQUOT
    case EDQUOT:
#endif
        return FileFault::DiskFull;
    default:
        return FileFault::Other;
    }
}

ErrorNumber errorNumberOf(FileFault fault)
{
    switch (fault) {
    case FileFault::NoRights:
        return ErrorNumber::PermissionDenied;
    case FileFault::DiskFull:
        return ErrorNumber::DiskFull;
    case FileFault::None:
    case FileFault::Exists:
    case FileFault::Other:
        break;
    }
    return ErrorNumber::WriteFailed;
}

} // namespace pelloric
